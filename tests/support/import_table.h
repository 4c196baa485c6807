// A loaded module's import table, where its calls into other modules can be led elsewhere.
#pragma once

#include <windows.h>

#include <functional>
#include <string>

namespace kortest {

// Called with the imported module's name, the function's, and the place of its address.
using ImportVisitor = std::function<void(const char* dll, const char* name, ULONG_PTR* slot)>;

// Functions imported by ordinal are left out.
void VisitImports(HMODULE module, const ImportVisitor& visit);

// The place of the imported function's address, or nullptr.
ULONG_PTR* FindImportSlot(HMODULE module, const std::string& wanted);

void WriteImportSlot(ULONG_PTR* slot, ULONG_PTR value);

}  // namespace kortest

// The export table and resources of a loaded module, read from its headers.
#pragma once

#include <windows.h>

#include <map>
#include <set>
#include <string>

namespace kortest {

// Ordinals of the named exports. Exports without a name appear as "#7".
std::map<std::string, int> ExportOrdinals(HMODULE module);

// DLLs that the module imports from, in lower case.
std::set<std::string> ImportedLibraries(HMODULE module);

// Resource of a type and number as its bytes; empty when there is none.
std::string ResourceBytes(HMODULE module, int number, int type);

}  // namespace kortest

#include "support/import_table.h"

namespace kortest {

void VisitImports(HMODULE module, const ImportVisitor& visit) {
    auto* base = reinterpret_cast<BYTE*>(module);
    auto* dos = reinterpret_cast<IMAGE_DOS_HEADER*>(base);
    auto* nt = reinterpret_cast<IMAGE_NT_HEADERS*>(base + dos->e_lfanew);
    const auto& directory = nt->OptionalHeader.DataDirectory[IMAGE_DIRECTORY_ENTRY_IMPORT];
    if (!directory.Size) return;

    auto* dll = reinterpret_cast<IMAGE_IMPORT_DESCRIPTOR*>(base + directory.VirtualAddress);
    for (; dll->Name; ++dll) {
        auto* name = reinterpret_cast<IMAGE_THUNK_DATA*>(base + dll->OriginalFirstThunk);
        auto* slot = reinterpret_cast<IMAGE_THUNK_DATA*>(base + dll->FirstThunk);
        for (; name->u1.AddressOfData; ++name, ++slot) {
            if (IMAGE_SNAP_BY_ORDINAL(name->u1.Ordinal)) continue;
            auto* entry = reinterpret_cast<IMAGE_IMPORT_BY_NAME*>(base + name->u1.AddressOfData);
            visit(reinterpret_cast<const char*>(base + dll->Name),
                  reinterpret_cast<const char*>(entry->Name),
                  reinterpret_cast<ULONG_PTR*>(&slot->u1.Function));
        }
    }
}

ULONG_PTR* FindImportSlot(HMODULE module, const std::string& wanted) {
    ULONG_PTR* found = nullptr;
    VisitImports(module, [&](const char*, const char* name, ULONG_PTR* slot) {
        if (wanted == name) found = slot;
    });
    return found;
}

void WriteImportSlot(ULONG_PTR* slot, ULONG_PTR value) {
    DWORD protection = 0;
    VirtualProtect(slot, sizeof value, PAGE_READWRITE, &protection);
    *slot = value;
    VirtualProtect(slot, sizeof value, protection, &protection);
}

}  // namespace kortest

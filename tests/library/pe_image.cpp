#include "pe_image.h"

#include <algorithm>
#include <cctype>
#include <vector>

namespace kortest {
namespace {

template <typename Data>
const Data* At(HMODULE module, DWORD offset) {
    return reinterpret_cast<const Data*>(reinterpret_cast<const BYTE*>(module) + offset);
}

const IMAGE_DATA_DIRECTORY& Directory(HMODULE module, int index) {
    const auto* dos = At<IMAGE_DOS_HEADER>(module, 0);
    const auto* nt = At<IMAGE_NT_HEADERS>(module, static_cast<DWORD>(dos->e_lfanew));
    return nt->OptionalHeader.DataDirectory[index];
}

}  // namespace

std::map<std::string, int> ExportOrdinals(HMODULE module) {
    const auto* table = At<IMAGE_EXPORT_DIRECTORY>(
        module, Directory(module, IMAGE_DIRECTORY_ENTRY_EXPORT).VirtualAddress);
    const auto* functions = At<DWORD>(module, table->AddressOfFunctions);
    const auto* names = At<DWORD>(module, table->AddressOfNames);
    const auto* places = At<WORD>(module, table->AddressOfNameOrdinals);

    std::map<std::string, int> ordinals;
    std::vector<bool> isNamed(table->NumberOfFunctions, false);
    for (DWORD i = 0; i < table->NumberOfNames; ++i) {
        ordinals[At<char>(module, names[i])] = static_cast<int>(table->Base + places[i]);
        isNamed[places[i]] = true;
    }
    for (DWORD i = 0; i < table->NumberOfFunctions; ++i) {
        if (!functions[i] || isNamed[i]) continue;
        const int ordinal = static_cast<int>(table->Base + i);
        std::string name(1, '#');
        name += std::to_string(ordinal);
        ordinals[name] = ordinal;
    }
    return ordinals;
}

std::set<std::string> ImportedLibraries(HMODULE module) {
    std::set<std::string> libraries;
    const auto& directory = Directory(module, IMAGE_DIRECTORY_ENTRY_IMPORT);
    if (!directory.Size) return libraries;
    const auto* entry = At<IMAGE_IMPORT_DESCRIPTOR>(module, directory.VirtualAddress);
    for (; entry->Name; ++entry) {
        std::string name = At<char>(module, entry->Name);
        std::transform(name.begin(), name.end(), name.begin(), [](unsigned char letter) {
            return static_cast<char>(std::tolower(letter));
        });
        libraries.insert(name);
    }
    return libraries;
}

std::string ResourceBytes(HMODULE module, int number, int type) {
    HRSRC found = FindResourceW(module, MAKEINTRESOURCEW(number), MAKEINTRESOURCEW(type));
    if (!found) return {};
    const auto* bytes = static_cast<const char*>(LockResource(LoadResource(module, found)));
    return {bytes, SizeofResource(module, found)};
}

}  // namespace kortest

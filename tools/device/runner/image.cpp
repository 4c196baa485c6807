#include "runner/image.h"

#include "runner/failure.h"

#include <algorithm>
#include <cstring>

namespace device {

GuestImage guest;

namespace {

// The subsystem of images for Windows CE.
constexpr WORD kWindowsCe = 9;

std::vector<uint8_t> ReadWhole(const std::wstring& path) {
    const HANDLE file = CreateFileW(path.c_str(), GENERIC_READ, FILE_SHARE_READ, nullptr,
                                    OPEN_EXISTING, 0, nullptr);
    if (file == INVALID_HANDLE_VALUE) Fail("cannot open %ls", path.c_str());
    std::vector<uint8_t> bytes(GetFileSize(file, nullptr));
    DWORD read = 0;
    const BOOL isRead =
        ReadFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &read, nullptr);
    CloseHandle(file);
    if (!isRead || read != bytes.size()) Fail("cannot read %ls", path.c_str());
    return bytes;
}

template <typename Data>
Data* At(uint32_t offset) {
    return reinterpret_cast<Data*>(guest.base + offset);
}

IMAGE_NT_HEADERS32& Headers() {
    return *At<IMAGE_NT_HEADERS32>(static_cast<uint32_t>(At<IMAGE_DOS_HEADER>(0)->e_lfanew));
}

IMAGE_DATA_DIRECTORY Directory(int index) { return Headers().OptionalHeader.DataDirectory[index]; }

template <typename Visitor>
void ForEachSection(Visitor visit) {
    auto& headers = Headers();
    IMAGE_SECTION_HEADER* section = IMAGE_FIRST_SECTION(&headers);
    for (int i = 0; i < headers.FileHeader.NumberOfSections; ++i) visit(section[i]);
}

void CheckHeaders(const std::vector<uint8_t>& file) {
    const auto& dos = *reinterpret_cast<const IMAGE_DOS_HEADER*>(file.data());
    if (file.size() < 1024 || dos.e_magic != IMAGE_DOS_SIGNATURE) Fail("not a Windows image");
    const auto& headers = *reinterpret_cast<const IMAGE_NT_HEADERS32*>(file.data() + dos.e_lfanew);
    if (headers.Signature != IMAGE_NT_SIGNATURE) Fail("not a Windows image");
    if (headers.FileHeader.Machine != IMAGE_FILE_MACHINE_ARM) {
        Fail("machine %04x is not ARM", headers.FileHeader.Machine);
    }
    if (headers.OptionalHeader.Subsystem != kWindowsCe) {
        Fail("subsystem %u is not Windows CE", headers.OptionalHeader.Subsystem);
    }
}

void MapSections(const std::vector<uint8_t>& file) {
    const auto& dos = *reinterpret_cast<const IMAGE_DOS_HEADER*>(file.data());
    const auto& optional =
        reinterpret_cast<const IMAGE_NT_HEADERS32*>(file.data() + dos.e_lfanew)->OptionalHeader;
    guest.size = optional.SizeOfImage;
    guest.base = reinterpret_cast<uint32_t>(
        VirtualAlloc(nullptr, guest.size, MEM_COMMIT | MEM_RESERVE, PAGE_READWRITE));
    if (!guest.base) Fail("no room for an image of %u bytes", static_cast<unsigned>(guest.size));
    if (guest.base == optional.ImageBase) Fail("the image lies where it wants: nothing is moved");
    std::memcpy(At<void>(0), file.data(), optional.SizeOfHeaders);
    ForEachSection([&](const IMAGE_SECTION_HEADER& section) {
        const DWORD bytes = std::min(section.SizeOfRawData, section.Misc.VirtualSize);
        std::memcpy(At<void>(section.VirtualAddress), file.data() + section.PointerToRawData,
                    bytes);
        if (!(section.Characteristics & IMAGE_SCN_MEM_EXECUTE)) return;
        if (guest.codeSize) Fail("the image has more than one section of code");
        guest.codeBegin = guest.base + section.VirtualAddress;
        guest.codeSize = section.Misc.VirtualSize;
    });
    guest.entry = guest.base + optional.AddressOfEntryPoint;
}

void Relocate() {
    const uint32_t moved = guest.base - Headers().OptionalHeader.ImageBase;
    const auto directory = Directory(IMAGE_DIRECTORY_ENTRY_BASERELOC);
    uint32_t at = directory.VirtualAddress;
    const uint32_t end = at + directory.Size;
    while (at < end) {
        const auto* block = At<IMAGE_BASE_RELOCATION>(at);
        const auto* entry = reinterpret_cast<const WORD*>(block + 1);
        const DWORD count = (block->SizeOfBlock - sizeof *block) / sizeof *entry;
        for (DWORD i = 0; i < count; ++i) {
            const int kind = entry[i] >> 12;
            if (kind == IMAGE_REL_BASED_HIGHLOW) {
                *At<uint32_t>(block->VirtualAddress + (entry[i] & 0xFFF)) += moved;
            } else if (kind != IMAGE_REL_BASED_ABSOLUTE) {
                Fail("a relocation of kind %d", kind);
            }
        }
        at += block->SizeOfBlock;
    }
    // As the device's loader leaves it.
    Headers().OptionalHeader.ImageBase = guest.base;
}

void ReadImports() {
    const auto directory = Directory(IMAGE_DIRECTORY_ENTRY_IMPORT);
    if (!directory.Size) return;
    for (auto* library = At<IMAGE_IMPORT_DESCRIPTOR>(directory.VirtualAddress); library->Name;
         ++library) {
        for (auto* slot = At<uint32_t>(library->FirstThunk); *slot; ++slot) {
            if (*slot & IMAGE_ORDINAL_FLAG32) {
                Fail("an import by number from %s", At<char>(library->Name));
            }
            const auto* entry = At<IMAGE_IMPORT_BY_NAME>(*slot);
            guest.imports.push_back(
                {At<char>(library->Name), reinterpret_cast<const char*>(entry->Name), slot});
        }
    }
}

void ReadExports() {
    const auto directory = Directory(IMAGE_DIRECTORY_ENTRY_EXPORT);
    if (!directory.Size) Fail("the image exports nothing");
    const auto* table = At<IMAGE_EXPORT_DIRECTORY>(directory.VirtualAddress);
    const auto* names = At<uint32_t>(table->AddressOfNames);
    const auto* places = At<uint16_t>(table->AddressOfNameOrdinals);
    const auto* functions = At<uint32_t>(table->AddressOfFunctions);
    for (DWORD i = 0; i < table->NumberOfNames; ++i) {
        guest.exports.push_back({At<char>(names[i]), static_cast<int>(table->Base + places[i]),
                                 guest.base + functions[places[i]]});
    }
}

}  // namespace

void LoadImageFile(const std::wstring& path) {
    const std::vector<uint8_t> file = ReadWhole(path);
    CheckHeaders(file);
    MapSections(file);
    Relocate();
    ReadImports();
    ReadExports();
    const auto resources = Directory(IMAGE_DIRECTORY_ENTRY_RESOURCE);
    if (resources.Size) {
        guest.resources = guest.base + resources.VirtualAddress;
        guest.resourcesSize = resources.Size;
    }
}

void ProtectImage() {
    const uint32_t imports = Directory(IMAGE_DIRECTORY_ENTRY_IMPORT).VirtualAddress;
    DWORD before = 0;
    VirtualProtect(At<void>(0), guest.size, PAGE_READONLY, &before);
    ForEachSection([&](const IMAGE_SECTION_HEADER& section) {
        const bool holdsImports = imports - section.VirtualAddress < section.Misc.VirtualSize;
        if (!(section.Characteristics & IMAGE_SCN_MEM_WRITE) || holdsImports) return;
        VirtualProtect(At<void>(section.VirtualAddress), section.Misc.VirtualSize, PAGE_READWRITE,
                       &before);
    });
}

}  // namespace device

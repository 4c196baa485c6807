#include "runner/own_headers.h"

#include "runner/failure.h"
#include "runner/image.h"

#include <algorithm>
#include <cstring>
#include <map>
#include <vector>

namespace device {
namespace {

struct Import {
    std::string library, name;
    uint32_t address;
    uint32_t* slot;  // in the table, once there is one
};

std::vector<Import> imports;

// The module that this code is in.
HMODULE FindOwnModule() {
    HMODULE found = nullptr;
    GetModuleHandleExW(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                           GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                       reinterpret_cast<const wchar_t*>(&FindOwnModule), &found);
    return found;
}

uint32_t OwnBase() {
    static const auto base = reinterpret_cast<uint32_t>(FindOwnModule());
    return base;
}

template <typename Data>
Data* OwnAt(uint32_t offset) {
    return reinterpret_cast<Data*>(OwnBase() + offset);
}

// Offsets in a module have 32 bits: with wrap-round, any address has one.
uint32_t OffsetOf(const void* place) { return reinterpret_cast<uint32_t>(place) - OwnBase(); }

IMAGE_DATA_DIRECTORY& OwnDirectory(int index) {
    const auto offset = static_cast<uint32_t>(OwnAt<IMAGE_DOS_HEADER>(0)->e_lfanew);
    return OwnAt<IMAGE_NT_HEADERS32>(offset)->OptionalHeader.DataDirectory[index];
}

void SetDirectory(int index, const void* place, uint32_t size) {
    auto& directory = OwnDirectory(index);
    DWORD before = 0;
    VirtualProtect(&directory, sizeof directory, PAGE_READWRITE, &before);
    directory = {OffsetOf(place), size};
    VirtualProtect(&directory, sizeof directory, before, &before);
}

// The runner's own imports that stay in the table. Must be called before the table is replaced.
std::vector<IMAGE_IMPORT_DESCRIPTOR> KeptDescriptors() {
    std::vector<IMAGE_IMPORT_DESCRIPTOR> kept;
    const auto& directory = OwnDirectory(IMAGE_DIRECTORY_ENTRY_IMPORT);
    for (auto* library = OwnAt<IMAGE_IMPORT_DESCRIPTOR>(directory.VirtualAddress); library->Name;
         ++library) {
        const char* name = OwnAt<char>(library->Name);
        if (!lstrcmpiA(name, "USER32.dll") || !lstrcmpiA(name, "GDI32.dll")) {
            kept.push_back(*library);
        }
    }
    return kept;
}

// The runner's own slot for a function that stays in the table, else null.
uint32_t* KeptSlot(const std::string& wanted) {
    for (const IMAGE_IMPORT_DESCRIPTOR& library : KeptDescriptors()) {
        auto* name = OwnAt<uint32_t>(library.OriginalFirstThunk);
        auto* slot = OwnAt<uint32_t>(library.FirstThunk);
        for (; *name; ++name, ++slot) {
            const auto* entry = OwnAt<IMAGE_IMPORT_BY_NAME>(*name);
            if (wanted == reinterpret_cast<const char*>(entry->Name)) return slot;
        }
    }
    return nullptr;
}

// Lies inside the module: offsets of names above 2 GB would mean imports by ordinal.
alignas(16) uint8_t tableRoom[32 * 1024];

// Allocates pieces of tableRoom.
class Builder {
public:
    template <typename Data>
    Data* take(size_t count = 1) {
        uint8_t* taken = tableRoom + used_;
        used_ += (count * sizeof(Data) + 3) & ~size_t{3};
        if (used_ > sizeof tableRoom) Fail("too many imports");
        return reinterpret_cast<Data*>(taken);
    }

    const char* text(const std::string& words) {
        return std::strcpy(take<char>(words.size() + 1), words.c_str());
    }

private:
    size_t used_ = 0;
};

using Libraries = std::map<std::string, std::vector<Import*>>;

// A name as an import table has it: preceded by a hint, which is unused here.
const char* TakeName(Builder& builder, const std::string& name) {
    auto* entry = builder.take<char>(sizeof(WORD) + name.size() + 1);
    std::strcpy(entry + sizeof(WORD), name.c_str());
    return entry;
}

void DescribeLibrary(Builder& builder, IMAGE_IMPORT_DESCRIPTOR& descriptor,
                     const Libraries::value_type& library) {
    const auto& [name, functions] = library;
    auto* names = builder.take<uint32_t>(functions.size() + 1);
    auto* slots = builder.take<uint32_t>(functions.size() + 1);
    descriptor.Name = OffsetOf(builder.text(name));
    descriptor.OriginalFirstThunk = OffsetOf(names);
    descriptor.FirstThunk = OffsetOf(slots);
    for (size_t i = 0; i < functions.size(); ++i) {
        names[i] = OffsetOf(TakeName(builder, functions[i]->name));
        slots[i] = functions[i]->address;
        functions[i]->slot = &slots[i];
    }
}

}  // namespace

int AddImport(const std::string& library, const std::string& name, uint32_t address) {
    for (size_t i = 0; i < imports.size(); ++i) {
        if (imports[i].library == library && imports[i].name == name) return static_cast<int>(i);
    }
    imports.push_back({library, name, address, KeptSlot(name)});
    return static_cast<int>(imports.size() - 1);
}

uint32_t ImportTarget(int import) { return *imports[static_cast<size_t>(import)].slot; }

void ShowGuestImports() {
    Libraries libraries;
    for (Import& import : imports) {
        if (import.slot) continue;
        libraries[import.library].push_back(&import);
    }
    Builder builder;
    const auto kept = KeptDescriptors();
    const size_t count = kept.size() + libraries.size() + 1;
    auto* descriptors = builder.take<IMAGE_IMPORT_DESCRIPTOR>(count);
    std::copy(kept.begin(), kept.end(), descriptors);
    size_t i = kept.size();
    for (const auto& library : libraries) {
        DescribeLibrary(builder, descriptors[i++], library);
    }
    SetDirectory(IMAGE_DIRECTORY_ENTRY_IMPORT, descriptors,
                 static_cast<uint32_t>(count * sizeof *descriptors));
}

namespace {

// Points the data entries below a resource directory at the guest's data, which lies `moved` bytes
// away.
void MoveResources(uint32_t directoryOffset, uint32_t moved) {
    auto* directory =
        reinterpret_cast<IMAGE_RESOURCE_DIRECTORY*>(guest.resources + directoryOffset);
    auto* entry = reinterpret_cast<IMAGE_RESOURCE_DIRECTORY_ENTRY*>(directory + 1);
    const int count = directory->NumberOfNamedEntries + directory->NumberOfIdEntries;
    for (int i = 0; i < count; ++i) {
        const uint32_t offset = entry[i].OffsetToData & 0x7FFFFFFF;
        if (entry[i].OffsetToData >> 31) {
            MoveResources(offset, moved);
        } else {
            reinterpret_cast<IMAGE_RESOURCE_DATA_ENTRY*>(guest.resources + offset)->OffsetToData +=
                moved;
        }
    }
}

}  // namespace

void ShowGuestResources() {
    if (!guest.resources) return;
    MoveResources(0, OffsetOf(reinterpret_cast<void*>(guest.base)));
    SetDirectory(IMAGE_DIRECTORY_ENTRY_RESOURCE, reinterpret_cast<void*>(guest.resources),
                 guest.resourcesSize);
}

}  // namespace device

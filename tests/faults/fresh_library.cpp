#include "faults/fresh_library.h"

#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include "device/device_counters.h"
#include "support/import_spy.h"

#include <cstring>

namespace kortest {
namespace {

const IMAGE_NT_HEADERS& HeadersOf(const BYTE* image) {
    const auto& dos = *reinterpret_cast<const IMAGE_DOS_HEADER*>(image);
    return *reinterpret_cast<const IMAGE_NT_HEADERS*>(image + dos.e_lfanew);
}

// Variables alone: the tables of imports, which a spy has changed, stand in sections of their own.
bool HoldsVariables(const IMAGE_SECTION_HEADER& section) {
    const auto* name = reinterpret_cast<const char*>(section.Name);
    return std::strncmp(name, ".data", sizeof section.Name) == 0 ||
           std::strncmp(name, ".bss", sizeof section.Name) == 0;
}

// Where the library's variables are: in its own image, or, where the device's library is stood in
// for, in the image that the stand-in runs. Its resources, which the stand-in shows as its own, lie
// there.
const BYTE* ImageWithVariables() {
    const auto* image = reinterpret_cast<const BYTE*>(LibraryModule());
    if (!device::FindCounters()) return image;
    const auto& resources =
        HeadersOf(image).OptionalHeader.DataDirectory[IMAGE_DIRECTORY_ENTRY_RESOURCE];
    MEMORY_BASIC_INFORMATION memory{};
    VirtualQuery(image + resources.VirtualAddress, &memory, sizeof memory);
    return static_cast<const BYTE*>(memory.AllocationBase);
}

}  // namespace

FreshLibrary::FreshLibrary() { remember(ImageWithVariables()); }

void FreshLibrary::remember(const BYTE* image) {
    const auto& headers = HeadersOf(image);
    const IMAGE_SECTION_HEADER* section = IMAGE_FIRST_SECTION(&headers);
    for (int i = 0; i < headers.FileHeader.NumberOfSections; ++i, ++section) {
        if (!HoldsVariables(*section)) continue;
        auto* begin = const_cast<BYTE*>(image) + section->VirtualAddress;
        parts_.push_back({begin, {begin, begin + section->Misc.VirtualSize}});
    }
}

void FreshLibrary::restore() const {
    for (const Part& part : parts_) std::memcpy(part.begin, part.bytes.data(), part.bytes.size());
}

void UnregisterLibraryClasses() {
    for (const wchar_t* name : {KORGRID_CLASS, KORHEADER_CLASS, KORGRAPH_CLASS, KORLEGEND_CLASS,
                                KORTOOLTIP_CLASS, KORFUNKYBAR_CLASS})
        UnregisterClassW(name, GetModuleHandleW(nullptr));
}

}  // namespace kortest

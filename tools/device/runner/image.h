// The library's image for the device, mapped into this process.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>
#include <vector>

namespace device {

struct GuestImport {
    std::string library;  // as the image has it, "coredll.dll"
    std::string name;
    uint32_t* slot;  // where the image expects the function's address
};

struct GuestExport {
    std::string name;
    int ordinal;
    uint32_t address;
};

struct GuestImage {
    uint32_t base = 0;
    uint32_t size = 0;
    uint32_t entry = 0;
    uint32_t codeBegin = 0;  // of the one section that is executable
    uint32_t codeSize = 0;
    uint32_t resources = 0;  // the resource directory, and its size; 0 without one
    uint32_t resourcesSize = 0;
    std::vector<GuestImport> imports;
    std::vector<GuestExport> exports;

    bool isCode(uint32_t address) const { return address - codeBegin < codeSize; }
};

// The one guest of the process.
extern GuestImage guest;

// Loads the file into `guest`, at an address other than its preferred one. All of it is writable
// until ProtectImage.
void LoadImageFile(const std::wstring& path);

// Gives each section the access that the image says, and makes none executable by the host.
void ProtectImage();

}  // namespace device

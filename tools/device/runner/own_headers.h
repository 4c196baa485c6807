// The runner's own module, made to show the guest's imports and resources as its own.
//
// Tests read and change the import table of the module that they load, and the system finds a
// module's resources by its headers. So both directories of the module's headers are led to the
// guest's: a table of imports with the names that the desktop has for them, and the guest's
// resources. The runner's own imports keep working; only nobody finds them any more.
//
// Its imports of windows and drawing functions stay in the table, though: they belong to the
// command bar of src/platform/desktop, which stands in for the device's, and the runner needs none
// itself.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>

namespace device {

// The slot through which the guest's calls of a desktop function go. The same for the same
// function. All slots are asked for before ShowGuestImports.
int AddImport(const std::string& library, const std::string& name, uint32_t address);

// Where its calls go at this moment.
uint32_t ImportTarget(int import);

void ShowGuestImports();
void ShowGuestResources();

}  // namespace device

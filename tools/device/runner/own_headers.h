// The runner's own module, made to show the guest's imports and resources as its own.
//
// Tests read and change the import table of the module that they load, and the system finds a
// module's resources by its headers. So both directories in the module's headers are pointed at the
// guest's: an import table with the desktop's names, and the guest's resources. The runner's own
// imports keep working, but nobody can find them any more.
//
// Its imports of window and drawing functions stay in the table, though: they belong to the command
// bar of src/platform/desktop, which stands in for the device's, and the runner itself needs none.
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>

namespace device {

// Number of the slot through which the guest calls a desktop function; the same for the same
// function. All slots are requested before ShowGuestImports.
int AddImport(const std::string& library, const std::string& name, uint32_t address);

// The address that a slot's calls reach at this moment.
uint32_t ImportTarget(int import);

void ShowGuestImports();
void ShowGuestResources();

}  // namespace device

// The library's exports, which lead into the guest.
#pragma once

namespace device {

// Connects each export to the image's one of the same ordinal. A name or ordinal that is not the
// same on both sides ends the process.
void ConnectExports();

}  // namespace device

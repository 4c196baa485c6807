// The library's exports, which lead into the guest.
#pragma once

namespace device {

// Connects each export to the image's export of the same ordinal. A name or ordinal that differs
// between the two ends the process.
void ConnectExports();

}  // namespace device

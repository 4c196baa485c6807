// The public headers in C++ of the oldest standard.
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/korcontrols.h>

DWORD sizesSeenByOldCpp();

DWORD sizesSeenByOldCpp() {
    return static_cast<DWORD>(sizeof(GridSelection) << 16 | sizeof(HeaderItemDesc));
}

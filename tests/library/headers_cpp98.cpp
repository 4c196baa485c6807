// The public headers in C++ of the oldest standard.
#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/korcontrols.h>
#include <korcontrols/legend.h>
#include <korcontrols/listhelpers.h>
#include <korcontrols/tooltip.h>

DWORD sizesSeenByOldCpp();

DWORD sizesSeenByOldCpp() {
    return static_cast<DWORD>(sizeof(GridSelection) << 16 | sizeof(HeaderItemDesc));
}

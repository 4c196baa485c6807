#include "grid/state.h"

#include "zoom/zoom.h"

namespace kor {

constinit GridState grid;

void InitialiseGridState() {
    grid.focusWindow = grid.hwndGrid;
    grid.cellsLeft = grid.rowHeaderWidth;
    grid.columnHeaderHeight = HeaderHeightAt(zoomLevel);
}

}  // namespace kor

/* The first and only thing that this file includes. */
#include <korcontrols/grid.h>

int useGridHeaderAlone(HWND grid);

int useGridHeaderAlone(HWND grid)
{
    KorGrid_Redraw(grid);
    KorGrid_SetEquationText(grid, L"text");
    return KORGRID_CELLROW(KORGRID_CELL(1, 2)) == 2;
}

// What cells are drawn with. Made once, at 100 % zoom: the grid scales the fonts itself.
#pragma once

#include <windows.h>

namespace workbook {

constexpr COLORREF kTextColour = RGB(0, 0, 0);
constexpr COLORREF kErrorColour = RGB(176, 0, 0);
constexpr COLORREF kPaperColour = RGB(255, 255, 255);
constexpr COLORREF kTitleColour = RGB(222, 232, 244);

// Owns its objects, from CreateCellStyles to DeleteCellStyles.
struct CellStyles {
    HFONT normal = nullptr;
    HFONT bold = nullptr;         // title row
    HBRUSH titleBrush = nullptr;  // behind the title row
    HPEN titleEdgePen = nullptr;  // under it
    HPEN titleLinePen = nullptr;  // between its cells, where the background covered the grid lines
    int digitWidth = 8;           // of `normal`, in pixels
};

void CreateCellStyles(CellStyles& styles);
void DeleteCellStyles(CellStyles& styles);

}  // namespace workbook

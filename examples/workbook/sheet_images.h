// Small images: sheets in colours of their own, and kinds of columns. They are drawn here, so that
// there are as many as needed.
#pragma once

#include <windows.h>

#include <commctrl.h>

#include <vector>

namespace workbook {

constexpr int kImageSize = 16;

// Images of the list for sheets.
int SheetImage(int colour, bool isModified);

// Images of the list for columns; behind them stand the colours of charted series.
enum ColumnImage { kNumbersImage, kTextsImage, kSeriesImages };

// The caller destroys the list.
HIMAGELIST CreateSheetImages();
HIMAGELIST CreateColumnImages(const std::vector<COLORREF>& series);

// The colour of a sheet's image, from 0 to kSheetColours - 1 (see open_sheets.h), and its variant
// that is best to read both in the menu and on its highlighted entry.
COLORREF SheetColour(int colour);
COLORREF ReadableSheetColour(int colour, COLORREF menu, COLORREF highlight);

}  // namespace workbook

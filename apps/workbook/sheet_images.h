// Small images: sheets in colours of their own, and kinds of columns. They are drawn here, so that
// there are as many as needed.
#pragma once

#include <windows.h>

#include <commctrl.h>

#include <vector>

#include "open_sheets.h"

namespace workbook {

constexpr int kImageSize = 16;

// Images of the list for sheets, which has columns as well.
int SheetImage(int colour, bool isModified);
constexpr int kTreeNumbersImage = 2 * kSheetColours;
constexpr int kTreeTextsImage = kTreeNumbersImage + 1;

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

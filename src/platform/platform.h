// The platform, included by everything in src/ in place of <windows.h>, and the few calls whose
// meaning differs between Windows CE and the desktop. Each of those is declared here once and
// defined once per platform, in src/platform/ce or src/platform/desktop.
#pragma once

#ifndef WIN32_LEAN_AND_MEAN
#define WIN32_LEAN_AND_MEAN
#endif
#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>

#include <cstddef>
#include <cstdint>

namespace kor {

// Windows CE sets this bit in a system colour's index to tell it from other indexes and from
// handles. The library always sets it.
constexpr int kSystemColourFlag = 0x40000000;

// The system colour of a flagged index, such as COLOR_BTNFACE | kSystemColourFlag.
COLORREF SystemColour(int flaggedIndex);

// The stock brush of a flagged index. It is never deleted.
HBRUSH SystemStockBrush(int flaggedIndex);

// Finishes pending drawing into a DIB section, so that its bits may be read. On Windows CE drawing
// is finished when a call returns.
void FinishDrawing();

}  // namespace kor

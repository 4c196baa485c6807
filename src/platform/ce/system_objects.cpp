// System colours on Windows CE, whose calls know the flag; drawing is never put off.
#include "platform/platform.h"

namespace kor {

COLORREF SystemColour(int flaggedIndex) { return GetSysColor(flaggedIndex); }

HBRUSH SystemStockBrush(int flaggedIndex) {
    return static_cast<HBRUSH>(GetStockObject(flaggedIndex));
}

void FinishDrawing() {}

}  // namespace kor

// System colours on Windows CE, whose calls take the flag; drawing is never deferred.
#include "platform/platform.h"

namespace kor {

COLORREF SystemColour(int flaggedIndex) { return GetSysColor(flaggedIndex); }

HBRUSH SystemStockBrush(int flaggedIndex) {
    return static_cast<HBRUSH>(GetStockObject(flaggedIndex));
}

void FinishDrawing() {}

}  // namespace kor

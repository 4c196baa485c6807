// System colours on the desktop, whose calls do not take the flag; drawing is batched and may be
// deferred.
#include "platform/platform.h"

namespace kor {

COLORREF SystemColour(int flaggedIndex) { return GetSysColor(flaggedIndex & ~kSystemColourFlag); }

HBRUSH SystemStockBrush(int flaggedIndex) {
    return GetSysColorBrush(flaggedIndex & ~kSystemColourFlag);
}

void FinishDrawing() { GdiFlush(); }

}  // namespace kor

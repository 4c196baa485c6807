// System colours on the desktop, whose calls do not know the flag; drawing is collected and may be
// put off.
#include "platform/platform.h"

namespace kor {

COLORREF SystemColour(int flaggedIndex) { return GetSysColor(flaggedIndex & ~kSystemColourFlag); }

HBRUSH SystemStockBrush(int flaggedIndex) {
    return GetSysColorBrush(flaggedIndex & ~kSystemColourFlag);
}

void FinishDrawing() { GdiFlush(); }

}  // namespace kor

// System colours on Windows CE, whose calls know the flag.
#include "platform/platform.h"

namespace kor {

COLORREF SystemColour(int flaggedIndex) { return GetSysColor(flaggedIndex); }

HBRUSH SystemStockBrush(int flaggedIndex) {
    return static_cast<HBRUSH>(GetStockObject(flaggedIndex));
}

}  // namespace kor

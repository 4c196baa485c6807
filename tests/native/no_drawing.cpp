// Drawing that stands in one file with what reckons, and that nothing here may reach.
#include "graph/drawing/frame.h"

namespace kor {

void FillBackground(const GraphRecord&, HDC) { NoWindowsHere("FillBackground"); }

void DrawGraphTitle(const GraphRecord&, HDC) { NoWindowsHere("DrawGraphTitle"); }

}  // namespace kor

// The header strip's window class.
#pragma once

#include "platform/platform.h"

namespace kor {

// Registers the class "korvane Header"; false when it could not be, as when it already is.
bool RegisterHeaderClass(HINSTANCE instance);

// What is called, with the strip, when a border was being dragged and will not be let go: the strip
// has lost the capture. No message tells the parent.
void WhenHeaderResizeIsLost(void (*handler)(HWND strip));

}  // namespace kor

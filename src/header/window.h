// The header strip's window class.
#pragma once

#include "platform/platform.h"

namespace kor {

// Registers the class "korvane Header". False when that fails, for instance because it is
// registered already.
bool RegisterHeaderClass(HINSTANCE instance);

// Sets the handler that is called with the strip when a border drag is cancelled because the strip
// has lost the capture. No message tells the parent.
void WhenHeaderResizeIsLost(void (*handler)(HWND strip));

}  // namespace kor

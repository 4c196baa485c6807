// The header strip's window class.
#pragma once

#include "platform/platform.h"

namespace kor {

// Registers the class "korvane Header"; false when it could not be, as when it already is.
bool RegisterHeaderClass(HINSTANCE instance);

}  // namespace kor

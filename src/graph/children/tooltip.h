// The tooltip's window class.
#pragma once

#include "platform/platform.h"

namespace kor {

// Registers the class once per process; false when that first call failed.
bool RegisterToolTipClass(HINSTANCE instance);

}  // namespace kor

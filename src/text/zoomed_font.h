// Fonts at the zoom of the grid and its strips.
#pragma once

#include "platform/platform.h"

namespace kor {

// A new font: `font` at the current zoom, with its own proportions. The caller deletes it. Null
// when `font` is null or cannot be read or made.
HFONT CreateZoomedFont(HFONT font);

}  // namespace kor

// Fonts at the zoom of the grid and its strips.
#pragma once

#include "platform/platform.h"

namespace kor {

// Creates a copy of `font` at the current zoom, with the font's own proportions. The caller deletes
// it. Null when `font` is null or cannot be read, or when the copy cannot be created.
HFONT CreateZoomedFont(HFONT font);

}  // namespace kor

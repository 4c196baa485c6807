// Painting a strip.
#pragma once

#include "header/record.h"

namespace kor {

// Paints the items that meet `area` (client coordinates) with the record's own DC.
void DrawHeaderItems(const HeaderRecord& header, const RECT& area);

}  // namespace kor

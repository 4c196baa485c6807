// Copies the chart's image for other programs.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Puts the image of a chart, in its window's size, on the clipboard as a device-independent bitmap.
void CopyGraphToClipboard(const GraphRecord& graph);

}  // namespace kor

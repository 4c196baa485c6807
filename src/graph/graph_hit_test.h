// Which data point lies under the pointer, and what the tooltip says of it.
#pragma once

#include "graph/graph_record.h"

namespace kor {

constexpr int kTipTextCapacity = 128;

// Fills `text` (kTipTextCapacity characters) and returns 1 when a point lies under an image
// position; otherwise empties it and returns 0. Series are tried in the order they were added.
int HitTestGraphValue(const GraphRecord& graph, int x, int y, wchar_t* text);

}  // namespace kor

// Finds the data point under the pointer, and its tooltip text.
#pragma once

#include "graph/data/record.h"
#include "platform/number_text.h"

namespace kor {

constexpr int kTipTextCapacity = 128;
static_assert(kTipTextCapacity > 2 * kNumberTextCapacity + 10);  // a share, a value, their labels

// Fills `text` (kTipTextCapacity characters) and returns 1 when a point lies under an image
// position; otherwise empties it and returns 0. Series are tried in the order they were added.
int HitTestGraphValue(const GraphRecord& graph, int x, int y, wchar_t* text);

}  // namespace kor

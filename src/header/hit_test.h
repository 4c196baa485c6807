// Which item, and which border, lies under a position along the strip. No window needed.
#pragma once

#include <cstdint>

namespace kor {

struct HeaderHit {
    int item;        // under the pointer; -1 past all items
    bool onBorder;   // within the grip zone of a border
    int borderItem;  // the item that ends at that border; -1 for the strip's own start
};

// The grip zone of a border is the 5 pixels before it and the 6 from it on. Where items are
// narrower than that, the border found last along the walk wins. A negative position hits nothing.
HeaderHit HitTestHeader(const uint16_t* sizes, uint32_t count, int position);

}  // namespace kor

// The list of items, and the current one. Nothing here needs a window; the caller that changes the
// list repaints.
#pragma once

#include "funkybar/record.h"

namespace kor {

constexpr int32_t kNoItem = -1;

// The item at an index; null when there is none.
FunkyBarItem* ItemAt(int32_t index);

// Index of an item; kNoItem when it is not (or no longer) in the list. The pointer is only
// compared, never dereferenced.
int32_t IndexOfItem(const void* item);

constexpr bool HasField(const FunkyBarItem& item, uint32_t field) {
    return (item.mask & field) != 0;
}

// Inserts a copy of the described item. Returns the count before the insertion, or kNoItem when
// nothing was inserted.
int32_t InsertItem(const FunkyBarItemDesc* description);

// Fills in the members that the description's mask names. False, and nothing is filled in, when it
// cannot be done.
bool ReadItem(FunkyBarItemDesc* description);

// Returns whether the bar has to be repainted.
bool RemoveItem(int32_t index);

// Returns false when there were none.
bool RemoveAllItems();

}  // namespace kor

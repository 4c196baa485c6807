// The list of items: what is in it, and which of them is the current one. Nothing here knows a
// window; whoever changes the list repaints.
#pragma once

#include "funkybar/record.h"

namespace kor {

constexpr int32_t kNoItem = -1;

// The item at an index, null when there is none.
FunkyBarItem* ItemAt(int32_t index);

// Where an item stands, kNoItem when it is not (or no longer) in the list. The pointer is compared,
// never followed.
int32_t IndexOfItem(const void* item);

constexpr bool HasField(const FunkyBarItem& item, uint32_t field) {
    return (item.mask & field) != 0;
}

// The count before the insertion, kNoItem when nothing was inserted.
int32_t InsertItem(const FunkyBarItemDesc* description);

// Fills in what the description's mask asks for; false, and nothing filled in, when it cannot be.
bool ReadItem(FunkyBarItemDesc* description);

// True when the bar is to be painted again.
bool RemoveItem(int32_t index);

// False when there were none.
bool RemoveAllItems();

}  // namespace kor

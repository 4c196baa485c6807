#include "header/items.h"

#include "base/assert.h"
#include "base/local_heap.h"
#include "base/runtime.h"

namespace kor {

namespace {

// Compatibility: the count itself is a valid index, and the arrays have a spare element for it;
// pinned by HeaderItems.HaveASparePlaceAtTheCount.
bool IsBadIndex(const HeaderRecord& header, int index) {
    return index < 0 || static_cast<uint32_t>(index) > header.count;
}

// A copy on the local heap, empty for a null text; null when there is no memory.
wchar_t* CopyLabel(const wchar_t* text) {
    const size_t length = text ? wcslen(text) : 0;
    // Compatibility: twice the room that a wide string needs; pinned by
    // HeaderItems.ReserveFourBytesForACharacter.
    auto* copy =
        reinterpret_cast<wchar_t*>(AllocateLocal<uint32_t>(static_cast<uint32_t>(length) + 1));
    if (copy && text) memcpy(copy, text, length * sizeof(wchar_t));
    return copy;
}

void FreeLabel(HeaderRecord& header, uint32_t index) {
    if (header.texts[index]) LocalFree(header.texts[index]);
    header.texts[index] = nullptr;
}

// Grows one array by a step and zeroes the new elements. False: the array is unchanged.
template <typename Value>
bool GrowArray(Value*& array, uint32_t capacity) {
    const uint32_t newCapacity = capacity + kHeaderCapacityStep;
    Value* grown = ReallocateLocal(array, newCapacity + 1);
    if (!grown) return false;
    array = grown;
    memset(array + capacity + 1, 0, kHeaderCapacityStep * sizeof(Value));
    return true;
}

// An array that grew before another one failed stays grown; `capacity` counts what all three have.
bool Grow(HeaderRecord& header) {
    if (!GrowArray(header.texts, header.capacity) || !GrowArray(header.sizes, header.capacity) ||
        !GrowArray(header.states, header.capacity)) {
        return false;
    }
    header.capacity += kHeaderCapacityStep;
    return true;
}

// Opens a gap at `index`: moves all elements from there up to the capacity by one.
void OpenPlace(HeaderRecord& header, uint32_t index) {
    const uint32_t last = index < header.capacity ? header.capacity - 1 : header.capacity;
    KOR_ASSERT(index <= last);
    FreeLabel(header, last);  // the move overwrites it
    const size_t moved = last - index;
    memmove(header.texts + index + 1, header.texts + index, moved * sizeof(wchar_t*));
    memmove(header.sizes + index + 1, header.sizes + index, moved * sizeof(uint16_t));
    memmove(header.states + index + 1, header.states + index, moved * sizeof(uint8_t));
    header.texts[index] = nullptr;
}

}  // namespace

LRESULT InsertItem(HeaderRecord& header, int index, const HeaderItemDesc* item) {
    if (!item) return -1;
    if (header.count == header.capacity && !Grow(header)) return -1;
    const bool append = index < 0 || static_cast<uint32_t>(index) > header.capacity;
    const uint32_t place = append ? header.count : static_cast<uint32_t>(index);
    ++header.count;
    KOR_ASSERT(place <= header.capacity && header.count <= header.capacity);
    OpenPlace(header, place);
    header.sizes[place] = item->size;
    header.states[place] = 0;
    header.texts[place] = CopyLabel(item->text);
    return header.texts[place] ? static_cast<LRESULT>(place) : -1;
}

LRESULT DeleteItem(HeaderRecord& header, int index) {
    if (IsBadIndex(header, index) || header.count == 0) return 0;
    const auto place = static_cast<uint32_t>(index);
    FreeLabel(header, place);
    if (place < header.count) {
        const size_t moved = header.count - place - 1;
        memmove(header.texts + place, header.texts + place + 1, moved * sizeof(wchar_t*));
        memmove(header.sizes + place, header.sizes + place + 1, moved * sizeof(uint16_t));
        memmove(header.states + place, header.states + place + 1, moved * sizeof(uint8_t));
        header.texts[header.count - 1] = nullptr;  // its label has moved down
    }
    --header.count;
    return 1;
}

LRESULT SetItem(HeaderRecord& header, int index, const HeaderItemDesc* item) {
    if (!item || IsBadIndex(header, index)) return 0;
    wchar_t* label = CopyLabel(item->text);
    if (!label) return 0;
    const auto place = static_cast<uint32_t>(index);
    FreeLabel(header, place);
    header.texts[place] = label;
    header.sizes[place] = item->size;
    return 1;
}

LRESULT SetItemState(HeaderRecord& header, int index, uint32_t state) {
    if (IsBadIndex(header, index)) return 0;
    constexpr uint32_t kKnownStates = HIS_SELECTED | HIS_FRAMED;
    uint8_t& bits = header.states[index];
    bits = state == 0 ? uint8_t{0} : static_cast<uint8_t>(bits | (state & kKnownStates));
    return 1;
}

LRESULT GetItem(const HeaderRecord& header, int index, HeaderItemDesc* item) {
    if (!item || IsBadIndex(header, index)) return 0;
    wchar_t* label = CopyLabel(header.texts[index]);
    if (!label) return 0;
    item->text = label;
    item->size = header.sizes[index];
    return 1;
}

LRESULT GetItemSize(const HeaderRecord& header, int index) {
    return IsBadIndex(header, index) ? -1 : header.sizes[index];
}

}  // namespace kor

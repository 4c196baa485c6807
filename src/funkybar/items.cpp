#include "funkybar/items.h"

#include "base/local_text.h"

namespace kor {

constinit FunkyBarState funkyBar = {};

namespace {

bool SetItemText(FunkyBarItem& item, const wchar_t* text) {
    const auto characters = static_cast<uint32_t>(wcslen(text)) + 1;
    item.text = AllocateLocal<wchar_t>(characters);
    if (!item.text) return false;
    item.textBytes = characters * static_cast<uint32_t>(sizeof(wchar_t));
    memcpy(item.text, text, item.textBytes);
    return true;
}

void FreeItem(FunkyBarItem* item) {
    FreeLocal(item->text);
    LocalFree(item);
}

// A copy of the described item, not in the list yet; null when there is no memory.
FunkyBarItem* NewItem(const FunkyBarItemDesc& description) {
    auto* item = AllocateLocal<FunkyBarItem>(1);
    if (!item) return nullptr;
    if (!SetItemText(*item, description.text)) {
        LocalFree(item);
        return nullptr;
    }
    item->mask = description.mask;
    if (HasField(*item, FBIF_IMAGE)) item->image = description.image;
    if (HasField(*item, FBIF_USERDATA)) item->userData = description.userData;
    if (HasField(*item, FBIF_COLOURS)) {
        item->textColour = description.textColour;
        item->backgroundColour = description.backgroundColour;
    }
    return item;
}

// Compatibility: inside the list an item can be inserted after the first one only, and is refused
// elsewhere; pinned by BarInsertion.FartherInsideIsRefused.
bool LinkItem(FunkyBarItem* item, int32_t index) {
    if (!funkyBar.first) {
        funkyBar.first = item;
        funkyBar.last = item;
    } else if (index == 0) {
        item->next = funkyBar.first;
        funkyBar.first = item;
    } else if (index > funkyBar.count - 1) {
        funkyBar.last->next = item;
        funkyBar.last = item;
    } else if (index == 1) {
        item->next = funkyBar.first->next;
        funkyBar.first->next = item;
    } else {
        return false;
    }
    ++funkyBar.count;
    return true;
}

void UnlinkFirstItem() {
    funkyBar.first = funkyBar.first->next;
    if (!funkyBar.first) funkyBar.last = nullptr;
}

void UnlinkItemAfter(FunkyBarItem* previous) {
    FunkyBarItem* item = previous->next;
    previous->next = item->next;
    if (funkyBar.last == item) funkyBar.last = previous;
}

}  // namespace

FunkyBarItem* ItemAt(int32_t index) {
    if (index < 0) return nullptr;
    FunkyBarItem* item = funkyBar.first;
    while (item && index-- > 0) item = item->next;
    return item;
}

int32_t IndexOfItem(const void* item) {
    int32_t index = 0;
    for (const FunkyBarItem* each = funkyBar.first; each; each = each->next, ++index) {
        if (each == item) return index;
    }
    return kNoItem;
}

int32_t InsertItem(const FunkyBarItemDesc* description) {
    if (!description || !(description->mask & FBIF_TEXT) || !description->text) return kNoItem;
    FunkyBarItem* item = NewItem(*description);
    if (!item) return kNoItem;
    const int32_t countBefore = funkyBar.count;
    if (!LinkItem(item, description->index)) {
        FreeItem(item);
        return kNoItem;
    }
    if (!funkyBar.current) funkyBar.current = funkyBar.first;
    return countBefore;
}

bool ReadItem(FunkyBarItemDesc* description) {
    if (!description) return false;
    const FunkyBarItem* item = ItemAt(description->index);
    if (!item) return false;
    if (description->mask & FBIF_TEXT) {
        if (!description->text) return false;
        // Compatibility: a text that fills the buffer has no terminator; pinned by
        // BarReading.OfATextThatFillsTheBufferLeavesNoTerminator.
        if (description->textCapacity > 0) {
            wcsncpy(description->text, item->text, static_cast<size_t>(description->textCapacity));
        }
    }
    if (description->mask & FBIF_IMAGE) description->image = item->image;
    if (description->mask & FBIF_COLOURS) {
        description->textColour = item->textColour;
        description->backgroundColour = item->backgroundColour;
    }
    if (description->mask & FBIF_USERDATA) description->userData = item->userData;
    return true;
}

bool RemoveItem(int32_t index) {
    FunkyBarItem* item = ItemAt(index);
    if (!item) return false;
    const bool wasFirst = item == funkyBar.first;
    const bool wasCurrent = item == funkyBar.current;
    if (wasFirst) {
        UnlinkFirstItem();
    } else {
        UnlinkItemAfter(ItemAt(index - 1));
    }
    --funkyBar.count;
    // Compatibility: only the record is freed, the text stays allocated; pinned by
    // BarDeletion.FreesTheRecordAlone.
    LocalFree(item);
    if (wasCurrent) funkyBar.current = funkyBar.first;
    // Compatibility: when the first item goes, the bar is also repainted if the next one was
    // current already; pinned by BarDeletion.OfTheFirstItemBeforeTheCurrentOneRepaints.
    return wasCurrent || (wasFirst && funkyBar.current == funkyBar.first);
}

bool RemoveAllItems() {
    FunkyBarItem* item = funkyBar.first;
    if (!item) return false;
    funkyBar.first = nullptr;
    funkyBar.last = nullptr;
    funkyBar.current = nullptr;
    funkyBar.count = 0;
    while (item) {
        FunkyBarItem* next = item->next;
        FreeItem(item);
        item = next;
    }
    return true;
}

}  // namespace kor

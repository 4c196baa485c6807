// The function bar of the process: its items, the one that is shown, and the objects it draws with.
#pragma once

#include <korcontrols/funkybar.h>

#include "platform/platform.h"

namespace kor {

// An item, on the local heap, in a list in display order.
struct FunkyBarItem {
    uint32_t mask;       // FBIF_..., as the host gave it
    wchar_t* text;       // own copy on the local heap, never null
    int32_t image;       // index into FunkyBarState::itemImages
    uint32_t textBytes;  // terminator included
    uint32_t userData;
    COLORREF textColour;
    COLORREF backgroundColour;
    FunkyBarItem* next;
};

// One per process, shared by all its bars.
struct FunkyBarState {
    FunkyBarItem* first;
    FunkyBarItem* last;
    int32_t count;
    FunkyBarItem* current;   // shown in the bar; one of the list, or null
    HIMAGELIST itemImages;   // the host's, never destroyed here; outlives the window
    HIMAGELIST arrowImages;  // from WM_CREATE to WM_DESTROY
    HFONT font;              // likewise
    bool menuOpen;           // a bar's menu is open
};

extern FunkyBarState funkyBar;

static_assert(sizeof(void*) != 4 || sizeof(FunkyBarItem) == 32);
static_assert(sizeof(void*) != 4 || sizeof(FunkyBarItemDesc) == 32);
static_assert(sizeof(void*) != 4 || offsetof(FunkyBarItemDesc, userData) == 28);
static_assert(sizeof(void*) != 4 || sizeof(FunkyBarNotification) == 16);
static_assert(sizeof(void*) != 4 || offsetof(FunkyBarNotification, index) == 12);

}  // namespace kor

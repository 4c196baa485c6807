// The state of header strips: one record per window, in a module-wide list, and the drag that all
// strips share, since only one pointer can drag at a time.
#pragma once

#include "base/records.h"
#include "platform/platform.h"

namespace kor {

// In the module's list from WM_CREATE to WM_DESTROY. The three item arrays always have one element
// more than `capacity` says: an index equal to the count is valid, even when the strip is full.
struct HeaderRecord {
    HWND window;     // the key of the list
    HWND parent;     // receives all notifications
    HDC dc;          // of the window, kept for its life; everything is painted with it
    uint32_t count;  // items in use
    uint32_t capacity;
    wchar_t** texts;  // labels, each a local-heap block or null
    uint16_t* sizes;  // pixels along the strip
    uint8_t* states;  // HIS_ bits
    uint32_t style;   // the window style at creation
    HeaderRecord* next;
    RecordLife life;
};

static_assert(sizeof(void*) != 4 || offsetof(HeaderRecord, sizes) == 24);
static_assert(sizeof(void*) != 4 || offsetof(HeaderRecord, next) == 36);

constexpr uint32_t kHeaderInitialCapacity = 10;
constexpr uint32_t kHeaderCapacityStep = 25;

// A drag and its bounds, in pixels along the strip; indexes are -1 for none.
// Compatibility: lastHoveredItem outlives the drag; pinned by
// HeaderPress.StaysSilentOnTheItemWhereTheLastDragEnded.
struct HeaderDrag {
    const HeaderRecord* strip = nullptr;  // where the button went down; null without a drag
    int maximumRowSize = 600;
    int maximumColumnSize = 600;
    int resizeItem = -1;                       // whose border is dragged
    int pressAnchor = -1;                      // the item that was pressed
    int lastHoveredItem = -1;                  // the item reported last
    int dragPosition = 0;                      // last pointer position while resizing
    void (*resizeLost)(HWND strip) = nullptr;  // see WhenHeaderResizeIsLost
};

extern HeaderDrag headerDrag;

constexpr int kMinimumItemSize = 3;

// What every strip paints with; created for the first strip, deleted with the last.
struct HeaderPaintObjects {
    HPEN framePen;
    HBRUSH faceBrush;
};

extern HeaderPaintObjects headerPaint;

// The record of a window, or null.
HeaderRecord* FindHeaderRecord(HWND window);

// Creates the record of a new window and appends it to the list; null when there is no memory.
HeaderRecord* CreateHeaderRecord(const CREATESTRUCTW& creation, HWND window);

// WM_DESTROY: removes the record from the list and releases its DC.
void RetireHeaderRecord(HeaderRecord& record);

// Frees the record and everything it holds.
void FreeRecord(HeaderRecord* record);

bool IsVertical(const HeaderRecord& record);

// Sum of the sizes of the items before `index`.
int ItemStart(const HeaderRecord& record, uint32_t index);

}  // namespace kor

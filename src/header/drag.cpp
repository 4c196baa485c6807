// One press or border drag is tracked at a time, in `headerDrag`. The strip that was pressed has
// the capture, so moves and the release go to it. If another strip receives them anyway, an item
// that it does not have is ignored. A drag ends with the release, with the loss of the capture, or
// with the strip.
#include "header/drag.h"

#include <korcontrols/header.h>

#include <algorithm>

#include "base/windows_helpers.h"
#include "header/hit_test.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

constexpr int kSizeBoundMargin = 10;

void PostToParent(const HeaderRecord& header, UINT notification, int lowWord, int highWord) {
    if (header.life.retired) return;  // the parent could no longer query the sender
    PostMessageW(header.parent, notification, reinterpret_cast<WPARAM>(header.window),
                 WordPair(lowWord, highWord));
}

HeaderHit HitTest(const HeaderRecord& header, int position) {
    return HitTestHeader(header.sizes, header.count, position);
}

bool HasItem(const HeaderRecord& header, int index) {
    return index >= 0 && static_cast<uint32_t>(index) < header.count;
}

// Invalidates from a position to the strip's end.
void InvalidateFrom(const HeaderRecord& header, int start) {
    RECT area = ClientRectOf(header.window);
    (IsVertical(header) ? area.top : area.left) = start;
    InvalidateRect(header.window, &area, TRUE);
}

int ClientExtent(const HeaderRecord& header) {
    const RECT client = ClientRectOf(header.window);
    return IsVertical(header) ? client.bottom : client.right;
}

void ResizeTo(HeaderRecord& header, int position) {
    if (!HasItem(header, headerDrag.resizeItem) || position > ClientExtent(header)) return;
    const auto item = static_cast<uint32_t>(headerDrag.resizeItem);
    const int maximum =
        IsVertical(header) ? headerDrag.maximumRowSize : headerDrag.maximumColumnSize;
    const int size = DraggedSize(header.sizes[item], headerDrag.dragPosition, position, maximum);
    header.sizes[item] = static_cast<uint16_t>(size);
    headerDrag.dragPosition = position;
    const int start = ItemStart(header, item);
    InvalidateFrom(header, start);
    PostToParent(header, HCN_ITEMRESIZING, start, start + size);
}

void PressMovesTo(const HeaderRecord& header, int position) {
    const int item = HitTest(header, position).item;
    if (item < 0 || item == headerDrag.lastHoveredItem) return;
    headerDrag.lastHoveredItem = item;
    PostToParent(header, HCN_ITEMCLICK, headerDrag.pressAnchor, item);
}

// The strip is set before the capture is taken: the window that loses it may do anything.
void BeginDrag(const HeaderRecord& header) {
    headerDrag.strip = &header;
    SetCapture(header.window);
}

void ForgetDrag() {
    headerDrag.strip = nullptr;
    headerDrag.resizeItem = -1;
    headerDrag.pressAnchor = -1;
}

void EndResize(const HeaderRecord& header) {
    const int resized = headerDrag.resizeItem;
    ForgetDrag();
    ReleaseCapture();
    if (!HasItem(header, resized)) return;
    const auto item = static_cast<uint32_t>(resized);
    PostToParent(header, HCN_ITEMRESIZED, resized,
                 UnitsOfDraggedSize(header.sizes[item], zoomLevel));
    // Compatibility: the start is multiplied by the bare zoom level and so is usually too far
    // along; the parent repaints the strip anyway; pinned by
    // HeaderResize.InvalidatesFromFarBehindTheItemWhenLetGo.
    InvalidateFrom(header,
                   static_cast<int>(zoomLevel * static_cast<uint32_t>(ItemStart(header, item))));
}

}  // namespace

int DraggedSize(int size, int from, int to, int maximum) {
    if (to <= from) return std::max(size - (from - to), kMinimumItemSize);
    return std::min(size + (to - from), maximum);
}

int UnitsOfDraggedSize(int pixels, uint32_t zoom) {
    return static_cast<int>((pixels + 0.5) * 4.0 / zoom);
}

void UpdateSizeBounds(const HeaderRecord& header, int clientWidth, int clientHeight) {
    // Strips are created without a size; the bound must not be below the minimum size.
    if (IsVertical(header)) {
        headerDrag.maximumRowSize = std::max(clientHeight - kSizeBoundMargin, kMinimumItemSize);
    } else {
        headerDrag.maximumColumnSize = std::max(clientWidth - kSizeBoundMargin, kMinimumItemSize);
    }
}

LRESULT OnHeaderButtonDown(HeaderRecord& header, int position) {
    const HeaderHit hit = HitTest(header, position);
    headerDrag.resizeItem = -1;
    headerDrag.pressAnchor = -1;
    if (hit.onBorder) {
        // Compatibility: the border of item -1, the strip's first pixels, takes the capture as
        // well; nothing is dragged then, and the release does not release the capture; pinned by
        // HeaderPress.AtTheStripsBeginTakesTheCaptureForGood.
        headerDrag.resizeItem = hit.borderItem;
        headerDrag.dragPosition = position;
        BeginDrag(header);
    } else if (hit.item >= 0 && header.parent) {
        headerDrag.pressAnchor = hit.item;
        BeginDrag(header);
        PostToParent(header, HCN_ITEMCLICK, hit.item, hit.item);
    }
    return 0;
}

LRESULT OnHeaderPointerMove(HeaderRecord& header, int position) {
    if (headerDrag.resizeItem != -1) {
        ResizeTo(header, position);
    } else if (headerDrag.pressAnchor != -1) {
        PressMovesTo(header, position);
    }
    return 0;
}

LRESULT OnHeaderButtonUp(HeaderRecord& header) {
    if (headerDrag.resizeItem != -1) {
        EndResize(header);
    } else if (headerDrag.pressAnchor != -1) {
        ForgetDrag();
        ReleaseCapture();
    }
    return 0;
}

void LoseHeaderDrag(const HeaderRecord& header) {
    if (headerDrag.strip != &header) return;
    const bool wasResizing = headerDrag.resizeItem != -1;
    ForgetDrag();
    if (wasResizing && headerDrag.resizeLost) headerDrag.resizeLost(header.window);
}

void EndHeaderDrag(const HeaderRecord& header) {
    if (headerDrag.strip == &header) ForgetDrag();
}

}  // namespace kor

#include "header_pointer.h"

#include <korcontrols/header.h>

#include <cstdlib>

namespace workbook {

namespace {

constexpr int kGrip = 6;  // pixels on either side of a border in which a press takes it

bool IsOnBorder(HWND header, int position) {
    const int count = KorHeader_GetItemCount(header);
    int edge = 0;
    for (int item = 0; item < count && edge < position + kGrip; ++item) {
        edge += KorHeader_GetItemSize(header, item);
        if (std::abs(edge - position) < kGrip) return true;
    }
    return false;
}

}  // namespace

LPCWSTR HeaderPointer(HWND header) {
    POINT pointer = {};
    GetCursorPos(&pointer);
    ScreenToClient(header, &pointer);
    const bool isVertical = (GetWindowLongPtrW(header, GWL_STYLE) & HCS_VERTICAL) != 0;
    if (!IsOnBorder(header, isVertical ? pointer.y : pointer.x)) return IDC_ARROW;
    return isVertical ? IDC_SIZENS : IDC_SIZEWE;
}

}  // namespace workbook

// The pointer's shape over the grid's headers, which have none of their own.
#pragma once

#include <windows.h>

namespace workbook {

// A double arrow over a border that can be dragged, otherwise the arrow.
LPCWSTR HeaderPointer(HWND header);

}  // namespace workbook

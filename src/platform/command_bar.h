// The calls that fill a host's command bar. On the desktop the bar is a toolbar; a bar that
// supports a call itself is sent that call.
#pragma once

#include "platform/platform.h"

#include <commctrl.h>

namespace kor {

// Adds a bitmap resource of `imageCount` images side by side, in the bar's own image size.
void AddCommandBarBitmap(HWND bar, HINSTANCE instance, int bitmapId, int imageCount);

// Appends buttons.
void AddCommandBarButtons(HWND bar, const TBBUTTON* buttons, int count);

// Inserts a combo box at a button position; the buttons from there on move right. The combo box is
// a child of the bar and belongs to it. Null when it could not be created.
HWND InsertCommandBarComboBox(HWND bar, HINSTANCE instance, int width, DWORD style, UINT id,
                              int position);

// Sets the bar's tooltip texts. The bar keeps the array and reads it when it shows a tooltip.
void SetCommandBarToolTips(HWND bar, int count, const wchar_t* const* texts);

}  // namespace kor

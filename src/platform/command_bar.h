// The calls that fill a host's command bar. On the desktop the bar is a toolbar; wherever such a
// bar understands a call by itself, that is what happens.
#pragma once

#include "platform/platform.h"

#include <commctrl.h>

namespace kor {

// Adds the images of a bitmap resource, `imageCount` of them side by side, in the bar's own size.
void AddCommandBarBitmap(HWND bar, HINSTANCE instance, int bitmapId, int imageCount);

// Adds buttons behind those that there are.
void AddCommandBarButtons(HWND bar, const TBBUTTON* buttons, int count);

// Puts a combo box at a button position; what stands there moves to the right. The combo box is a
// child of the bar and belongs to it. Null when it could not be made.
HWND InsertCommandBarComboBox(HWND bar, HINSTANCE instance, int width, DWORD style, UINT id,
                              int position);

// Hands the bar an array of tooltip texts, which it keeps and reads when it shows one.
void SetCommandBarToolTips(HWND bar, int count, const wchar_t* const* texts);

}  // namespace kor

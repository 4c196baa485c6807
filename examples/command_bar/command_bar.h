// A command bar for desktop hosts: a toolbar that also understands the one message that command
// bars have and toolbars lack, by which SetupGraphCommandBar hands over the tooltip texts.
#pragma once

#include <windows.h>

namespace command_bar {

// Sent to a bar: wParam count, lParam LPCWSTR*. The bar keeps the array and reads it whenever it
// shows a tooltip. Text k belongs to the k-th button or combo box from the left; separators that
// only make room do not count.
constexpr UINT kSetToolTips = WM_USER + 81;

// An empty bar along the upper edge of its parent, with room for images of 16 by 16 pixels. Buttons
// and combo boxes send WM_COMMAND to the parent, which hands its WM_SIZE on to the bar.
HWND Create(HWND parent, HINSTANCE instance, int id);

}  // namespace command_bar

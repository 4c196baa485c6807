// The command bar of the common controls, which supports each of the calls itself.
#include "platform/command_bar.h"

namespace kor {

namespace {

extern "C" {
// The last two are the size of an image in pixels; 0 for the default, 16.
int CommandBar_AddBitmap(HWND bar, HINSTANCE instance, int bitmapId, int imageCount, int width,
                         int height);
HWND CommandBar_InsertComboBox(HWND bar, HINSTANCE instance, int width, UINT style, WORD id,
                               WORD position);
}

constexpr UINT kAddButtons = WM_USER + 20;   // TB_ADDBUTTONS, which has only this number here
constexpr UINT kSetToolTips = WM_USER + 81;  // TB_SETTOOLTIPS, another message on the desktop

}  // namespace

void AddCommandBarBitmap(HWND bar, HINSTANCE instance, int bitmapId, int imageCount) {
    CommandBar_AddBitmap(bar, instance, bitmapId, imageCount, 0, 0);
}

void AddCommandBarButtons(HWND bar, const TBBUTTON* buttons, int count) {
    SendMessageW(bar, kAddButtons, static_cast<WPARAM>(count), reinterpret_cast<LPARAM>(buttons));
}

HWND InsertCommandBarComboBox(HWND bar, HINSTANCE instance, int width, DWORD style, UINT id,
                              int position) {
    return CommandBar_InsertComboBox(bar, instance, width, style, static_cast<WORD>(id),
                                     static_cast<WORD>(position));
}

void SetCommandBarToolTips(HWND bar, int count, const wchar_t* const* texts) {
    SendMessageW(bar, kSetToolTips, static_cast<WPARAM>(count), reinterpret_cast<LPARAM>(texts));
}

}  // namespace kor

#include "command_bar.h"

#include <commctrl.h>

namespace command_bar {

namespace {

constexpr int kImageSize = 16;

// By it a toolbar asks for the tooltip texts.
constexpr wchar_t kToolTipsProperty[] = L"korcontrols tooltips";

// What a bar remembers, in its user data until WM_NCDESTROY.
struct ToolTips {
    WNDPROC toolbar;  // the procedure that ours stands before
    const wchar_t* const* texts;
    int count;
};

TBBUTTON ButtonAt(HWND bar, int position) {
    TBBUTTON button = {};
    SendMessageW(bar, TB_GETBUTTON, static_cast<WPARAM>(position),
                 reinterpret_cast<LPARAM>(&button));
    return button;
}

// The combo box over a separator; null for the other buttons.
HWND ComboOf(HWND bar, const TBBUTTON& button) {
    if ((button.fsStyle & TBSTYLE_SEP) == 0 || !button.idCommand) return nullptr;
    return GetDlgItem(bar, button.idCommand);
}

// Calls visit(button, slot) for everything that has a tooltip text, from the left.
template <typename Visit>
void VisitSlots(HWND bar, Visit visit) {
    const auto count = static_cast<int>(SendMessageW(bar, TB_BUTTONCOUNT, 0, 0));
    int slot = 0;
    for (int position = 0; position < count; ++position) {
        const TBBUTTON button = ButtonAt(bar, position);
        const bool isSpace = (button.fsStyle & TBSTYLE_SEP) != 0 && !ComboOf(bar, button);
        if (!isSpace) visit(button, slot++);
    }
}

const wchar_t* TextOf(HWND bar, const ToolTips& tips, int command) {
    const wchar_t* text = nullptr;
    VisitSlots(bar, [&](const TBBUTTON& button, int slot) {
        if (button.idCommand == command && slot < tips.count) text = tips.texts[slot];
    });
    return text;
}

// The tooltip window asks for a text. It knows a button by its command, a combo box by its window.
bool AnswerTextRequest(HWND bar, const ToolTips& tips, NMTTDISPINFOW& request) {
    const bool isWindow = (request.uFlags & TTF_IDISHWND) != 0;
    const int command = isWindow ? GetDlgCtrlID(reinterpret_cast<HWND>(request.hdr.idFrom))
                                 : static_cast<int>(request.hdr.idFrom);
    const wchar_t* text = TextOf(bar, tips, command);
    if (!text) return false;
    request.hinst = nullptr;
    request.lpszText = const_cast<wchar_t*>(text);
    return true;
}

// The toolbar tells its tooltip window of the buttons, not of windows over separators.
void AddComboToolTips(HWND bar) {
    const auto window = reinterpret_cast<HWND>(SendMessageW(bar, TB_GETTOOLTIPS, 0, 0));
    VisitSlots(bar, [&](const TBBUTTON& button, int) {
        HWND combo = ComboOf(bar, button);
        if (!combo) return;
        TTTOOLINFOW tool = {};
        tool.cbSize = TTTOOLINFOW_V1_SIZE;
        tool.uFlags = TTF_IDISHWND | TTF_SUBCLASS;
        tool.hwnd = bar;
        tool.uId = reinterpret_cast<UINT_PTR>(combo);
        tool.lpszText = LPSTR_TEXTCALLBACKW;
        SendMessageW(window, TTM_DELTOOLW, 0, reinterpret_cast<LPARAM>(&tool));
        SendMessageW(window, TTM_ADDTOOLW, 0, reinterpret_cast<LPARAM>(&tool));
    });
}

LRESULT CALLBACK BarProc(HWND bar, UINT message, WPARAM wParam, LPARAM lParam) {
    auto* tips = reinterpret_cast<ToolTips*>(GetWindowLongPtrW(bar, GWLP_USERDATA));
    const WNDPROC toolbar = tips->toolbar;
    switch (message) {
    case kSetToolTips:
        tips->count = lParam ? static_cast<int>(wParam) : 0;
        tips->texts = reinterpret_cast<const wchar_t* const*>(lParam);
        AddComboToolTips(bar);
        return TRUE;
    case WM_NOTIFY:
        if (reinterpret_cast<NMHDR*>(lParam)->code == TTN_GETDISPINFOW &&
            AnswerTextRequest(bar, *tips, *reinterpret_cast<NMTTDISPINFOW*>(lParam))) {
            return 0;
        }
        break;
    case WM_NCDESTROY:
        RemovePropW(bar, kToolTipsProperty);
        SetWindowLongPtrW(bar, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(toolbar));
        delete tips;
        break;
    default: break;
    }
    return CallWindowProcW(toolbar, bar, message, wParam, lParam);
}

}  // namespace

HWND Create(HWND parent, HINSTANCE instance, int id) {
    InitCommonControls();
    HWND bar = CreateWindowExW(
        0, TOOLBARCLASSNAMEW, L"",
        WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN | TBSTYLE_FLAT | TBSTYLE_TOOLTIPS, 0, 0, 0, 0,
        parent, reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), instance, nullptr);
    if (!bar) return nullptr;
    SendMessageW(bar, TB_BUTTONSTRUCTSIZE, sizeof(TBBUTTON), 0);
    SendMessageW(bar, TB_SETBITMAPSIZE, 0, MAKELPARAM(kImageSize, kImageSize));
    auto* tips = new ToolTips{};
    SetWindowLongPtrW(bar, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(tips));
    tips->toolbar = reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(bar, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(BarProc)));
    SetPropW(bar, kToolTipsProperty, bar);  // from here on the message is answered
    return bar;
}

}  // namespace command_bar

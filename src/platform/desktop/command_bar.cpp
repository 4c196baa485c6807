// A command bar on the desktop's toolbar: a combo box lies over a separator that leaves room for
// it. The separator carries the combo box's id and, as its data, the window handle.
#include "platform/command_bar.h"

namespace kor {

namespace {

constexpr int kGapBesideCombo = 4;   // pixels between a combo box and each of its neighbours
constexpr int kDroppedHeight = 150;  // pixels, of a combo box with its list open
constexpr UINT kSetToolTips = WM_USER + 81;
constexpr wchar_t kToolTipsProperty[] = L"korcontrols tooltips";
constexpr int kClassNameCapacity = 32;

int ButtonCount(HWND bar) { return static_cast<int>(SendMessageW(bar, TB_BUTTONCOUNT, 0, 0)); }

// The combo box over a separator; null for any other button.
HWND ComboOver(HWND bar, int position) {
    TBBUTTON button = {};
    if (!SendMessageW(bar, TB_GETBUTTON, static_cast<WPARAM>(position),
                      reinterpret_cast<LPARAM>(&button))) {
        return nullptr;
    }
    if ((button.fsStyle & TBSTYLE_SEP) == 0 || !button.dwData) return nullptr;
    const auto combo = reinterpret_cast<HWND>(button.dwData);
    return GetParent(combo) == bar ? combo : nullptr;
}

void PlaceOver(HWND bar, int position, HWND combo) {
    RECT gap = {};
    SendMessageW(bar, TB_GETITEMRECT, static_cast<WPARAM>(position),
                 reinterpret_cast<LPARAM>(&gap));
    RECT closed = {};
    GetWindowRect(combo, &closed);
    const int top = gap.top + (gap.bottom - gap.top - (closed.bottom - closed.top)) / 2;
    SetWindowPos(combo, nullptr, gap.left + kGapBesideCombo, top, 0, 0,
                 SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

// An insertion moves everything to the right of it.
void PlaceAllCombos(HWND bar) {
    const int count = ButtonCount(bar);
    for (int position = 0; position < count; ++position) {
        if (HWND combo = ComboOver(bar, position)) PlaceOver(bar, position, combo);
    }
}

void InsertGap(HWND bar, int position, int width, UINT id, HWND combo) {
    TBBUTTON gap = {};
    gap.iBitmap = width;  // the width, for a separator
    gap.idCommand = static_cast<int>(id);
    gap.dwData = reinterpret_cast<DWORD_PTR>(combo);
    gap.fsState = TBSTATE_ENABLED;
    gap.fsStyle = TBSTYLE_SEP;
    SendMessageW(bar, TB_INSERTBUTTONW, static_cast<WPARAM>(position),
                 reinterpret_cast<LPARAM>(&gap));
}

HWND CreateCombo(HWND bar, HINSTANCE instance, int width, DWORD style, UINT id) {
    HWND combo = CreateWindowExW(
        0, L"COMBOBOX", L"", WS_CHILD | WS_VISIBLE | style, 0, 0, width, kDroppedHeight, bar,
        reinterpret_cast<HMENU>(static_cast<UINT_PTR>(id)), instance, nullptr);
    if (!combo) return nullptr;
    SendMessageW(combo, WM_SETFONT, reinterpret_cast<WPARAM>(GetStockObject(DEFAULT_GUI_FONT)), 0);
    return combo;
}

bool IsToolbar(HWND window) {
    wchar_t name[kClassNameCapacity] = {};
    GetClassNameW(window, name, kClassNameCapacity);
    return lstrcmpiW(name, TOOLBARCLASSNAMEW) == 0;
}

}  // namespace

void AddCommandBarBitmap(HWND bar, HINSTANCE instance, int bitmapId, int imageCount) {
    TBADDBITMAP images = {instance, static_cast<UINT_PTR>(bitmapId)};
    SendMessageW(bar, TB_ADDBITMAP, static_cast<WPARAM>(imageCount),
                 reinterpret_cast<LPARAM>(&images));
}

void AddCommandBarButtons(HWND bar, const TBBUTTON* buttons, int count) {
    SendMessageW(bar, TB_ADDBUTTONSW, static_cast<WPARAM>(count),
                 reinterpret_cast<LPARAM>(buttons));
}

HWND InsertCommandBarComboBox(HWND bar, HINSTANCE instance, int width, DWORD style, UINT id,
                              int position) {
    HWND combo = CreateCombo(bar, instance, width, style, id);
    if (!combo) return nullptr;
    InsertGap(bar, position, width + 2 * kGapBesideCombo, id, combo);
    PlaceAllCombos(bar);
    return combo;
}

// The toolbar's own procedure takes the number for TB_INSERTMARKHITTEST and the count for a
// pointer, which it reads through. Whether a host's subclass intercepts the message before that
// cannot be seen, so the host says so with a window property.
void SetCommandBarToolTips(HWND bar, int count, const wchar_t* const* texts) {
    if (IsToolbar(bar) && !GetPropW(bar, kToolTipsProperty)) return;
    SendMessageW(bar, kSetToolTips, static_cast<WPARAM>(count), reinterpret_cast<LPARAM>(texts));
}

}  // namespace kor

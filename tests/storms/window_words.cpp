#include "storms/window_words.h"

namespace kortest {
namespace {

// Bits that change what a window is to the system or to the library; the usual ones stay.
DWORD OddStyle(int number) {
    const auto bits = static_cast<DWORD>(number);
    return WS_CHILD | WS_VISIBLE |
           (bits & (WS_BORDER | WS_HSCROLL | WS_VSCROLL | WS_DISABLED | WS_CLIPCHILDREN |
                    WS_CLIPSIBLINGS | HCS_VERTICAL));
}

// The system's own views wait for the pointer in a loop when they are pressed.
template <Kind kind>
constexpr bool kIsSystems = kind == kList || kind == kTree;

void SetShift(bool isDown) {
    BYTE keys[256];
    if (!GetKeyboardState(keys)) return;
    keys[VK_SHIFT] = isDown ? 0x80 : 0;
    SetKeyboardState(keys);
}

void Shift(Stage&, const Arguments& a) { SetShift(a[0] != 0); }

void Pump(Stage& stage, const Arguments&) { stage.pump(); }

void Paint(Stage& stage, const Arguments& a) { stage.paintingManner = a[0]; }

// Another window takes the pointer away from whoever has it, or it is let go.
void LoseCapture(Stage& stage, const Arguments& a) {
    if (a[0] & 1) {
        SetCapture(stage.parent(4 + (a[0] >> 1 & 1)));
    } else {
        ReleaseCapture();
    }
}

void LoseFocus(Stage& stage, const Arguments& a) { SetFocus(stage.parent(4 + a[0])); }

// As a modal box does: the host is disabled, focus and capture are elsewhere, messages go on.
void Modal(Stage& stage, const Arguments& a) {
    HWND host = stage.parent(4 + a[0]);
    HWND other = stage.parent(5 - a[0]);
    EnableWindow(host, FALSE);
    ReleaseCapture();
    SetFocus(other);
    stage.pump();
    EnableWindow(host, TRUE);
    SetFocus(host);
}

// Answers the next message box as soon as it is there.
LRESULT CALLBACK OnHook(int code, WPARAM wParam, LPARAM lParam) {
    if (code == HCBT_ACTIVATE) PostMessageW(reinterpret_cast<HWND>(wParam), WM_COMMAND, IDOK, 0);
    return CallNextHookEx(nullptr, code, wParam, lParam);
}

void Box(Stage& stage, const Arguments& a) {
    HWND host = stage.parent(4 + a[0]);
    HHOOK hook = SetWindowsHookExW(WH_CBT, OnHook, nullptr, GetCurrentThreadId());
    MessageBoxW(host, L"A storm", L"A storm", MB_OK);
    UnhookWindowsHookEx(hook);
}

void DestroyHost(Stage& stage, const Arguments& a) { DestroyWindow(stage.parent(4 + a[0])); }

}  // namespace

const Word kHostWords[] = {
    {"shift", 10, "b", Shift},
    {"pump", 60, "", Pump},
    {"painting", 6, "i", Paint},
    {"lose_capture", 12, "i", LoseCapture},
    {"lose_focus", 6, "b", LoseFocus},
    {"modal", 2, "b", Modal},
    {"destroy_host", 1, "b", DestroyHost},
    {"box", 1, "b", Box},
};
const size_t kHostWordCount = std::size(kHostWords);

template <Kind kind>
void WindowWords<kind>::create(Stage& stage, const Arguments& a) {
    const bool isSecondGrid = kind == kGrid && (a[4] & 63) == 0;
    stage.create(kind, kind != kGrid || isSecondGrid ? a[0] : 0, a[1], a[2], a[3],
                 a[5] ? OddStyle(a[4]) : OddStyle(a[4] & HCS_VERTICAL));
}

template <Kind kind>
void WindowWords<kind>::destroy(Stage& stage, const Arguments& a) {
    HWND window = stage.window(kind, a[0]);
    if (window && stage.isLive(window)) DestroyWindow(window);
}

template <Kind kind>
void WindowWords<kind>::destroyParent(Stage& stage, const Arguments& a) {
    HWND window = stage.window(kind, a[0]);
    if (window && stage.isLive(window)) DestroyWindow(GetParent(window));
}

template <Kind kind>
void WindowWords<kind>::destroyMessage(Stage& stage, const Arguments& a) {
    HWND window = stage.window(kind, a[0]);
    if (!window || !stage.isLive(window) || kind == kList || kind == kTree) return;
    stage.markWithoutRecord(window);
    SendMessageW(window, WM_DESTROY, 0, 0);
}

template <Kind kind>
void WindowWords<kind>::resize(Stage& stage, const Arguments& a) {
    SetWindowPos(stage.ensure(kind, a[0]), nullptr, 0, 0, a[1], a[2],
                 SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
}

template <Kind kind>
void WindowWords<kind>::show(Stage& stage, const Arguments& a) {
    ShowWindow(stage.ensure(kind, a[0]), a[1] ? SW_SHOW : SW_HIDE);
}

template <Kind kind>
void WindowWords<kind>::enable(Stage& stage, const Arguments& a) {
    EnableWindow(stage.ensure(kind, a[0]), a[1]);
}

template <Kind kind>
void WindowWords<kind>::paint(Stage& stage, const Arguments& a) {
    HWND window = stage.ensure(kind, a[0]);
    if (a[1]) InvalidateRect(window, nullptr, TRUE);
    UpdateWindow(window);
}

template <Kind kind>
void WindowWords<kind>::erase(Stage& stage, const Arguments& a) {
    HWND window = stage.ensure(kind, a[0]);
    HDC dc = GetDC(window);
    stage.send(window, WM_ERASEBKGND, reinterpret_cast<WPARAM>(dc), 0);
    ReleaseDC(window, dc);
}

template <Kind kind>
void WindowWords<kind>::focus(Stage& stage, const Arguments& a) {
    SetFocus(stage.ensure(kind, a[0]));
}

template <Kind kind>
void WindowWords<kind>::capture(Stage& stage, const Arguments& a) {
    HWND window = stage.ensure(kind, a[0]);
    switch (a[1] & 3) {
    case 0: SetCapture(window); break;
    case 1: ReleaseCapture(); break;
    case 2: stage.send(window, WM_CANCELMODE, 0, 0); break;
    default: SetCapture(stage.parent(4)); break;
    }
}

template <Kind kind>
void WindowWords<kind>::reparent(Stage& stage, const Arguments& a) {
    HWND window = stage.ensure(kind, a[0]);
    HWND parent = stage.parent(a[1]);
    if (parent && parent != window && !IsChild(window, parent)) SetParent(window, parent);
}

template <Kind kind>
void WindowWords<kind>::press(Stage& stage, const Arguments& a) {
    if (kIsSystems<kind>) return;
    const WPARAM keys = MK_LBUTTON | (a[3] & 1 ? MK_SHIFT : 0);
    const UINT message = (a[3] & 0x70) == 0x70 ? WM_LBUTTONDBLCLK : WM_LBUTTONDOWN;
    stage.send(stage.ensure(kind, a[0]), message, keys, PairOf(a[1], a[2]));
}

template <Kind kind>
void WindowWords<kind>::move(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kind, a[0]), WM_MOUSEMOVE, a[3] ? MK_LBUTTON : 0, PairOf(a[1], a[2]));
}

template <Kind kind>
void WindowWords<kind>::release(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kind, a[0]), WM_LBUTTONUP, a[3] ? MK_SHIFT : 0, PairOf(a[1], a[2]));
}

// Numbers, never pointers: where a message has one in lParam it is null here.
template <Kind kind>
void WindowWords<kind>::wild(Stage& stage, const Arguments& a) {
    HWND window = stage.ensure(kind, a[0]);
    const UINT message = MessageOf(a[1]);
    const bool hasPointer = message == WM_CREATE || message == WM_GETDLGCODE;
    const bool isPress = message >= WM_LBUTTONDOWN && message <= WM_RBUTTONDBLCLK;
    // The system's own views cannot be created without a description.
    if (kIsSystems<kind> && (message == WM_CREATE || isPress)) return;
    // A number that is nearly a DC or a region is followed by the system itself.
    const bool hasDrawing =
        message == WM_PAINT || message == WM_ERASEBKGND || message == WM_NCPAINT;
    // A size that no screen has takes as long to draw as it has pixels.
    constexpr int32_t kScreenSizes = 0x07FF07FF;
    const int32_t number = message == WM_SIZE ? a[3] & kScreenSizes : a[3];
    stage.send(window, message, hasDrawing ? 0 : WideWord(a[2]),
               hasPointer ? 0 : static_cast<LPARAM>(number));
}

template struct WindowWords<kStrip>;
template struct WindowWords<kGrid>;
template struct WindowWords<kChart>;
template struct WindowWords<kLegend>;
template struct WindowWords<kTip>;
template struct WindowWords<kBar>;
template struct WindowWords<kList>;
template struct WindowWords<kTree>;

}  // namespace kortest

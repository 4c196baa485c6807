#include "message_routing.h"

#include "grid_host.h"
#include "resource.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

namespace {

bool IsDown(int key) { return GetKeyState(key) < 0; }

// Ctrl+A in the equation bar: its edit control need not know the key.
bool SelectAllTyping(const MSG& message) {
    if (message.message != WM_KEYDOWN || message.wParam != 'A') return false;
    if (!IsDown(VK_CONTROL) || IsDown(VK_MENU) || IsDown(VK_SHIFT)) return false;
    SendMessageW(message.hwnd, EM_SETSEL, 0, -1);
    return true;
}

bool IsAccelerator(const Workbook& workbook, HACCEL keys, const MSG& message) {
    MSG copy = message;
    return TranslateAcceleratorW(workbook.window, keys, &copy) != 0;
}

// The wheel turns what is under the pointer: the panel's lists, otherwise the sheet. An open combo
// box keeps it.
HWND WheelTarget(const Workbook& workbook, const MSG& message) {
    const POINT place = {static_cast<short>(LOWORD(message.lParam)),
                         static_cast<short>(HIWORD(message.lParam))};
    const HWND window = WindowFromPoint(place);
    if (IsInSidePanel(workbook, window)) return window;
    if (IsChild(workbook.chart.bar.window, message.hwnd)) return message.hwnd;
    return workbook.window;
}

}  // namespace

bool HandleBeforeDispatch(Workbook& workbook, const MSG& message) {
    switch (message.message) {
    case WM_MOUSEWHEEL:
        SendMessageW(WheelTarget(workbook, message), message.message, message.wParam,
                     message.lParam);
        return true;
    case WM_LBUTTONDOWN:
        // The headers leave the focus where it is, and change the current cell a moment later: what
        // is being typed must be stored before, in the cell that it was typed for.
        if (IsGridHeader(workbook, message.hwnd)) SetFocus(workbook.grid);
        return false;
    case WM_MOUSEMOVE:
        // A drag in the cells is over with its button, but the grid goes on after a release with
        // Shift.
        return message.hwnd == workbook.grid && !(message.wParam & MK_LBUTTON);
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        if (IsAccelerator(workbook, workbook.keysAlways, message)) return true;
        // Undo, copy and the like mean the typed text while it is being typed.
        if (message.hwnd == GetHandleToEquationControl()) return SelectAllTyping(message);
        // Tree and list have keys of their own.
        if (IsInSidePanel(workbook, message.hwnd)) return false;
        return IsAccelerator(workbook, workbook.keysInGrid, message);
    default: return false;
    }
}

bool MayBecomeCharacter(const MSG& message) {
    if (message.message != WM_KEYDOWN) return true;
    if (message.wParam == VK_ESCAPE) return false;
    // AltGr, which types characters, is Ctrl and Alt together.
    const bool control = IsDown(VK_CONTROL) && !IsDown(VK_MENU);
    return !control || message.hwnd == GetHandleToEquationControl();
}

bool HandleNextMessage(Workbook& workbook) {
    MSG message = {};
    if (!PeekMessageW(&message, nullptr, 0, 0, PM_NOREMOVE)) OnIdle(workbook);
    if (GetMessageW(&message, nullptr, 0, 0) <= 0) return false;
    if (HandleBeforeDispatch(workbook, message)) return true;
    if (MayBecomeCharacter(message)) TranslateMessage(&message);
    DispatchMessageW(&message);
    return true;
}

}  // namespace workbook

// The edit's own modified flag says whether there is something to commit. Losing the focus commits,
// so moving the focus to the grid is a way to commit.
#include "grid/equation.h"

#include "base/runtime.h"
#include "base/windows_helpers.h"
#include "grid/keyboard.h"
#include "grid/layout.h"
#include "grid/notify.h"
#include "grid/selection.h"
#include "grid/state.h"

namespace kor {

namespace {

constexpr int kCommitCapacity = 256;  // characters, with the terminator
// WM_SETTEXT ignores its wParam. By this value a host that subclasses the edit can tell that the
// grid clears it for a new text.
constexpr WPARAM kClearTextMark = 256;

void SetModified(bool modified) { SendMessageW(grid.hwndEquation, EM_SETMODIFY, modified, 0); }

void SetEquationText(WPARAM mark) {
    SendMessageW(grid.hwndEquation, WM_SETTEXT, mark, reinterpret_cast<LPARAM>(L""));
}

void FocusGrid() { SetFocus(grid.hwndGrid); }

// How to handle a message to the edit: pass it on to the edit, or return a result.
struct EditAnswer {
    bool passOn;
    LRESULT result;
};

constexpr EditAnswer kPassOn = {true, 0};
constexpr EditAnswer Answer(LRESULT result) { return {false, result}; }

EditAnswer OnEditFocus() {
    grid.focusWindow = grid.hwndEquation;
    NotifyEditFocus();
    return kPassOn;
}

EditAnswer OnEditKillFocus() {
    NotifyEditKillFocus();
    CommitEquation();
    grid.editCaretMode = false;
    return kPassOn;
}

EditAnswer OnEditEnter() {
    if (!HasCurrentCell()) return Answer(1);
    FocusGrid();
    PressGridKey(VK_DOWN);
    return kPassOn;
}

EditAnswer OnEditTab() {
    if (!HasCurrentCell()) return Answer(1);
    FocusGrid();
    PressGridKey(IsShiftDown() ? VK_LEFT : VK_RIGHT);
    return Answer(0);
}

EditAnswer OnEditEscape() {
    memset(grid.editBuffer, 0, sizeof grid.editBuffer);
    SetEquationText(0);
    SetModified(false);
    FocusGrid();  // nothing is left to commit
    NotifyCurrentCell();
    return kPassOn;
}

EditAnswer OnEditArrow(WPARAM key, LPARAM flags) {
    if (grid.editCaretMode) return kPassOn;
    if (!HasCurrentCell()) return Answer(1);
    FocusGrid();
    SendMessageW(grid.hwndGrid, WM_KEYDOWN, key, flags);
    return Answer(0);
}

EditAnswer OnEditKeyDown(WPARAM key, LPARAM flags) {
    switch (key) {
    case VK_RETURN: return OnEditEnter();
    case VK_BACK: SetModified(true); return kPassOn;  // deleting text is a change as well
    case VK_TAB: return OnEditTab();
    case VK_ESCAPE: return OnEditEscape();
    case VK_LEFT:
    case VK_UP:
    case VK_RIGHT:
    case VK_DOWN: return OnEditArrow(key, flags);
    default: return kPassOn;
    }
}

EditAnswer OnEditMessage(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_SETFOCUS: return OnEditFocus();
    case WM_KILLFOCUS: return OnEditKillFocus();
    case WM_KEYDOWN: return OnEditKeyDown(wParam, lParam);
    case WM_CHAR: return wParam == VK_RETURN || wParam == VK_TAB ? Answer(0) : kPassOn;
    case WM_LBUTTONDOWN: grid.editCaretMode = true; return kPassOn;
    default: return kPassOn;
    }
}

LRESULT PassToButton(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return PassOn(grid.savedButtonProc, hwnd, message, wParam, lParam);
}

}  // namespace

LRESULT CALLBACK EquationEditProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    const EditAnswer answer = OnEditMessage(message, wParam, lParam);
    if (!answer.passOn) return answer.result;
    return PassOn(grid.savedEditProc, hwnd, message, wParam, lParam);
}

LRESULT CALLBACK OkButtonProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    const LRESULT result = PassToButton(hwnd, message, wParam, lParam);
    if (message != WM_LBUTTONDOWN) return result;
    PressGridKey(VK_DOWN);  // the press has taken the focus, which has committed
    return 0;
}

LRESULT CALLBACK FunctionButtonProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    const LRESULT result = PassToButton(hwnd, message, wParam, lParam);
    if (message != WM_LBUTTONDOWN) return result;
    PostFunctionCommand();
    return 0;
}

LRESULT CALLBACK CancelButtonProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_LBUTTONDOWN) CancelEquation();
    return PassToButton(hwnd, message, wParam, lParam);
}

LRESULT CommitEquation() {
    if (!HasCurrentCell()) return 1;
    if (!SendMessageW(grid.hwndEquation, EM_GETMODIFY, 0, 0)) return 1;
    wchar_t text[kCommitCapacity] = {};
    SendMessageW(grid.hwndEquation, WM_GETTEXT, kCommitCapacity, reinterpret_cast<LPARAM>(text));
    if (*text) {
        SetModified(false);
        NotifyEquationEntered(text);
    } else {
        NotifyEquationEmpty();
    }
    SendMessageW(grid.hwndGrid, GRIDM_REDRAW, 0, 0);
    return 0;
}

LRESULT CancelEquation() {
    SetEquationText(0);
    NotifyCurrentCell();
    return 0;
}

void TypeIntoEquation(WPARAM character, LPARAM flags) {
    if (character == VK_TAB || character == VK_RETURN) return;
    if (!grid.hwndEquation) return;
    SetFocus(grid.hwndEquation);
    SetEquationText(kClearTextMark);
    SendMessageW(grid.hwndEquation, WM_CHAR, character, flags);
    SetModified(true);
}

void ClearEquationText() { SetEquationText(kClearTextMark); }

}  // namespace kor

using namespace kor;

extern "C" HWND KORCONTROLS_API GetHandleToEquationControl(void) { return grid.hwndEquation; }

extern "C" HWND KORCONTROLS_API GetControlWithFocus(void) { return grid.focusWindow; }

extern "C" void KORCONTROLS_API SetFunctionButtonMessageID(DWORD id) {
    grid.functionButtonMessageId = id;
}

extern "C" LONG KORCONTROLS_API PressOKButton(void) { return static_cast<LONG>(CommitEquation()); }

#include "equation_bar.h"

#include <windows.h>

#include "selection.h"
#include "workbook.h"

namespace workbook {

namespace {

// Characters that a commit's notification carries at most.
constexpr int kNotifiedLength = 255;

BOOL CALLBACK GiveFont(HWND child, LPARAM font) {
    wchar_t name[16] = {};
    GetClassNameW(child, name, ARRAYSIZE(name));
    if (lstrcmpiW(name, L"EDIT") == 0 || lstrcmpiW(name, L"BUTTON") == 0) {
        SendMessageW(child, WM_SETFONT, static_cast<WPARAM>(font), TRUE);
    }
    return TRUE;
}

std::wstring TextOf(HWND window) {
    std::wstring text(static_cast<size_t>(GetWindowTextLengthW(window)) + 1, L'\0');
    text.resize(
        static_cast<size_t>(GetWindowTextW(window, text.data(), static_cast<int>(text.size()))));
    return text;
}

void PutCaretAtEnd(HWND edit) {
    const int length = GetWindowTextLengthW(edit);
    SendMessageW(edit, EM_SETSEL, static_cast<WPARAM>(length), length);
    SendMessageW(edit, EM_SCROLLCARET, 0, 0);
}

// A click into the text is what makes the arrow keys move the caret; otherwise they store the text
// and move to another cell. It brings the focus, too.
void ClickInto(HWND edit) {
    SendMessageW(edit, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(2, 2));
    SendMessageW(edit, WM_LBUTTONUP, 0, MAKELPARAM(2, 2));
    SetFocus(edit);
}

}  // namespace

void PrepareEquationBar(const Workbook& workbook) {
    EnumChildWindows(workbook.grid, GiveFont, reinterpret_cast<LPARAM>(workbook.styles.normal));
    SendMessageW(GetHandleToEquationControl(), EM_LIMITTEXT, kLongestCellText, 0);
}

void ShowCurrentCell(Workbook& workbook) {
    KorGrid_SetEquationText(workbook.grid, workbook.sheet().text(CurrentCell()).c_str());
    // Not every EDIT clears the flag when its text is set; left set, the shown text would be stored
    // again, or an empty one would clear whatever cell is current by then.
    SendMessageW(GetHandleToEquationControl(), EM_SETMODIFY, FALSE, 0);
    workbook.shown.statusIsStale = true;
}

void CommitTyping(Workbook& workbook) {
    if (PressOKButton() == 0) ShowCurrentCell(workbook);
    if (IsTyping()) SetFocus(workbook.grid);
}

bool IsTyping() { return GetFocus() == GetHandleToEquationControl(); }

std::wstring CommittedText(const wchar_t* notified) {
    if (lstrlenW(notified) < kNotifiedLength) return notified;
    return TextOf(GetHandleToEquationControl());
}

void EditCurrentCell() {
    const HWND edit = GetHandleToEquationControl();
    ClickInto(edit);
    PutCaretAtEnd(edit);
}

void BeginTyping(Workbook& workbook, const std::wstring& text) {
    const HWND edit = GetHandleToEquationControl();
    ClickInto(edit);
    KorGrid_SetEquationText(workbook.grid, text.c_str());
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    PutCaretAtEnd(edit);
}

void TakeFocusFromButtons(const Workbook& workbook) {
    const HWND focus = GetFocus();
    if (!focus || GetParent(focus) != workbook.grid || focus == GetHandleToEquationControl())
        return;
    // While its press lasts the button needs the focus to become a click.
    if (GetCapture() == focus) return;
    SetFocus(workbook.grid);
}

}  // namespace workbook

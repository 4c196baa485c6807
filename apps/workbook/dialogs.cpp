#include "dialogs.h"

#include <windows.h>

#include <optional>
#include <string>

#include "equation_bar.h"
#include "resource.h"
#include "selection.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr int kLongestAddress = 32;

// The dialog's user data points to the std::optional<Block> that receives the answer.
void OnGoToAccepted(HWND dialog) {
    wchar_t text[kLongestAddress] = {};
    GetDlgItemTextW(dialog, IDC_GOTO_ADDRESS, text, ARRAYSIZE(text));
    const std::optional<Block> block = ParseBlock(text);
    if (!block) {
        MessageBoxW(dialog, L"There is no such cell. Cells are named A1 to IV16384.", L"Workbook",
                    MB_OK | MB_ICONINFORMATION);
        SendDlgItemMessageW(dialog, IDC_GOTO_ADDRESS, EM_SETSEL, 0, -1);
        return;
    }
    *reinterpret_cast<std::optional<Block>*>(GetWindowLongPtrW(dialog, DWLP_USER)) = block;
    EndDialog(dialog, IDOK);
}

INT_PTR CALLBACK GoToProc(HWND dialog, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
    switch (message) {
    case WM_INITDIALOG:
        SetWindowLongPtrW(dialog, DWLP_USER, lParam);
        SendDlgItemMessageW(dialog, IDC_GOTO_ADDRESS, EM_LIMITTEXT, kLongestAddress - 1, 0);
        return TRUE;
    case WM_COMMAND:
        if (LOWORD(wParam) == IDOK) OnGoToAccepted(dialog);
        if (LOWORD(wParam) == IDCANCEL) EndDialog(dialog, IDCANCEL);
        return TRUE;
    default: return FALSE;
    }
}

INT_PTR CALLBACK KeysProc(HWND dialog, UINT message, WPARAM wParam, LPARAM) noexcept {
    if (message == WM_COMMAND) EndDialog(dialog, LOWORD(wParam));
    return message == WM_INITDIALOG || message == WM_COMMAND;
}

}  // namespace

void GoToWithDialog(Workbook& workbook) {
    CommitTyping(workbook);
    std::optional<Block> block;
    DialogBoxParamW(workbook.instance, MAKEINTRESOURCEW(IDD_GOTO), workbook.window, GoToProc,
                    reinterpret_cast<LPARAM>(&block));
    if (block) GoTo(workbook, *block);
}

void ShowKeys(const Workbook& workbook) {
    DialogBoxParamW(workbook.instance, MAKEINTRESOURCEW(IDD_KEYS), workbook.window, KeysProc, 0);
}

void ShowAbout(const Workbook& workbook) {
    const LONG version = KORCONTROLS_Version();
    std::wstring text = L"Workbook, the example host of korcontrols.\n\nLibrary version 0.";
    text += std::to_wstring(version) + L", " + std::to_wstring(sizeof(void*) * 8) + L" bits.";
    MessageBoxW(workbook.window, text.c_str(), L"About Workbook", MB_OK | MB_ICONINFORMATION);
}

}  // namespace workbook

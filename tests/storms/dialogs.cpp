#include "storms/dialogs.h"

#include "platform/print_dialog.h"
#include "storms/library.h"

#include <cstring>

namespace kortest {
namespace {

constexpr int kPageSide = 120;
constexpr int kMostActivations = 6;

Stage* waiting = nullptr;  // whose dialog or job it is
bool isPrinterChosen = false;
int pages = 0;

// ---- Printing
// --------------------------------------------------------------------------------------

decltype(&GetProcAddress) realGetProcAddress = nullptr;

// The bitmap is the process's; the library deletes the DC, which lets go of it.
HDC MakePrinter() {
    static const HBITMAP page = CreateBitmap(kPageSide, kPageSide, 1, 32, nullptr);
    HDC printer = CreateCompatibleDC(nullptr);
    SelectObject(printer, page);
    return printer;
}

BOOL WINAPI ChoosePrinter(kor::PrintDialogRecord* record) {
    waiting->pump();
    waiting->springIdle();
    record->dc = isPrinterChosen ? MakePrinter() : nullptr;
    return isPrinterChosen;
}

int WINAPI StartJob(HDC, const DOCINFOW*) {
    ++pages;
    waiting->springIdle();
    return 1;
}

int WINAPI StepOfJob(HDC) {
    waiting->springIdle();
    return 1;
}

FARPROC WINAPI FindPrinting(HMODULE module, LPCSTR name) {
    const bool isByName = reinterpret_cast<ULONG_PTR>(name) > 0xFFFF;
    const auto is = [&](const char* wanted) { return isByName && std::strcmp(name, wanted) == 0; };
    if (is("PrintDlg")) return reinterpret_cast<FARPROC>(&ChoosePrinter);
    if (is("StartDoc")) return reinterpret_cast<FARPROC>(&StartJob);
    if (is("StartPage") || is("EndPage") || is("EndDoc")) {
        return reinterpret_cast<FARPROC>(&StepOfJob);
    }
    return realGetProcAddress(module, name);
}

// ---- The sheet
// -------------------------------------------------------------------------------------

const wchar_t* typedText = nullptr;
bool isSheetAccepted = false;
int activations = 0;
int sheets = 0;

BOOL CALLBACK TypeInto(HWND child, LPARAM) {
    wchar_t name[16] = L"";
    GetClassNameW(child, name, 16);
    if (lstrcmpiW(name, L"EDIT") == 0) {
        SetWindowTextW(child, typedText);
        SendMessageW(child, EM_SETMODIFY, TRUE, 0);
    }
    return TRUE;
}

// The sheet, or a box that the sheet brought up. A sheet that comes back again and again, because a
// number is none, is cancelled.
LRESULT CALLBACK OnHook(int code, WPARAM wParam, LPARAM lParam) {
    const auto window = reinterpret_cast<HWND>(wParam);
    wchar_t name[16] = L"";
    if (code == HCBT_ACTIVATE) GetClassNameW(window, name, 16);
    if (lstrcmpW(name, L"#32770") == 0) {
        ++activations;
        if (typedText && activations == 1) EnumChildWindows(window, TypeInto, 0);
        const bool isOver = !isSheetAccepted || activations > kMostActivations;
        PostMessageW(window, WM_COMMAND, isOver ? IDCANCEL : IDOK, 0);
        if (isOver) PostMessageW(window, WM_COMMAND, IDOK, 0);  // a box has no Cancel
    }
    return CallNextHookEx(nullptr, code, wParam, lParam);
}

}  // namespace

void ReplacePrinter(Stage& stage) {
    waiting = &stage;
    realGetProcAddress = reinterpret_cast<decltype(&GetProcAddress)>(
        ReplaceImport("GetProcAddress", reinterpret_cast<void*>(&FindPrinting)));
}

void PrintChart(Stage& stage, HWND chart, bool isChosen) {
    isPrinterChosen = isChosen;
    stage.send(chart, WM_NOTIFY, GN_PRINT, 0);
    if (stage.isLive(chart)) EnableWindow(chart, TRUE);
}

void UseProperties(Stage& stage, HWND chart, const wchar_t* typed, bool isAccepted) {
    if (!HasOwnImports()) return;  // the objects alone have no dialogs
    typedText = typed;
    isSheetAccepted = isAccepted;
    activations = 0;
    HHOOK hook = SetWindowsHookExW(WH_CBT, OnHook, nullptr, GetCurrentThreadId());
    stage.send(chart, WM_NOTIFY, GN_PROPERTIES, 0);
    UnhookWindowsHookEx(hook);
    if (activations > 0) ++sheets;
}

int PagesPrinted() { return pages; }

int SheetsUsed() { return sheets; }

}  // namespace kortest

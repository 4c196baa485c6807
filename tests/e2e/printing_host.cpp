// Prints charts on a printer that writes PostScript files, as a user would who answers the dialog.
//
//   printing_host PRINTER.ppd FOLDER
//
// installs the printer, prints "FOLDER\plain0.ps" (a line chart without titles and labels) to
// "plain4.ps" (a pie) and the same with titles and labels, "full0.ps" to "full4.ps", cancels one
// more print that would have gone to "cancelled.ps", and removes the printer. It tells what it saw
// in lines like
//
//   available 1
//   full0 dialog "Print" window-enabled 0
//
// and ends with status 0, or with 2 when the dialog does not go away within a minute.
#include <korcontrols/graph.h>

#include <winspool.h>

#include <iostream>
#include <iterator>
#include <string>

namespace {

constexpr wchar_t kPrinterName[] = L"korcontrols test printer";
constexpr wchar_t kDialogClass[] = L"#32770";
constexpr DWORD kPatience = 60000;

// ---- The printer --------------------------------------------------------------------------------

LPWSTR Text(const wchar_t* text) { return const_cast<LPWSTR>(text); }

bool InstallDriver(const std::wstring& description) {
    DRIVER_INFO_3W driver{};
    driver.cVersion = 3;
    driver.pName = Text(kPrinterName);
    driver.pDriverPath = Text(L"wineps.drv");
    driver.pConfigFile = Text(L"wineps.drv");
    driver.pDataFile = Text(description.c_str());
    driver.pDefaultDataType = Text(L"RAW");
    return AddPrinterDriverExW(nullptr, 3, reinterpret_cast<BYTE*>(&driver),
                               APD_COPY_NEW_FILES | APD_COPY_FROM_DIRECTORY) != FALSE;
}

// The default printer, whose output goes to a file, until the end.
class FilePrinter {
public:
    explicit FilePrinter(const std::wstring& file) {
        PRINTER_INFO_2W printer{};
        printer.pPrinterName = Text(kPrinterName);
        printer.pDriverName = Text(kPrinterName);
        printer.pPortName = Text(file.c_str());
        printer.pPrintProcessor = Text(L"winprint");
        printer.pDatatype = Text(L"RAW");
        printer.pShareName = printer.pComment = printer.pLocation = printer.pParameters = Text(L"");
        handle_ = AddPrinterW(nullptr, 2, reinterpret_cast<BYTE*>(&printer));
        isReady_ = handle_ && SetDefaultPrinterW(kPrinterName);
    }
    ~FilePrinter() {
        if (!handle_) return;
        DeletePrinter(handle_);
        ClosePrinter(handle_);
    }
    FilePrinter(const FilePrinter&) = delete;
    FilePrinter& operator=(const FilePrinter&) = delete;

    bool isReady() const { return isReady_; }

private:
    HANDLE handle_ = nullptr;
    bool isReady_ = false;
};

// ---- The user -----------------------------------------------------------------------------------

WORD answer = IDOK;
std::wstring seenDialog;

// Presses a button as soon as a dialog comes up.
LRESULT CALLBACK WatchWindows(int code, WPARAM window, LPARAM data) {
    if (code == HCBT_ACTIVATE) {
        const HWND activated = reinterpret_cast<HWND>(window);
        wchar_t name[32]{};
        GetClassNameW(activated, name, 32);
        if (name == std::wstring(kDialogClass)) {
            wchar_t title[64]{};
            GetWindowTextW(activated, title, 64);
            seenDialog = title;
            PostMessageW(activated, WM_COMMAND, answer, 0);
        }
    }
    return CallNextHookEx(nullptr, code, window, data);
}

// At once, and without the streams that the other thread may be using.
DWORD WINAPI LosePatience(void*) {
    Sleep(kPatience);
    constexpr char kWords[] = "printing_host: not done after a minute\n";
    DWORD written = 0;
    WriteFile(GetStdHandle(STD_OUTPUT_HANDLE), kWords, sizeof kWords - 1, &written, nullptr);
    TerminateProcess(GetCurrentProcess(), 2);
    return 2;
}

// ---- The chart ----------------------------------------------------------------------------------

HWND CreateChart() {
    const HINSTANCE program = GetModuleHandleW(nullptr);
    RegisterGraphControl(program);
    const HWND host = CreateWindowExW(0, L"STATIC", L"host", WS_POPUP | WS_VISIBLE, 0, 0, 320, 240,
                                      nullptr, nullptr, program, nullptr);
    const HWND chart = CreateWindowExW(0, KORGRAPH_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, 320,
                                       240, host, nullptr, program, nullptr);
    const double wheat[] = {1, 2, 3, 4};
    const double rye[] = {4, 4, 2, 2};
    const LPCWSTR fields[] = {L"north", L"east", L"south", L"west"};
    const GraphSeriesData series[] = {{4, L"wheat", wheat, 0}, {4, L"rye", rye, 0}};
    for (const GraphSeriesData& data : series) KorGraph_AddSeries(chart, &data);
    KorGraph_SetCategories(chart, 4, fields);
    KorGraph_SetTitle(chart, L"Harvest of the four fields");
    KorGraph_SetXTitle(chart, L"field");
    KorGraph_SetYTitle(chart, L"tons");
    return chart;
}

void Print(HWND chart, const std::wstring& folder, const std::wstring& name) {
    const FilePrinter printer(folder + L"\\" + name + L".ps");
    seenDialog.clear();
    EnableWindow(chart, TRUE);
    KorGraph_Print(chart);
    std::wcout << name << L" dialog \"" << seenDialog << L"\" window-enabled "
               << IsWindowEnabled(chart) << (printer.isReady() ? L"" : L" (no printer)")
               << std::endl;
}

void PrintAllTypes(HWND chart, const std::wstring& folder, const std::wstring& kind) {
    for (LONG type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        KorGraph_SetType(chart, type);
        Print(chart, folder, kind + std::to_wstring(type));
    }
    KorGraph_SetType(chart, KORGRAPH_LINE);
}

}  // namespace

int wmain(int count, wchar_t** arguments) {
    if (count != 3 || !InstallDriver(arguments[1])) return 1;
    const std::wstring folder = arguments[2];
    CloseHandle(CreateThread(nullptr, 0, LosePatience, nullptr, 0, nullptr));
    const HHOOK hook = SetWindowsHookExW(WH_CBT, WatchWindows, nullptr, GetCurrentThreadId());
    const HWND chart = CreateChart();
    std::wcout << L"available " << IsPrintingAvailableForGraphControl() << std::endl;
    PrintAllTypes(chart, folder, L"full");
    KorGraph_ToggleOptions(chart, KorGraph_GetOptions(chart));
    PrintAllTypes(chart, folder, L"plain");
    answer = IDCANCEL;
    Print(chart, folder, L"cancelled");
    UnhookWindowsHookEx(hook);
    return 0;
}

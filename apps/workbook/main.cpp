// Start-up and the end.
#include <windows.h>

#include <commctrl.h>
#include <shellapi.h>

#include <algorithm>
#include <string>
#include <vector>

#include "message_routing.h"
#include "workbook.h"
#include "workbook_window.h"

namespace {

// The arguments: CSV files to open.
std::vector<std::wstring> FilesOnCommandLine() {
    int count = 0;
    LPWSTR* arguments = CommandLineToArgvW(GetCommandLineW(), &count);
    if (!arguments) return {};
    const std::vector<std::wstring> files(arguments + 1, arguments + std::max(count, 1));
    LocalFree(arguments);
    return files;
}

}  // namespace

int WINAPI WinMain(HINSTANCE instance, HINSTANCE, LPSTR, int show) {
    const INITCOMMONCONTROLSEX controls = {sizeof controls, ICC_BAR_CLASSES};
    InitCommonControlsEx(&controls);

    workbook::Workbook workbook;
    workbook.instance = instance;
    if (!workbook::CreateWorkbookWindow(workbook, FilesOnCommandLine(), show)) {
        MessageBoxW(nullptr, L"The window could not be created.", L"Workbook", MB_ICONERROR);
        return 1;
    }
    while (workbook::HandleNextMessage(workbook)) {
    }
    return 0;
}

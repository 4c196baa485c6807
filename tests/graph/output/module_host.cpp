// A host in a process of its own, for tests of which modules a chart brings along:
//
//   module_host LIBRARY
//
// loads the library, creates a chart, and writes three lines: the full names of the modules
// "commdlg.dll" and "wingdi.dll", or "none", and whether there is printing.
#include <windows.h>

#include <cstdio>

namespace {

using Register = DWORD (*)(HINSTANCE);
using ClassName = LPCWSTR (*)();
using IsAvailable = DWORD (*)();

template <typename Function>
Function Find(HMODULE library, const char* name) {
    return reinterpret_cast<Function>(reinterpret_cast<void*>(GetProcAddress(library, name)));
}

void WriteModule(const wchar_t* name) {
    wchar_t path[MAX_PATH] = L"none";
    const HMODULE module = GetModuleHandleW(name);
    if (module) GetModuleFileNameW(module, path, MAX_PATH);
    std::printf("%ls\n", path);
}

}  // namespace

int wmain(int count, wchar_t** words) {
    const HMODULE library = count == 2 ? LoadLibraryW(words[1]) : nullptr;
    if (!library) return 1;
    const HINSTANCE program = GetModuleHandleW(nullptr);
    Find<Register>(library, "RegisterGraphControl")(program);
    const HWND host = CreateWindowExW(0, L"STATIC", L"", WS_POPUP, 0, 0, 200, 200, nullptr, nullptr,
                                      program, nullptr);
    const HWND chart =
        CreateWindowExW(0, Find<ClassName>(library, "GetGraphControlClassName")(), L"", WS_CHILD, 0,
                        0, 100, 100, host, nullptr, program, nullptr);
    if (!chart) return 2;
    WriteModule(L"commdlg.dll");
    WriteModule(L"wingdi.dll");
    std::printf("%d\n", Find<IsAvailable>(library, "IsPrintingAvailableForGraphControl")() ? 1 : 0);
    return 0;
}

// Window classes of the workbook's panes: child windows that lay out children of their own, and
// whose messages the workbook answers.
#pragma once

#include <windows.h>

#include <new>

#include "workbook.h"

namespace workbook {

using PaneDispatch = LRESULT (*)(Workbook& workbook, UINT message, WPARAM wParam, LPARAM lParam);

// Until its user data is the workbook a pane has default processing alone.
template <PaneDispatch dispatch>
LRESULT CALLBACK PaneProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
    auto* const workbook = reinterpret_cast<Workbook*>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (!workbook) return DefWindowProcW(window, message, wParam, lParam);
    try {
        return dispatch(*workbook, message, wParam, lParam);
    } catch (const std::bad_alloc&) {
        workbook->isOutOfMemory = true;
        return 0;
    }
}

inline bool RegisterPaneClass(HINSTANCE instance, const wchar_t* name, WNDPROC procedure) {
    WNDCLASSEXW windowClass = {};
    windowClass.cbSize = sizeof windowClass;
    windowClass.lpfnWndProc = procedure;
    windowClass.hInstance = instance;
    windowClass.hbrBackground = reinterpret_cast<HBRUSH>(INT_PTR{COLOR_BTNFACE + 1});
    windowClass.lpszClassName = name;
    return RegisterClassExW(&windowClass) != 0;
}

}  // namespace workbook

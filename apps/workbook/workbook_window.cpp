#include "workbook_window.h"

#include <shellapi.h>

#include <algorithm>
#include <new>

#include "chart_bar.h"
#include "chart_pane.h"
#include "chart_view.h"
#include "commands.h"
#include "equation_bar.h"
#include "file_commands.h"
#include "grid_host.h"
#include "header_pointer.h"
#include "resource.h"
#include "sheet_bar.h"
#include "sheet_switch.h"
#include "status_line.h"
#include "view_commands.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr const wchar_t* kClassName = L"korcontrols Workbook";
constexpr int kFirstWidth = 960;
constexpr int kFirstHeight = 680;
constexpr int kLeastWidth = 320;
constexpr int kLeastHeight = 240;
constexpr int kSheetBarWidth = 250;
constexpr int kSheetBarHeight = 18;  // of one line of its text, which it draws at the top
constexpr DWORD kGridStyle = WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL;

// ---- Birth and death ----

bool OnCreate(Workbook& workbook, HWND window) {
    workbook.window = window;
    CreateCellStyles(workbook.styles);
    workbook.measure.open();
    workbook.statusBar = CreateStatusBar(window, workbook.instance);
    workbook.grid =
        CreateWindowExW(0, KORGRID_CLASS, nullptr, kGridStyle, 0, 0, 0, 0, window,
                        reinterpret_cast<HMENU>(INT_PTR{IDC_GRID}), workbook.instance, nullptr);
    if (!workbook.grid || !workbook.statusBar || !CreateChartPane(workbook) ||
        !CreateChartBar(workbook) || !CreateSheetBar(workbook) || !CreateSidePanel(workbook)) {
        return false;
    }
    PrepareEquationBar(workbook);
    SetFunctionButtonMessageID(IDM_FUNCTIONS);
    DragAcceptFiles(window, TRUE);
    return true;
}

void OnDestroy(Workbook& workbook) {
    DestroySidePanel(workbook);
    DestroySheetBar(workbook);
    workbook.measure.close();
    DeleteCellStyles(workbook.styles);
    workbook.grid = nullptr;
    PostQuitMessage(0);
}

// ---- Layout and focus ----

void OnSize(Workbook& workbook, WPARAM kind) {
    if (kind == SIZE_MINIMIZED) return;
    LayOutWindow(workbook);
    UpdateScrollRanges(workbook);
}

// Back from another program or a dialog: on with what had the focus before.
void OnSetFocus(const Workbook& workbook) {
    const HWND last = GetControlWithFocus();
    SetFocus(last ? last : workbook.grid);
}

// The grid and its headers have no cursor of their own: the one from outside, such as that of the
// window's border, would stay.
//   result  whether the cursor is set
bool OnSetCursor(const Workbook& workbook, HWND window, UINT place) {
    const bool isHeader = IsGridHeader(workbook, window);
    if ((!isHeader && window != workbook.grid) || place != HTCLIENT) return false;
    SetCursor(LoadCursorW(nullptr, isHeader ? HeaderPointer(window) : IDC_ARROW));
    return true;
}

void OnGetMinMaxInfo(MINMAXINFO& info) { info.ptMinTrackSize = {kLeastWidth, kLeastHeight}; }

// ---- Dispatch ----

void OnSheetBarNotify(Workbook& workbook, LPARAM lParam) {
    const auto& chosen = *reinterpret_cast<const FunkyBarNotification*>(lParam);
    if (chosen.header.code == FBN_SELECTED) OnSheetChosen(workbook, chosen);
}

LRESULT Dispatch(Workbook& workbook, UINT message, WPARAM wParam, LPARAM lParam) {
    const HWND window = workbook.window;
    switch (message) {
    case WM_SIZE: OnSize(workbook, wParam); return 0;
    case WM_SETFOCUS: OnSetFocus(workbook); return 0;
    case WM_NOTIFY:
        if (OnGridNotify(workbook, static_cast<UINT>(wParam), lParam)) return 0;
        if (wParam == IDC_SHEET_BAR) OnSheetBarNotify(workbook, lParam);
        break;
    case GRIDN_EQUATIONENTERED:
        OnEquationEntered(workbook, reinterpret_cast<const wchar_t*>(wParam), lParam);
        return 0;
    case GRIDN_EQUATIONEMPTY: OnEquationEmptied(workbook, lParam); return 0;
    case WM_KEYDOWN:
        if (wParam == VK_DELETE) OnDeleteKey(workbook);
        return 0;
    case WM_SETCURSOR:
        if (OnSetCursor(workbook, reinterpret_cast<HWND>(wParam), LOWORD(lParam))) return TRUE;
        break;
    case WM_COMMAND:
        if (!OnChartBarCommand(workbook, LOWORD(wParam), HIWORD(wParam))) {
            RunCommand(workbook, LOWORD(wParam));
        }
        return 0;
    case WM_INITMENUPOPUP: PrepareMenu(workbook, reinterpret_cast<HMENU>(wParam)); return 0;
    case WM_MOUSEWHEEL:
        OnMouseWheel(workbook, LOWORD(wParam), static_cast<short>(HIWORD(wParam)));
        return 0;
    case WM_DROPFILES: OnDropFiles(workbook, reinterpret_cast<HDROP>(wParam)); return 0;
    case WM_CLOSE:
        if (MayEnd(workbook)) DestroyWindow(window);
        return 0;
    case WM_QUERYENDSESSION: return MayEnd(workbook);
    case WM_DESTROY: OnDestroy(workbook); return 0;
    default: break;
    }
    return DefWindowProcW(window, message, wParam, lParam);
}

// No exception may leave: the library that sent the message could not handle it.
LRESULT CALLBACK WorkbookProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
    if (message == WM_GETMINMAXINFO) OnGetMinMaxInfo(*reinterpret_cast<MINMAXINFO*>(lParam));
    if (message == WM_CREATE) {
        auto* const created =
            static_cast<Workbook*>(reinterpret_cast<CREATESTRUCTW*>(lParam)->lpCreateParams);
        SetWindowLongPtrW(window, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(created));
        return OnCreate(*created, window) ? 0 : -1;
    }
    auto* const workbook = reinterpret_cast<Workbook*>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (!workbook || !workbook->grid) return DefWindowProcW(window, message, wParam, lParam);
    try {
        return Dispatch(*workbook, message, wParam, lParam);
    } catch (const std::bad_alloc&) {
        workbook->isOutOfMemory = true;
        return 0;
    }
}

bool RegisterWorkbookClass(HINSTANCE instance) {
    WNDCLASSEXW windowClass = {};
    windowClass.cbSize = sizeof windowClass;
    windowClass.lpfnWndProc = WorkbookProc;
    windowClass.hInstance = instance;
    windowClass.hIcon = LoadIconW(nullptr, IDI_APPLICATION);
    windowClass.hCursor = LoadCursorW(nullptr, IDC_ARROW);
    windowClass.hbrBackground = reinterpret_cast<HBRUSH>(INT_PTR{COLOR_BTNFACE + 1});
    windowClass.lpszMenuName = MAKEINTRESOURCEW(IDR_MENU);
    windowClass.lpszClassName = kClassName;
    return RegisterClassExW(&windowClass) != 0;
}

}  // namespace

bool CreateWorkbookWindow(Workbook& workbook, const std::vector<std::wstring>& files, int show) {
    if (!RegisterGridControl(workbook.instance) || !RegisterWorkbookClass(workbook.instance)) {
        return false;
    }
    workbook.keysAlways = LoadAcceleratorsW(workbook.instance, MAKEINTRESOURCEW(IDR_KEYS_ALWAYS));
    workbook.keysInGrid = LoadAcceleratorsW(workbook.instance, MAKEINTRESOURCEW(IDR_KEYS_GRID));
    if (!CreateWindowExW(0, kClassName, L"Workbook", WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN,
                         CW_USEDEFAULT, CW_USEDEFAULT, kFirstWidth, kFirstHeight, nullptr, nullptr,
                         workbook.instance, &workbook)) {
        return false;
    }
    ShowSheet(workbook);
    UpdateStatusBar(workbook);
    ShowWindow(workbook.window, show);
    UpdateWindow(workbook.window);
    for (const std::wstring& file : files) OpenFile(workbook, file);
    return true;
}

void LayOutWindow(const Workbook& workbook) {
    RECT area = {};
    GetClientRect(workbook.window, &area);
    const int width = static_cast<int>(area.right);
    const int top = ChartBarHeight(workbook);
    const int bottom = static_cast<int>(area.bottom) - LayoutStatusBar(workbook);
    const int height = std::max(0, bottom - top);
    const int gridLeft = SidePanelWidth(workbook, width);
    const int gridRight = width - ChartPaneWidth(workbook, width);
    MoveWindow(workbook.sheetBar, 0, (top - kSheetBarHeight) / 2, kSheetBarWidth, kSheetBarHeight,
               TRUE);
    MoveWindow(workbook.chart.bar.window, kSheetBarWidth, 0, width - kSheetBarWidth, top, TRUE);
    MoveWindow(workbook.panel.window, 0, top, gridLeft, height, TRUE);
    MoveWindow(workbook.grid, gridLeft, top, gridRight - gridLeft, height, TRUE);
    MoveWindow(workbook.chart.pane, gridRight, top, width - gridRight, height, TRUE);
}

void ShowTitle(Workbook& workbook) {
    workbook.panel.isStale = true;
    const Document& document = workbook.document();
    const std::wstring title = document.name() + L" - Workbook";
    SetWindowTextW(workbook.window, ((document.isModified() ? L"*" : L"") + title).c_str());
}

void OnIdle(Workbook& workbook) noexcept {
    if (!workbook.grid) return;
    try {
        CatchUpWithGrid(workbook);
        RefreshChart(workbook);
        KeepTooltipsInPane(workbook);
        RefreshChartBar(workbook);
        RefreshSheetBar(workbook);
        RefreshSidePanel(workbook);
    } catch (const std::bad_alloc&) {
        workbook.isOutOfMemory = true;
    }
    if (!workbook.isOutOfMemory) return;
    workbook.isOutOfMemory = false;
    MessageBoxW(workbook.window, L"There is not enough memory for that.", L"Workbook",
                MB_OK | MB_ICONWARNING);
}

}  // namespace workbook

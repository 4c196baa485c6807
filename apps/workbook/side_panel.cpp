#include "side_panel.h"

#include <algorithm>

#include "equation_bar.h"
#include "file_tree.h"
#include "pane_class.h"
#include "resource.h"
#include "statistics_list.h"
#include "view_commands.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

namespace {

constexpr const wchar_t* kPanelClass = L"korcontrols Workbook Side Panel";
constexpr int kTreePercent = 40;  // of the height
constexpr int kGap = 4;           // between tree and list
constexpr int kGrip = 4;          // at the right edge, to drag it
constexpr int kLeastWidth = 120;

void LayOut(const SidePanel& panel) {
    RECT area = {};
    GetClientRect(panel.window, &area);
    const int width = std::max(0, static_cast<int>(area.right) - kGrip);
    const int height = static_cast<int>(area.bottom);
    const int treeHeight = height * kTreePercent / 100;
    MoveWindow(panel.tree, 0, 0, width, treeHeight, TRUE);
    const int listTop = treeHeight + kGap;
    MoveWindow(panel.list, 0, listTop, width, std::max(0, height - listTop), TRUE);
}

bool IsOnGrip(HWND window) {
    POINT pointer = {};
    RECT area = {};
    GetCursorPos(&pointer);
    ScreenToClient(window, &pointer);
    GetClientRect(window, &area);
    return pointer.x >= area.right - kGrip;
}

void OnDrag(Workbook& workbook, int x) {
    workbook.panel.width = std::max(kLeastWidth, x + kGrip / 2);
    LayOutWindow(workbook);
    UpdateScrollRanges(workbook);
}

void OnNotify(Workbook& workbook, const NMHDR& notification) {
    if (notification.idFrom == IDC_FILE_TREE) OnTreeNotify(workbook, notification);
    if (notification.idFrom == IDC_STATISTICS) OnListNotify(workbook, notification);
}

LRESULT Dispatch(Workbook& workbook, UINT message, WPARAM wParam, LPARAM lParam) {
    const HWND window = workbook.panel.window;
    switch (message) {
    case WM_SIZE: LayOut(workbook.panel); return 0;
    case WM_NOTIFY: OnNotify(workbook, *reinterpret_cast<const NMHDR*>(lParam)); return 0;
    case WM_LBUTTONDOWN: SetCapture(window); return 0;
    case WM_LBUTTONUP: ReleaseCapture(); return 0;
    case WM_MOUSEMOVE:
        if (GetCapture() == window) OnDrag(workbook, static_cast<short>(LOWORD(lParam)));
        return 0;
    case WM_SETCURSOR:
        if (reinterpret_cast<HWND>(wParam) != window) break;
        SetCursor(LoadCursorW(nullptr, IsOnGrip(window) ? IDC_SIZEWE : IDC_ARROW));
        return TRUE;
    default: break;
    }
    return DefWindowProcW(window, message, wParam, lParam);
}

}  // namespace

bool CreateSidePanel(Workbook& workbook) {
    if (!RegisterPaneClass(workbook.instance, kPanelClass, PaneProc<Dispatch>)) return false;
    SidePanel& panel = workbook.panel;
    panel.window =
        CreateWindowExW(WS_EX_CONTROLPARENT, kPanelClass, nullptr, WS_CHILD | WS_CLIPCHILDREN, 0, 0,
                        0, 0, workbook.window, reinterpret_cast<HMENU>(INT_PTR{IDC_SIDE_PANEL}),
                        workbook.instance, nullptr);
    if (!panel.window) return false;
    panel.tree = CreateFileTree(workbook);
    panel.list = CreateStatisticsList(workbook);
    SetWindowLongPtrW(panel.window, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(&workbook));
    return panel.tree && panel.list;
}

void DestroySidePanel(Workbook& workbook) {
    workbook.panel.isFilling = true;
    ClearStatisticsList(workbook.panel);
    DestroyWindow(workbook.panel.window);
}

void ToggleSidePanel(Workbook& workbook) {
    SidePanel& panel = workbook.panel;
    CommitTyping(workbook);
    panel.isShown = !panel.isShown;
    panel.isStale = true;
    LayOutWindow(workbook);
    ShowWindow(panel.window, panel.isShown ? SW_SHOW : SW_HIDE);
    UpdateScrollRanges(workbook);
    if (!panel.isShown) SetFocus(workbook.grid);
}

int SidePanelWidth(const Workbook& workbook, int windowWidth) {
    return workbook.panel.isShown ? std::min(workbook.panel.width, windowWidth / 2) : 0;
}

void RefreshSidePanel(Workbook& workbook) {
    SidePanel& panel = workbook.panel;
    if (!panel.isShown || !panel.isStale) return;
    panel.isStale = false;
    const OpenSheet* const sheet = &workbook.sheets.current();
    if (panel.listedSheet != sheet) panel.hidden.clear();
    panel.listedSheet = sheet;
    RefreshFileTree(workbook);
    RefreshStatisticsList(workbook);
}

bool IsInSidePanel(const Workbook& workbook, HWND window) {
    return window == workbook.panel.window || IsChild(workbook.panel.window, window);
}

void StepFocus(Workbook& workbook) {
    const SidePanel& panel = workbook.panel;
    const HWND focus = GetFocus();
    if (!panel.isShown || focus == panel.list) {
        SetFocus(workbook.grid);
    } else {
        SetFocus(focus == panel.tree ? panel.list : panel.tree);
    }
}

}  // namespace workbook

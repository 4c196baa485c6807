#include "stage.h"

#include "grid_cells.h"

#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/tooltip.h>

namespace footprint {
namespace {

constexpr int kBarHeight = 26;
constexpr int kStripHeight = 16;

HWND host;
HFONT font;

HINSTANCE Instance() { return GetModuleHandleW(nullptr); }

LRESULT CALLBACK HostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_NOTIFY && wParam == GRIDN_PAINTCELLS) {
        PaintCells(*reinterpret_cast<const GridVisibleRange*>(lParam), font);
        return 0;
    }
    return DefWindowProcW(window, message, wParam, lParam);
}

const wchar_t* HostClass() {
    static const bool registered = [] {
        WNDCLASSW windowClass = {};
        windowClass.lpfnWndProc = HostProc;
        windowClass.hInstance = Instance();
        windowClass.lpszClassName = L"Footprint";
        RegisterGraphControl(Instance());
        RegisterGridControl(Instance());
        InitFunkyControl(Instance());
        LOGFONTW description = {};
        description.lfHeight = -12;
        font = CreateFontIndirectW(&description);
        return RegisterClassW(&windowClass) != 0;
    }();
    return registered ? L"Footprint" : nullptr;
}

HWND CreateControl(const wchar_t* windowClass, DWORD style, int height) {
    return CreateWindowW(windowClass, L"", WS_CHILD | WS_VISIBLE | style, 0, 0, kWidth, height,
                         host, nullptr, Instance(), nullptr);
}

void DeliverPosted() {
    MSG message;
    while (PeekMessageW(&message, nullptr, 0, WM_TIMER - 1, PM_REMOVE) ||
           PeekMessageW(&message, nullptr, WM_TIMER + 1, 0xFFFF, PM_REMOVE)) {
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
}

}  // namespace

void OpenHost() {
    host = CreateWindowW(HostClass(), L"", WS_POPUP | WS_VISIBLE, 0, 0, kWidth, kHeight, nullptr,
                         nullptr, Instance(), nullptr);
}

void CloseHost() {
    if (GetCapture()) Release(GetCapture(), 0, 0);  // the drags' state is the process's
    DeliverPosted();
    DestroyWindow(host);
    host = nullptr;
    DeliverPosted();
}

HWND Host() { return host; }

void Settle() {
    DeliverPosted();
    RedrawWindow(host, nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
    DeliverPosted();
}

HWND CreateGrid() {
    ResetGrid();
    SetSelectedRanged(0, 0);
    const HWND grid =
        CreateControl(KORGRID_CLASS, WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL, kHeight);
    SetHorizontalDataRange(KORGRID_COLUMNS);
    SetVerticalDataRange(KORGRID_ROWS);
    SetGridZoomLevel(4);
    SetFirstVisibleCell(0);
    return grid;
}

HWND ColumnStrip(HWND grid) { return FindWindowExW(grid, nullptr, KORHEADER_CLASS, nullptr); }

HWND RowStrip(HWND grid) {
    return FindWindowExW(grid, ColumnStrip(grid), KORHEADER_CLASS, nullptr);
}

HWND CreateStrip() {
    const HWND strip = CreateControl(KORHEADER_CLASS, 0, kStripHeight);
    wchar_t label[] = L"Label";
    const HeaderItemDesc item = {label, kWidth / 4};
    for (int i = 0; i < 4; ++i) {
        SendMessageW(strip, HCM_INSERTITEM, static_cast<WPARAM>(-1),
                     reinterpret_cast<LPARAM>(&item));
    }
    return strip;
}

HWND CreateChart(int type) {
    const HWND chart = CreateControl(KORGRAPH_CLASS, 0, kHeight);
    KorGraph_SetType(chart, type);
    return chart;
}

HWND CreateToolTip() { return CreateControl(KORTOOLTIP_CLASS, 0, 0); }

HWND CreateFunctionBar() {
    const HWND bar = CreateControl(KORFUNKYBAR_CLASS, 0, kBarHeight);
    wchar_t text[] = L"Function 0";
    for (int i = 0; i < 6; ++i) {
        text[9] = static_cast<wchar_t>(L'0' + i);
        const FunkyBarItemDesc item = {FBIF_TEXT | FBIF_COLOURS, KORFUNKYBAR_APPEND, text, 0, 0,
                                       RGB(0, 0, 128),           RGB(255, 255, 255), 0};
        KorFunkyBar_InsertItem(bar, &item);
    }
    return bar;
}

HWND CreateListView() {
    InitCommonControls();
    const HWND list = CreateControl(WC_LISTVIEWW, LVS_REPORT, kHeight);
    wchar_t title[] = L"Title";
    LVCOLUMNW column = {};
    column.mask = LVCF_TEXT | LVCF_WIDTH;
    column.cx = kWidth / 2;
    column.pszText = title;
    for (int i = 0; i < 2; ++i) {
        SendMessageW(list, LVM_INSERTCOLUMNW, static_cast<WPARAM>(i),
                     reinterpret_cast<LPARAM>(&column));
    }
    return list;
}

std::vector<double> Noise(int count) {
    std::vector<double> values(static_cast<size_t>(count));
    unsigned seed = 1;
    for (double& value : values) {
        seed = seed * 1664525u + 1013904223u;
        value = (seed >> 8) / 16777216.0 * 100 - 20;
    }
    return values;
}

void AddSeries(HWND chart, int points) {
    const std::vector<double> values = Noise(points);
    const GraphSeriesData data = {points, L"Series", values.data(), 0};
    KorGraph_AddSeries(chart, &data);
}

void Press(HWND window, int x, int y) {
    SendMessageW(window, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(x, y));
}

void Release(HWND window, int x, int y) { SendMessageW(window, WM_LBUTTONUP, 0, MAKELPARAM(x, y)); }

}  // namespace footprint

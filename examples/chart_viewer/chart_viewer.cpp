// Numbers and their chart, one at a time, under a command bar: what a host does with the bar that
// SetupGraphCommandBar fills, with the property pages and with the clipboard.
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>

#include <cwchar>
#include <iterator>

#include "command_bar.h"

namespace {

constexpr int kBarId = 100;
constexpr WORD kShowCommand = 101;
constexpr WORD kPropertiesCommand = 102;
constexpr WORD kZoomCombo = 103;
constexpr WORD kTypeCombo = 104;
constexpr WORD kLegendCommand = 105;
constexpr WORD kCopyCommand = 106;

const wchar_t* const kNames[] = {L"Vanilla", L"Cherry"};
const wchar_t* const kDays[] = {L"Mon", L"Tue", L"Wed", L"Thu", L"Fri", L"Sat", L"Sun"};
constexpr int kDayCount = static_cast<int>(std::size(kDays));
constexpr double kSold[][kDayCount] = {{20, 31, 34, 26, 13, 35, 38}, {9, 12, 17, 21, 16, 25, 30}};

struct Viewer {
    HWND window;
    HWND bar;
    HWND zoom;
    HWND type;
    HWND grid;
    HWND chart;
};

Viewer viewer = {};

bool IsChartShown() { return (GetWindowLongPtrW(viewer.chart, GWL_STYLE) & WS_VISIBLE) != 0; }

void ShowChart(bool isShown) {
    ShowWindow(viewer.chart, isShown ? SW_SHOW : SW_HIDE);
    ShowWindow(viewer.grid, isShown ? SW_HIDE : SW_SHOW);
    SetFocus(isShown ? viewer.chart : viewer.grid);
}

void FillChart() {
    for (int i = 0; i < static_cast<int>(std::size(kNames)); ++i) {
        const GraphSeriesData series = {kDayCount, kNames[i], kSold[i], 0};
        KorGraph_AddSeries(viewer.chart, &series);
    }
    KorGraph_SetCategories(viewer.chart, kDayCount, kDays);
    KorGraph_SetTitle(viewer.chart, L"Ice cream sold");
    KorGraph_Redraw(viewer.chart);
}

// The days in the first column, a series in each further one.
void PaintCell(WORD column, WORD row) {
    wchar_t text[20] = L"";
    const int series = column - 1, day = row - 1;
    const bool isSeries = series >= 0 && series < static_cast<int>(std::size(kNames));
    if (row == 0 && isSeries) std::swprintf(text, std::size(text), L"%ls", kNames[series]);
    if (day >= 0 && day < kDayCount) {
        if (column == 0) std::swprintf(text, std::size(text), L"%ls", kDays[day]);
        if (isSeries) std::swprintf(text, std::size(text), L"%g", kSold[series][day]);
    }
    if (!*text) return;
    SetCellValue(KORGRID_CELL(column, row), text, nullptr, RGB(0, 0, 0), RGB(255, 255, 255), 0, 0,
                 0, FALSE, FALSE);
}

void PaintCells(const GridVisibleRange& range) {
    for (WORD row = range.firstRow; row < range.endRow; ++row) {
        for (WORD column = range.firstColumn; column < range.endColumn; ++column) {
            PaintCell(column, row);
        }
    }
}

// The image of each button comes from the library; what it does is the host's business.
void FillBar(HINSTANCE instance) {
    TBBUTTON buttons[2] = {};
    buttons[0].iBitmap = 0;
    buttons[0].idCommand = kShowCommand;
    buttons[1].iBitmap = 1;
    buttons[1].idCommand = kPropertiesCommand;
    for (TBBUTTON& button : buttons) {
        button.fsState = TBSTATE_ENABLED;
        button.fsStyle = TBSTYLE_BUTTON;
    }
    SetupGraphCommandBar(instance, viewer.bar, buttons, static_cast<LONG>(std::size(buttons)),
                         &viewer.zoom, kZoomCombo, &viewer.type, kTypeCombo);
}

void CreateParts(HWND window, HINSTANCE instance) {
    viewer.window = window;
    viewer.bar = command_bar::Create(window, instance, kBarId);
    FillBar(instance);
    RegisterGridControl(instance);
    RegisterGraphControl(instance);
    viewer.grid =
        CreateWindowW(KORGRID_CLASS, L"", WS_CHILD | WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL, 0,
                      0, 0, 0, window, nullptr, instance, nullptr);
    SetHorizontalDataRange(KORGRID_COLUMNS);
    SetVerticalDataRange(KORGRID_ROWS);
    viewer.chart = CreateWindowW(KORGRAPH_CLASS, L"", WS_CHILD | WS_CLIPCHILDREN, 0, 0, 0, 0,
                                 window, nullptr, instance, nullptr);
    FillChart();
    ShowChart(true);
}

void LayOut(int width, int height) {
    SendMessageW(viewer.bar, WM_SIZE, 0, 0);
    RECT bar = {};
    GetWindowRect(viewer.bar, &bar);
    const int top = bar.bottom - bar.top;
    MoveWindow(viewer.grid, 0, top, width, height - top, TRUE);
    MoveWindow(viewer.chart, 0, top, width, height - top, TRUE);
}

// The library numbers the items as its messages want them.
LONG ChosenIn(HWND combo) {
    const LRESULT item = SendMessageW(combo, CB_GETCURSEL, 0, 0);
    return static_cast<LONG>(SendMessageW(combo, CB_GETITEMDATA, static_cast<WPARAM>(item), 0));
}

// The pages may have changed what the combo boxes show.
void ShowProperties() {
    KorGraph_ShowProperties(viewer.chart);
    SendMessageW(viewer.type, CB_SETCURSEL, static_cast<WPARAM>(KorGraph_GetType(viewer.chart)), 0);
    SendMessageW(viewer.zoom, CB_SETCURSEL, static_cast<WPARAM>(KorGraph_GetZoom(viewer.chart)), 0);
}

void ShowLegend() {
    RECT client = {};
    GetClientRect(viewer.chart, &client);
    const RECT place = {client.right - 110, 20, client.right - 10, 80};
    KorGraph_ShowLegend(viewer.chart, &place);
}

void OnCommand(WORD id, WORD notification) {
    switch (id) {
    case kShowCommand: ShowChart(!IsChartShown()); break;
    case kPropertiesCommand: ShowProperties(); break;
    case kLegendCommand: ShowLegend(); break;
    case kCopyCommand: KorGraph_Copy(viewer.chart); break;
    case kZoomCombo:
        if (notification == CBN_SELCHANGE) KorGraph_SetZoom(viewer.chart, ChosenIn(viewer.zoom));
        break;
    case kTypeCombo:
        if (notification == CBN_SELCHANGE) KorGraph_SetType(viewer.chart, ChosenIn(viewer.type));
        break;
    default: break;
    }
}

LRESULT CALLBACK ViewerProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_CREATE:
        CreateParts(hwnd, reinterpret_cast<CREATESTRUCTW*>(lParam)->hInstance);
        return 0;
    case WM_SIZE: LayOut(LOWORD(lParam), HIWORD(lParam)); return 0;
    case WM_COMMAND: OnCommand(LOWORD(wParam), HIWORD(wParam)); return 0;
    case WM_NOTIFY:
        if (wParam == GRIDN_PAINTCELLS) {
            PaintCells(*reinterpret_cast<const GridVisibleRange*>(lParam));
        }
        return 0;
    case WM_DESTROY: PostQuitMessage(0); return 0;
    default: return DefWindowProcW(hwnd, message, wParam, lParam);
    }
}

HMENU CreateChartMenu() {
    HMENU chart = CreatePopupMenu();
    AppendMenuW(chart, MF_STRING, kPropertiesCommand, L"&Properties...\tCtrl+P");
    AppendMenuW(chart, MF_STRING, kLegendCommand, L"&Legend\tCtrl+L");
    AppendMenuW(chart, MF_STRING, kCopyCommand, L"&Copy\tCtrl+C");
    HMENU bar = CreateMenu();
    AppendMenuW(bar, MF_POPUP, reinterpret_cast<UINT_PTR>(chart), L"&Chart");
    return bar;
}

HACCEL CreateKeys() {
    ACCEL keys[] = {{FCONTROL | FVIRTKEY, 'P', kPropertiesCommand},
                    {FCONTROL | FVIRTKEY, 'L', kLegendCommand},
                    {FCONTROL | FVIRTKEY, 'C', kCopyCommand}};
    return CreateAcceleratorTableW(keys, static_cast<int>(std::size(keys)));
}

}  // namespace

int WINAPI WinMain(HINSTANCE instance, HINSTANCE, LPSTR, int show) {
    WNDCLASSW host = {};
    host.lpfnWndProc = ViewerProc;
    host.hInstance = instance;
    host.hCursor = LoadCursorW(nullptr, reinterpret_cast<const wchar_t*>(IDC_ARROW));
    host.hbrBackground = GetSysColorBrush(COLOR_BTNFACE);
    host.lpszClassName = L"Chart viewer";
    RegisterClassW(&host);
    HWND window =
        CreateWindowW(host.lpszClassName, L"Chart viewer", WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN,
                      60, 60, 480, 340, nullptr, CreateChartMenu(), instance, nullptr);
    ShowWindow(window, show);
    HACCEL keys = CreateKeys();
    MSG message;
    while (GetMessageW(&message, nullptr, 0, 0) > 0) {
        if (TranslateAcceleratorW(window, keys, &message)) continue;
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
    return 0;
}

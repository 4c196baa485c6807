#include "chart_bar.h"

#include <commctrl.h>
#include <korcontrols/graph.h>

#include <array>

#include "chart_commands.h"
#include "chart_pane.h"
#include "resource.h"
#include "workbook.h"
#include <command_bar.h>

namespace workbook {

namespace {

// The library's button images.
enum ButtonImage { kShowImage, kPropertiesImage, kLegendImage };

constexpr int kEdge = 3;  // above and below the buttons

constexpr TBBUTTON Button(int image, int command, BYTE style) {
    TBBUTTON button = {};
    button.iBitmap = image;
    button.idCommand = command;
    button.fsState = TBSTATE_ENABLED;
    button.fsStyle = style;
    return button;
}

// These two stand before the combo boxes, and the library has tooltips for them.
constexpr std::array<TBBUTTON, 2> kButtons = {
    Button(kShowImage, IDM_CHART_SHOW, TBSTYLE_CHECK),
    Button(kPropertiesImage, IDM_CHART_PROPERTIES, TBSTYLE_BUTTON)};

// Its own text, as the library's would be one for another button.
void SetToolTip(HWND bar, int command, const wchar_t* text) {
    const auto toolTips = reinterpret_cast<HWND>(SendMessageW(bar, TB_GETTOOLTIPS, 0, 0));
    TTTOOLINFOW tool = {};
    tool.cbSize = TTTOOLINFOW_V1_SIZE;
    tool.hwnd = bar;
    tool.uId = static_cast<UINT_PTR>(command);
    tool.lpszText = const_cast<wchar_t*>(text);
    SendMessageW(toolTips, TTM_UPDATETIPTEXTW, 0, reinterpret_cast<LPARAM>(&tool));
}

void AddLegendButton(HWND bar) {
    const TBBUTTON button = Button(kLegendImage, IDM_CHART_LEGEND, TBSTYLE_CHECK);
    SendMessageW(bar, TB_ADDBUTTONSW, 1, reinterpret_cast<LPARAM>(&button));
    SetToolTip(bar, IDM_CHART_LEGEND, L"Legend");
}

// The bar shares its line with the bar of sheets, so it must not stretch over the whole window.
void LetPlace(HWND bar) {
    const LONG_PTR style = GetWindowLongPtrW(bar, GWL_STYLE);
    SetWindowLongPtrW(bar, GWL_STYLE, style | CCS_NOPARENTALIGN | CCS_NORESIZE | CCS_NODIVIDER);
}

LONG ChosenData(HWND combo) {
    const LRESULT item = SendMessageW(combo, CB_GETCURSEL, 0, 0);
    return static_cast<LONG>(SendMessageW(combo, CB_GETITEMDATA, static_cast<WPARAM>(item), 0));
}

// The item's data are the chart's own numbers, in whose order the menu's commands are.
void Choose(Workbook& workbook, HWND combo, UINT firstCommand) {
    RunChartCommand(workbook, firstCommand + static_cast<UINT>(ChosenData(combo)));
}

void Show(HWND combo, LONG data, bool enabled) {
    const LRESULT count = SendMessageW(combo, CB_GETCOUNT, 0, 0);
    const bool isOpen = SendMessageW(combo, CB_GETDROPPEDSTATE, 0, 0) != 0;
    for (LRESULT item = 0; item < count && !isOpen; ++item) {
        const auto place = static_cast<WPARAM>(item);
        if (SendMessageW(combo, CB_GETITEMDATA, place, 0) != data) continue;
        if (SendMessageW(combo, CB_GETCURSEL, 0, 0) != item) {
            SendMessageW(combo, CB_SETCURSEL, place, 0);
        }
    }
    if ((IsWindowEnabled(combo) != FALSE) != enabled) EnableWindow(combo, enabled);
}

}  // namespace

bool CreateChartBar(Workbook& workbook) {
    ChartBar& bar = workbook.chart.bar;
    bar.window = command_bar::Create(workbook.window, workbook.instance, IDC_CHART_BAR);
    if (!bar.window) return false;
    LetPlace(bar.window);
    SetupGraphCommandBar(workbook.instance, bar.window, kButtons.data(),
                         static_cast<LONG>(kButtons.size()), &bar.zoom, IDC_ZOOM_COMBO, &bar.type,
                         IDC_TYPE_COMBO);
    AddLegendButton(bar.window);
    return bar.zoom && bar.type;
}

int ChartBarHeight(const Workbook& workbook) {
    return HIWORD(SendMessageW(workbook.chart.bar.window, TB_GETBUTTONSIZE, 0, 0)) + 2 * kEdge;
}

bool OnChartBarCommand(Workbook& workbook, UINT id, UINT code) {
    if (id != IDC_ZOOM_COMBO && id != IDC_TYPE_COMBO) return false;
    const ChartBar& bar = workbook.chart.bar;
    if (code == CBN_SELENDOK) {
        if (id == IDC_ZOOM_COMBO) Choose(workbook, bar.zoom, IDM_CHART_ZOOM_25);
        if (id == IDC_TYPE_COMBO) Choose(workbook, bar.type, IDM_CHART_LINE);
    }
    if (code == CBN_CLOSEUP) SetFocus(workbook.grid);
    return true;
}

void RefreshChartBar(const Workbook& workbook) {
    const Chart& chart = workbook.chart;
    const auto setButton = [&chart](UINT message, WPARAM command, bool value) {
        SendMessageW(chart.bar.window, message, command, MAKELPARAM(value, 0));
    };
    setButton(TB_CHECKBUTTON, IDM_CHART_SHOW, chart.isShown);
    setButton(TB_CHECKBUTTON, IDM_CHART_LEGEND, chart.isShown && IsLegendShown(workbook));
    setButton(TB_ENABLEBUTTON, IDM_CHART_PROPERTIES, chart.isShown);
    setButton(TB_ENABLEBUTTON, IDM_CHART_LEGEND, chart.isShown);
    Show(chart.bar.zoom, KorGraph_GetZoom(chart.graph), chart.isShown);
    Show(chart.bar.type, KorGraph_GetType(chart.graph), chart.isShown);
}

}  // namespace workbook

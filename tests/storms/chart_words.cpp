#include "storms/dialogs.h"
#include "storms/window_words.h"
#include "storms/words.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr int kMostSeries = 10;
constexpr int kMostTotal = 9000;  // a count of points beyond this is not handed over
constexpr int kMostLabels = 400;

HWND Chart(Stage& stage, int place) { return stage.ensure(kChart, place); }

void Notify(Stage& stage, HWND chart, UINT code, LPARAM argument) {
    stage.send(chart, WM_NOTIFY, code, argument);
}

// A pointer is handed over with as many values as the count says, or with a count below 1.
struct HandedSeries {
    HandedSeries(int kind, int count, int index)
        : values(SeriesOf(kind, std::clamp(count, 0, kMostTotal))), data{static_cast<LONG>(std::min(
                                                                             count, kMostTotal)),
                                                                         TextOf(kind + count),
                                                                         values.data(), index} {
        if (values.empty()) data.values = nullptr;
    }
    std::vector<double> values;
    GraphSeriesData data;
};

int SeriesCount(Stage& stage, HWND chart) {
    int count = 0;
    COLORREF colour = 0;
    for (; count <= kMostSeries; ++count) {
        stage.send(chart, GM_GETSERIESCOLOR, static_cast<WPARAM>(count),
                   reinterpret_cast<LPARAM>(&colour));
        if (colour == 0) break;
    }
    return count;
}

void Add(Stage& stage, const Arguments& a) {
    HWND chart = Chart(stage, a[0]);
    const HandedSeries series(a[1], a[2], a[3]);
    if (SeriesCount(stage, chart) >= kMostSeries) {
        Notify(stage, chart, GN_CLEAR, 0);
    } else {
        stage.send(chart, GM_ADDSERIES, 0, reinterpret_cast<LPARAM>(&series.data));
    }
}

void Replace(Stage& stage, const Arguments& a) {
    const HandedSeries series(a[1], a[2], a[3]);
    Notify(stage, Chart(stage, a[0]), GN_REPLACESERIES, reinterpret_cast<LPARAM>(&series.data));
}

void Live(Stage& stage, const Arguments& a) {
    HWND chart = Chart(stage, a[0]);
    const HandedSeries series(a[1], std::min(a[2], 300), a[3]);
    // What the argument is depends on the mode, which a chart does not tell: it is set first.
    stage.send(chart, GM_SETDATAMODE, 0, a[3] & 1);
    Notify(stage, chart, GN_LIVEUPDATE,
           a[3] & 1 ? reinterpret_cast<LPARAM>(&series.data) : static_cast<LPARAM>(a[2]));
}

void SetValue(Stage& stage, const Arguments& a) {
    const GraphValue value = {a[1], a[2], RealOf(a[3])};
    Notify(stage, Chart(stage, a[0]), GN_SETVALUE, reinterpret_cast<LPARAM>(&value));
}

void SetRange(Stage& stage, const Arguments& a) {
    const GraphRange range = {a[1] & 3, 0, RealOf(a[2]), RealOf(a[3])};
    stage.send(Chart(stage, a[0]), GM_SETRANGE, 0, reinterpret_cast<LPARAM>(&range));
}

void Categories(Stage& stage, const Arguments& a) {
    LPCWSTR labels[kMostLabels];
    for (int i = 0; i < kMostLabels; ++i) labels[i] = TextOf(a[2] + i);
    stage.send(Chart(stage, a[0]), GM_SETCATEGORIES,
               static_cast<WPARAM>(std::min(a[1], kMostLabels)), reinterpret_cast<LPARAM>(labels));
}

void Title(Stage& stage, const Arguments& a) {
    static constexpr UINT kTitles[] = {GM_SETTITLE, GM_SETXTITLE, GM_SETYTITLE, GM_SETTITLE};
    stage.send(Chart(stage, a[0]), kTitles[a[1] & 3], 0, reinterpret_cast<LPARAM>(TextOf(a[2])));
}

void Type(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_SETTYPE, 0, a[1] < 0 ? a[1] : a[1] % 5);
}

void OddType(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_SETTYPE, 0, a[1]);
}

void Zoom(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_SETZOOM, 0, a[1] & 3);
}

void Options(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_TOGGLEOPTIONS, 0, 1 << (static_cast<unsigned>(a[1]) % 11));
}

void AllOptions(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_TOGGLEOPTIONS, 0, a[1]);
}

void AutoRange(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_AUTORANGE, 0, a[1]);
}

void Background(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_SETBKCOLOR, 0, a[1]);
}

void DataMode(Stage& stage, const Arguments& a) {
    stage.send(Chart(stage, a[0]), GM_SETDATAMODE, 0, a[1]);
}

void Reset(Stage& stage, const Arguments& a) { Notify(stage, Chart(stage, a[0]), GN_RESET, a[1]); }
void Clear(Stage& stage, const Arguments& a) { Notify(stage, Chart(stage, a[0]), GN_CLEAR, 0); }
void Redraw(Stage& stage, const Arguments& a) { Notify(stage, Chart(stage, a[0]), GN_REDRAW, 0); }

// Null where a pointer is needed, in every message that has one.
void Nulls(Stage& stage, const Arguments& a) {
    static constexpr UINT kMessages[] = {GM_ADDSERIES, GM_GETTITLE,      GM_GETXTITLE,
                                         GM_GETYTITLE, GM_SETCATEGORIES, GM_GETTYPE,
                                         GM_SETRANGE,  GM_GETOPTIONS,    GM_GETSERIESCOLOR,
                                         GM_GETZOOM,   GM_GETRANGE,      GM_SHOWLEGEND};
    HWND chart = Chart(stage, a[0]);
    for (const UINT message : kMessages) stage.send(chart, message, 0, 0);
    Notify(stage, chart, GN_SETVALUE, 0);
    Notify(stage, chart, GN_REPLACESERIES, 0);
    stage.send(chart, GM_SETDATAMODE, 0, KORGRAPH_REPLACE);
    Notify(stage, chart, GN_LIVEUPDATE, 0);
}

// Codes of WM_NOTIFY that nobody has, and the grid's. Those with a pointer or a dialog stay out.
void OddNotice(Stage& stage, const Arguments& a) {
    const auto code = static_cast<UINT>(a[1]);
    const bool takesPointerOrDialog = code >= GN_PROPERTIES && code <= GN_REPLACESERIES;
    if (!takesPointerOrDialog) Notify(stage, Chart(stage, a[0]), code, a[2]);
}

void Copy(Stage& stage, const Arguments& a) { stage.send(Chart(stage, a[0]), GM_COPY, 0, 0); }

void ShowLegend(Stage& stage, const Arguments& a) {
    const RECT place = {a[1], a[2], WrappedSum(a[1], a[3]), WrappedSum(a[2], a[4])};
    stage.send(Chart(stage, a[0]), GM_SHOWLEGEND, 0, reinterpret_cast<LPARAM>(&place));
}

HWND Legend(Stage& stage, int place) { return GetDlgItem(Chart(stage, place), KORLEGEND_ID); }

void LegendScroll(Stage& stage, const Arguments& a) {
    stage.send(Legend(stage, a[0]), WM_VSCROLL, static_cast<WPARAM>(MAKELONG(a[1], a[2])), 0);
}

void LegendPaint(Stage& stage, const Arguments& a) {
    HWND legend = Legend(stage, a[0]);
    if (!legend) return;
    InvalidateRect(legend, nullptr, TRUE);
    UpdateWindow(legend);
}

void LegendDestroy(Stage& stage, const Arguments& a) {
    HWND legend = Legend(stage, a[0]);
    if (legend) DestroyWindow(legend);
}

void LegendResize(Stage& stage, const Arguments& a) {
    HWND legend = Legend(stage, a[0]);
    if (legend) SetWindowPos(legend, nullptr, 0, 0, a[1], a[2], SWP_NOZORDER | SWP_NOACTIVATE);
}

void TipDestroy(Stage& stage, const Arguments& a) {
    HWND tip = GetDlgItem(GetParent(Chart(stage, a[0])), KORTOOLTIP_ID);
    if (tip) DestroyWindow(tip);
}

// Where points are likely to be.
void PressPoint(Stage& stage, const Arguments& a) {
    HWND chart = Chart(stage, a[0]);
    RECT client = {};
    GetClientRect(chart, &client);
    const int x = client.right * (a[1] & 31) / 31;
    const int y = client.bottom * (a[2] & 31) / 31;
    stage.send(chart, WM_LBUTTONDOWN, MK_LBUTTON, PairOf(x, y));
    if (a[3]) stage.send(chart, WM_LBUTTONUP, 0, PairOf(x, y));
}

// One at a time: a second sheet, or a sheet in a printer's dialog, is a host's mistake.
bool isDialogOpen = false;

void Print(Stage& stage, const Arguments& a) {
    HWND chart = Chart(stage, a[0]);
    if (isDialogOpen) return;
    isDialogOpen = true;
    PrintChart(stage, chart, a[1] != 0);
    isDialogOpen = false;
}

void Properties(Stage& stage, const Arguments& a) {
    HWND chart = Chart(stage, a[0]);
    if (isDialogOpen) return;
    isDialogOpen = true;
    UseProperties(stage, chart, TextOf(a[1]), a[2] != 0);
    isDialogOpen = false;
}

constexpr Word kWords[] = {
    KORTEST_WINDOW_WORDS(kChart, "chart."),
    {"chart.add", 90, "svmi", Add},
    {"chart.replace", 40, "svmi", Replace},
    {"chart.live", 40, "svmi", Live},
    {"chart.value", 70, "siid", SetValue},
    {"chart.range", 50, "sidd", SetRange},
    {"chart.categories", 25, "sit", Categories},
    {"chart.title", 40, "sit", Title},
    {"chart.type", 60, "si", Type},
    {"chart.odd_type", 4, "sn", OddType},
    {"chart.zoom", 40, "si", Zoom},
    {"chart.options", 50, "si", Options},
    {"chart.all_options", 10, "sn", AllOptions},
    {"chart.auto_range", 40, "si", AutoRange},
    {"chart.background", 10, "sn", Background},
    {"chart.data_mode", 6, "si", DataMode},
    {"chart.reset", 15, "sb", Reset},
    {"chart.clear", 10, "s", Clear},
    {"chart.redraw", 90, "s", Redraw},
    {"chart.nulls", 6, "s", Nulls},
    {"chart.odd_notice", 10, "snn", OddNotice},
    {"chart.copy", 3, "s", Copy},
    {"chart.print", 6, "sb", Print},
    {"chart.properties", 1, "stb", Properties},
    {"chart.legend", 20, "sxxzz", ShowLegend},
    {"chart.legend_scroll", 25, "soi", LegendScroll},
    {"chart.legend_paint", 20, "s", LegendPaint},
    {"chart.legend_destroy", 2, "s", LegendDestroy},
    {"chart.legend_resize", 8, "szz", LegendResize},
    {"chart.tip_destroy", 2, "s", TipDestroy},
    {"chart.press_point", 80, "snnb", PressPoint},
};

constexpr Word kLegendWords[] = {KORTEST_WINDOW_WORDS(kLegend, "legend.")};

void TipShow(Stage& stage, const Arguments& a) {
    const ToolTipRequest request = {TextOf(a[1]), a[2], a[3], a[4]};
    stage.send(stage.ensure(kTip, a[0]), TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request));
}

void TipHide(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kTip, a[0]), TIPM_HIDE, 0, 0);
}

void TipNull(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kTip, a[0]), TIPM_SHOW, 0, 0);
}

void TipPaint(Stage& stage, const Arguments& a) {
    HWND tip = stage.ensure(kTip, a[0]);
    HDC dc = GetDC(tip);
    stage.send(tip, WM_PAINT, reinterpret_cast<WPARAM>(dc), 0);
    ReleaseDC(tip, dc);
}

constexpr Word kTipWords[] = {
    KORTEST_WINDOW_WORDS(kTip, "tip."),    {"tip.request", 120, "stxxx", TipShow},
    {"tip.hide", 60, "s", TipHide},        {"tip.null", 10, "s", TipNull},
    {"tip.paint_into", 40, "s", TipPaint},
};

}  // namespace

void AddChartWords(Vocabulary& vocabulary) { vocabulary.add(kWords); }
void AddLegendWords(Vocabulary& vocabulary) {
    vocabulary.add(kLegendWords);
    vocabulary.add(kWords);
}
void AddToolTipWords(Vocabulary& vocabulary) { vocabulary.add(kTipWords); }

}  // namespace kortest

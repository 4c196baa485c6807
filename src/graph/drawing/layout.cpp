#include "graph/drawing/layout.h"

#include <korcontrols/graph.h>

#include <algorithm>
#include <cmath>

#include "base/gdi_scopes.h"
#include "base/runtime.h"
#include "graph/scale/number_format.h"
#include "text/text_run.h"

namespace kor {

namespace {

constexpr int kLeastMargin = 15;
constexpr int kTextGap = 4;
constexpr int kLabelGap = 2;
constexpr int kTipRoom = 8;
constexpr double kFontPoints = 10.0;
constexpr int kQuarterTurn = 900;  // tenths of a degree
constexpr wchar_t kAnyDigit[] = L"9";
constexpr wchar_t kWidestPercentage[] = L"99%";

int LineHeight(HDC dc, HFONT font) { return MeasureText(dc, font, kAnyDigit).cy; }

int TopMargin(const GraphRecord& graph, HDC dc) {
    if (!HasOption(graph, KORGRAPH_TITLE) || !graph.title) return kLeastMargin;
    return std::max(LineHeight(dc, graph.hfontTitle) + kTextGap, kLeastMargin);
}

int BottomMargin(GraphRecord& graph, HDC dc) {
    int margin = 0;
    if (HasOption(graph, KORGRAPH_XLABELS)) {
        graph.xLabelHeight = LineHeight(dc, graph.hfontLabel);
        margin += graph.xLabelHeight + kTextGap;
    }
    if (HasOption(graph, KORGRAPH_XTITLE) && graph.xAxisTitle) {
        margin += LineHeight(dc, graph.hfontXTitle) + kTextGap;
    }
    return std::max(margin, kLeastMargin);
}

// Compatibility: only the upper end of the range is measured, so a longer label at the lower end
// may be clipped (GraphMargins.OfTheLeftAreMeasuredByTheUpperEndAlone).
int LeftMargin(GraphRecord& graph, HDC dc) {
    int margin = kTextGap;
    if (HasOption(graph, KORGRAPH_YTITLE) && graph.yAxisTitle) {
        margin = LineHeight(dc, graph.hfontYTitle) + kTextGap;
    }
    if (HasOption(graph, KORGRAPH_YLABELS)) {
        wchar_t widest[kNumberTextCapacity];
        FormatGraphNumber(-std::fabs(graph.yMax), widest, kGraphPrecision);
        const SIZE label = MeasureText(dc, graph.hfontAxis, widest);
        graph.labelMaxWidth = std::max<int>(graph.labelMaxWidth, label.cx / 2);
        graph.labelHalfHeight = label.cy / 2;
        margin += (graph.labelMaxWidth + kLabelGap) * 2;
    }
    return std::max(margin, kLeastMargin);
}

}  // namespace

SIZE MeasureText(HDC dc, HFONT font, const wchar_t* text) {
    SelectScope selected(dc, font);
    return DrawnSize(dc, text);
}

void CreateGraphFonts(GraphRecord& graph, HDC dc) {
    if (graph.hfontTitle) DeleteObject(graph.hfontTitle);
    if (graph.hfontYTitle) DeleteObject(graph.hfontYTitle);
    LOGFONTW description = {};
    description.lfHeight =
        static_cast<LONG>(GetDeviceCaps(dc, LOGPIXELSY) * kFontPoints * (1.0 / 72.0));
    description.lfWeight = FW_NORMAL;
    description.lfCharSet = DEFAULT_CHARSET;
    memcpy(description.lfFaceName, L"Arial", sizeof L"Arial");
    HFONT font = CreateFontIndirectW(&description);
    graph.hfontTitle = graph.hfontXTitle = graph.hfontLabel = graph.hfontAxis = font;
    description.lfEscapement = kQuarterTurn;
    description.lfOrientation = kQuarterTurn;
    graph.hfontYTitle = CreateFontIndirectW(&description);
    graph.numberWidths = MeasureNumberCharacters(dc, graph.hfontAxis);
}

void LayoutGraphMargins(GraphRecord& graph, HDC dc) {
    graph.marginTop = TopMargin(graph, dc);
    graph.marginBottom = BottomMargin(graph, dc);
    graph.marginLeft = LeftMargin(graph, dc);
    graph.tipWidth = 0;
    graph.tipHeight = 0;
    if (HasOption(graph, KORGRAPH_PERCENTAGES)) {
        const SIZE tip = MeasureText(dc, graph.hfontAxis, kWidestPercentage);
        graph.tipWidth = tip.cx + kTipRoom;
        graph.tipHeight = tip.cy + kTipRoom;
    }
}

}  // namespace kor

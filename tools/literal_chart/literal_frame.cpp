#include "literal_chart/literal_chart.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr int kMostSteps = 400000;

void Stroke(HDC dc, int x1, int y1, int x2, int y2) {
    const POINT ends[] = {{x1, y1}, {x2, y2}};
    Polyline(dc, ends, 2);
}

// draw(value, pixel) at the multiples of a step: from 0 backwards until the pixel has passed `low`,
// then from 0 forwards until it has passed `high`. False when it takes too long.
bool WalkFromZero(double step, const std::function<int(double)>& pixelOf, int low, int high,
                  const std::function<void(double, int)>& draw) {
    for (int k = 0;; --k) {
        const int pixel = pixelOf(k * step);
        if (pixel < low) break;
        if (pixel < high) draw(k * step, pixel);
        if (k == -kMostSteps) return false;
    }
    for (int k = 0;; ++k) {
        const int pixel = pixelOf(k * step);
        if (pixel > high) break;
        if (pixel > low) draw(k * step, pixel);
        if (k == kMostSteps) return false;
    }
    return true;
}

bool WalkX(const ChartState& state, int left, int right,
           const std::function<void(double, int)>& draw) {
    return WalkFromZero(
        state.xTickStep, [&](double x) { return state.xPixel(x); }, left, right, draw);
}

// Rows count downwards: from the bottom of the view they are taken as distances below row 0.
bool WalkY(const ChartState& state, int top, int bottom,
           const std::function<void(double, int)>& draw) {
    return WalkFromZero(
        state.yTickStep, [&](double y) { return -state.yPixel(y); }, -bottom, -top,
        [&](double y, int negated) { draw(y, -negated); });
}

void DrawCentred(HDC dc, const std::wstring& text, RECT cell) {
    DrawTextW(dc, text.c_str(), -1, &cell, DT_CENTER);
}

void DrawArrow(ChartState& state, HDC dc, int bit, bool shown, POINT (&place)[3], POINT tip,
               POINT second, POINT third) {
    state.arrowsShown &= ~bit;
    if (!shown) return;
    state.arrowsShown |= bit;
    place[0] = tip;
    place[1] = second;
    place[2] = third;
    Polygon(dc, place, 3);
}

bool DrawYAxis(ChartState& state, HDC dc) {
    const RECT plot = state.plot();
    int x = state.xPixel(0);
    if (x < plot.left) x = plot.left;
    if (x > state.surface.right + state.marginRight) x = state.surface.right + state.marginRight;
    {
        Drawn pen(dc, CreatePen(PS_SOLID, 2, RGB(0, 0, 0)));
        Stroke(dc, x, plot.top, x, plot.bottom);
        DrawArrow(state, dc, kArrowUp, state.yPixel(state.yMax) < plot.top, state.arrowUp,
                  {x, plot.top - 10}, {x - 5, plot.top - 3}, {x + 5, plot.top - 3});
        DrawArrow(state, dc, kArrowDown, state.yPixel(state.yMin) > plot.bottom, state.arrowDown,
                  {x, plot.bottom + 10}, {x - 5, plot.bottom + 3}, {x + 5, plot.bottom + 3});
    }
    if (!state.has(KORGRAPH_YTICKS)) return true;
    Drawn pen(dc, CreatePen(PS_SOLID, 1, RGB(0, 0, 0)));
    return WalkY(state, plot.top, plot.bottom,
                 [&](double, int y) { Stroke(dc, x - 3, y, x + 3, y); });
}

bool DrawXLabels(const ChartState& state, HDC dc) {
    if (!state.has(KORGRAPH_XLABELS)) return true;
    const RECT plot = state.plot();
    const int top = plot.bottom + 4;
    const int bottom = top + state.xLabelHeight;
    const auto cell = [&](int x) {
        return RECT{x - state.xTickHalfSpacing, top, x + state.xTickHalfSpacing, bottom};
    };
    if (!state.categories || state.type == KORGRAPH_BAR) {
        return WalkX(state, plot.left, plot.right,
                     [&](double value, int x) { DrawCentred(dc, NumberText(value), cell(x)); });
    }
    ClipDC(dc, {plot.left + 6, top, plot.right, bottom});
    for (size_t i = 1; i <= state.categories->size(); ++i) {
        const std::wstring& label = (*state.categories)[i - 1];
        const int x = state.xPixel(static_cast<double>(i));
        if (x >= plot.left && x < plot.right && !label.empty()) DrawCentred(dc, label, cell(x));
    }
    const RECT& all = state.surface;
    ClipDC(dc, {all.left, all.top, all.right + 1, all.bottom + 1});
    return true;
}

bool DrawYLabels(const ChartState& state, HDC dc) {
    if (!state.has(KORGRAPH_YLABELS)) return true;
    const RECT plot = state.plot();
    const int right = state.marginLeft - 4;
    const int left = right - 2 * state.labelMaxWidth;
    const auto cell = [&](int y) {
        return RECT{left, y - state.labelHalfHeight, right, y + state.labelHalfHeight};
    };
    if (!state.categories || state.type != KORGRAPH_BAR) {
        return WalkY(state, plot.top, plot.bottom,
                     [&](double value, int y) { DrawCentred(dc, NumberText(value), cell(y)); });
    }
    for (size_t i = 1; i <= state.categories->size(); ++i) {
        const std::wstring& label = (*state.categories)[i - 1];
        const int y = state.yPixel(static_cast<double>(i));
        if (y > plot.top && y <= plot.bottom && !label.empty()) DrawCentred(dc, label, cell(y));
    }
    return true;
}

void DrawXTitle(const ChartState& state, const ChartFonts& fonts, HDC dc) {
    if (!state.has(KORGRAPH_XTITLE) || state.xTitle.empty()) return;
    HGDIOBJ previous = SelectObject(dc, fonts.upright());
    const RECT plot = state.plot();
    DrawCentred(
        dc, state.xTitle,
        {plot.left, plot.bottom + state.xLabelHeight + 8, plot.right, state.surface.bottom});
    SelectObject(dc, previous);
}

void DrawYTitle(const ChartState& state, const ChartFonts& fonts, HDC dc) {
    if (!state.has(KORGRAPH_YTITLE) || state.yTitle.empty()) return;
    HGDIOBJ previous = SelectObject(dc, fonts.turned());
    const RECT plot = state.plot();
    const RECT strip{0, plot.top, 25, plot.bottom};
    ExtTextOutW(dc, 4, plot.bottom - ((plot.bottom - plot.top) >> 1), ETO_CLIPPED, &strip,
                state.yTitle.c_str(), static_cast<UINT>(state.yTitle.size()), nullptr);
    SelectObject(dc, previous);
}

}  // namespace

void ClipDC(HDC dc, const RECT& area) {
    HRGN region = CreateRectRgn(area.left, area.top, area.right, area.bottom);
    SelectObject(dc, region);
    DeleteObject(region);
}

void FillLiteral(HDC dc, const RECT& area, COLORREF colour) {
    HBRUSH brush = CreateSolidBrush(colour);
    FillRect(dc, &area, brush);
    DeleteObject(brush);
}

void DrawLiteralTitle(const ChartState& state, const ChartFonts& fonts, HDC dc) {
    if (!state.has(KORGRAPH_TITLE) || state.title.empty()) return;
    HGDIOBJ previous = SelectObject(dc, fonts.upright());
    DrawCentred(dc, state.title,
                {state.surface.left, state.surface.top, state.surface.right, state.marginTop});
    SelectObject(dc, previous);
}

bool DrawLiteralGrid(const ChartState& state, HDC dc, const RECT* bounds) {
    const RECT area = bounds ? *bounds : state.plot();
    Drawn pen(dc, CreatePen(PS_SOLID, 1, RGB(0, 150, 150)));
    bool finished = true;
    if (state.has(KORGRAPH_HORIZONTALGRID)) {
        finished &= WalkY(state, area.top, area.bottom,
                          [&](double, int y) { Stroke(dc, area.left, y, area.right, y); });
    }
    if (state.has(KORGRAPH_VERTICALGRID)) {
        finished &= WalkX(state, area.left, area.right,
                          [&](double, int x) { Stroke(dc, x, area.top, x, area.bottom); });
    }
    return finished;
}

bool DrawLiteralXAxis(ChartState& state, HDC dc) {
    const RECT plot = state.plot();
    int y = state.yPixel(0);
    if (y < plot.top || y > plot.bottom) y = plot.bottom;
    {
        Drawn pen(dc, CreatePen(PS_SOLID, 2, RGB(0, 0, 0)));
        Stroke(dc, plot.left, y, plot.right, y);
        DrawArrow(state, dc, kArrowLeft, state.xPixel(state.xMin) < plot.left, state.arrowLeft,
                  {plot.left - 10, y}, {plot.left - 3, y - 5}, {plot.left - 3, y + 5});
        DrawArrow(state, dc, kArrowRight, state.xPixel(state.xMax) > plot.right, state.arrowRight,
                  {plot.right + 10, y}, {plot.right + 3, y - 5}, {plot.right + 3, y + 5});
    }
    if (!state.has(KORGRAPH_XTICKS)) return true;
    Drawn pen(dc, CreatePen(PS_SOLID, 1, RGB(0, 0, 0)));
    return WalkX(state, plot.left, plot.right,
                 [&](double, int x) { Stroke(dc, x, y - 3, x, y + 3); });
}

bool DrawLiteralFrame(ChartState& state, const ChartFonts& fonts, HDC dc,
                      const std::function<bool()>& drawSeries) {
    const RECT& all = state.surface;
    FillLiteral(dc, all, state.background);
    DrawLiteralTitle(state, fonts, dc);
    bool finished = DrawLiteralGrid(state, dc, nullptr);
    ClipDC(dc, state.plot());
    finished &= drawSeries();
    ClipDC(dc, {all.left, all.top, all.right + 1, all.bottom + 1});
    finished &= DrawLiteralXAxis(state, dc);
    finished &= DrawYAxis(state, dc);
    HGDIOBJ previous = SelectObject(dc, fonts.upright());
    finished &= DrawXLabels(state, dc);
    finished &= DrawYLabels(state, dc);
    SelectObject(dc, previous);
    DrawXTitle(state, fonts, dc);
    DrawYTitle(state, fonts, dc);
    return finished;
}

}  // namespace kortest

#include "literal_chart/literal_chart.h"

#include <algorithm>
#include <cmath>

namespace kortest {
namespace {

std::vector<POINT> PointsOf(const ChartState& state, const StateSeries& series) {
    std::vector<POINT> points;
    points.reserve(series.values.size());
    for (int i = 1; i <= series.count(); ++i) {
        const double value = series.values[static_cast<size_t>(i - 1)];
        if (std::isfinite(value)) points.push_back({state.xPixel(i), state.yPixel(value)});
    }
    return points;
}

void DrawLineSeries(const ChartState& state, HDC dc, const StateSeries& series) {
    const std::vector<POINT> points = PointsOf(state, series);
    Drawn pen(dc, CreatePen(PS_SOLID, 1, series.colour));
    if (points.size() > 1) Polyline(dc, points.data(), static_cast<int>(points.size()));
    Drawn brush(dc, CreateSolidBrush(series.colour));
    for (const POINT& at : points) {
        Ellipse(dc, at.x - 4, at.y - 4, at.x + 4, at.y + 4);
    }
}

// Polygon's time grows with the rows that its corners span, times the square of their number.
// Measured: about 6e-8 ms each.
bool TakesTooLong(const std::vector<POINT>& corners) {
    constexpr double kMostWork = 5e9;
    const auto [top, bottom] = std::minmax_element(corners.begin(), corners.end(),
                                                   [](POINT a, POINT b) { return a.y < b.y; });
    const double count = static_cast<double>(corners.size());
    return count * count * (static_cast<double>(bottom->y) - top->y) > kMostWork;
}

bool DrawAreaSeries(const ChartState& state, HDC dc, const StateSeries& series) {
    std::vector<POINT> corners = PointsOf(state, series);
    corners.insert(corners.begin(), {state.xPixel(1), state.yPixel(0)});
    corners.push_back({state.xPixel(series.count()), state.yPixel(0)});
    if (TakesTooLong(corners)) return false;
    Drawn brush(dc, CreateSolidBrush(series.colour));
    Polygon(dc, corners.data(), static_cast<int>(corners.size()));
    return true;
}

int Zoomed(const ChartState& state, int thickness) {
    return state.zoom >= 1.0 ? thickness : static_cast<int>(thickness * state.zoom);
}

void DrawColumns(const ChartState& state, HDC dc, const StateSeries& series, int offset, int w) {
    Drawn brush(dc, CreateSolidBrush(series.colour));
    const int base = state.yPixel(0);
    for (int i = 1; i <= series.count(); ++i) {
        const double value = series.values[static_cast<size_t>(i - 1)];
        if (!std::isfinite(value)) continue;
        const int left = state.xPixel(i) + offset;
        const int end = state.yPixel(value);
        const POINT corners[] = {{left, base}, {left, end}, {left + w, end}, {left + w, base}};
        Polygon(dc, corners, 4);
    }
}

void DrawBars(const ChartState& state, HDC dc, const StateSeries& series, int offset, int h) {
    Drawn brush(dc, CreateSolidBrush(series.colour));
    const int base = state.xPixel(0);
    for (int i = 1; i <= series.count(); ++i) {
        const double value = series.values[static_cast<size_t>(i - 1)];
        if (!std::isfinite(value)) continue;
        const int top = state.yPixel(i) - offset;
        const int end = state.xPixel(value);
        const POINT corners[] = {{base, top}, {end, top}, {end, top - h}, {base, top - h}};
        Polygon(dc, corners, 4);
    }
}

void DrawGroups(const ChartState& state, HDC dc) {
    const bool columns = state.type == KORGRAPH_COLUMN;
    const int size = Zoomed(state, columns ? state.barWidth : state.barHeight);
    const int count = static_cast<int>(state.series.size());
    int offset = -(count * size / 2);
    for (const StateSeries& series : state.series) {
        if (columns) {
            DrawColumns(state, dc, series, offset, size);
        } else {
            DrawBars(state, dc, series, offset, size);
        }
        offset += size;
    }
}

}  // namespace

bool DrawLiteralSeries(const ChartState& state, HDC dc) {
    bool finished = true;
    switch (state.type) {
    case KORGRAPH_LINE:
        for (const StateSeries& series : state.series) DrawLineSeries(state, dc, series);
        break;
    case KORGRAPH_AREA:
        for (auto it = state.series.rbegin(); it != state.series.rend(); ++it) {
            finished &= DrawAreaSeries(state, dc, *it);
        }
        break;
    case KORGRAPH_BAR:
    case KORGRAPH_COLUMN: DrawGroups(state, dc); break;
    default: break;
    }
    return finished;
}

bool DrawLiteral(ChartState& state, const ChartFonts& fonts, HDC dc) {
    if (state.type == KORGRAPH_PIE) {
        DrawLiteralPie(state, fonts, dc);
        return true;
    }
    if (state.type < KORGRAPH_LINE || state.type > KORGRAPH_PIE) return true;
    return DrawLiteralFrame(state, fonts, dc, [&] { return DrawLiteralSeries(state, dc); });
}

}  // namespace kortest

// The pie is the one picture whose filling leaves the pixels along a boundary open: here a pixel
// has the colour of the slice that holds its own angle.
#include "literal_chart/literal_chart.h"

#include <algorithm>
#include <cmath>

namespace kortest {
namespace {

constexpr double kRadiansPerDegree = 0.017453292519943295;

POINT RadiusEnd(int radius, double degrees) {
    const double angle = degrees * kRadiansPerDegree;
    return {static_cast<LONG>(-radius * std::sin(angle)),
            static_cast<LONG>(-radius * std::cos(angle))};
}

void DrawRadius(HDC dc, POINT centre, POINT end) {
    const POINT ends[] = {centre, {centre.x + end.x, centre.y + end.y}};
    Polyline(dc, ends, 2);
}

// Half the width of each row of the disc, from the points of a midpoint circle.
std::vector<int> HalfWidths(int radius) {
    std::vector<int> widths(static_cast<size_t>(std::max(radius, 0)) + 1, 0);
    const auto reach = [&](int row, int column) {
        int& width = widths[static_cast<size_t>(row)];
        width = std::max(width, column);
    };
    int d = 3 - 2 * radius;
    for (int x = 0, y = radius; x <= y; ++x) {
        reach(y, x);
        reach(x, y);
        if (d < 0) {
            d += 4 * x + 6;
        } else {
            d += 4 * (x - y) + 10;
            --y;
        }
    }
    return widths;
}

void FillSlice(HDC dc, const LiteralPie& pie, double start, double end) {
    if (pie.radius < 1) return;
    const std::vector<int> widths = HalfWidths(pie.radius);
    for (int dy = -pie.radius; dy <= pie.radius; ++dy) {
        const int half = widths[static_cast<size_t>(std::abs(dy))];
        for (int dx = -half; dx <= half;) {
            const auto inside = [&](int x) {
                const double angle = AngleOf(x, dy);
                return start <= angle && angle < end;
            };
            if (!inside(dx)) {
                ++dx;
                continue;
            }
            const int first = dx;
            while (dx <= half && inside(dx)) ++dx;
            const POINT run[] = {{pie.centre.x + first, pie.centre.y + dy},
                                 {pie.centre.x + dx, pie.centre.y + dy}};
            Polyline(dc, run, 2);
        }
    }
}

void DrawSlices(const ChartState& state, HDC dc, const LiteralPie& pie) {
    const std::vector<double>& values = state.series[0].values;
    const double sum = state.absSum();
    double end = 0;
    POINT boundary{0, -pie.radius};
    for (size_t k = 0; k < values.size(); ++k) {
        const double start = end;
        end += std::fabs(values[k]) / sum * 360;
        {
            Drawn pen(dc, CreatePen(PS_SOLID, 1, PaletteColour(2 + static_cast<int>(k % 15))));
            FillSlice(dc, pie, start, end);
        }
        DrawRadius(dc, pie.centre, boundary);
        boundary = RadiusEnd(pie.radius, end);
        DrawRadius(dc, pie.centre, boundary);
    }
}

void DrawPercentage(const ChartState& state, HDC dc, POINT centre, POINT at, double share) {
    const LONG w = state.tipWidth;
    const LONG h = state.tipHeight;
    RECT box;
    UINT alignment = DT_RIGHT;
    if (at.x < centre.x && at.y <= centre.y) {
        box = {at.x - w, at.y - h, at.x, at.y};
    } else if (at.x <= centre.x && at.y >= centre.y) {
        box = {at.x - w, at.y, at.x, at.y + h};
    } else {
        alignment = DT_LEFT;
        const bool above = at.y < centre.y;
        box = {at.x, above ? at.y - h : at.y, at.x + w, above ? at.y : at.y + h};
    }
    const std::wstring text = std::to_wstring(static_cast<int>(share * 100 + 0.5)) + L"%";
    DrawTextW(dc, text.c_str(), -1, &box, alignment);
}

void DrawPercentages(const ChartState& state, const ChartFonts& fonts, HDC dc, int radius) {
    HGDIOBJ previous = SelectObject(dc, fonts.upright());
    const POINT centre{(state.surface.left + state.surface.right) >> 1,
                       (state.surface.top + state.surface.bottom) >> 1};
    const double sum = state.absSum();
    double end = 0;
    for (const double value : state.series[0].values) {
        const double start = end;
        const double share = std::fabs(value) / sum;
        end += share * 360;
        const POINT offset = RadiusEnd(radius + 4, (start + end) * 0.5);
        DrawPercentage(state, dc, centre, {centre.x + offset.x, centre.y + offset.y}, share);
    }
    SelectObject(dc, previous);
}

}  // namespace

double AngleOf(int dx, int dy) {
    const double degrees = std::atan2(-dx, -dy) / kRadiansPerDegree;
    return degrees < 0 ? degrees + 360 : degrees;
}

LiteralPie PlacePie(const ChartState& state) {
    const RECT& all = state.surface;
    RECT box{all.left + state.tipWidth + 4, all.top + state.tipHeight + 4,
             all.right - state.tipWidth - 4, all.bottom - state.tipHeight - 4};
    if (state.has(KORGRAPH_TITLE) && !state.title.empty()) box.top += state.marginTop;
    const int w = box.right - box.left;
    const int h = box.bottom - box.top;
    if (w <= h) {
        const int middle = (box.top + box.bottom) / 2;
        box.top = middle - w / 2;
        box.bottom = middle + w / 2;
    } else {
        const int middle = (box.left + box.right) / 2;
        box.left = middle - h / 2;
        box.right = middle + h / 2;
    }
    const int radius = (box.bottom - box.top) / 2;
    return {box, {box.left + (box.right - box.left) / 2, box.top + radius}, radius};
}

void DrawLiteralPie(const ChartState& state, const ChartFonts& fonts, HDC dc) {
    FillLiteral(dc, state.surface, state.background);
    DrawLiteralTitle(state, fonts, dc);
    if (state.series.empty()) return;
    const LiteralPie pie = PlacePie(state);
    DrawRadius(dc, pie.centre, {0, -pie.radius});
    const bool sliced = state.absSum() > 0;
    if (sliced) DrawSlices(state, dc, pie);
    HGDIOBJ previous = SelectObject(dc, GetStockObject(NULL_BRUSH));
    Ellipse(dc, pie.box.left, pie.box.top, pie.box.right, pie.box.bottom);
    SelectObject(dc, previous);
    if (sliced && state.has(KORGRAPH_PERCENTAGES)) DrawPercentages(state, fonts, dc, pie.radius);
}

}  // namespace kortest

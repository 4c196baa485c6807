#include "chart_floor.h"

#include <cmath>
#include <cstdlib>

#include "graph/shapes/disc.h"

namespace bench {

namespace {

using kortest::ChartState;
using kortest::StateSeries;

constexpr int kMarkerRadius = 4;
constexpr int kTickHalf = 3;
constexpr double kRadiansPerDegree = 0.017453292519943295;

struct Tick {
    double value;
    int pixel;
};

// The multiples of a step whose pixels lie between two edges, both included.
template <typename PixelOf>
std::vector<Tick> TicksInView(double step, int lowEdge, int highEdge, PixelOf pixelOf) {
    std::vector<Tick> ticks;
    const auto walk = [&](int from, int stride) {
        for (int k = from;; k += stride) {
            const int pixel = pixelOf(k * step);
            if (pixel < lowEdge || pixel > highEdge) return;
            ticks.push_back({k * step, pixel});
        }
    };
    walk(0, 1);
    walk(-1, -1);
    return ticks;
}

int PointCount(const StateSeries& series) { return series.count(); }

double ValueOf(const StateSeries& series, int number) {
    return series.values[static_cast<size_t>(number - 1)];
}

std::vector<POINT> PointsOf(const ChartState& state, const StateSeries& series) {
    std::vector<POINT> points;
    points.reserve(series.values.size() + 2);
    for (int i = 1; i <= PointCount(series); ++i) {
        points.push_back({state.xPixel(i), state.yPixel(ValueOf(series, i))});
    }
    return points;
}

POINT RadiusEnd(POINT centre, int radius, double degrees) {
    const double angle = degrees * kRadiansPerDegree;
    return {centre.x + static_cast<LONG>(-radius * std::sin(angle)),
            centre.y + static_cast<LONG>(-radius * std::cos(angle))};
}

// A slice as horizontal strokes. Which slice has a pixel on a boundary is the library's choice.
void PlanSlice(std::vector<ChartStroke>& strokes, const kortest::LiteralPie& pie, double start,
               double end) {
    std::vector<int32_t> halfWidths(static_cast<size_t>(pie.radius) + 1);
    kor::WalkCircle(pie.radius, halfWidths.data());
    for (int dy = -pie.radius; dy <= pie.radius; ++dy) {
        const int halfWidth = halfWidths[static_cast<size_t>(std::abs(dy))];
        const LONG y = pie.centre.y + dy;
        for (const kor::DiscRun& run :
             SliceOnRow(kor::MakeSliceEdge(start), kor::MakeSliceEdge(end), dy, halfWidth).runs) {
            if (run.from >= run.to) continue;
            strokes.push_back({{{pie.centre.x + run.from, y}, {pie.centre.x + run.to, y}}});
        }
    }
}

}  // namespace

ChartFloor::ChartFloor(const ChartState& state, const kortest::ChartFonts& fonts)
    : isPie_(state.type == KORGRAPH_PIE), surface_(state.surface), font_(fonts.upright()),
      gridPen_(CreatePen(PS_SOLID, 1, RGB(0, 150, 150))),
      axisPen_(CreatePen(PS_SOLID, 2, RGB(0, 0, 0))),
      plot_(CreateRectRgnIndirect(&static_cast<const RECT&>(state.plot()))) {
    switch (state.type) {
    case KORGRAPH_LINE: PlanLines(state); break;
    case KORGRAPH_AREA: PlanAreas(state); break;
    case KORGRAPH_BAR:
    case KORGRAPH_COLUMN: PlanBars(state); break;
    default: PlanPie(state); return;
    }
    PlanFrame(state);
}

ChartFloor::~ChartFloor() {
    for (const Shape& shape : shapes_) {
        DeleteObject(shape.pen);
        DeleteObject(shape.brush);
    }
    DeleteObject(plot_);
    DeleteObject(axisPen_);
    DeleteObject(gridPen_);
}

ChartFloor::Shape& ChartFloor::AddShape(COLORREF colour) {
    shapes_.push_back(
        {CreatePen(PS_SOLID, 1, colour), CreateSolidBrush(colour), {}, {}, {}, {}, {}});
    return shapes_.back();
}

void ChartFloor::PlanFrame(const ChartState& state) {
    const RECT plot = state.plot();
    const int xAxis = state.yPixel(0);
    const int yAxis = state.xPixel(0);
    axes_.push_back({{{plot.left, xAxis}, {plot.right, xAxis}}});
    axes_.push_back({{{yAxis, plot.top}, {yAxis, plot.bottom}}});
    const LONG rowTop = plot.bottom + 4;
    for (const Tick& tick : TicksInView(state.xTickStep, plot.left, plot.right,
                                        [&](double x) { return state.xPixel(x); })) {
        const LONG x = tick.pixel;
        const LONG half = state.xTickHalfSpacing;
        if (x > plot.left) grid_.push_back({{{x, plot.top}, {x, plot.bottom}}});
        ticks_.push_back({{{x, xAxis - kTickHalf}, {x, xAxis + kTickHalf}}});
        labels_.push_back({kortest::NumberText(tick.value),
                           {x - half, rowTop, x + half, rowTop + state.xLabelHeight},
                           DT_CENTER});
    }
    const LONG right = state.marginLeft - 4;
    const LONG left = right - 2 * state.labelMaxWidth;
    for (const Tick& tick : TicksInView(state.yTickStep, plot.top, plot.bottom,
                                        [&](double y) { return state.yPixel(y); })) {
        const LONG y = tick.pixel;
        const LONG half = state.labelHalfHeight;
        grid_.push_back({{{plot.left, y}, {plot.right, y}}});
        ticks_.push_back({{{yAxis - kTickHalf, y}, {yAxis + kTickHalf, y}}});
        labels_.push_back(
            {kortest::NumberText(tick.value), {left, y - half, right, y + half}, DT_CENTER});
    }
}

void ChartFloor::PlanLines(const ChartState& state) {
    for (const StateSeries& series : state.series) {
        AddShape(series.colour).line = PointsOf(state, series);
    }
}

// The first series lies on top.
void ChartFloor::PlanAreas(const ChartState& state) {
    for (auto series = state.series.rbegin(); series != state.series.rend(); ++series) {
        std::vector<POINT>& area = AddShape(series->colour).area;
        area = PointsOf(state, *series);
        area.insert(area.begin(), {state.xPixel(1), state.yPixel(0)});
        area.push_back({state.xPixel(PointCount(*series)), state.yPixel(0)});
    }
}

void ChartFloor::PlanBars(const ChartState& state) {
    const bool upright = state.type == KORGRAPH_COLUMN;
    const LONG size = upright ? state.barWidth : state.barHeight;
    LONG offset = -(static_cast<LONG>(state.series.size()) * size / 2);
    for (const StateSeries& series : state.series) {
        std::vector<POINT>& quads = AddShape(series.colour).quads;
        quads.reserve(4 * series.values.size());
        for (int i = 1; i <= PointCount(series); ++i) {
            const double value = ValueOf(series, i);
            if (upright) {
                const LONG x = state.xPixel(i) + offset;
                const LONG base = state.yPixel(0);
                const LONG end = state.yPixel(value);
                const POINT corners[] = {{x, base}, {x, end}, {x + size, end}, {x + size, base}};
                quads.insert(quads.end(), corners, corners + 4);
            } else {
                const LONG y = state.yPixel(i) - offset;
                const LONG base = state.xPixel(0);
                const LONG end = state.xPixel(value);
                const POINT corners[] = {{base, y}, {end, y}, {end, y - size}, {base, y - size}};
                quads.insert(quads.end(), corners, corners + 4);
            }
        }
        offset += size;
    }
}

void ChartFloor::PlanPie(const ChartState& state) {
    const kortest::LiteralPie pie = PlacePie(state);
    pieBox_ = pie.box;
    const POINT middle = {state.surface.right / 2, state.surface.bottom / 2};
    const double sum = state.absSum();
    double end = 0;
    int number = 0;
    for (const double value : state.series[0].values) {
        const double start = end;
        const double share = std::fabs(value) / sum;
        end += share * 360;
        Shape& slice = AddShape(kortest::PaletteColour(2 + number++ % 15));
        PlanSlice(slice.strokes, pie, start, end);
        slice.edges.push_back({{pie.centre, RadiusEnd(pie.centre, pie.radius, start)}});
        slice.edges.push_back({{pie.centre, RadiusEnd(pie.centre, pie.radius, end)}});
        const POINT at = RadiusEnd(middle, pie.radius + 4, (start + end) * 0.5);
        const bool left = at.x < middle.x || (at.x == middle.x && at.y >= middle.y);
        const bool above = at.y < middle.y || (at.x < middle.x && at.y == middle.y);
        const LONG x = left ? at.x - state.tipWidth : at.x;
        const LONG y = above ? at.y - state.tipHeight : at.y;
        labels_.push_back({std::to_wstring(static_cast<int>(share * 100 + 0.5)) + L"%",
                           {x, y, x + state.tipWidth, y + state.tipHeight},
                           static_cast<UINT>(left ? DT_RIGHT : DT_LEFT)});
    }
}

void ChartFloor::Draw(HDC dc) const {
    FillRect(dc, &surface_, static_cast<HBRUSH>(GetStockObject(WHITE_BRUSH)));
    if (isPie_) {
        DrawPie(dc);
    } else {
        DrawFramed(dc);
    }
    DrawLabels(dc);
}

void ChartFloor::DrawFramed(HDC dc) const {
    HGDIOBJ defaultPen = SelectObject(dc, gridPen_);
    for (const ChartStroke& line : grid_) Polyline(dc, line.ends, 2);
    SelectObject(dc, defaultPen);
    SelectClipRgn(dc, plot_);
    for (const Shape& shape : shapes_) DrawShape(dc, shape);
    SelectClipRgn(dc, nullptr);
    SelectObject(dc, axisPen_);
    for (const ChartStroke& line : axes_) Polyline(dc, line.ends, 2);
    SelectObject(dc, defaultPen);
    for (const ChartStroke& line : ticks_) Polyline(dc, line.ends, 2);
}

void ChartFloor::DrawPie(HDC dc) const {
    for (const Shape& shape : shapes_) DrawShape(dc, shape);
    HGDIOBJ brush = SelectObject(dc, GetStockObject(NULL_BRUSH));
    Ellipse(dc, pieBox_.left, pieBox_.top, pieBox_.right, pieBox_.bottom);
    SelectObject(dc, brush);
}

void ChartFloor::DrawShape(HDC dc, const Shape& shape) const {
    const bool outlined = !shape.area.empty() || !shape.quads.empty();  // with the default pen
    HGDIOBJ brush = SelectObject(dc, shape.brush);
    HGDIOBJ pen = outlined ? nullptr : SelectObject(dc, shape.pen);
    if (!shape.line.empty()) Polyline(dc, shape.line.data(), static_cast<int>(shape.line.size()));
    for (const POINT& at : shape.line) {
        Ellipse(dc, at.x - kMarkerRadius, at.y - kMarkerRadius, at.x + kMarkerRadius,
                at.y + kMarkerRadius);
    }
    if (!shape.area.empty()) Polygon(dc, shape.area.data(), static_cast<int>(shape.area.size()));
    for (size_t i = 0; i < shape.quads.size(); i += 4) Polygon(dc, &shape.quads[i], 4);
    for (const ChartStroke& stroke : shape.strokes) Polyline(dc, stroke.ends, 2);
    if (pen) SelectObject(dc, pen);
    SelectObject(dc, brush);
    for (const ChartStroke& edge : shape.edges) Polyline(dc, edge.ends, 2);
}

void ChartFloor::DrawLabels(HDC dc) const {
    HGDIOBJ font = SelectObject(dc, font_);
    for (const Label& label : labels_) {
        RECT cell = label.cell;
        DrawTextW(dc, label.text.c_str(), static_cast<int>(label.text.size()), &cell, label.format);
    }
    SelectObject(dc, font);
}

}  // namespace bench

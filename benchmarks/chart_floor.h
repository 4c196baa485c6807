// The floor of a chart's redraw: the same picture as a list of bare GDI calls, all of whose values
// are known beforehand. Drawing it computes nothing, looks nothing up and makes no object, so no
// program that draws every point of the chart can do with less.
#pragma once

#include "literal_chart/literal_chart.h"

#include <string>
#include <vector>

namespace bench {

// A line without its last pixel, as Polyline draws it.
struct ChartStroke {
    POINT ends[2];
};

class ChartFloor {
public:
    // `fonts` must outlive it.
    ChartFloor(const kortest::ChartState& state, const kortest::ChartFonts& fonts);
    ~ChartFloor();
    ChartFloor(const ChartFloor&) = delete;
    ChartFloor& operator=(const ChartFloor&) = delete;

    // The DC has its default pen and brush, and draws texts transparently.
    void Draw(HDC dc) const;

private:
    struct Label {
        std::wstring text;
        RECT cell;
        UINT format;
    };
    // What one series, or one slice, is made of; only one kind of drawing has entries.
    struct Shape {
        HPEN pen;
        HBRUSH brush;
        std::vector<POINT> line;           // one Polyline, with a marker on each point
        std::vector<POINT> area;           // one Polygon
        std::vector<POINT> quads;          // a Polygon for every four
        std::vector<ChartStroke> strokes;  // a Polyline for each
        std::vector<ChartStroke> edges;    // the same with the default pen, after the strokes
    };

    void PlanFrame(const kortest::ChartState& state);
    void PlanLines(const kortest::ChartState& state);
    void PlanAreas(const kortest::ChartState& state);
    void PlanBars(const kortest::ChartState& state);
    void PlanPie(const kortest::ChartState& state);
    Shape& AddShape(COLORREF colour);
    void DrawFramed(HDC dc) const;
    void DrawPie(HDC dc) const;
    void DrawShape(HDC dc, const Shape& shape) const;
    void DrawLabels(HDC dc) const;

    bool isPie_;
    RECT surface_;
    RECT pieBox_ = {};
    HFONT font_;
    HPEN gridPen_;
    HPEN axisPen_;
    HRGN plot_;
    std::vector<ChartStroke> grid_;
    std::vector<ChartStroke> axes_;
    std::vector<ChartStroke> ticks_;
    std::vector<Label> labels_;
    std::vector<Shape> shapes_;
};

}  // namespace bench

#include "graph/graph_pie.h"

#include <korcontrols/graph.h>

#include <algorithm>
#include <cmath>

#include "graph/graph_disc.h"
#include "graph/graph_frame.h"
#include "graph/graph_numbers.h"
#include "graph/graph_palette.h"
#include "graph/graph_series.h"
#include "platform/gdi_scopes.h"
#include "platform/local_text.h"

namespace kor {

namespace {

constexpr int kBoxGap = 4;
constexpr int kLabelGap = 4;
constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr double kFullTurn = 360.0;

void DrawRadius(HDC dc, POINT centre, int dx, int dy) {
    const POINT ends[] = {centre, {centre.x + dx, centre.y + dy}};
    Polyline(dc, ends, 2);
}

// The end of a radius, from the centre, in whole pixels.
POINT RadiusEnd(int radius, double degrees) {
    double dx = 0;
    double dy = -radius;
    RotateVector(dx, dy, degrees);
    return {TruncateToInt(dx), TruncateToInt(dy)};
}

void DrawSlice(HDC dc, const PieLayout& pie, COLORREF colour, double start, double end) {
    LocalGdiObject<HPEN> pen(CreatePen(PS_SOLID, 1, colour));
    SelectScope selected(dc, pen.get());
    FillPieSlice(dc, pie.centre.x, pie.centre.y, pie.radius, start, end);
}

void DrawSlices(const GraphSeries& series, HDC dc, const PieLayout& pie) {
    double end = 0;
    POINT boundary = {0, -pie.radius};
    for (int k = 0; k < series.pointCount; ++k) {
        const double start = end;
        end += SliceShare(series, k) * kFullTurn;
        DrawSlice(dc, pie, SliceColour(k), start, end);
        DrawRadius(dc, pie.centre, boundary.x, boundary.y);  // the fill may have covered it
        boundary = RadiusEnd(pie.radius, end);
        DrawRadius(dc, pie.centre, boundary.x, boundary.y);
    }
}

struct LabelPlace {
    RECT box;
    UINT alignment;
};

// Outwards of the label's point, by the quarter it lies in.
LabelPlace PlaceLabel(const GraphRecord& graph, POINT centre, POINT at) {
    const int width = graph.tipWidth;
    const int height = graph.tipHeight;
    if (at.x < centre.x && at.y <= centre.y) {
        return {{at.x - width, at.y - height, at.x, at.y}, DT_RIGHT};
    }
    if (at.x <= centre.x && at.y >= centre.y) {
        return {{at.x - width, at.y, at.x, at.y + height}, DT_RIGHT};
    }
    if (at.y < centre.y) return {{at.x, at.y - height, at.x + width, at.y}, DT_LEFT};
    return {{at.x, at.y, at.x + width, at.y + height}, DT_LEFT};
}

void DrawPercentages(const GraphRecord& graph, const GraphSeries& series, HDC dc, int radius) {
    SelectScope font(dc, graph.hfontAxis);
    const POINT centre = SurfaceCentre(graph);
    double end = 0;
    for (int k = 0; k < series.pointCount; ++k) {
        const double start = end;
        const double share = SliceShare(series, k);
        end += share * kFullTurn;
        const POINT offset = RadiusEnd(radius + kLabelGap, (start + end) * 0.5);
        const LabelPlace place =
            PlaceLabel(graph, centre, {centre.x + offset.x, centre.y + offset.y});
        wchar_t text[kDecimalCapacity + 1];
        _itow(TruncateToInt(share * 100.0 + 0.5), text, 10);
        wcscat(text, L"%");
        DrawNumberText(dc, graph.numberWidths, text, place.box, place.alignment);
    }
}

}  // namespace

POINT SurfaceCentre(const GraphRecord& graph) {
    const RECT& surface = graph.rcPlot;
    return {(surface.left + surface.right) >> 1, (surface.top + surface.bottom) >> 1};
}

PieLayout LayoutPie(const GraphRecord& graph) {
    const RECT& surface = graph.rcPlot;
    const bool titled = HasOption(graph, KORGRAPH_TITLE) && graph.title;
    RECT box = {surface.left + graph.tipWidth + kBoxGap,
                surface.top + graph.tipHeight + kBoxGap + (titled ? graph.marginTop : 0),
                surface.right - graph.tipWidth - kBoxGap,
                surface.bottom - graph.tipHeight - kBoxGap};
    const int width = box.right - box.left;
    const int height = box.bottom - box.top;
    if (width <= height) {
        const int middle = (box.top + box.bottom) / 2;
        box.top = middle - width / 2;
        box.bottom = middle + width / 2;
    } else {
        const int middle = (box.left + box.right) / 2;
        box.left = middle - height / 2;
        box.right = middle + height / 2;
    }
    const int radius = (box.bottom - box.top) / 2;
    return {box, {box.left + (box.right - box.left) / 2, box.top + radius}, radius};
}

bool HasSlices(const GraphSeries* series) {
    return series && series->values && series->absSum > 0 && IsFinite(series->absSum);
}

double SliceShare(const GraphSeries& series, int slice) {
    const double value = series.values[slice];
    return IsFinite(value) ? std::fabs(value) / series.absSum : 0.0;
}

void RotateVector(double& dx, double& dy, double degrees) {
    const double angle = degrees * kRadiansPerDegree;
    const double sine = std::sin(angle);
    const double cosine = std::cos(angle);
    const double turnedX = dx * cosine + dy * sine;
    dy = -dx * sine + dy * cosine;
    dx = turnedX;
}

namespace {

// Rows from the centre's that hold pixels of a slice, and some more: from the centre to its arc.
struct RowRange {
    int first;
    int last;
};

RowRange RowsOfSlice(int radius, double startDegrees, double endDegrees) {
    constexpr int kSpare = 2;
    const int start = RadiusEnd(radius, startDegrees).y;
    const int end = RadiusEnd(radius, endDegrees).y;
    const bool reachesBottom = startDegrees <= 180.0 && endDegrees >= 180.0;
    const int lowest = reachesBottom ? radius : std::max({start, end, 0});
    return {std::max(std::min({start, end, 0}) - kSpare, -radius),
            std::min(lowest + kSpare, radius)};
}

}  // namespace

void FillPieSlice(HDC dc, int centreX, int centreY, int radius, double startDegrees,
                  double endDegrees) {
    if (radius < 1 || !(endDegrees > startDegrees)) return;
    auto* halfWidths = AllocateLocal<int32_t>(static_cast<uint32_t>(radius) + 1);
    if (!halfWidths) return;
    WalkCircle(radius, halfWidths);
    const SliceEdge start = MakeSliceEdge(startDegrees);
    const SliceEdge end = MakeSliceEdge(endDegrees);
    const RowRange rows = RowsOfSlice(radius, startDegrees, endDegrees);
    for (int dy = rows.first; dy <= rows.last; ++dy) {
        const SliceRow row = SliceOnRow(start, end, dy, halfWidths[dy < 0 ? -dy : dy]);
        for (const DiscRun& run : row.runs) {
            if (run.to <= run.from) continue;
            const POINT ends[] = {{centreX + run.from, centreY + dy},
                                  {centreX + run.to, centreY + dy}};
            Polyline(dc, ends, 2);
        }
    }
    LocalFree(halfWidths);
}

void DrawPieChart(GraphRecord& graph, HDC dc) {
    FillBackground(graph, dc);
    DrawGraphTitle(graph, dc);
    const GraphSeries* series = SeriesAt(graph, 0);
    if (!series || !series->values) return;
    const PieLayout pie = LayoutPie(graph);
    DrawRadius(dc, pie.centre, 0, -pie.radius);
    if (HasSlices(series)) DrawSlices(*series, dc, pie);
    {
        SelectScope hollow(dc, GetStockObject(NULL_BRUSH));
        Ellipse(dc, pie.box.left, pie.box.top, pie.box.right, pie.box.bottom);
    }
    if (HasSlices(series) && HasOption(graph, KORGRAPH_PERCENTAGES)) {
        DrawPercentages(graph, *series, dc, pie.radius);
    }
    if (graph.hwnd) InvalidateRect(graph.hwnd, nullptr, FALSE);
}

}  // namespace kor

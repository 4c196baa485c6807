#include "graph/drawing/pie.h"

#include <korcontrols/graph.h>

#include <algorithm>
#include <iterator>

#include "base/assert.h"
#include "base/gdi_scopes.h"
#include "base/local_text.h"
#include "graph/data/axes.h"
#include "graph/data/palette.h"
#include "graph/data/series.h"
#include "graph/drawing/frame.h"
#include "graph/shapes/pie_layout.h"
#include "numbers/truncate.h"

namespace kor {

namespace {

constexpr int kLabelGap = 4;
constexpr double kFullTurn = 360.0;

void DrawRadius(HDC dc, Point centre, int dx, int dy) {
    const POINT ends[] = {{centre.x, centre.y}, {centre.x + dx, centre.y + dy}};
    Polyline(dc, ends, 2);
}

bool IsSamePoint(Point a, Point b) { return a.x == b.x && a.y == b.y; }

// One pen per slice colour, created on first use.
class SlicePens {
public:
    SlicePens() = default;
    ~SlicePens() {
        for (HPEN pen : pens_) {
            if (pen) DeleteObject(pen);
        }
    }
    SlicePens(const SlicePens&) = delete;
    SlicePens& operator=(const SlicePens&) = delete;

    HPEN Of(int slice) {
        HPEN& pen = pens_[slice % kSliceColours];
        if (!pen) pen = CreatePen(PS_SOLID, 1, SliceColour(slice));
        return pen;
    }

private:
    HPEN pens_[kSliceColours] = {};
};

// Fills the disc of a pie slice by slice with horizontal runs. Slices that meet at an angle share
// no pixel and leave no gap.
class DiscFiller {
public:
    DiscFiller(HDC dc, const PieLayout& pie) : dc_(dc), pie_(pie) {
        if (pie.radius < 1) return;
        halfWidths_ = AllocateLocal<int32_t>(static_cast<uint32_t>(pie.radius) + 1);
        if (halfWidths_) WalkCircle(pie.radius, halfWidths_);
    }
    ~DiscFiller() { FreeLocal(halfWidths_); }
    DiscFiller(const DiscFiller&) = delete;
    DiscFiller& operator=(const DiscFiller&) = delete;

    void FillPieSlice(const Boundary& start, const Boundary& end, HPEN pen) const {
        SelectScope selected(dc_, pen);
        if (!halfWidths_ || !(end.edge.degrees > start.edge.degrees)) return;
        const Point centre = pie_.centre;
        const RowRange rows = RowsOfSlice(pie_.radius, start, end);
        KOR_ASSERT(rows.first >= -pie_.radius &&
                   rows.last <= pie_.radius);  // halfWidths_ ends there
        WalkSlice(start.edge, end.edge, rows, halfWidths_, [&](int dy, DiscRun run) {
            const POINT ends[] = {{centre.x + run.from, centre.y + dy},
                                  {centre.x + run.to, centre.y + dy}};
            Polyline(dc_, ends, 2);
        });
    }

private:
    HDC dc_;
    const PieLayout& pie_;
    int32_t* halfWidths_ = nullptr;
};

// The radius where a slice begins is drawn after the slice is filled, because the fill may have
// covered it. Where slices are so thin that the next one begins at the same pixel, the last of them
// draws it for all, so the number of lines depends on the radius, not on the number of slices.
void DrawSlices(const Slices& slices, HDC dc, const PieLayout& pie) {
    SlicePens pens;
    const DiscFiller disc(dc, pie);
    Boundary end = BoundaryAt(pie.radius, 0);
    for (int k = 0; k < slices.count; ++k) {
        const Boundary start = end;
        end = BoundaryAt(pie.radius, start.edge.degrees + ShareOf(slices, k) * kFullTurn);
        disc.FillPieSlice(start, end, pens.Of(k));
        const bool isLast = k == slices.count - 1;
        if (isLast || !IsSamePoint(start.end, end.end)) {
            DrawRadius(dc, pie.centre, start.end.x, start.end.y);
        }
        if (isLast) DrawRadius(dc, pie.centre, end.end.x, end.end.y);
    }
}

struct LabelPlace {
    RECT box;
    UINT alignment;
};

// A label lies outwards of its point, depending on the quadrant.
LabelPlace PlaceLabel(const GraphRecord& graph, Point centre, Point at) {
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

// Labels of thin slices may fall on one another. Drawing the same text again at the same position
// soon changes nothing. Where pixels either take the text's colour or are left alone, once is
// enough. Where they are blended with it, each change darkens a pixel, so there are at most as many
// changes as a channel has values. So what is drawn depends on the positions around the pie, not on
// the number of slices.
class RepeatedLabels {
public:
    explicit RepeatedLabels(const NumberWidths& widths)
        : limit_(widths.stencil ? 1 : kChannelValues) {}

    // Whether to draw a percentage at a position. Positions come in the order of their angles.
    bool IsNeeded(Point at, int percentage) {
        if (percentage < 0 || percentage > kWhole) return true;
        if (!isStarted_ || !IsSamePoint(at, at_)) {
            std::fill(std::begin(drawn_), std::end(drawn_), uint8_t{0});
            isStarted_ = true;
            at_ = at;
        }
        if (drawn_[percentage] == limit_) return false;
        ++drawn_[percentage];
        return true;
    }

private:
    static constexpr int kWhole = 100;
    static constexpr int kChannelValues = 255;

    int limit_;
    bool isStarted_ = false;
    Point at_ = {};
    uint8_t drawn_[kWhole + 1] = {};  // times that each percentage was drawn here
};

void DrawPercentages(const GraphRecord& graph, const Slices& slices, HDC dc, int radius) {
    SelectScope font(dc, graph.hfontAxis);
    const Point centre = CentreOf(SurfaceOf(graph));
    RepeatedLabels repeated(graph.numberWidths);
    double end = 0;
    for (int k = 0; k < slices.count; ++k) {
        const double start = end;
        const double share = ShareOf(slices, k);
        end += share * kFullTurn;
        const int percentage = TruncateToInt(share * 100.0 + 0.5);
        const Point offset = RadiusEnd(radius + kLabelGap, (start + end) * 0.5);
        if (!repeated.IsNeeded(offset, percentage)) continue;
        const LabelPlace place =
            PlaceLabel(graph, centre, {centre.x + offset.x, centre.y + offset.y});
        wchar_t text[kDecimalCapacity + 1];
        _itow(percentage, text, 10);
        wcscat(text, L"%");
        DrawNumberText(dc, graph.numberWidths, text, place.box, place.alignment);
    }
}

}  // namespace

void DrawPieChart(GraphRecord& graph, HDC dc) {
    FillBackground(graph, dc);
    DrawGraphTitle(graph, dc);
    const GraphSeries* series = SeriesAt(graph, 0);
    if (!series || !series->values) return;
    const PieLayout pie = LayoutPie(graph);
    DrawRadius(dc, pie.centre, 0, -pie.radius);
    if (HasSlices(series)) DrawSlices(SlicesOf(*series), dc, pie);
    {
        SelectScope hollow(dc, GetStockObject(NULL_BRUSH));
        Ellipse(dc, pie.box.left, pie.box.top, pie.box.right, pie.box.bottom);
    }
    if (HasSlices(series) && HasOption(graph, KORGRAPH_PERCENTAGES)) {
        DrawPercentages(graph, SlicesOf(*series), dc, pie.radius);
    }
    if (graph.hwnd) InvalidateRect(graph.hwnd, nullptr, FALSE);
}

}  // namespace kor

// The markers of a line. The platform draws one circle; where there are many, its pixels are learnt
// once, united over all points, and filled as horizontal runs: the same pixels for far fewer calls.
#include <algorithm>

#include "graph/graph_frame.h"
#include "graph/graph_lines.h"
#include "graph/graph_numbers.h"
#include "graph/graph_points.h"
#include "graph/graph_scale.h"
#include "platform/gdi_scopes.h"
#include "platform/local_text.h"

namespace kor {

namespace {

constexpr int kRadius = 4;
constexpr int kSide = 2 * kRadius;
constexpr int kFewPoints = 600;  // up to here the platform's own circles are as quick

void DrawCircle(HDC dc, int x, int y) {
    Ellipse(dc, x - kRadius, y - kRadius, x + kRadius, y + kRadius);
}

// Of each row of the circle's square, the columns that it covers: [from, to).
struct CircleRuns {
    int8_t from[kSide];
    int8_t to[kSide];
};

// Draws one circle on a scratch bitmap and reads which pixels it has. The result is the same for
// every screen, so it is learnt once in the process.
const CircleRuns* LearnCircle(HDC like) {
    static constinit CircleRuns runs = {};
    static constinit bool learnt = false;
    if (learnt) return &runs;
    HDC dc = CreateCompatibleDC(like);
    HBITMAP bitmap = dc ? CreateCompatibleBitmap(like, kSide, kSide) : nullptr;
    if (bitmap) {
        SelectScope selected(dc, bitmap);
        PatBlt(dc, 0, 0, kSide, kSide, WHITENESS);
        SelectScope pen(dc, GetStockObject(BLACK_PEN));
        SelectScope brush(dc, GetStockObject(BLACK_BRUSH));
        Ellipse(dc, 0, 0, kSide, kSide);
        for (int y = 0; y < kSide; ++y) {
            int from = 0;
            int to = kSide;
            while (from < kSide && GetPixel(dc, from, y) != RGB(0, 0, 0)) ++from;
            while (to > from && GetPixel(dc, to - 1, y) != RGB(0, 0, 0)) --to;
            runs.from[y] = static_cast<int8_t>(from);
            runs.to[y] = static_cast<int8_t>(to);
        }
        learnt = true;
    }
    if (bitmap) DeleteObject(bitmap);
    if (dc) DeleteDC(dc);
    return learnt ? &runs : nullptr;
}

// Which pixels of an area are covered by runs that begin or end anywhere in it: per row, how many
// more runs cover a column than the one before.
class Coverage {
public:
    Coverage(int left, int top, int width, int height)
        : left_(left), top_(top), width_(width), height_(height),
          steps_(AllocateLocal<int32_t>(static_cast<uint32_t>((width + 1) * height))) {}
    ~Coverage() { FreeLocal(steps_); }
    Coverage(const Coverage&) = delete;
    Coverage& operator=(const Coverage&) = delete;

    bool IsMade() const { return steps_ != nullptr; }

    void AddCircle(const CircleRuns& circle, int x, int y) {
        for (int row = 0; row < kSide; ++row) {
            Add(y - kRadius + row, x - kRadius + circle.from[row], x - kRadius + circle.to[row]);
        }
    }

    // fill(x, y, width) for every run of covered pixels.
    template <typename Fill>
    void ForEachRun(Fill fill) const {
        for (int row = 0; row < height_; ++row) {
            const int32_t* steps = steps_ + row * (width_ + 1);
            int depth = 0;
            int start = 0;
            for (int x = 0; x <= width_; ++x) {
                const int next = depth + steps[x];
                if (depth == 0 && next > 0) start = x;
                if (depth > 0 && next == 0) fill(left_ + start, top_ + row, x - start);
                depth = next;
            }
        }
    }

private:
    void Add(int y, int from, int to) {
        const int row = y - top_;
        if (row < 0 || row >= height_) return;
        const int first = std::clamp(from - left_, 0, width_);
        const int past = std::clamp(to - left_, 0, width_);
        int32_t* steps = steps_ + row * (width_ + 1);
        ++steps[first];
        --steps[past];
    }

    int left_;
    int top_;
    int width_;
    int height_;
    int32_t* steps_;
};

// Rows of one image column that hold a point: each point counts once however often it comes, and
// none is looked at when there can be no new one.
class RowSet {
public:
    RowSet(int top, int height)
        : top_(top), height_(height), rows_(AllocateLocal<uint8_t>(static_cast<uint32_t>(height))) {
    }
    ~RowSet() { FreeLocal(rows_); }
    RowSet(const RowSet&) = delete;
    RowSet& operator=(const RowSet&) = delete;

    bool IsMade() const { return rows_ != nullptr; }

    // Begins a column whose points lie between two rows, both included.
    void Begin(int highest, int lowest) {
        std::fill_n(rows_, height_, uint8_t{0});
        missing_ = std::min(lowest, top_ + height_ - 1) - std::max(highest, top_) + 1;
    }

    bool MayGrow() const { return missing_ > 0; }

    // True when the row lies in view and is new in this column.
    bool Insert(int y) {
        const int row = y - top_;
        if (row < 0 || row >= height_ || rows_[row]) return false;
        rows_[row] = 1;
        --missing_;
        return true;
    }

private:
    int top_;
    int height_;
    int missing_ = 0;  // rows that the column's points can still come to
    uint8_t* rows_;
};

// found(y) for each row that holds one of the points [number, end) of a column.
template <typename Found>
void ForEachNewRow(const GraphRecord& graph, const double* values, int number, int end,
                   RowSet& rows, Found found) {
    const PositionSummary summary = Summarise(values, number, end);
    if (summary.first < 0) return;
    rows.Begin(yPixel(graph, values[summary.highest]), yPixel(graph, values[summary.lowest]));
    for (int i = number; i < end && rows.MayGrow(); ++i) {
        const double value = values[i - 1];
        if (!IsFinite(value)) continue;
        const int y = yPixel(graph, value);
        if (rows.Insert(y)) found(y);
    }
}

bool DrawUnited(const GraphRecord& graph, HDC dc, const GraphSeries& series, PointRange range,
                const RECT& view) {
    const CircleRuns* circle = LearnCircle(dc);
    if (!circle) return false;
    const int height = view.bottom - view.top;
    Coverage coverage(view.left, view.top, view.right - view.left, height);
    RowSet seen(view.top - kRadius, height + kSide);
    if (!coverage.IsMade() || !seen.IsMade()) return false;
    for (int number = range.first; number <= range.last;) {
        const int x = xPixel(graph, number);
        const int end = EndOfPosition(graph, xPixel, range, number);
        ForEachNewRow(graph, series.values, number, end, seen,
                      [&](int y) { coverage.AddCircle(*circle, x, y); });
        number = end;
    }
    coverage.ForEachRun([&](int x, int y, int width) { PatBlt(dc, x, y, width, 1, PATCOPY); });
    return true;
}

// Circles are learnt on a screen; a printer draws its own.
bool IsRasterImage(HDC dc) { return GetDeviceCaps(dc, TECHNOLOGY) == DT_RASDISPLAY; }

}  // namespace

void DrawSeriesMarkers(const GraphRecord& graph, HDC dc, const GraphSeries& series) {
    LocalGdiObject<HBRUSH> brush(CreateSolidBrush(series.colour));
    SelectScope selected(dc, brush.get());
    const RECT view = PlotClip(graph);
    const PointRange range =
        PointsBetween(graph, xPixel, series.pointCount, view.left - kRadius, view.right + kRadius);
    const bool many = range.last - range.first + 1 > kFewPoints;
    if (many && IsRasterImage(dc) && DrawUnited(graph, dc, series, range, view)) return;
    for (int i = range.first; i <= range.last; ++i) {
        const double value = series.values[i - 1];
        if (IsFinite(value)) DrawCircle(dc, xPixel(graph, i), yPixel(graph, value));
    }
}

}  // namespace kor

// The markers of a line. The platform draws single circles. Where there are many, one circle is
// rasterised once, its pixels are merged over all points, and the result is filled as horizontal
// runs: the same pixels with far fewer calls.
#include <algorithm>
#include <iterator>

#include "base/assert.h"
#include "base/gdi_scopes.h"
#include "base/local_text.h"
#include "base/runtime.h"
#include "graph/drawing/frame.h"
#include "graph/drawing/lines.h"
#include "graph/drawing/series_points.h"
#include "numbers/comparable.h"

namespace kor {

namespace {

constexpr int kRadius = 4;
constexpr int kSide = 2 * kRadius;
constexpr int kFewPoints = 600;  // up to this many, the platform's own circles are as fast

void DrawCircle(HDC dc, int x, int y) {
    Ellipse(dc, x - kRadius, y - kRadius, x + kRadius, y + kRadius);
}

// One mask per row of the marker's bounding box, bit 0 the leftmost column; the set bits are
// contiguous.
struct CircleRows {
    uint32_t bits[kSide];
};

bool ReadCircleRow(HDC dc, int y, uint32_t& bits) {
    bits = 0;
    for (int x = 0; x < kSide; ++x) {
        const COLORREF pixel = GetPixel(dc, x, y);
        if (pixel == CLR_INVALID) return false;
        if (pixel == RGB(0, 0, 0)) bits |= 1u << x;
    }
    return true;
}

// Whether the set bits are contiguous, or none is set.
constexpr bool IsOneRun(uint32_t bits) { return (bits & (bits + (bits & (0u - bits)))) == 0; }
static_assert(IsOneRun(0) && IsOneRun(0x3C) && IsOneRun(0xFF) && !IsOneRun(0x42));

// Whether the rows are those of a filled circle. A failed call leaves a blank bitmap, a full one or
// an outline.
bool IsCircle(const CircleRows& rows) {
    if (rows.bits[0] == 0 || (rows.bits[0] & 1) != 0) return false;
    return std::all_of(std::begin(rows.bits), std::end(rows.bits), IsOneRun);
}

// Draws one circle on a scratch bitmap and reads its pixels back.
bool ReadCircle(HDC like, CircleRows& rows) {
    MemoryDC dc(like);
    LocalGdiObject<HBITMAP> bitmap(dc.get() ? CreateCompatibleBitmap(like, kSide, kSide) : nullptr);
    if (!bitmap.get()) return false;
    SelectScope selected(dc.get(), bitmap.get());
    PatBlt(dc.get(), 0, 0, kSide, kSide, WHITENESS);
    SelectScope pen(dc.get(), GetStockObject(BLACK_PEN));
    SelectScope brush(dc.get(), GetStockObject(BLACK_BRUSH));
    Ellipse(dc.get(), 0, 0, kSide, kSide);
    for (int y = 0; y < kSide; ++y) {
        if (!ReadCircleRow(dc.get(), y, rows.bits[y])) return false;
    }
    return IsCircle(rows);
}

// The result is the same for every screen, so the circle is rasterised once per process, by the
// first chart for which no call fails.
const CircleRows* LearnCircle(HDC like) {
    static constinit CircleRows rows = {};
    static constinit bool learnt = false;
    if (!learnt) learnt = ReadCircle(like, rows);
    return learnt ? &rows : nullptr;
}

// The pixels of an area that circles cover, one bit per pixel.
class Coverage {
public:
    explicit Coverage(const RECT& area)
        : area_(area), words_((area.right - area.left) / kWordBits + 1 + 2 * kSpareWords),
          bits_(AllocateLocal<uint32_t>(static_cast<uint32_t>(words_ * (area.bottom - area.top)))) {
    }
    ~Coverage() { FreeLocal(bits_); }
    Coverage(const Coverage&) = delete;
    Coverage& operator=(const Coverage&) = delete;

    bool IsMade() const { return bits_ != nullptr; }

    void AddCircle(const CircleRows& circle, int x, int y) {
        const int left = x - kRadius;
        if (left + kSide <= area_.left || left >= area_.right) return;
        const auto place = static_cast<uint32_t>(left - area_.left + kSpareWords * kWordBits);
        const uint32_t shift = place % kWordBits;
        const int first = std::max(y - kRadius, static_cast<int>(area_.top));
        const int past = std::min(y - kRadius + kSide, static_cast<int>(area_.bottom));
        // A circle extends less than a word beyond the area, which has a spare word on each side.
        KOR_ASSERT(place / kWordBits + 1 < static_cast<uint32_t>(words_));
        for (int row = first; row < past; ++row) {
            const uint32_t covered = circle.bits[row - (y - kRadius)];
            uint32_t* bits = bits_ + (row - area_.top) * words_ + place / kWordBits;
            bits[0] |= covered << shift;
            if (shift > kWordBits - kSide) bits[1] |= covered >> (kWordBits - shift);
        }
    }

    // fill(x, y, width) for every run of covered pixels.
    template <typename Fill>
    void ForEachRun(Fill fill) const {
        for (int y = area_.top; y < area_.bottom; ++y) {
            const uint32_t* row = bits_ + (y - area_.top) * words_ + kSpareWords;
            for (int x = area_.left; x < area_.right;) {
                const int start = FindColumn(row, x, true);
                x = FindColumn(row, start, false);
                if (start < x) fill(start, y, x - start);
            }
        }
    }

private:
    static constexpr int kWordBits = 32;
    static constexpr int kSpareWords = 1;  // on each side, for circles that extend beyond the area

    // The first column from x on that is covered, or is not covered; the area's right edge if there
    // is none.
    int FindColumn(const uint32_t* row, int x, bool covered) const {
        const uint32_t other = covered ? 0 : ~0u;
        while (x < area_.right) {
            const auto place = static_cast<uint32_t>(x - area_.left);
            uint32_t rest = (row[place / kWordBits] ^ other) >> (place % kWordBits);
            if (rest == 0) {
                x += kWordBits - static_cast<int>(place % kWordBits);
                continue;
            }
            for (; (rest & 1) == 0; rest >>= 1) ++x;
            return std::min(x, static_cast<int>(area_.right));
        }
        return area_.right;
    }

    RECT area_;
    int words_;  // per row
    uint32_t* bits_;
};

// The rows of one image column that hold a point. Each row counts once, however many points share
// it, and the search ends when there can be no new row.
class RowSet {
public:
    RowSet(int top, int height)
        : top_(top), height_(height), rows_(AllocateLocal<uint8_t>(static_cast<uint32_t>(height))) {
    }
    ~RowSet() { FreeLocal(rows_); }
    RowSet(const RowSet&) = delete;
    RowSet& operator=(const RowSet&) = delete;

    bool IsMade() const { return rows_ != nullptr; }

    // Starts a column whose points lie between two rows, both included.
    void Begin(int highest, int lowest) {
        const int first = std::max(highest - top_, 0);
        missing_ = std::min(lowest - top_, height_ - 1) - first + 1;
        KOR_ASSERT(missing_ <= 0 || first + missing_ <= height_);
        if (missing_ > 0) memset(rows_ + first, 0, static_cast<size_t>(missing_));
    }

    bool MayGrow() const { return missing_ > 0; }

    // True when the row lies in view and is new in this column.
    bool Insert(int y) {
        const int row = y - top_;
        if (row < 0 || row >= height_ || rows_[row]) return false;
        KOR_ASSERT(missing_ > 0);
        rows_[row] = 1;
        --missing_;
        return true;
    }

private:
    int top_;
    int height_;
    int missing_ = 0;  // rows that the column's points may still reach
    uint8_t* rows_;
};

// Calls found(y) for each row that holds one of the points [number, end) of a column.
template <typename Found>
void ForEachNewRow(const ValueTrace& trace, int number, int end, RowSet& rows, Found found) {
    const PositionSummary summary = Summarise(trace.values, number, end);
    if (summary.first < 0) return;
    rows.Begin(PixelAt(trace.y, trace.values[summary.highest]),
               PixelAt(trace.y, trace.values[summary.lowest]));
    for (int i = number; i < end && rows.MayGrow(); ++i) {
        const double value = trace.values[i - 1];
        if (!IsFinite(value)) continue;
        const int y = PixelAt(trace.y, value);
        if (rows.Insert(y)) found(y);
    }
}

bool DrawUnited(HDC dc, const ValueTrace& trace, PointRange range, const RECT& view) {
    const CircleRows* circle = LearnCircle(dc);
    if (!circle) return false;
    Coverage coverage(view);
    RowSet seen(view.top - kRadius, view.bottom - view.top + kSide);
    if (!coverage.IsMade() || !seen.IsMade()) return false;
    for (PositionWalk walk(trace.x, range); !walk.IsAtEnd(); walk.Next()) {
        ForEachNewRow(trace, walk.number(), walk.end(), seen,
                      [&](int y) { coverage.AddCircle(*circle, walk.pixel(), y); });
    }
    coverage.ForEachRun([&](int x, int y, int width) { PatBlt(dc, x, y, width, 1, PATCOPY); });
    return true;
}

// Circles are rasterised for a screen; a printer draws its own.
bool IsRasterImage(HDC dc) { return GetDeviceCaps(dc, TECHNOLOGY) == DT_RASDISPLAY; }

}  // namespace

void DrawSeriesMarkers(const GraphRecord& graph, HDC dc, const GraphSeries& series) {
    LocalGdiObject<HBRUSH> brush(CreateSolidBrush(series.colour));
    SelectScope selected(dc, brush.get());
    const RECT view = PlotClip(graph);
    const ValueTrace trace = TraceOf(graph, series);
    const PointRange range =
        PointsBetween(trace.x, trace.count, view.left - kRadius, view.right + kRadius);
    const bool many = range.last - range.first + 1 > kFewPoints;
    if (many && IsRasterImage(dc) && DrawUnited(dc, trace, range, view)) return;
    for (int i = range.first; i <= range.last; ++i) {
        const double value = trace.values[i - 1];
        if (IsFinite(value)) DrawCircle(dc, PixelAt(trace.x, i), PixelAt(trace.y, value));
    }
}

}  // namespace kor

// Polygon's time grows with the rows that its corners span, visible or not, and with their number.
// Here each column in view is filled on its own. That gives the same pixels, because the outline is
// drawn over the fill: it covers each pixel whose centre is less than half a pixel from an edge,
// and all other pixels lie inside or outside by any rounding rule.
#include "graph/drawing/area.h"

#include <algorithm>

namespace kor {

namespace {

// Polygon's time grows with the rows that its corners span, times the square of their number. Up to
// about this product it is faster.
constexpr double kPolygonWork = 5e6;

bool SuitsPolygon(HDC dc, const AreaOutline& outline) {
    // A printer driver takes a whole polygon, and a page has very many columns.
    if (GetDeviceCaps(dc, TECHNOLOGY) != DT_RASDISPLAY) return true;
    const auto isHigher = [](const POINT& a, const POINT& b) { return a.y < b.y; };
    const auto [highest, lowest] =
        std::minmax_element(outline.corners, outline.corners + outline.count, isHigher);
    const double count = outline.count;
    return count * count * (static_cast<double>(lowest->y) - highest->y) <= kPolygonWork;
}

// Rows [top, bottom).
struct Rows {
    int top;
    int bottom;
};

// The rows strictly between the zero line and the outline in one column, where the outline covers
// at least the rows from `highest` down to `lowest`.
Rows RowsBetween(int base, int highest, int lowest) {
    if (lowest < base) return {lowest + 1, base};
    if (highest > base) return {base + 1, highest};
    return {base, base};
}

int FloorOf(INT64 numerator, INT64 denominator) {
    const INT64 quotient = numerator / denominator;
    return static_cast<int>(quotient * denominator > numerator ? quotient - 1 : quotient);
}

// Fills columns of a view. Neighbouring columns with the same rows become one rectangle.
class ColumnFiller {
public:
    ColumnFiller(HDC dc, const RECT& view) : dc_(dc), view_(view) {}
    ~ColumnFiller() { Flush(); }
    ColumnFiller(const ColumnFiller&) = delete;
    ColumnFiller& operator=(const ColumnFiller&) = delete;

    // Columns must come from left to right, without gaps.
    void Fill(int column, Rows rows) {
        rows.top = std::max(rows.top, static_cast<int>(view_.top));
        rows.bottom = std::min(rows.bottom, static_cast<int>(view_.bottom));
        if (rows.top != rows_.top || rows.bottom != rows_.bottom) {
            Flush();
            rows_ = rows;
            left_ = column;
        }
        end_ = column + 1;
    }

private:
    void Flush() {
        if (rows_.top < rows_.bottom) {
            PatBlt(dc_, left_, rows_.top, end_ - left_, rows_.bottom - rows_.top, PATCOPY);
        }
    }

    HDC dc_;
    RECT view_;
    Rows rows_ = {0, 0};
    int left_ = 0;
    int end_ = 0;
};

// Fills the columns strictly between two corners, where the outline is a single line.
void FillBetween(ColumnFiller& filler, const RECT& view, int base, POINT from, POINT to) {
    const INT64 run = static_cast<INT64>(to.x) - from.x;
    const INT64 rise = static_cast<INT64>(to.y) - from.y;
    const int last = std::min(to.x, view.right) - 1;
    for (int column = std::max(from.x + 1, view.left); column <= last; ++column) {
        const INT64 numerator = (column - static_cast<INT64>(from.x)) * rise;
        const int above = from.y + FloorOf(numerator, run);
        const int below = from.y - FloorOf(-numerator, run);
        filler.Fill(column, RowsBetween(base, below, above));
    }
}

void FillColumns(HDC dc, const RECT& view, const AreaOutline& outline) {
    const POINT* const end = outline.corners + outline.count;
    const int base = outline.corners->y;
    ColumnFiller filler(dc, view);
    for (const POINT* corner = outline.corners; corner != end && corner->x < view.right;) {
        // The corners of one column: the outline covers all rows between them.
        const POINT* const first = corner;
        int highest = first->y;
        int lowest = first->y;
        for (; corner != end && corner->x == first->x; ++corner) {
            highest = std::min(highest, static_cast<int>(corner->y));
            lowest = std::max(lowest, static_cast<int>(corner->y));
        }
        if (first->x >= view.left) filler.Fill(first->x, RowsBetween(base, highest, lowest));
        if (corner != end) FillBetween(filler, view, base, corner[-1], *corner);
    }
}

}  // namespace

void DrawArea(HDC dc, const RECT& view, const AreaOutline& outline) {
    if (SuitsPolygon(dc, outline)) {
        Polygon(dc, outline.corners, outline.count);
        return;
    }
    FillColumns(dc, view, outline);
    outline.corners[outline.count] = outline.corners[0];
    Polyline(dc, outline.corners, outline.count + 1);
}

}  // namespace kor

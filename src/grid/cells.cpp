// What a host calls to draw cells inside GRIDN_PAINTCELLS: background, border and text of a cell,
// straight into the off-screen image.
#include <korcontrols/grid.h>

#include <algorithm>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "grid/sizes.h"
#include "grid/state.h"
#include "grid/visible.h"
#include "text/text_run.h"
#include "text/zoomed_font.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

constexpr UINT kDefaultFormat = DT_NOPREFIX | DT_VCENTER | DT_CENTER;
constexpr int kTextMargin = 3;
constexpr int kTextTop = 1;
constexpr int kHashLimit = 255;
constexpr LONG kSpanLimit = 16000;  // columns; keeps the sums from overflowing

// The client rectangle that a text may cover; `box` is its own cell's.
RECT TextArea(const RECT& box, int column, LONG spanLeft, LONG spanRight) {
    RECT area = box;
    if (spanLeft > 0) {
        const int first =
            std::max<int>(grid.firstVisibleColumn, column - std::min<LONG>(spanLeft, column));
        area.left = ColumnLeft(first);
    }
    if (spanRight > 0) {
        // Columns past the sheet's end have the default width.
        area.right = ColumnLeft(column + std::min<LONG>(spanRight, kSpanLimit) + 1);
    } else if (spanRight < 0) {
        area.right = ClientRectOf(grid.hwndGrid).right + (box.right - box.left);
    }
    return {area.left + kTextMargin, area.top + kTextTop, area.right - kTextMargin, area.bottom};
}

// Fills `text` with as many "#" as fit into `width` pixels. It has room for kHashLimit of them and
// the terminator.
void FillWithHashes(HDC dc, int width, wchar_t* text) {
    const int hashWidth = TextRun(dc, L"#").Width();
    const int count = hashWidth > 0 ? std::clamp(width / hashWidth, 0, kHashLimit) : 0;
    std::fill_n(text, count, L'#');
    text[count] = L'\0';
}

struct CellText {
    const wchar_t* text;
    UINT format;
    bool fitCheck;  // a text that is too wide becomes a row of "#"
    bool keepSpan;  // a centred text stays over the span even if it fits
};

void DrawRun(TextRun& run, const RECT& area, UINT format) {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (zoomLevel >= kZoomHuge) run.LimitTo(client);
    run.Draw(area, format);
}

void DrawCellText(HDC dc, const RECT& box, RECT area, const CellText& cell) {
    const int width = area.right - area.left;
    TextRun run(dc, cell.text);
    if (cell.fitCheck && width < run.Width()) {
        wchar_t hashes[kHashLimit + 1];
        FillWithHashes(dc, width, hashes);
        TextRun row(dc, hashes);
        DrawRun(row, area, kDefaultFormat);
        return;
    }
    const bool mayShrink = !cell.fitCheck && !cell.keepSpan && (cell.format & DT_CENTER);
    if (mayShrink && run.Width() < width) {
        area.left = box.left + kTextMargin;
        area.right = box.right - kTextMargin;
    }
    DrawRun(run, area, cell.format);
}

}  // namespace

}  // namespace kor

using namespace kor;

extern "C" void KORCONTROLS_API SetCellBackGroundColor(CellIndex cell, HBRUSH brush) {
    const int column = KORGRID_CELLCOLUMN(cell);
    const int row = KORGRID_CELLROW(cell);
    if (!brush || !IsCellVisible(column, row)) return;
    RECT box = CellBox(column, row);
    ++box.right;  // covers the lines on all four sides
    ++box.bottom;
    FillRect(grid.memoryDC, &box, brush);
}

extern "C" void KORCONTROLS_API SetCellBorder(CellIndex cell, HPEN pen, DWORD left, DWORD right,
                                              DWORD top, DWORD bottom) {
    const int column = KORGRID_CELLCOLUMN(cell);
    const int row = KORGRID_CELLROW(cell);
    if (!pen || !IsCellVisible(column, row)) return;
    const RECT box = CellBox(column, row);
    const POINT leftTop = {box.left, box.top};
    const POINT leftBottom = {box.left, box.bottom};
    const POINT rightTop = {box.right, box.top};
    const POINT rightBottom = {box.right, box.bottom};
    const struct {
        DWORD flag;
        POINT ends[2];
    } edges[] = {{left, {leftTop, leftBottom}},
                 {right, {rightTop, rightBottom}},
                 {top, {leftTop, rightTop}},
                 {bottom, {leftBottom, rightBottom}}};
    SelectScope borderPen(grid.memoryDC, pen);
    for (const auto& edge : edges) {
        if (LowWord(edge.flag)) Polyline(grid.memoryDC, edge.ends, 2);
    }
}

extern "C" void KORCONTROLS_API SetCellValue(CellIndex cell, LPCWSTR text, HFONT font,
                                             COLORREF textColour, COLORREF backColour, UINT format,
                                             LONG spanLeft, LONG spanRight, DWORD fitCheck,
                                             DWORD keepSpan) {
    const int column = KORGRID_CELLCOLUMN(cell);
    const int row = KORGRID_CELLROW(cell);
    if (!text || !IsCellVisible(column, row)) return;
    const RECT box = CellBox(column, row);
    HDC dc = grid.memoryDC;
    SetTextColor(dc, textColour);
    SetBkColor(dc, backColour);
    LocalGdiObject<HFONT> zoomed(zoomLevel == kZoomWhole ? nullptr : CreateZoomedFont(font));
    SelectScope selected(dc, zoomLevel == kZoomWhole ? font : zoomed.get());
    DrawCellText(dc, box, TextArea(box, column, spanLeft, spanRight),
                 {text, format ? format : kDefaultFormat, fitCheck != 0, keepSpan != 0});
}

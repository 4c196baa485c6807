// Items are drawn as raised buttons with Rectangle calls; pen and brush decide each edge.
#include "header/drawing.h"

#include <korcontrols/header.h>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "text/text_run.h"
#include "text/zoomed_font.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

constexpr int kTextMargin = 3;
constexpr COLORREF kTextColour = RGB(0, 0, 0);
constexpr COLORREF kSelectedTextColour = RGB(255, 255, 255);

void DrawBox(HDC dc, const RECT& box) { Rectangle(dc, box.left, box.top, box.right, box.bottom); }

void SelectStock(HDC dc, int object) { SelectObject(dc, GetStockObject(object)); }

// Draws outline and face. Leaves the white pen selected, and the brush that the frame is drawn
// with.
void DrawFace(HDC dc, const RECT& box, const RECT& highlight, bool selected) {
    SelectObject(dc, headerPaint.framePen);
    SelectObject(dc, headerPaint.faceBrush);
    DrawBox(dc, box);
    SelectStock(dc, WHITE_PEN);
    DrawBox(dc, highlight);
    if (selected) {
        SelectStock(dc, DKGRAY_BRUSH);
        DrawBox(dc, box);
        SelectStock(dc, LTGRAY_BRUSH);
    }
}

void DrawFrame(HDC dc, const RECT& whiteLine, const RECT& firstBlackLine,
               const RECT& secondBlackLine) {
    DrawBox(dc, whiteLine);
    SelectStock(dc, BLACK_PEN);
    DrawBox(dc, firstBlackLine);
    DrawBox(dc, secondBlackLine);
}

// `left` and `right` bound the item along the strip, `client` across it.
void DrawHorizontalItem(HDC dc, const RECT& client, int left, int right, uint32_t states) {
    const int top = client.top;
    const int bottom = client.bottom;
    DrawFace(dc, {left, top, right, bottom}, {left + 1, top + 1, left + 2, bottom - 1},
             (states & HIS_SELECTED) != 0);
    if (states & HIS_FRAMED) {
        DrawFrame(dc, {left + 1, top + 1, right - 1, top + 2},
                  {left + 1, bottom - 1, right - 1, bottom - 2},
                  {right - 2, top + 1, right - 1, bottom - 1});
    }
}

void DrawVerticalItem(HDC dc, const RECT& client, int top, int bottom, uint32_t states) {
    const int left = client.left;
    const int right = client.right;
    DrawFace(dc, {left, top, right, bottom}, {left + 1, top + 1, right - 1, top + 2},
             (states & HIS_SELECTED) != 0);
    if (states & HIS_FRAMED) {
        DrawFrame(dc, {left + 1, top + 1, left + 2, bottom - 1},
                  {right - 1, top + 1, right - 2, bottom - 1},
                  {left + 1, bottom - 2, right - 1, bottom - 1});
    }
}

void DrawLabel(HDC dc, const wchar_t* text, const RECT& box, UINT format, uint32_t states,
               const RECT& client) {
    SetBkMode(dc, TRANSPARENT);
    SetTextColor(dc, (states & HIS_SELECTED) ? kSelectedTextColour : kTextColour);
    TextRun label(dc, text);
    if (zoomLevel >= kZoomHuge) label.LimitTo(client);
    label.Draw(box, format);
}

void DrawItem(const HeaderRecord& header, uint32_t index, const RECT& client, int start, int end,
              HFONT font) {
    const wchar_t* text = header.texts[index];
    const bool hasText = text && *text;
    const uint32_t states = header.states[index];
    if (IsVertical(header)) {
        DrawVerticalItem(header.dc, client, start, end, states);
        if (!hasText) return;
        SelectScope zoomed(header.dc, font);
        DrawLabel(header.dc, text, {client.left, start, client.right - kTextMargin, end},
                  DT_RIGHT | DT_VCENTER, states, client);
    } else {
        DrawHorizontalItem(header.dc, client, start, end, states);
        if (!hasText) return;
        SelectScope zoomed(header.dc, font);
        DrawLabel(header.dc, text,
                  {start + kTextMargin, client.top, end - kTextMargin, client.bottom},
                  DT_CENTER | DT_VCENTER, states, client);
    }
}

}  // namespace

void DrawHeaderItems(const HeaderRecord& header, const RECT& area) {
    const RECT client = ClientRectOf(header.window);
    const bool vertical = IsVertical(header);
    const int lowEdge = vertical ? area.top : area.left;
    const int highEdge = vertical ? area.bottom : area.right;
    // One font serves all labels; if it cannot be created they are drawn with the DC's own.
    LocalGdiObject<HFONT> font(
        CreateZoomedFont(static_cast<HFONT>(GetCurrentObject(header.dc, OBJ_FONT))));
    SelectScope pen(header.dc, headerPaint.framePen);
    // Items select other brushes: whatever fails, the DC's own is restored at the end.
    const HGDIOBJ hollow = GetStockObject(NULL_BRUSH);
    SelectScope brush(header.dc, hollow ? hollow : headerPaint.faceBrush);
    int start = 0;
    // The first item past the area is painted as well: the DC is not clipped to the area.
    bool past = false;
    for (uint32_t i = 0; i < header.count && !past; ++i) {
        const int end = start + header.sizes[i];
        if (start > lowEdge || end > lowEdge) {
            DrawItem(header, i, client, start, end, font.get());
        }
        past = start > highEdge;
        start = end;
    }
}

}  // namespace kor

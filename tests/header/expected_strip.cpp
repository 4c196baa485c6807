#include "expected_strip.h"

#include <korcontrols/header.h>

namespace kortest {
namespace {

constexpr COLORREF kBackground = RGB(192, 192, 192);

void Select(HDC dc, int stockObject) { SelectObject(dc, GetStockObject(stockObject)); }

void Box(HDC dc, int left, int top, int right, int bottom) {
    Rectangle(dc, left, top, right, bottom);
}

struct OutlineObjects {
    HPEN pen = CreatePen(PS_SOLID, 1, RGB(128, 128, 128));
    HBRUSH brush = CreateSolidBrush(GetSysColor(COLOR_BTNFACE));
    OutlineObjects() = default;
    OutlineObjects(const OutlineObjects&) = delete;
    OutlineObjects& operator=(const OutlineObjects&) = delete;
    ~OutlineObjects() {
        DeleteObject(pen);
        DeleteObject(brush);
    }
};

HFONT CreateZoomed(HGDIOBJ current, DWORD zoom) {
    LOGFONTW font{};
    GetObjectW(current, sizeof font, &font);
    font.lfHeight = static_cast<LONG>(zoom * 0.25 * font.lfHeight);
    if (font.lfHeight > 0) font.lfHeight = -font.lfHeight;
    font.lfWidth = 0;
    return CreateFontIndirectW(&font);
}

void DrawLabel(HDC dc, const StripItem& item, RECT area, UINT format, DWORD zoom) {
    if (item.label.empty()) return;
    SetBkMode(dc, TRANSPARENT);
    SetTextColor(dc, item.state & HIS_SELECTED ? RGB(255, 255, 255) : RGB(0, 0, 0));
    if (zoom == 0) {
        DrawTextW(dc, item.label.c_str(), -1, &area, format);
        return;
    }
    HFONT zoomed = CreateZoomed(GetCurrentObject(dc, OBJ_FONT), zoom);
    HGDIOBJ previous = SelectObject(dc, zoomed);
    DrawTextW(dc, item.label.c_str(), -1, &area, format);
    SelectObject(dc, previous);
    DeleteObject(zoomed);
}

// x0 and w along the strip, T and B across it.
void DrawColumnItem(HDC dc, const StripItem& item, int x0, int B, DWORD zoom) {
    const int T = 0;
    const int w = item.size;
    Box(dc, x0, T, x0 + w, B);
    Select(dc, WHITE_PEN);
    Box(dc, x0 + 1, T + 1, x0 + 2, B - 1);
    if (item.state & HIS_SELECTED) {
        Select(dc, DKGRAY_BRUSH);
        Box(dc, x0, T, x0 + w, B);
        Select(dc, LTGRAY_BRUSH);
    }
    if (item.state & HIS_FRAMED) {
        Box(dc, x0 + 1, T + 1, x0 + w - 1, T + 2);
        Select(dc, BLACK_PEN);
        Box(dc, x0 + 1, B - 1, x0 + w - 1, B - 2);
        Box(dc, x0 + w - 2, T + 1, x0 + w - 1, B - 1);
    }
    DrawLabel(dc, item, {x0 + 3, T, x0 + w - 3, B}, DT_CENTER | DT_VCENTER, zoom);
}

void DrawRowItem(HDC dc, const StripItem& item, int y0, int R, DWORD zoom) {
    const int L = 0;
    const int h = item.size;
    Box(dc, L, y0, R, y0 + h);
    Select(dc, WHITE_PEN);
    Box(dc, L + 1, y0 + 1, R - 1, y0 + 2);
    if (item.state & HIS_SELECTED) {
        Select(dc, DKGRAY_BRUSH);
        Box(dc, L, y0, R, y0 + h);
        Select(dc, LTGRAY_BRUSH);
    }
    if (item.state & HIS_FRAMED) {
        Box(dc, L + 1, y0 + 1, L + 2, y0 + h - 1);
        Select(dc, BLACK_PEN);
        Box(dc, R - 1, y0 + 1, R - 2, y0 + h - 1);
        Box(dc, L + 1, y0 + h - 2, R - 1, y0 + h - 1);
    }
    DrawLabel(dc, item, {L, y0, R - 3, y0 + h}, DT_RIGHT | DT_VCENTER, zoom);
}

}  // namespace

Picture ExpectedStrip(const Strip& strip) {
    Canvas canvas(strip.width, strip.height, kBackground);
    HDC dc = canvas.dc();
    const OutlineObjects outline;
    int start = 0;
    for (const StripItem& item : strip.items) {
        SelectObject(dc, outline.pen);
        SelectObject(dc, outline.brush);
        if (strip.isVertical) {
            DrawRowItem(dc, item, start, strip.width, strip.zoom);
        } else {
            DrawColumnItem(dc, item, start, strip.height, strip.zoom);
        }
        start += item.size;
    }
    Select(dc, BLACK_PEN);
    Select(dc, WHITE_BRUSH);
    return canvas.picture();
}

}  // namespace kortest

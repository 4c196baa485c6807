// The whole picture of a chart, drawn with plain GDI calls: every point of a line in one Polyline,
// every marker its own Ellipse, every column its own polygon, every tick a step away from 0.
#pragma once

#include "literal_chart/chart_state.h"

#include <functional>

namespace kortest {

// Draws into `dc`, whose pen, brush and text colour are the defaults, and notes in `state` which
// pan arrows were drawn. False when a walk from 0 or the polygon of an area would take too long;
// the picture is unfinished.
bool DrawLiteral(ChartState& state, const ChartFonts& fonts, HDC dc);

// Its parts.
bool DrawLiteralFrame(ChartState& state, const ChartFonts& fonts, HDC dc,
                      const std::function<bool()>& drawSeries);
void DrawLiteralTitle(const ChartState& state, const ChartFonts& fonts, HDC dc);
bool DrawLiteralGrid(const ChartState& state, HDC dc, const RECT* bounds);
bool DrawLiteralXAxis(ChartState& state, HDC dc);
bool DrawLiteralSeries(const ChartState& state, HDC dc);
void DrawLiteralPie(const ChartState& state, const ChartFonts& fonts, HDC dc);
void ClipDC(HDC dc, const RECT& area);
void FillLiteral(HDC dc, const RECT& area, COLORREF colour);

// A pen or brush of a drawing, selected and given back together.
class Drawn {
public:
    Drawn(HDC dc, HGDIOBJ object) : dc_(dc), object_(object), previous_(SelectObject(dc, object)) {}
    ~Drawn() {
        SelectObject(dc_, previous_);
        DeleteObject(object_);
    }
    Drawn(const Drawn&) = delete;
    Drawn& operator=(const Drawn&) = delete;

private:
    HDC dc_;
    HGDIOBJ object_;
    HGDIOBJ previous_;
};

// The pie's place.
struct LiteralPie {
    RECT box;
    POINT centre;
    int radius;
};
LiteralPie PlacePie(const ChartState& state);

// Column or row of the pixels that a pie's slice number k may have, decided by angle alone: the
// slice that holds the middle of a pixel, in degrees from 12 o'clock counter-clockwise.
double AngleOf(int dx, int dy);

}  // namespace kortest

// What a chart must know to be drawn, kept as its messages say and computed here a second time: the
// tests' own account of ranges, mapping, margins and pan, against which the library is held.
#pragma once

#include <korcontrols/graph.h>

#include <optional>
#include <string>
#include <vector>

namespace kortest {

struct StateSeries {
    std::vector<double> values;
    COLORREF colour;

    int count() const { return static_cast<int>(values.size()); }
};

// The chart's fonts, and what texts measure in them.
class ChartFonts {
public:
    explicit ChartFonts(HDC dc);
    ~ChartFonts();
    ChartFonts(const ChartFonts&) = delete;
    ChartFonts& operator=(const ChartFonts&) = delete;

    HFONT upright() const { return upright_; }
    HFONT turned() const { return turned_; }
    SIZE measure(const wchar_t* text, HFONT font) const;

private:
    HDC dc_;
    HFONT upright_;
    HFONT turned_;
};

enum PanArrow { kNoArrow = 0, kArrowLeft = 1, kArrowRight = 2, kArrowUp = 4, kArrowDown = 8 };

// Value of `%.5G` with an exponent of two digits where two do.
std::wstring NumberText(double value);

COLORREF PaletteColour(int entry);

class ChartState {
public:
    explicit ChartState(const ChartFonts& fonts);

    // One function per message.
    void addSeries(std::vector<double> values);
    void setTitle(std::wstring text);
    void setXTitle(std::wstring text);
    void setYTitle(std::wstring text);
    void setType(int newType);
    void setRange(int axis, double low, double high);
    void autoRange(int axis);
    void setZoom(int index);
    void toggle(DWORD mask);
    void resize(int width, int height);
    void reset();

    // A press at a place outside the plot; the arrows are those of the last drawing.
    void press(int x, int y);

    bool has(DWORD option) const { return (options & option) != 0; }
    RECT plot() const;
    int xPixel(double x) const;
    int yPixel(double y) const;
    double absSum() const;  // of the first series

    std::wstring title, xTitle, yTitle;
    std::optional<std::vector<std::wstring>> categories;
    std::vector<StateSeries> series;
    int type = KORGRAPH_LINE;
    DWORD options = 0x3FF;
    COLORREF background = RGB(255, 255, 255);
    RECT surface{0, 0, 1, 1};
    double zoom = 1.0;
    double xMin = 0, xMax = 1, yMin = 0, yMax = 1;
    int marginLeft = 15, marginTop = 15, marginRight = 15, marginBottom = 15;
    int xLabelHeight = 1, labelHalfHeight = 10, labelMaxWidth = 10;
    int tipWidth = 0, tipHeight = 0;
    int barWidth = 1, barHeight = 1;
    double xTickStep = 1, yTickStep = 1;
    int xTickHalfSpacing = 10;
    int arrowsShown = kNoArrow;  // written by the drawing, with their points
    POINT arrowLeft[3]{}, arrowRight[3]{}, arrowUp[3]{}, arrowDown[3]{};

private:
    struct Axis {
        double centre = 0;
        double unitsPerPixel = 1;
        int centrePixel = 0;
    };

    void layOut();
    void layOutAndRescale();
    void rescaleX();
    void rescaleY();
    double tickStep(double range, int pixels, double target) const;
    int barSize(double range, int pixels) const;
    void pan(int arrow);
    int arrowAt(int x, int y) const;

    const ChartFonts& fonts_;
    bool xAuto_ = true, yAuto_ = true;
    double xDataMax_ = 1, yDataMax_ = 1, yDataMin_ = 0;
    Axis x_, y_;
};

}  // namespace kortest

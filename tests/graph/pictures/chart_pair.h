// A real chart in a host window beside its expected picture: everything told to the one is told to
// the other, and both pictures are compared pixel for pixel.
#pragma once

#include "literal_chart/literal_chart.h"
#include "support/pixels.h"
#include "support/recording_host.h"

#include <memory>

namespace kortest {

// A memory DC with a bitmap like a window's, and a way to read it fast.
class Surface {
public:
    Surface(HWND like, int width, int height);
    ~Surface();
    Surface(const Surface&) = delete;
    Surface& operator=(const Surface&) = delete;

    HDC dc() const { return dc_; }
    int width() const { return width_; }
    int height() const { return height_; }
    Picture picture() const;

private:
    int width_;
    int height_;
    HDC dc_;
    HBITMAP bitmap_;
    HGDIOBJ previous_;
};

// Whether two DCs show the same in an area at the origin.
bool SamePixels(HDC a, HDC b, int width, int height);

class ChartPair {
public:
    ChartPair(RecordingHost& host, int width, int height);
    ~ChartPair();
    ChartPair(const ChartPair&) = delete;
    ChartPair& operator=(const ChartPair&) = delete;

    HWND window() const { return window_; }
    ChartState& state() { return state_; }
    const ChartFonts& fonts() const { return fonts_; }

    void addSeries(const std::vector<double>& values);
    void setTitle(const std::wstring& text);
    void setXTitle(const std::wstring& text);
    void setYTitle(const std::wstring& text);
    void setCategories(const std::vector<std::wstring>& labels);
    void setType(int type);
    void setRange(int axis, double low, double high);
    void autoRange(int axis);
    void setZoom(int index);
    void toggle(DWORD mask);
    void setBackground(COLORREF colour);
    void resize(int width, int height);
    void reset();

    // Draws both. Presses act on the arrows of the last drawing.
    void redraw();
    void press(int x, int y);
    void pan(PanArrow arrow);  // a press on the arrow, if it is shown

    // The window after a redraw, and the picture expected there. compare() is true when they are
    // equal; it leaves the walk's verdict in finished().
    bool compare();
    bool finished() const { return finished_; }
    Picture shown() const { return ReadWindow(window_); }
    Picture expected() const { return expected_->picture(); }
    HDC expectedDC() const { return expected_->dc(); }
    ::testing::AssertionResult same();  // redraws and compares, with the difference as a text

private:
    LRESULT send(UINT message, WPARAM wParam, LPARAM lParam) const;
    void drawExpected();

    HWND window_;
    HDC measuring_;
    ChartFonts fonts_;
    ChartState state_;
    std::unique_ptr<Surface> expected_;
    bool finished_ = true;
};

// A fixture with one chart of the usual size.
class ChartTest : public ::testing::Test {
protected:
    explicit ChartTest(int width = 320, int height = 240);

    // Counts of a colour, in the window as it is.
    int shownPixels(COLORREF colour, const RECT& area) const;
    COLORREF shownPixel(int x, int y) const { return chart.shown().pixel(x, y); }

    RecordingHost host;
    ChartPair chart;
};

}  // namespace kortest

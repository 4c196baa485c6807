// A chart in a window beside its floor: both show the same picture in the same window.
#pragma once

#include "chart_floor.h"

#include <memory>

namespace bench {

constexpr int kChartWidth = 320;
constexpr int kChartHeight = 240;

// Numbers between -20 and 80 without order, the same for the same seed.
std::vector<double> Noise(int count, unsigned seed);

// A chart of the usual size in the benchmark's one host window.
HWND CreateChart();
void AddSeries(HWND chart, const std::vector<double>& values);

// A full redraw up to the pixels in the window.
void Redraw(HWND chart);

// With its first window the window system starts programs of its own, which keep it busy for some
// seconds.
void WaitForQuietStart();

class MeasuredChart {
public:
    MeasuredChart(int type, int seriesCount, int points);
    ~MeasuredChart();
    MeasuredChart(const MeasuredChart&) = delete;
    MeasuredChart& operator=(const MeasuredChart&) = delete;

    void RedrawChart() const { Redraw(chart_); }

    // Draws the floor into a memory DC and has a plain window of the same size show it: the least
    // that a program does which draws for itself.
    void DrawFloor() const;

    // Whether both windows show the same, and anything at all.
    bool ShowsTheSame() const;

private:
    HWND chart_;
    HWND floorWindow_ = nullptr;
    HDC dc_;
    HBITMAP bitmap_;
    HGDIOBJ blank_;
    kortest::ChartFonts fonts_;
    std::unique_ptr<ChartFloor> floor_;
};

}  // namespace bench

#include "measured_chart.h"

#include <algorithm>
#include <cstdint>

namespace bench {

namespace {

HWND Host() {
    static const HWND host = [] {
        WNDCLASSW windowClass = {};
        windowClass.lpfnWndProc = DefWindowProcW;
        windowClass.hInstance = GetModuleHandleW(nullptr);
        windowClass.lpszClassName = L"Graph benchmark";
        RegisterClassW(&windowClass);
        RegisterGraphControl(windowClass.hInstance);
        return CreateWindowW(windowClass.lpszClassName, L"", WS_POPUP | WS_VISIBLE, 0, 0,
                             kChartWidth, kChartHeight, nullptr, nullptr, windowClass.hInstance,
                             nullptr);
    }();
    return host;
}

// What a DC shows, 32 bits a pixel.
std::vector<uint32_t> PixelsOf(HDC source) {
    BITMAPINFO info = {};
    info.bmiHeader.biSize = sizeof info.bmiHeader;
    info.bmiHeader.biWidth = kChartWidth;
    info.bmiHeader.biHeight = -kChartHeight;
    info.bmiHeader.biPlanes = 1;
    info.bmiHeader.biBitCount = 32;
    HDC dc = CreateCompatibleDC(nullptr);
    void* bits = nullptr;
    HBITMAP bitmap = CreateDIBSection(dc, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
    HGDIOBJ blank = SelectObject(dc, bitmap);
    BitBlt(dc, 0, 0, kChartWidth, kChartHeight, source, 0, 0, SRCCOPY);
    GdiFlush();
    const auto* pixels = static_cast<const uint32_t*>(bits);
    const std::vector<uint32_t> copy(pixels, pixels + kChartWidth * kChartHeight);
    SelectObject(dc, blank);
    DeleteObject(bitmap);
    DeleteDC(dc);
    return copy;
}

}  // namespace

std::vector<double> Noise(int count, unsigned seed) {
    std::vector<double> values(static_cast<size_t>(count));
    for (double& value : values) {
        seed = seed * 1664525u + 1013904223u;
        value = (seed >> 8) / 16777216.0 * 100 - 20;
    }
    return values;
}

HWND CreateChart() {
    const HWND host = Host();
    return CreateWindowW(KORGRAPH_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, kChartWidth,
                         kChartHeight, host, nullptr, GetModuleHandleW(nullptr), nullptr);
}

void AddSeries(HWND chart, const std::vector<double>& values) {
    const GraphSeriesData data = {static_cast<LONG>(values.size()), nullptr, values.data(), 0};
    KorGraph_AddSeries(chart, &data);
}

void Redraw(HWND chart) {
    KorGraph_Redraw(chart);
    UpdateWindow(chart);
}

void WaitForQuietStart() {
    constexpr DWORD kMilliseconds = 3000;
    HWND chart = CreateChart();
    const DWORD start = GetTickCount();
    while (GetTickCount() - start < kMilliseconds) {
        Redraw(chart);
        Sleep(10);
    }
    DestroyWindow(chart);
}

MeasuredChart::MeasuredChart(int type, int seriesCount, int points)
    : chart_(CreateChart()), dc_(CreateCompatibleDC(nullptr)), fonts_(dc_) {
    HDC window = GetDC(chart_);
    bitmap_ = CreateCompatibleBitmap(window, kChartWidth, kChartHeight);
    ReleaseDC(chart_, window);
    blank_ = SelectObject(dc_, bitmap_);
    SetBkMode(dc_, TRANSPARENT);
    kortest::ChartState state(fonts_);
    state.resize(kChartWidth, kChartHeight);
    KorGraph_SetType(chart_, type);
    state.setType(type);
    for (int i = 1; i <= seriesCount; ++i) {
        const std::vector<double> values = Noise(points, static_cast<unsigned>(i));
        AddSeries(chart_, values);
        state.addSeries(values);
    }
    floor_ = std::make_unique<ChartFloor>(state, fonts_);
}

MeasuredChart::~MeasuredChart() {
    SelectObject(dc_, blank_);
    DeleteObject(bitmap_);
    DeleteDC(dc_);
    DestroyWindow(chart_);
}

void MeasuredChart::DrawFloor() const {
    floor_->Draw(dc_);
    HDC window = GetDC(chart_);
    BitBlt(window, 0, 0, kChartWidth, kChartHeight, dc_, 0, 0, SRCCOPY);
    ReleaseDC(chart_, window);
}

bool MeasuredChart::ShowsTheSame() const {
    RedrawChart();
    HDC window = GetDC(chart_);
    const std::vector<uint32_t> shown = PixelsOf(window);
    ReleaseDC(chart_, window);
    const auto background = std::count(shown.begin(), shown.end(), shown.front());
    return shown == PixelsOf(dc_) && background < kChartWidth * kChartHeight;
}

}  // namespace bench

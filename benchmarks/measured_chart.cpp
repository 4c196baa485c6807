#include "measured_chart.h"

#include <algorithm>
#include <cstdint>

#include "support/bitmap_canvas.h"

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

// A window that shows a memory DC: what every program needs that draws for itself.
LRESULT CALLBACK FloorProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message != WM_PAINT) return DefWindowProcW(window, message, wParam, lParam);
    PAINTSTRUCT paint;
    HDC dc = BeginPaint(window, &paint);
    const auto image = reinterpret_cast<HDC>(GetWindowLongPtrW(window, GWLP_USERDATA));
    BitBlt(dc, 0, 0, kChartWidth, kChartHeight, image, 0, 0, SRCCOPY);
    EndPaint(window, &paint);
    return 0;
}

HWND CreateFloorWindow(HDC image) {
    static const ATOM registered = [] {
        WNDCLASSW windowClass = {};
        windowClass.lpfnWndProc = FloorProc;
        windowClass.hInstance = GetModuleHandleW(nullptr);
        windowClass.lpszClassName = L"Floor of a chart";
        return RegisterClassW(&windowClass);
    }();
    HWND window =
        CreateWindowW(MAKEINTATOM(registered), L"", WS_CHILD | WS_VISIBLE, 0, 0, kChartWidth,
                      kChartHeight, Host(), nullptr, GetModuleHandleW(nullptr), nullptr);
    SetWindowLongPtrW(window, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(image));
    return window;
}

// What a window shows, 32 bits a pixel.
std::vector<uint32_t> PixelsOf(HWND window) {
    const kortest::BitmapCanvas canvas(kChartWidth, kChartHeight);
    HDC source = GetDC(window);
    BitBlt(canvas.dc(), 0, 0, kChartWidth, kChartHeight, source, 0, 0, SRCCOPY);
    ReleaseDC(window, source);
    return canvas.pixels();
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
    floorWindow_ = CreateFloorWindow(dc_);
}

MeasuredChart::~MeasuredChart() {
    SelectObject(dc_, blank_);
    DeleteObject(bitmap_);
    DeleteDC(dc_);
    DestroyWindow(floorWindow_);
    DestroyWindow(chart_);
}

void MeasuredChart::DrawFloor() const {
    floor_->Draw(dc_);
    InvalidateRect(floorWindow_, nullptr, FALSE);
    UpdateWindow(floorWindow_);
}

bool MeasuredChart::ShowsTheSame() const {
    RedrawChart();
    const std::vector<uint32_t> shown = PixelsOf(chart_);
    DrawFloor();
    const auto background = std::count(shown.begin(), shown.end(), shown.front());
    return shown == PixelsOf(floorWindow_) && background < kChartWidth * kChartHeight;
}

}  // namespace bench

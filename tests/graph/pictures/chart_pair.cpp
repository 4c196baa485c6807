#include "graph/pictures/chart_pair.h"

#include <cstdint>
#include <cstring>

namespace kortest {
namespace {

// Pixels of a DC in one block of 32 bits each, rows from the top.
class PixelBlock {
public:
    PixelBlock(HDC source, int width, int height) {
        BITMAPINFO info{};
        info.bmiHeader.biSize = sizeof info.bmiHeader;
        info.bmiHeader.biWidth = width;
        info.bmiHeader.biHeight = -height;
        info.bmiHeader.biPlanes = 1;
        info.bmiHeader.biBitCount = 32;
        dc_ = CreateCompatibleDC(nullptr);
        void* bits = nullptr;
        bitmap_ = CreateDIBSection(dc_, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
        pixels_ = static_cast<uint32_t*>(bits);
        previous_ = SelectObject(dc_, bitmap_);
        BitBlt(dc_, 0, 0, width, height, source, 0, 0, SRCCOPY);
        GdiFlush();
    }
    ~PixelBlock() {
        SelectObject(dc_, previous_);
        DeleteObject(bitmap_);
        DeleteDC(dc_);
    }
    PixelBlock(const PixelBlock&) = delete;
    PixelBlock& operator=(const PixelBlock&) = delete;

    const uint32_t* pixels() const { return pixels_; }

private:
    HDC dc_;
    HBITMAP bitmap_;
    HGDIOBJ previous_;
    uint32_t* pixels_;
};

HDC MeasuringDC() {
    HDC screen = GetDC(nullptr);
    HDC dc = CreateCompatibleDC(screen);
    ReleaseDC(nullptr, screen);
    return dc;
}

HWND CreateChart(HWND parent, int width, int height) {
    RegisterGraphControl(GetModuleHandleW(nullptr));
    return CreateWindowExW(0, GetGraphControlClassName(), L"", WS_CHILD | WS_VISIBLE, 0, 0, width,
                           height, parent, nullptr, GetModuleHandleW(nullptr), nullptr);
}

}  // namespace

bool SamePixels(HDC a, HDC b, int width, int height) {
    if (width < 1 || height < 1) return true;
    const PixelBlock first(a, width, height);
    const PixelBlock second(b, width, height);
    const size_t count = static_cast<size_t>(width) * static_cast<size_t>(height);
    return std::memcmp(first.pixels(), second.pixels(), count * sizeof(uint32_t)) == 0;
}

Surface::Surface(HWND like, int width, int height) : width_(width), height_(height) {
    HDC window = GetDC(like);
    dc_ = CreateCompatibleDC(window);
    bitmap_ = CreateCompatibleBitmap(window, std::max(width, 1), std::max(height, 1));
    ReleaseDC(like, window);
    previous_ = SelectObject(dc_, bitmap_);
    SetBkMode(dc_, TRANSPARENT);
}

Surface::~Surface() {
    SelectObject(dc_, previous_);
    DeleteObject(bitmap_);
    DeleteDC(dc_);
}

Picture Surface::picture() const { return ReadDC(dc_, {0, 0, width_, height_}); }

ChartPair::ChartPair(RecordingHost& host, int width, int height)
    : window_(CreateChart(host.window(), width, height)), measuring_(MeasuringDC()),
      fonts_(measuring_), state_(fonts_) {
    state_.resize(width, height);
}

ChartPair::~ChartPair() {
    DestroyWindow(window_);
    DeleteDC(measuring_);
}

LRESULT ChartPair::send(UINT message, WPARAM wParam, LPARAM lParam) const {
    return SendMessageW(window_, message, wParam, lParam);
}

void ChartPair::addSeries(const std::vector<double>& values) {
    const GraphSeriesData data{static_cast<LONG>(values.size()), nullptr, values.data(), 0};
    ASSERT_TRUE(KorGraph_AddSeries(window_, &data));
    state_.addSeries(values);
}

void ChartPair::setTitle(const std::wstring& text) {
    KorGraph_SetTitle(window_, text.c_str());
    state_.setTitle(text);
}

void ChartPair::setXTitle(const std::wstring& text) {
    KorGraph_SetXTitle(window_, text.c_str());
    state_.setXTitle(text);
}

void ChartPair::setYTitle(const std::wstring& text) {
    KorGraph_SetYTitle(window_, text.c_str());
    state_.setYTitle(text);
}

void ChartPair::setCategories(const std::vector<std::wstring>& labels) {
    std::vector<LPCWSTR> texts;
    for (const std::wstring& label : labels) texts.push_back(label.c_str());
    KorGraph_SetCategories(window_, static_cast<LONG>(texts.size()), texts.data());
    state_.categories.reset();
    if (!labels.empty()) state_.categories = labels;
}

void ChartPair::setType(int type) {
    KorGraph_SetType(window_, type);
    state_.setType(type);
}

void ChartPair::setRange(int axis, double low, double high) {
    KorGraph_SetRange(window_, axis, low, high);
    state_.setRange(axis, low, high);
}

void ChartPair::autoRange(int axis) {
    KorGraph_AutoRange(window_, axis);
    state_.autoRange(axis);
}

void ChartPair::setZoom(int index) {
    KorGraph_SetZoom(window_, index);
    state_.setZoom(index);
}

void ChartPair::toggle(DWORD mask) {
    KorGraph_ToggleOptions(window_, mask);
    state_.toggle(mask);
}

void ChartPair::setBackground(COLORREF colour) {
    KorGraph_SetBackgroundColour(window_, colour);
    state_.background = colour;
}

void ChartPair::resize(int width, int height) {
    SetWindowPos(window_, nullptr, 0, 0, width, height, SWP_NOZORDER | SWP_NOACTIVATE);
    state_.resize(width, height);
}

void ChartPair::reset() {
    KorGraph_Reset(window_, TRUE);
    state_.reset();
}

void ChartPair::drawExpected() {
    const int width = state_.surface.right;
    const int height = state_.surface.bottom;
    if (!expected_ || expected_->width() != width || expected_->height() != height) {
        expected_ = std::make_unique<Surface>(window_, width, height);
    }
    finished_ = DrawLiteral(state_, fonts_, expected_->dc());
}

void ChartPair::redraw() {
    KorGraph_Redraw(window_);
    UpdateWindow(window_);
    drawExpected();
}

void ChartPair::press(int x, int y) {
    send(WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(x, y));
    send(WM_LBUTTONUP, 0, MAKELPARAM(x, y));
    state_.press(x, y);
}

void ChartPair::pan(PanArrow arrow) {
    if (!(state_.arrowsShown & arrow)) return;
    const POINT* points = arrow == kArrowLeft    ? state_.arrowLeft
                          : arrow == kArrowRight ? state_.arrowRight
                          : arrow == kArrowUp    ? state_.arrowUp
                                                 : state_.arrowDown;
    press((points[0].x + points[1].x + points[2].x) / 3,
          (points[0].y + points[1].y + points[2].y) / 3);
}

bool ChartPair::compare() {
    HDC window = GetDCEx(window_, nullptr, DCX_CACHE);
    const bool same = SamePixels(window, expected_->dc(), expected_->width(), expected_->height());
    ReleaseDC(window_, window);
    return same;
}

::testing::AssertionResult ChartPair::same() {
    redraw();
    if (!finished_) return ::testing::AssertionFailure() << "drawing it literally takes too long";
    if (compare()) return ::testing::AssertionSuccess();
    return SamePicture(expected(), shown());
}

ChartTest::ChartTest(int width, int height) : host(640, 480), chart(host, width, height) {}

int ChartTest::shownPixels(COLORREF colour, const RECT& area) const {
    return chart.shown().count(colour, area);
}

}  // namespace kortest

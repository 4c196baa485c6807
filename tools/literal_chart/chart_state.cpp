#include "literal_chart/chart_state.h"

#include <algorithm>
#include <cmath>
#include <cwchar>
#include <utility>

namespace kortest {
namespace {

// Pixels farther out than any window are all alike; the mapping ends there.
constexpr double kFarthestPixel = 67108864.0;

int Truncated(double pixels) {
    if (pixels >= kFarthestPixel) return static_cast<int>(kFarthestPixel);
    if (pixels <= -kFarthestPixel) return -static_cast<int>(kFarthestPixel);
    return static_cast<int>(pixels);
}

}  // namespace

std::wstring NumberText(double value) {
    wchar_t text[64];
    _snwprintf(text, std::size(text), L"%.5G", value);  // the platform's own rounding of ties
    std::wstring number = text;
    const size_t exponent = number.find(L'E');
    if (exponent == std::wstring::npos) return number;
    const size_t digits = exponent + 2;  // past the sign
    if (number.size() - digits >= 3 && number[digits] == L'0') number.erase(digits, 1);
    return number;
}

COLORREF PaletteColour(int entry) {
    static constexpr COLORREF kColours[] = {
        RGB(0, 0, 0),       RGB(255, 255, 255), RGB(255, 0, 0),     RGB(0, 255, 0),
        RGB(0, 0, 255),     RGB(255, 255, 0),   RGB(255, 0, 255),   RGB(0, 255, 255),
        RGB(128, 0, 0),     RGB(0, 128, 0),     RGB(0, 0, 128),     RGB(128, 128, 0),
        RGB(128, 0, 128),   RGB(0, 128, 128),   RGB(255, 128, 128), RGB(128, 255, 128),
        RGB(128, 128, 255), RGB(128, 128, 128), RGB(192, 192, 192), RGB(0, 0, 0)};
    return entry < static_cast<int>(std::size(kColours)) ? kColours[entry] : RGB(0, 0, 0);
}

ChartFonts::ChartFonts(HDC dc) : dc_(dc) {
    LOGFONTW font{};
    font.lfHeight = static_cast<LONG>(GetDeviceCaps(dc, LOGPIXELSY) * 10.0 / 72.0);
    font.lfWeight = 400;
    font.lfCharSet = DEFAULT_CHARSET;
    lstrcpyW(font.lfFaceName, L"Arial");
    upright_ = CreateFontIndirectW(&font);
    font.lfEscapement = font.lfOrientation = 900;
    turned_ = CreateFontIndirectW(&font);
}

ChartFonts::~ChartFonts() {
    DeleteObject(upright_);
    DeleteObject(turned_);
}

SIZE ChartFonts::measure(const wchar_t* text, HFONT font) const {
    HGDIOBJ previous = SelectObject(dc_, font);
    RECT box{};
    DrawTextW(dc_, text, -1, &box, DT_CALCRECT);
    SelectObject(dc_, previous);
    return {box.right - box.left, box.bottom - box.top};
}

ChartState::ChartState(const ChartFonts& fonts) : fonts_(fonts) { layOut(); }

RECT ChartState::plot() const {
    return {surface.left + marginLeft, surface.top + marginTop, surface.right - marginRight,
            surface.bottom - marginBottom};
}

int ChartState::xPixel(double x) const {
    return x_.centrePixel + Truncated((x - x_.centre) / x_.unitsPerPixel);
}

int ChartState::yPixel(double y) const {
    return y_.centrePixel - Truncated((y - y_.centre) / y_.unitsPerPixel);
}

void ChartState::layOut() {
    const int line = fonts_.measure(L"9", fonts_.upright()).cy;
    marginTop = 15;
    if (has(KORGRAPH_TITLE) && !title.empty()) marginTop = std::max(line + 4, 15);
    int bottom = 0;
    if (has(KORGRAPH_XLABELS)) {
        xLabelHeight = line;
        bottom += line + 4;
    }
    if (has(KORGRAPH_XTITLE) && !xTitle.empty()) bottom += line + 4;
    marginBottom = std::max(bottom, 15);
    int left = 4;
    if (has(KORGRAPH_YTITLE) && !yTitle.empty()) {
        left = fonts_.measure(L"9", fonts_.turned()).cy + 4;
    }
    if (has(KORGRAPH_YLABELS)) {
        const SIZE label = fonts_.measure(NumberText(-std::fabs(yMax)).c_str(), fonts_.upright());
        labelMaxWidth = std::max<int>(labelMaxWidth, label.cx / 2);
        labelHalfHeight = label.cy / 2;
        left += (labelMaxWidth + 2) * 2;
    }
    marginLeft = std::max(left, 15);
    const SIZE tip = fonts_.measure(L"99%", fonts_.upright());
    tipWidth = has(KORGRAPH_PERCENTAGES) ? tip.cx + 8 : 0;
    tipHeight = has(KORGRAPH_PERCENTAGES) ? tip.cy + 8 : 0;
}

void ChartState::layOutAndRescale() {
    layOut();
    rescaleX();
    rescaleY();
}

double ChartState::tickStep(double range, int pixels, double target) const {
    if (range < 1.0) return 1 / std::pow(10.0, std::ceil(std::log10(1 / std::fabs(range))));
    return std::fabs(std::ceil((1 / zoom) * target * (range / pixels)));
}

int ChartState::barSize(double range, int pixels) const {
    if (series.empty()) return 0;
    return Truncated(pixels / range / static_cast<double>(series.size()));
}

// A window smaller than its margins counts as one pixel.
void ChartState::rescaleX() {
    const double range = xMax - xMin;
    const int width = plot().right - plot().left;
    const int pixels = std::max(width, 1);
    barWidth = barSize(range, pixels);
    x_.centre = range * 0.5 + xMin;
    x_.unitsPerPixel = (1 / zoom) * (std::fabs(range) / pixels);
    x_.centrePixel = marginLeft + (width >> 1);
    xTickStep = tickStep(range, pixels, 50.0);
    xTickHalfSpacing = ((xPixel(xTickStep) - xPixel(0)) >> 1) - 2;
    if (xTickStep == 0) xTickStep = 1.0;
}

void ChartState::rescaleY() {
    const double range = yMax - yMin;
    const int height = plot().bottom - plot().top;
    const int pixels = std::max(height, 1);
    barHeight = barSize(range, pixels);
    y_.centre = range * 0.5 + yMin;
    y_.unitsPerPixel = (1 / zoom) * (std::fabs(range) / pixels);
    y_.centrePixel = marginTop + (height >> 1);
    yTickStep = tickStep(range, pixels, 25.0);
    if (yTickStep == 0) yTickStep = 1.0;
}

void ChartState::addSeries(std::vector<double> values) {
    series.push_back({std::move(values), 0});
    series.back().colour = PaletteColour(static_cast<int>(series.size()) % 19 + 2);
    yDataMax_ = -HUGE_VAL;
    yDataMin_ = 0;
    for (const StateSeries& each : series) {
        yDataMax_ = std::max(yDataMax_, *std::max_element(each.values.begin(), each.values.end()));
        yDataMin_ = std::min(yDataMin_, *std::min_element(each.values.begin(), each.values.end()));
        xDataMax_ = std::max(xDataMax_, each.count() + 1.0);
    }
    if (yDataMax_ == yDataMin_) yDataMax_ = yDataMin_ + 1.0;
    if (xAuto_) autoRange(KORGRAPH_X);
    if (yAuto_) autoRange(KORGRAPH_Y);
}

void ChartState::autoRange(int axis) {
    const bool points = (axis == KORGRAPH_X) == (type != KORGRAPH_BAR);
    const double low = points ? 0.0 : yDataMin_;
    const double high = points ? xDataMax_ : yDataMax_;
    if (axis == KORGRAPH_X) {
        xAuto_ = true;
        xMin = low;
        xMax = high;
        rescaleX();
    } else {
        yAuto_ = true;
        yMin = low;
        yMax = high;
        rescaleY();
    }
}

void ChartState::setRange(int axis, double low, double high) {
    if (high == low) high = low + 1.0;
    if (axis == KORGRAPH_X) {
        xAuto_ = false;
        xMin = low;
        xMax = high;
        rescaleX();
        return;
    }
    if (type == KORGRAPH_BAR) {
        int most = 0;
        for (size_t i = 0; i < series.size(); i += 2) most = std::max(most, series[i].count());
        yAuto_ = true;
        yMax = std::max(yMax, most + 1.0);
    } else {
        yAuto_ = false;
        yMin = low;
        yMax = high;
    }
    rescaleY();
}

void ChartState::setTitle(std::wstring text) {
    title = std::move(text);
    layOutAndRescale();
}

void ChartState::setXTitle(std::wstring text) {
    xTitle = std::move(text);
    layOutAndRescale();
}

void ChartState::setYTitle(std::wstring text) {
    yTitle = std::move(text);
    layOutAndRescale();
}

void ChartState::setType(int newType) {
    if ((type == KORGRAPH_BAR) != (newType == KORGRAPH_BAR)) {
        std::swap(xMin, yMin);
        std::swap(xMax, yMax);
        std::swap(xTitle, yTitle);
        layOutAndRescale();
    }
    type = newType;
}

void ChartState::setZoom(int index) {
    zoom = 0.25 * (1 << index);
    rescaleX();
    rescaleY();
}

void ChartState::toggle(DWORD mask) {
    options ^= mask;
    layOutAndRescale();
}

void ChartState::resize(int width, int height) {
    surface = {0, 0, width, height};
    rescaleX();
    rescaleY();
}

// All series and labels go, the ranges are 0 to 1; the mapping waits for the next change.
void ChartState::reset() {
    series.clear();
    categories.reset();
    xDataMax_ = yDataMax_ = 1;
    yDataMin_ = 0;
    xMin = yMin = 0;
    xMax = yMax = 1;
    xTickStep = yTickStep = 1;
    x_.centre = y_.centre = 0;
    x_.unitsPerPixel = y_.unitsPerPixel = 1;
    barWidth = barHeight = 1;
    xAuto_ = yAuto_ = true;
}

double ChartState::absSum() const {
    double sum = 0;
    for (const double value : series[0].values) sum += std::fabs(value);
    return sum;
}

int ChartState::arrowAt(int x, int y) const {
    const auto within = [](int value, LONG low, LONG high) {
        return low <= value && value <= high;
    };
    const auto shown = [this](int arrow) { return (arrowsShown & arrow) != 0; };
    if (shown(kArrowLeft) && within(x, arrowLeft[0].x, arrowLeft[1].x) &&
        within(y, arrowLeft[1].y, arrowLeft[2].y)) {
        return kArrowLeft;
    }
    if (shown(kArrowRight) && within(x, arrowRight[1].x, arrowRight[0].x) &&
        within(y, arrowRight[1].y, arrowRight[2].y)) {
        return kArrowRight;
    }
    if (shown(kArrowUp) && within(x, arrowUp[1].x, arrowUp[2].x) &&
        within(y, arrowUp[0].y, arrowUp[1].y)) {
        return kArrowUp;
    }
    if (shown(kArrowDown) && within(x, arrowDown[1].x, arrowDown[2].x) &&
        within(y, arrowDown[1].y, arrowDown[0].y)) {
        return kArrowDown;
    }
    return kNoArrow;
}

void ChartState::press(int x, int y) {
    const RECT area = plot();
    if (area.left <= x && x <= area.right && area.top <= y && y <= area.bottom) return;
    pan(arrowAt(x, y));
}

void ChartState::pan(int arrow) {
    const RECT area = plot();
    if (arrow == kArrowLeft && xPixel(0) < area.left) x_.centre -= xTickStep;
    if (arrow == kArrowRight && xPixel(xDataMax_) > area.right) x_.centre += xTickStep;
    if (arrow == kArrowUp && yPixel(yDataMax_) < area.top) y_.centre += yTickStep;
    if (arrow == kArrowDown && yPixel(yDataMin_) > area.bottom) y_.centre -= yTickStep;
}

}  // namespace kortest

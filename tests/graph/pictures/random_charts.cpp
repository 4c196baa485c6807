#include "graph/pictures/random_charts.h"

#include <algorithm>
#include <cmath>

namespace kortest {
namespace {

constexpr int kChartsPerWindow = 12;

std::string Number(double value) {
    char text[40];
    std::snprintf(text, sizeof text, "%.17g", value);
    return text;
}

}  // namespace

double RandomCharts::real(double low, double high) {
    return low + (high - low) * (random_() / 4294967296.0);
}

// The label column never narrows: now and then a fresh window.
void RandomCharts::renew() {
    chart_.reset();
    chart_ = std::make_unique<ChartPair>(host_, 320, 240);
}

int RandomCharts::pointCount() {
    int most = mostPoints;
    switch (upTo(11)) {
    case 0: most = 1; break;
    case 1: most = 2; break;
    case 2: most = 4; break;
    case 3:
    case 4:
    case 5: most = 20; break;
    case 6:
    case 7:
    case 8: most = 400; break;
    case 9:
    case 10: most = 3000; break;
    default: break;
    }
    return 1 + upTo(std::min(most, mostPoints) - 1);
}

std::vector<double> RandomCharts::values(int count) {
    const int kind = upTo(9);
    valueScale_ = kind == 9 ? std::pow(10.0, real(-300, 300)) : std::pow(10.0, real(-3, 6));
    const double base = oneIn(3) ? real(-5, 5) * valueScale_ : 0;
    std::vector<double> made;
    made.reserve(static_cast<size_t>(count));
    for (int i = 0; i < count; ++i) {
        const double noise = real(-1, 1) * valueScale_;
        double value = noise;
        switch (kind) {
        case 0: value = 0; break;                                     // flat
        case 1: value = oneIn(40) ? noise * 50 : noise / 100; break;  // spikes
        case 2: value = -std::fabs(noise); break;                     // negative
        case 3: value = std::sin(i * 0.05) * valueScale_ + noise * 0.02; break;
        case 4: value = upTo(10) - 3; break;                           // small whole numbers
        case 5: value = valueScale_ * i; break;                        // straight
        case 6: value = oneIn(2) ? valueScale_ : -valueScale_; break;  // two levels
        default: break;
        }
        made.push_back(value + base);
    }
    say(std::to_string(count) + " points of kind " + std::to_string(kind) + " and scale " +
        Number(valueScale_) + " on " + Number(base));
    return made;
}

void RandomCharts::chooseSize() {
    int width = 320;
    int height = 240;
    if (oneIn(2)) {
        width = 60 + upTo(340);
        height = 60 + upTo(300);
    }
    if (oneIn(12)) {
        width = 1 + upTo(80);
        height = 1 + upTo(80);
    }
    say("size " + std::to_string(width) + " x " + std::to_string(height));
    chart().resize(width, height);
}

void RandomCharts::chooseTexts() {
    static const wchar_t* const kTexts[] = {
        L"",           L"",
        L"",           L"Sales & more",
        L"A",          L"A rather long title of a chart that is small",
        L"Two\nlines", L"\u00c4pfel"};
    const auto text = [&] { return kTexts[upTo(static_cast<int>(std::size(kTexts)) - 1)]; };
    chart().setTitle(text());
    chart().setXTitle(text());
    chart().setYTitle(text());
    std::vector<std::wstring> labels;
    if (oneIn(3)) {
        const int count = 1 + upTo(oneIn(3) ? 400 : 20);
        for (int i = 0; i < count; ++i) {
            labels.push_back(oneIn(6) ? L"" : L"c" + std::to_wstring(i));
        }
    }
    say(std::to_string(labels.size()) + " labels");
    chart().setCategories(labels);
    const DWORD mask = oneIn(3) ? random_() & 0x3FF : 0;
    say("options turned " + std::to_string(mask));
    chart().toggle(mask);
    chart().setBackground(oneIn(3) ? RGB(upTo(255), upTo(255), upTo(255)) : RGB(255, 255, 255));
}

void RandomCharts::chooseSeries() {
    const int count = oneIn(2) ? 1 : 1 + upTo(4);
    longest_ = 1;
    const int shared = pointCount();
    for (int i = 0; i < count; ++i) {
        const int points = oneIn(3) ? pointCount() : shared;
        longest_ = std::max(longest_, points);
        chart().addSeries(values(points));
    }
}

void RandomCharts::chooseRanges() {
    const bool bars = chart().state().type == KORGRAPH_BAR;
    for (const int axis : {KORGRAPH_X, KORGRAPH_Y}) {
        if (!oneIn(3)) continue;
        const bool ofPoints = (axis == KORGRAPH_X) != bars;
        const double scale = ofPoints ? longest_ + 1.0 : valueScale_;
        double low = real(-1, 1) * scale;
        double high = low + real(0, 2) * scale;
        if (oneIn(3)) {
            low = std::floor(low);
            high = std::ceil(high);
        }
        if (oneIn(10)) std::swap(low, high);
        if (oneIn(20)) high = low;
        if (oneIn(12)) chart().autoRange(axis);
        say("axis " + std::to_string(axis) + " from " + Number(low) + " to " + Number(high));
        chart().setRange(axis, low, high);
    }
    const int zoom = oneIn(2) ? upTo(3) : 2;
    say("zoom " + std::to_string(zoom));
    chart().setZoom(zoom);
}

void RandomCharts::choosePans() {
    static constexpr PanArrow kArrows[] = {kArrowLeft, kArrowRight, kArrowUp, kArrowDown};
    const int count = oneIn(2) ? upTo(5) : 0;
    for (int i = 0; i < count; ++i) {
        chart().redraw();
        const PanArrow arrow = kArrows[upTo(3)];
        say("pan " + std::to_string(arrow));
        chart().pan(arrow);
    }
}

void RandomCharts::next(int type) {
    if (made_++ % kChartsPerWindow == kChartsPerWindow - 1) renew();
    text_.str("");
    chart().reset();
    chart().toggle(chart().state().options ^ 0x3FF);
    const bool rangesFirst = oneIn(6);
    chart().setType(type);
    chooseSize();
    chooseTexts();
    if (rangesFirst) chooseRanges();
    chooseSeries();
    if (!rangesFirst) chooseRanges();
    if (type != KORGRAPH_PIE) choosePans();
    chart().redraw();
}

}  // namespace kortest

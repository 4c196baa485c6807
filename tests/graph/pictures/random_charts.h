// Random charts with a fixed seed, told to a pair of a real and an expected one.
#pragma once

#include "graph/pictures/chart_pair.h"

#include <random>
#include <sstream>

namespace kortest {

class RandomCharts {
public:
    RandomCharts(RecordingHost& host, unsigned seed) : host_(host), random_(seed) { renew(); }

    // Up to how many points a series may have. Most series are much shorter.
    int mostPoints = 20000;

    ChartPair& chart() { return *chart_; }

    // Another chart of a type, drawn. description() says what was done to it.
    void next(int type);
    std::string description() const { return text_.str(); }

private:
    int upTo(int last) { return static_cast<int>(random_() % (static_cast<unsigned>(last) + 1)); }
    bool oneIn(int n) { return upTo(n - 1) == 0; }
    double real(double low, double high);
    void renew();
    int pointCount();
    std::vector<double> values(int count);
    void say(const std::string& what) { text_ << what << "; "; }

    void chooseSize();
    void chooseTexts();
    void chooseSeries();
    void chooseRanges();
    void choosePans();

    RecordingHost& host_;
    std::mt19937 random_;
    std::unique_ptr<ChartPair> chart_;
    std::ostringstream text_;
    int made_ = 0;
    double valueScale_ = 1;  // of the last series
    int longest_ = 1;
};

}  // namespace kortest

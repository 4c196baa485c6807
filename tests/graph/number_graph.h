// A chart record whose numbers are easy to reckon with, for tests of functions over it.
//
// The image is 230 by 130 pixels with margins of 15 all round, so the plot area is 200 by 100
// pixels, from (15, 15) to (215, 115). Both axes show 0 to 10: 20 pixels make one x unit, 10 pixels
// one y unit; x value 5 stands in column 115, y value 5 in row 65.
#pragma once

#include "graph/data/axes.h"
#include "graph/data/record.h"
#include "graph/data/series.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace kortest {

class NumberGraph : public ::testing::Test {
protected:
    NumberGraph();
    ~NumberGraph() override;

    // Adds a series and gives it back; the ranges stay as they are.
    kor::GraphSeries& add(const std::vector<double>& values, const wchar_t* name = nullptr);

    // Adds a series as a message would, ranges included.
    bool addAutomatic(const std::vector<double>& values);

    void set(int series, int point, double value);
    void replace(int series, const std::vector<double>& values);

    // Makes the plot area this large, the margins staying as they are.
    void resizePlot(int width, int height);

    void showX(double low, double high);
    void showY(double low, double high);
    void rescale();

    // What the tooltip says at an image position; "-" for no hit.
    std::wstring hit(int x, int y) const;

    kor::GraphRecord& graph;
};

// The values of a series as the chart holds them.
std::vector<double> ValuesOf(const kor::GraphSeries& series);

}  // namespace kortest

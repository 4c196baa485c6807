// Changing single values, and replacing a series' values.
#include "graph/number_graph.h"

#include "base/local_text.h"

#include <limits>

namespace kortest {
namespace {

class GraphSetValue : public NumberGraph {
protected:
    const kor::GraphSeries& series(int index = 0) { return *graph.series[index]; }
};

TEST_F(GraphSetValue, StoresIt) {
    add({1, 2, 3});
    add({4, 5});
    set(1, 0, 6.5);
    EXPECT_EQ(ValuesOf(series(0)), (std::vector<double>{1, 2, 3}));
    EXPECT_EQ(ValuesOf(series(1)), (std::vector<double>{6.5, 5}));
}

TEST_F(GraphSetValue, NewMaximumIsTaken) {
    add({3, 2, 1});
    set(0, 1, 8);
    EXPECT_EQ(series().maxValue, 8);
    EXPECT_EQ(series().maxIndex, 1);
    EXPECT_EQ(series().absSum, 12);
}

TEST_F(GraphSetValue, NewMinimumIsTaken) {
    add({3, 2, 9});
    set(0, 1, -4);
    EXPECT_EQ(series().minValue, -4);
    EXPECT_EQ(series().minIndex, 1);
    EXPECT_EQ(series().absSum, 16);
}

TEST_F(GraphSetValue, LoweredMaximumGivesTheNextLargest) {
    add({3, 5, 4});
    set(0, 0, 20);
    set(0, 0, 1);
    EXPECT_EQ(series().maxValue, 5);
    EXPECT_EQ(series().maxIndex, 1);
    EXPECT_EQ(series().absSum, 10);
}

TEST_F(GraphSetValue, RaisedMinimumGivesTheNextSmallest) {
    add({3, 5, 4});
    set(0, 0, -7);
    set(0, 0, 4.5);
    EXPECT_EQ(series().minValue, 4);
    EXPECT_EQ(series().minIndex, 2);
    EXPECT_EQ(series().absSum, 13.5);
}

// The scan for a new maximum begins with the first value and does not set the index to it.
TEST_F(GraphSetValue, IndexOfAFirstMaximumIsNotSetByTheScan) {
    add({5, 9, 1});
    set(0, 1, 3);
    EXPECT_EQ(series().maxValue, 5);
    EXPECT_EQ(series().maxIndex, 1);
}

TEST_F(GraphSetValue, SumStaysStaleWhenNeitherExtremeChanges) {
    add({1, 5, 9});
    set(0, 1, 7);
    EXPECT_EQ(series().absSum, 15) << "of 1, 5 and 9";
    EXPECT_EQ(series().values[1], 7);
    EXPECT_EQ(series().minValue, 1);
    EXPECT_EQ(series().maxValue, 9);
}

TEST_F(GraphSetValue, SumIsRightAgainAfterAChangeOfAnExtreme) {
    add({1, 5, 9});
    set(0, 1, 7);
    set(0, 2, 10);
    EXPECT_EQ(series().absSum, 18);
}

TEST_F(GraphSetValue, NegativeValuesCountByTheirMagnitude) {
    add({1, 5, 9});
    set(0, 0, -6);
    EXPECT_EQ(series().absSum, 20);
}

TEST_F(GraphSetValue, BadIndexesAreIgnored) {
    add({1, 2, 3});
    for (const int point : {3, 4, 1000000, -1, -1000000}) set(0, point, 77);
    for (const int index : {1, 2, 1000000, -1, -1000000}) set(index, 0, 77);
    EXPECT_EQ(ValuesOf(series()), (std::vector<double>{1, 2, 3}));
    EXPECT_EQ(series().maxValue, 3);
}

TEST_F(GraphSetValue, AppliesAutomaticRangesAndScales) {
    addAutomatic({1, 2, 3});
    graph.xMax = 99;
    graph.yMax = 99;
    set(0, 1, 2.5);
    EXPECT_EQ(graph.xMax, 4.0);
    EXPECT_EQ(graph.yMax, 3.0);
    EXPECT_EQ(graph.xCentre, 2.0);
    EXPECT_EQ(graph.yCentre, 1.5);
}

TEST_F(GraphSetValue, AppliesAutomaticRangesEvenForABadPoint) {
    addAutomatic({1, 2, 3});
    graph.xMax = 99;
    graph.yMax = 99;
    set(0, 3, 2.5);
    EXPECT_EQ(graph.xMax, 4.0);
    EXPECT_EQ(graph.yMax, 3.0);
}

TEST_F(GraphSetValue, AppliesNothingForABadSeries) {
    addAutomatic({1, 2, 3});
    graph.xMax = 99;
    graph.yMax = 99;
    set(1, 0, 2.5);
    EXPECT_EQ(graph.xMax, 99.0);
    EXPECT_EQ(graph.yMax, 99.0);
}

TEST_F(GraphSetValue, LeavesFixedRangesAlone) {
    add({1, 2, 3});
    set(0, 1, 2.5);
    EXPECT_EQ(graph.xMax, 10.0);
    EXPECT_EQ(graph.yMax, 10.0);
}

TEST_F(GraphSetValue, InfiniteOnesAreStoredAsGiven) {
    const double infinity = std::numeric_limits<double>::infinity();
    add({1, 2, 3});
    set(0, 0, infinity);
    set(0, 1, -infinity);
    set(0, 2, std::numeric_limits<double>::quiet_NaN());
    EXPECT_EQ(series().values[0], infinity);
    EXPECT_EQ(series().values[1], -infinity);
    EXPECT_NE(series().values[2], series().values[2]);
}

// A rescan begins with the first value that counts.
struct Rescan {
    const char* name;
    std::vector<double> values;
    int index;
    double value;
    double least, most;
};

void PrintTo(const Rescan& rescan, std::ostream* out) { *out << rescan.name; }

constexpr double kInfinity = std::numeric_limits<double>::infinity();
constexpr double kNone = std::numeric_limits<double>::quiet_NaN();

class GraphRescan : public GraphSetValue, public ::testing::WithParamInterface<Rescan> {};

TEST_P(GraphRescan, NeverMakesAnExtremeOfWhatIsInfiniteOrNone) {
    add(GetParam().values);
    set(0, GetParam().index, GetParam().value);
    EXPECT_EQ(series().minValue, GetParam().least);
    EXPECT_EQ(series().maxValue, GetParam().most);
}

INSTANTIATE_TEST_SUITE_P(
    First, GraphRescan,
    ::testing::Values(Rescan{"MaximumBecomesInfinite", {9, 5, 3}, 0, kInfinity, 3, 5},
                      Rescan{"InfiniteBeforeTheMaximum", {kInfinity, 5, 3}, 1, 4, 3, 4},
                      Rescan{"InfiniteBeforeTheMinimum", {-kInfinity, 5, 3}, 2, 4, 4, 5},
                      Rescan{"OnlyOneBecomesNone", {5}, 0, kNone, 5, 0},
                      Rescan{"MinimumBecomesNone", {3, 5, 9}, 0, kNone, 5, 9}),
    [](const auto& rescan) { return rescan.param.name; });

// ---- Replacing --------------------------------------------------------------------------------

class GraphReplace : public GraphSetValue {};

TEST_F(GraphReplace, TakesTheNewValuesAndTheirExtremes) {
    add({1, 2, 3}, L"name");
    replace(0, {-7, 9, 4});
    EXPECT_EQ(ValuesOf(series()), (std::vector<double>{-7, 9, 4}));
    EXPECT_EQ(series().minValue, -7);
    EXPECT_EQ(series().minIndex, 0);
    EXPECT_EQ(series().maxValue, 9);
    EXPECT_EQ(series().maxIndex, 1);
    EXPECT_EQ(series().absSum, 20);
    EXPECT_STREQ(kor::SeriesName(graph, 0), L"name") << "the name is not replaced";
}

TEST_F(GraphReplace, MissingValuesAreZero) {
    add({1, 2, 3, 4, 5, 6, 7, 8, 9, 10});
    replace(0, {4, 3, 2, 1});
    EXPECT_EQ(ValuesOf(series()), (std::vector<double>{4, 3, 2, 1, 0, 0, 0, 0, 0, 0}));
    EXPECT_EQ(series().pointCount, 10);
    EXPECT_EQ(series().minValue, 0);
    EXPECT_EQ(series().minIndex, 4);
    EXPECT_EQ(series().absSum, 10);
}

TEST_F(GraphReplace, SurplusValuesAreDropped) {
    add({1, 2});
    replace(0, {7, 8, 9});
    EXPECT_EQ(ValuesOf(series()), (std::vector<double>{7, 8}));
    EXPECT_EQ(series().maxValue, 8);
    EXPECT_EQ(series().absSum, 15);
}

TEST_F(GraphReplace, MakesAStaleSumRight) {
    add({1, 5, 9});
    set(0, 1, 7);
    replace(0, {1, 7, 9});
    EXPECT_EQ(series().absSum, 17);
}

TEST_F(GraphReplace, ChangesOnlyTheNamedSeries) {
    add({1, 2});
    add({3, 4});
    replace(1, {5, 6});
    EXPECT_EQ(ValuesOf(series(0)), (std::vector<double>{1, 2}));
    EXPECT_EQ(ValuesOf(series(1)), (std::vector<double>{5, 6}));
}

TEST_F(GraphReplace, BadSeriesAreIgnored) {
    add({1, 2});
    for (const int index : {1, 2, -1, 1000000, -1000000}) replace(index, {5, 6});
    EXPECT_EQ(ValuesOf(series()), (std::vector<double>{1, 2}));
}

TEST_F(GraphReplace, CountsBelowOneLeaveZeros) {
    const double values[] = {5, 6};
    for (const int count : {0, -3}) {
        add({1, 2});
        const int last = graph.seriesCount - 1;
        kor::ReplaceSeriesValues(graph, {count, nullptr, values, last});
        EXPECT_EQ(ValuesOf(series(last)), (std::vector<double>{0, 0})) << count;
        EXPECT_EQ(series(last).maxValue, 0) << count;
    }
}

TEST_F(GraphReplace, MissingArrayIsSurvived) {
    add({1, 2});
    kor::ReplaceSeriesValues(graph, {2, nullptr, nullptr, 0});
    EXPECT_EQ(series().pointCount, 2);
}

TEST_F(GraphReplace, AppliesAutomaticRanges) {
    addAutomatic({1, 2, 3});
    graph.xMax = 99;
    graph.yMax = 99;
    replace(0, {5, 50, 5});
    EXPECT_EQ(graph.xMax, 4.0);
    EXPECT_EQ(graph.yMax, 3.0) << "what the last add gave";
}

TEST_F(GraphReplace, GivesASeriesWithoutValuesItsOwn) {
    kor::GraphSeries& series = add({1, 2});
    kor::FreeLocal(series.values);
    series.values = nullptr;
    replace(0, {4, -6, 5});
    EXPECT_EQ(series.pointCount, 3);
    EXPECT_EQ(ValuesOf(series), (std::vector<double>{4, -6, 5}));
    EXPECT_EQ(series.minValue, -6);
    EXPECT_EQ(series.absSum, 15);
}

}  // namespace
}  // namespace kortest

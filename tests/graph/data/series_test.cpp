// Series and category labels: adding, removing, colours and names.
#include "graph/number_graph.h"

#include "graph/data/palette.h"

#include <limits>

namespace kortest {
namespace {

class GraphSeriesOf : public NumberGraph {};

TEST_F(GraphSeriesOf, NewValuesKnowTheirExtremes) {
    const kor::GraphSeries& series = add({3, -8, 5, 2});
    EXPECT_EQ(series.pointCount, 4);
    EXPECT_EQ(ValuesOf(series), (std::vector<double>{3, -8, 5, 2}));
    EXPECT_EQ(series.minValue, -8);
    EXPECT_EQ(series.minIndex, 1);
    EXPECT_EQ(series.maxValue, 5);
    EXPECT_EQ(series.maxIndex, 2);
    EXPECT_EQ(series.absSum, 18);
}

TEST_F(GraphSeriesOf, TiesKeepTheFirstIndex) {
    const kor::GraphSeries& series = add({4, 1, 9, 9, 1});
    EXPECT_EQ(series.minIndex, 1);
    EXPECT_EQ(series.maxIndex, 2);
    const kor::GraphSeries& equal = add({6, 6});
    EXPECT_EQ(equal.minIndex, 0);
    EXPECT_EQ(equal.maxIndex, 0);
}

TEST_F(GraphSeriesOf, ValuesAndNamesAreCopies) {
    double values[] = {1, 2};
    wchar_t name[] = L"North";
    ASSERT_TRUE(kor::AddSeries(graph, {2, name, values, 7}));
    values[0] = 50;
    name[0] = L'W';
    EXPECT_EQ(ValuesOf(*graph.series[0]), (std::vector<double>{1, 2}));
    EXPECT_STREQ(kor::SeriesName(graph, 0), L"North");
}

TEST_F(GraphSeriesOf, EmptyAndMissingNamesAreNone) {
    add({1}, L"");
    add({1}, nullptr);
    EXPECT_EQ(kor::SeriesName(graph, 0), nullptr);
    EXPECT_EQ(kor::SeriesName(graph, 1), nullptr);
}

TEST_F(GraphSeriesOf, BadDataAddsNothing) {
    const double value = 1;
    EXPECT_FALSE(kor::AddSeries(graph, {0, L"none", &value, 0}));
    EXPECT_FALSE(kor::AddSeries(graph, {-1, L"none", &value, 0}));
    EXPECT_FALSE(kor::AddSeries(graph, {(std::numeric_limits<LONG>::min)(), L"none", &value, 0}));
    EXPECT_FALSE(kor::AddSeries(graph, {1, L"none", nullptr, 0}));
    EXPECT_EQ(graph.seriesCount, 0);
    EXPECT_EQ(graph.xMax, 10.0);
}

// As many numbers as 32 bits of bytes cannot hold; the second count would wrap to one number.
TEST_F(GraphSeriesOf, SizeBeyondAllMemoryAddsNothing) {
    const double value = 1;
    EXPECT_FALSE(kor::AddSeries(graph, {0x7FFFFFFF, nullptr, &value, 0}));
    EXPECT_FALSE(kor::AddSeries(graph, {0x20000001, nullptr, &value, 0}));
    EXPECT_EQ(graph.seriesCount, 0);
}

TEST_F(GraphSeriesOf, ColoursGoOnThroughThePalette) {
    for (int i = 0; i < 21; ++i) add({1});
    for (int i = 0; i < 21; ++i)
        EXPECT_EQ(graph.series[i]->colour, kor::PaletteEntry((i + 1) % 19 + 2)) << i;
    EXPECT_EQ(kor::SeriesColour(graph, 0), 0x00FF00u);
    EXPECT_EQ(kor::SeriesColour(graph, 17), 0x000000u) << "entry 20";
    EXPECT_EQ(kor::SeriesColour(graph, 18), 0x0000FFu) << "entry 2";
}

TEST_F(GraphSeriesOf, ColourAndNameOfBadIndexesAreNone) {
    add({1}, L"one");
    for (const int index :
         {-1, 1, 2, 1000, (std::numeric_limits<int>::max)(), (std::numeric_limits<int>::min)()}) {
        EXPECT_EQ(kor::SeriesColour(graph, index), 0u) << index;
        EXPECT_EQ(kor::SeriesName(graph, index), nullptr) << index;
        EXPECT_EQ(kor::SeriesAt(graph, index), nullptr) << index;
    }
    EXPECT_EQ(kor::SeriesAt(graph, 0), graph.series[0]);
}

TEST_F(GraphSeriesOf, PieColoursAreThoseOfSlicesWhateverTheSeries) {
    graph.chartType = kor::kPie;
    EXPECT_EQ(kor::SeriesColour(graph, 0), 0x0000FFu);
    EXPECT_EQ(kor::SeriesColour(graph, 1), 0x00FF00u);
    EXPECT_EQ(kor::SeriesColour(graph, 14), 0xFF8080u);
    EXPECT_EQ(kor::SeriesColour(graph, 15), 0x0000FFu) << "the sixteenth slice";
}

TEST_F(GraphSeriesOf, NegativeSliceIsSurvived) {
    graph.chartType = kor::kPie;
    EXPECT_EQ(kor::SeriesColour(graph, -1), 0u);
    EXPECT_EQ(kor::SeriesColour(graph, (std::numeric_limits<int>::min)()), 0u);
}

TEST_F(GraphSeriesOf, LiveModeHasABufferOfAtLeastThreePoints) {
    EXPECT_EQ(add({1, 2, 3}).liveBuffer, nullptr);
    graph.options |= KORGRAPH_LIVE;
    const kor::GraphSeries& series = add({1});
    ASSERT_NE(series.liveBuffer, nullptr);
    EXPECT_GE(LocalSize(series.liveBuffer), 3 * sizeof(POINT));
    EXPECT_GE(LocalSize(add({1, 2, 3, 4, 5}).liveBuffer), 5 * sizeof(POINT));
}

TEST_F(GraphSeriesOf, RemovingAllLeavesNone) {
    add({1}, L"one");
    add({1}, L"two");
    kor::RemoveAllSeries(graph);
    EXPECT_EQ(graph.seriesCount, 0);
    EXPECT_EQ(graph.series, nullptr);
    EXPECT_EQ(kor::SeriesAt(graph, 0), nullptr);
    kor::RemoveAllSeries(graph);
    EXPECT_EQ(graph.seriesCount, 0);
    EXPECT_EQ(kor::ColourOfSeriesNumber(1), add({1}).colour) << "colours begin anew";
}

// ---- Category labels --------------------------------------------------------------------------

class GraphCategories : public NumberGraph {
protected:
    bool set(const std::vector<const wchar_t*>& labels) {
        return kor::SetCategories(graph, static_cast<int>(labels.size()), labels.data());
    }
};

TEST_F(GraphCategories, AreCopies) {
    wchar_t label[] = L"Jan";
    EXPECT_TRUE(set({label, nullptr, L"Mar"}));
    label[0] = L'X';
    ASSERT_EQ(graph.categoryCount, 3);
    EXPECT_STREQ(graph.categoryLabels[0], L"Jan");
    EXPECT_EQ(graph.categoryLabels[1], nullptr);
    EXPECT_STREQ(graph.categoryLabels[2], L"Mar");
}

TEST_F(GraphCategories, ReplaceTheOldOnes) {
    set({L"a", L"b", L"c"});
    EXPECT_TRUE(set({L"d"}));
    ASSERT_EQ(graph.categoryCount, 1);
    EXPECT_STREQ(graph.categoryLabels[0], L"d");
}

TEST_F(GraphCategories, CountBelowOneRemovesThem) {
    for (const int count : {0, -1, (std::numeric_limits<int>::min)()}) {
        set({L"a", L"b"});
        const wchar_t* labels[] = {L"x"};
        EXPECT_TRUE(kor::SetCategories(graph, count, labels));
        EXPECT_EQ(graph.categoryCount, 0);
        EXPECT_EQ(graph.categoryLabels, nullptr);
    }
}

TEST_F(GraphCategories, NullArrayGivesThatManyEmptyOnes) {
    EXPECT_TRUE(kor::SetCategories(graph, 3, nullptr));
    ASSERT_EQ(graph.categoryCount, 3);
    ASSERT_NE(graph.categoryLabels, nullptr);
    for (int i = 0; i < 3; ++i) EXPECT_EQ(graph.categoryLabels[i], nullptr);
}

TEST_F(GraphCategories, CountStaysWhenAllSeriesAreRemoved) {
    set({L"a", L"b"});
    kor::RemoveAllSeries(graph);
    EXPECT_EQ(graph.categoryCount, 2);
    EXPECT_EQ(graph.categoryLabels, nullptr);
}

TEST_F(GraphCategories, CountIsZeroAfterRemovalAndAnEmptySet) {
    set({L"a", L"b"});
    kor::RemoveAllSeries(graph);
    EXPECT_TRUE(kor::SetCategories(graph, 0, nullptr));
    EXPECT_EQ(graph.categoryCount, 0);
}

TEST_F(GraphCategories, CountBeyondAllMemoryIsRefused) {
    set({L"a", L"b"});
    EXPECT_FALSE(kor::SetCategories(graph, 0x40000001, nullptr)) << "would wrap to one label";
    EXPECT_FALSE(kor::SetCategories(graph, 0x7FFFFFFF, nullptr));
    EXPECT_EQ(graph.categoryLabels, nullptr);
}

}  // namespace
}  // namespace kortest

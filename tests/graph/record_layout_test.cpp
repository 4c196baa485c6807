// The order and the initial values of the chart's record.
#include "graph/number_graph.h"

#include <cstddef>
#include <memory>

namespace kortest {
namespace {

using kor::GraphRecord;

// Offsets on systems of 32 bits, counted by hand: every field 4 bytes, doubles 8 on multiples of 8.
TEST(GraphRecordLayout, IsTheOneOf32Bits) {
    if constexpr (sizeof(void*) != 4) GTEST_SKIP() << "pointers of this build have 64 bits";
    const struct {
        const char* name;
        size_t expected;
        size_t actual;
    } fields[] = {
#define KORTEST_FIELD(name, offset) {#name, offset, offsetof(GraphRecord, name)}
        KORTEST_FIELD(hwndParent, 0),
        KORTEST_FIELD(hInstance, 4),
        KORTEST_FIELD(hwnd, 8),
        KORTEST_FIELD(hwndToolTip, 12),
        KORTEST_FIELD(hwndLegend, 16),
        KORTEST_FIELD(hdcMem, 20),
        KORTEST_FIELD(hbmMem, 24),
        KORTEST_FIELD(hrgnClip, 28),
        KORTEST_FIELD(hpenThick, 32),
        KORTEST_FIELD(seriesCount, 36),
        KORTEST_FIELD(series, 40),
        KORTEST_FIELD(title, 44),
        KORTEST_FIELD(xAxisTitle, 48),
        KORTEST_FIELD(yAxisTitle, 52),
        KORTEST_FIELD(categoryCount, 56),
        KORTEST_FIELD(categoryLabels, 60),
        KORTEST_FIELD(labelHalfHeight, 64),
        KORTEST_FIELD(xTickHalfSpacing, 68),
        KORTEST_FIELD(labelMaxWidth, 72),
        KORTEST_FIELD(hfontTitle, 76),
        KORTEST_FIELD(hfontXTitle, 80),
        KORTEST_FIELD(hfontYTitle, 84),
        KORTEST_FIELD(hfontLabel, 88),
        KORTEST_FIELD(hfontAxis, 92),
        KORTEST_FIELD(chartType, 96),
        KORTEST_FIELD(dataMode, 100),
        KORTEST_FIELD(rcPlot, 104),
        KORTEST_FIELD(options, 120),
        KORTEST_FIELD(hbrBack, 124),
        KORTEST_FIELD(crBack, 128),
        KORTEST_FIELD(liveIndex, 132),
        KORTEST_FIELD(xAutoRange, 136),
        KORTEST_FIELD(yAutoRange, 137),
        KORTEST_FIELD(xDataMax, 144),
        KORTEST_FIELD(yDataMax, 152),
        KORTEST_FIELD(xDataMin, 160),
        KORTEST_FIELD(yDataMin, 168),
        KORTEST_FIELD(xMax, 176),
        KORTEST_FIELD(yMax, 184),
        KORTEST_FIELD(xMin, 192),
        KORTEST_FIELD(yMin, 200),
        KORTEST_FIELD(zoom, 208),
        KORTEST_FIELD(marginBottom, 216),
        KORTEST_FIELD(marginLeft, 220),
        KORTEST_FIELD(marginRight, 224),
        KORTEST_FIELD(marginTop, 228),
        KORTEST_FIELD(xLabelHeight, 232),
        KORTEST_FIELD(tipWidth, 236),
        KORTEST_FIELD(tipHeight, 240),
        KORTEST_FIELD(panArrows, 244),
        KORTEST_FIELD(arrowLeft, 248),
        KORTEST_FIELD(arrowRight, 272),
        KORTEST_FIELD(arrowUp, 296),
        KORTEST_FIELD(arrowDown, 320),
        KORTEST_FIELD(hpenThin, 344),
        KORTEST_FIELD(tickHalfLength, 348),
        KORTEST_FIELD(xTickStep, 352),
        KORTEST_FIELD(yTickStep, 360),
        KORTEST_FIELD(hpenGrid, 368),
        KORTEST_FIELD(xTickStepCopy, 376),
        KORTEST_FIELD(yTickStepCopy, 384),
        KORTEST_FIELD(xCentre, 392),
        KORTEST_FIELD(yCentre, 400),
        KORTEST_FIELD(xUnitsPerPixelBase, 408),
        KORTEST_FIELD(yUnitsPerPixelBase, 416),
        KORTEST_FIELD(xUnitsPerPixel, 424),
        KORTEST_FIELD(yUnitsPerPixel, 432),
        KORTEST_FIELD(xCentrePixel, 440),
        KORTEST_FIELD(yCentrePixel, 444),
        KORTEST_FIELD(barWidth, 448),
        KORTEST_FIELD(barHeight, 452),
#undef KORTEST_FIELD
    };
    for (const auto& field : fields) EXPECT_EQ(field.actual, field.expected) << field.name;
}

struct RecordDeleter {
    void operator()(GraphRecord* graph) const { kor::FreeRecord(graph); }
};

class GraphRecordAtFirst : public ::testing::Test {
protected:
    std::unique_ptr<GraphRecord, RecordDeleter> owner{kor::CreateGraphRecord()};
    const GraphRecord& graph{*owner};
};

TEST_F(GraphRecordAtFirst, HasNoWindowsImageDataOrTexts) {
    EXPECT_EQ(graph.hwndToolTip, nullptr);
    EXPECT_EQ(graph.hwndLegend, nullptr);
    EXPECT_EQ(graph.hdcMem, nullptr);
    EXPECT_EQ(graph.hbmMem, nullptr);
    EXPECT_EQ(graph.hrgnClip, nullptr);
    EXPECT_EQ(graph.seriesCount, 0);
    EXPECT_EQ(graph.series, nullptr);
    EXPECT_EQ(graph.title, nullptr);
    EXPECT_EQ(graph.xAxisTitle, nullptr);
    EXPECT_EQ(graph.yAxisTitle, nullptr);
    EXPECT_EQ(graph.categoryCount, 0);
    EXPECT_EQ(graph.categoryLabels, nullptr);
    for (const HFONT font : {graph.hfontTitle, graph.hfontXTitle, graph.hfontYTitle,
                             graph.hfontLabel, graph.hfontAxis})
        EXPECT_EQ(font, nullptr);
}

TEST_F(GraphRecordAtFirst, IsALineChartWithEveryOptionButLiveMode) {
    EXPECT_EQ(graph.chartType, 0);
    EXPECT_EQ(graph.dataMode, 0);
    EXPECT_EQ(graph.options, 0x3FFu);
    EXPECT_EQ(graph.liveIndex, 0);
}

TEST_F(GraphRecordAtFirst, HasAWhiteBackground) { EXPECT_EQ(graph.crBack, RGB(255, 255, 255)); }

TEST_F(GraphRecordAtFirst, HasItsSizesInPixels) {
    const RECT onePixel = {0, 0, 1, 1};
    EXPECT_TRUE(EqualRect(&graph.rcPlot, &onePixel));
    for (const int32_t margin :
         {graph.marginBottom, graph.marginLeft, graph.marginRight, graph.marginTop})
        EXPECT_EQ(margin, 15);
    EXPECT_EQ(graph.labelHalfHeight, 10);
    EXPECT_EQ(graph.xTickHalfSpacing, 10);
    EXPECT_EQ(graph.labelMaxWidth, 10);
    EXPECT_EQ(graph.xLabelHeight, 1);
    EXPECT_EQ(graph.tipWidth, 0);
    EXPECT_EQ(graph.tipHeight, 0);
    EXPECT_EQ(graph.tickHalfLength, 3);
    EXPECT_EQ(graph.barWidth, 1);
    EXPECT_EQ(graph.barHeight, 1);
    EXPECT_EQ(graph.xCentrePixel, 0);
    EXPECT_EQ(graph.yCentrePixel, 0);
}

TEST_F(GraphRecordAtFirst, ShowsZeroToOneAutomatically) {
    EXPECT_EQ(graph.xAutoRange, 1);
    EXPECT_EQ(graph.yAutoRange, 1);
    for (const double one :
         {graph.xDataMax, graph.yDataMax, graph.xMax, graph.yMax, graph.zoom, graph.xTickStep,
          graph.yTickStep, graph.xTickStepCopy, graph.yTickStepCopy, graph.xUnitsPerPixelBase,
          graph.yUnitsPerPixelBase, graph.xUnitsPerPixel, graph.yUnitsPerPixel})
        EXPECT_EQ(one, 1.0);
    for (const double zero :
         {graph.xDataMin, graph.yDataMin, graph.xMin, graph.yMin, graph.xCentre, graph.yCentre})
        EXPECT_EQ(zero, 0.0);
}

TEST_F(GraphRecordAtFirst, ShowsNoPanArrow) {
    EXPECT_EQ(graph.panArrows, 0u);
    for (const kor::Triangle& arrow :
         {graph.arrowLeft, graph.arrowRight, graph.arrowUp, graph.arrowDown})
        for (const POINT& point : arrow.points) {
            EXPECT_EQ(point.x, 0);
            EXPECT_EQ(point.y, 0);
        }
}

TEST_F(GraphRecordAtFirst, HasItsPens) {
    const struct {
        HPEN pen;
        LONG width;
        COLORREF colour;
    } pens[] = {{graph.hpenThick, 2, 0}, {graph.hpenThin, 1, 0}, {graph.hpenGrid, 1, 0x969600}};
    for (const auto& pen : pens) {
        LOGPEN description{};
        ASSERT_NE(GetObjectW(pen.pen, sizeof description, &description), 0);
        EXPECT_EQ(description.lopnStyle, UINT{PS_SOLID});
        EXPECT_EQ(description.lopnWidth.x, pen.width);
        EXPECT_EQ(description.lopnColor, pen.colour);
    }
}

class GraphRecordReset : public NumberGraph {};

TEST_F(GraphRecordReset, PutsRangesAndMappingBack) {
    addAutomatic({3, 4, 5});
    graph.zoom = 2.0;
    graph.xAutoRange = 0;
    graph.yAutoRange = 0;
    showX(-20, 30);
    showY(-20, 70);
    kor::ResetGraphRanges(graph);
    for (const double one : {graph.xMax, graph.yMax, graph.xTickStep, graph.yTickStep,
                             graph.xTickStepCopy, graph.yTickStepCopy, graph.xUnitsPerPixelBase,
                             graph.yUnitsPerPixelBase, graph.xUnitsPerPixel, graph.yUnitsPerPixel})
        EXPECT_EQ(one, 1.0);
    for (const double zero : {graph.xMin, graph.yMin, graph.xCentre, graph.yCentre})
        EXPECT_EQ(zero, 0.0);
    EXPECT_EQ(graph.barWidth, 1);
    EXPECT_EQ(graph.barHeight, 1);
    EXPECT_EQ(graph.xAutoRange, 1);
    EXPECT_EQ(graph.yAutoRange, 1);
}

TEST_F(GraphRecordReset, KeepsTheZoom) {
    graph.zoom = 0.25;
    kor::ResetGraphRanges(graph);
    EXPECT_EQ(graph.zoom, 0.25);
}

TEST_F(GraphRecordReset, PlotAreaIsTheImageLessItsMargins) {
    graph.rcPlot = {5, 6, 300, 200};
    graph.marginLeft = 40;
    graph.marginTop = 30;
    graph.marginRight = 15;
    graph.marginBottom = 20;
    const RECT expected = {45, 36, 285, 180};
    const RECT area = kor::PlotArea(graph);
    EXPECT_TRUE(EqualRect(&area, &expected));
}

}  // namespace
}  // namespace kortest

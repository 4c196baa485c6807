// Ticks and number labels as they come out on screen.
#include "graph/graph_fixture.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr COLORREF kBlack = RGB(0, 0, 0);

class GraphTicks : public GraphTest {
protected:
    // Columns with a mark three rows above the x axis (which is in row 115), where no axis lies.
    std::vector<int> xTicks() {
        const Picture picture = image();
        std::vector<int> columns;
        for (int x = 18; x < 216; ++x)
            if (picture.pixel(x, 112) == kBlack && picture.pixel(x, 111) != kBlack)
                columns.push_back(x);
        return columns;
    }

    // Rows with a mark three columns left of the y axis (in column 15).
    std::vector<int> yTicks() {
        const Picture picture = image();
        std::vector<int> rows;
        for (int y = 0; y < 112; ++y)
            if (picture.pixel(12, y) == kBlack && picture.pixel(11, y) != kBlack) rows.push_back(y);
        return rows;
    }

    void show(DWORD options, double xHigh, double yHigh) {
        createPlain();
        send(GM_TOGGLEOPTIONS, 0, static_cast<LPARAM>(options));
        KorGraph_SetRange(graph, KORGRAPH_X, 0, xHigh);
        KorGraph_SetRange(graph, KORGRAPH_Y, 0, yHigh);
        redraw();
    }
};

TEST_F(GraphTicks, OfXStandAtMultiplesOfTheStep) {
    show(KORGRAPH_XTICKS, 10, 10);
    EXPECT_EQ(xTicks(), (std::vector<int>{75, 135, 195}));
    EXPECT_EQ(yTicks(), std::vector<int>{});
}

TEST_F(GraphTicks, OfYStandAtMultiplesOfTheStep) {
    show(KORGRAPH_YTICKS, 10, 10);
    EXPECT_EQ(yTicks(), (std::vector<int>{25, 55, 85}));
    EXPECT_EQ(xTicks(), std::vector<int>{});
}

TEST_F(GraphTicks, ComeCloserInValueWhenZoomedIn) {
    show(KORGRAPH_XTICKS, 10, 10);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    // 40 pixels a unit around x 5 in column 115; the axis is at the bottom; every 2 units
    EXPECT_EQ(xTicks(), (std::vector<int>{75, 155}));
}

TEST_F(GraphTicks, OfAShortRangeAreTenths) {
    show(KORGRAPH_XTICKS, 0.5, 10);
    const int expected[] = {55, 95, 135, 175,
                            215};  // tenths are no exact numbers: a pixel either way
    const auto ticks = xTicks();
    ASSERT_EQ(ticks.size(), 5u);
    for (size_t i = 0; i < 5; ++i) EXPECT_NEAR(ticks[i], expected[i], 1);
}

// Zero is far left of what is shown; ticks still stand at multiples of the step.
TEST_F(GraphTicks, AreCountedFromZeroWhereverItLies) {
    createPlain();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_XTICKS);
    KorGraph_SetRange(graph, KORGRAPH_X, 1000, 1010);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    redraw();
    // 1002, 1005 and 1008
    EXPECT_EQ(xTicks(), (std::vector<int>{55, 115, 175}));
}

TEST_F(GraphTicks, OfNegativeValuesStandThereToo) {
    createPlain();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_XTICKS);
    KorGraph_SetRange(graph, KORGRAPH_X, -10, 0);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    redraw();
    EXPECT_EQ(xTicks(), (std::vector<int>{35, 95, 155}));
}

TEST_F(GraphTicks, NumbersAreWrittenAtThem) {
    create(400, 300);
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 4);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 0.2);
    const auto texts = textsOf([this] { redraw(); });
    for (const wchar_t* expected : {L"1", L"2", L"3", L"0.1"})
        EXPECT_NE(std::find(texts.begin(), texts.end(), expected), texts.end()) << Narrow(expected);
    EXPECT_EQ(std::find(texts.begin(), texts.end(), L"0.05"), texts.end());
}

TEST_F(GraphTicks, LargeNumbersHaveATwoDigitExponent) {
    create(400, 300);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 1e9);
    bool found = false;
    for (const std::wstring& text : textsOf([this] { redraw(); })) {
        found |= text.find(L"E+0") != std::wstring::npos;
        EXPECT_EQ(text.find(L"E+00"), std::wstring::npos) << Narrow(text.c_str());
    }
    EXPECT_TRUE(found);
}

}  // namespace
}  // namespace kortest

// Pan arrows: where they answer, what they move, and when not.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

// At 200 % the regular chart has all four arrows: 40 pixels are one x unit, 20 one y unit, a pan
// step is 2 units both ways. Point 3 (x 4, value 4) stands in column 75, row 85.
class GraphPan : public GraphTest {
protected:
    GraphPan() {
        createRegular();
        KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
        settle();
    }

    void press(int x, int y) { PressAt(graph, x, y); }

    // Whether the outline of a triangle around a place outside the plot is there.
    bool isArrowAt(int x, int y) const {
        return image().count(RGB(0, 0, 0), {x - 3, y - 3, x + 4, y + 4}) >= 5;
    }

    // Whether point 3 now stands at a place, and the place of before is empty.
    void expectMoved(int dx, int dy) {
        EXPECT_EQ(tap(75 + dx, 85 + dy), L"Value:4");
        EXPECT_NE(tap(75, 85), L"Value:4");
    }

    void expectUnmoved() { EXPECT_EQ(tap(75, 85), L"Value:4"); }
};

TEST_F(GraphPan, AllFourArrowsAreDrawn) {
    EXPECT_TRUE(isArrowAt(9, 115)) << "left";
    EXPECT_TRUE(isArrowAt(221, 115)) << "right";
    EXPECT_TRUE(isArrowAt(15, 9)) << "up";
    EXPECT_TRUE(isArrowAt(15, 121)) << "down";
}

TEST_F(GraphPan, LeftMovesThePointsRightByOneStep) {
    press(8, 115);
    expectMoved(80, 0);
}

TEST_F(GraphPan, RightMovesThePointsLeftByOneStep) {
    press(222, 115);
    EXPECT_EQ(tap(75, 45), L"Value:6") << "point 5, which stood in column 155";
    EXPECT_NE(tap(75, 85), L"Value:4");
}

TEST_F(GraphPan, UpMovesThePointsDownByOneStep) {
    // point 5 (x 6, value 6) stood in column 155, row 45
    press(15, 8);
    EXPECT_EQ(tap(155, 85), L"Value:6");
    EXPECT_EQ(tap(155, 45), L"-");
}

TEST_F(GraphPan, DownMovesThePointsUpByOneStep) {
    press(15, 122);
    expectMoved(0, -40);
}

TEST_F(GraphPan, DrawsAndShowsTheMove) {
    const Picture before = image();
    press(8, 115);
    EXPECT_FALSE(before == image());
    const Picture drawn = image();
    UpdateWindow(graph);
    EXPECT_TRUE(SamePicture(drawn, ReadWindow(graph)));
}

TEST_F(GraphPan, InvalidatesThePlotWithErasingAndUpdatesTheParent) {
    watchInvalidations();
    spy.watch("UpdateWindow");
    press(8, 115);
    bool found = false;
    for (const Invalidation& call : invalidationsOf(graph))
        found |= !call.isWhole && call.area == RECT{0, 0, 230, 130} && call.erases;
    EXPECT_TRUE(found);
    const auto updates = spy.callsOf("UpdateWindow");
    ASSERT_EQ(updates.size(), 1u);
    EXPECT_EQ(reinterpret_cast<HWND>(updates[0].arguments[0]), host.window());
}

// Each arrow answers in the rectangle around its triangle, edges included.
struct ArrowBox {
    const char* name;
    RECT box;  // right and bottom edges included
};

class GraphPanBox : public GraphPan, public ::testing::WithParamInterface<ArrowBox> {
protected:
    // Whether a press on a fresh chart pans it.
    bool pans(LONG x, LONG y) {
        KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
        const Picture before = image();
        press(static_cast<int>(x), static_cast<int>(y));
        return !(before == image());
    }
};

TEST_P(GraphPanBox, AnswersInTheRectangleAroundItsTriangle) {
    const RECT box = GetParam().box;
    for (const LONG x : {box.left, box.right})
        for (const LONG y : {box.top, box.bottom}) EXPECT_TRUE(pans(x, y)) << x << ", " << y;
}

TEST_P(GraphPanBox, AnswersNowhereElse) {
    const RECT box = GetParam().box;
    const LONG middleX = (box.left + box.right) / 2;
    const LONG middleY = (box.top + box.bottom) / 2;
    EXPECT_FALSE(pans(box.left - 1, middleY));
    EXPECT_FALSE(pans(box.right + 1, middleY));
    EXPECT_FALSE(pans(middleX, box.top - 1));
    EXPECT_FALSE(pans(middleX, box.bottom + 1));
}

std::string NameOf(const ::testing::TestParamInfo<ArrowBox>& info) { return info.param.name; }

INSTANTIATE_TEST_SUITE_P(Arrows, GraphPanBox,
                         ::testing::Values(ArrowBox{"Left", {5, 110, 12, 120}},
                                           ArrowBox{"Right", {218, 110, 225, 120}},
                                           ArrowBox{"Up", {10, 5, 20, 12}},
                                           ArrowBox{"Down", {10, 118, 20, 125}}),
                         NameOf);

// The boxes of left and down overlap in columns 10 to 12, rows 118 to 120.
TEST_F(GraphPan, LeftComesBeforeDown) {
    press(11, 119);
    expectMoved(80, 0);
}

TEST_F(GraphPan, EndsWhereTheDataEnds) {
    press(8, 115);  // centre 3
    press(8, 115);  // centre 1: x 0 is in column 75
    EXPECT_FALSE(isArrowAt(9, 115)) << "no arrow where nothing lies beyond";
    const Picture before = image();
    watchInvalidations();
    press(8, 115);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 0u) << "no arrow, no answer";
}

TEST_F(GraphPan, AtFullSizeThereIsNoArrow) {
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM100);
    const Picture before = image();
    watchInvalidations();
    for (const POINT place : {POINT{8, 115}, POINT{222, 115}, POINT{15, 8}, POINT{15, 122}}) {
        EXPECT_FALSE(isArrowAt(place.x, place.y));
        press(place.x, place.y);
    }
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 0u);
    EXPECT_EQ(shown.size(), 0u);
}

// The range goes farther left than the data: an arrow is shown, but no data lies there.
TEST_F(GraphPan, WithoutDataBeyondTheEdgeInvalidatesOnly) {
    KorGraph_SetRange(graph, KORGRAPH_X, -20, 20);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    // x 0 is the centre; data begins there, the range at -20
    ASSERT_TRUE(isArrowAt(9, 115));
    const Picture before = image();
    watchInvalidations();
    press(8, 115);
    EXPECT_TRUE(SamePicture(before, image()));
    ASSERT_EQ(invalidations.size(), 1u);
    EXPECT_TRUE(invalidations[0].erases);
}

TEST_F(GraphPan, UpAndDownWithoutDataBeyondTheEdgeInvalidateOnly) {
    KorGraph_SetRange(graph, KORGRAPH_Y, -40, 40);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    // y 0 is in the middle; data lies between it and 10, the plot ends at -20 and 20
    ASSERT_TRUE(isArrowAt(15, 9));
    ASSERT_TRUE(isArrowAt(15, 121));
    const Picture before = image();
    watchInvalidations();
    press(15, 8);
    press(15, 122);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 2u);
}

TEST_F(GraphPan, KeepsTheRange) {
    press(8, 115);
    press(15, 8);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 10.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 10.0}));
}

TEST_F(GraphPan, IsLostAtTheNextZoom) {
    press(8, 115);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    expectUnmoved();
}

TEST_F(GraphPan, IsLostAtADataChangeWithAutomaticRanges) {
    press(8, 115);
    setValue(0, 0, 1.5);
    expectUnmoved();
}

TEST_F(GraphPan, IsKeptAtADataChangeWithAFixedRange) {
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 10);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    press(8, 115);
    setValue(0, 0, 1.5);
    expectMoved(80, 0);
}

TEST_F(GraphPan, IsKeptByARedraw) {
    press(8, 115);
    redraw();
    expectMoved(80, 0);
}

TEST_F(GraphPan, IsLostAtASizeChange) {
    press(8, 115);
    send(WM_SIZE, 0, MAKELPARAM(230, 130));
    expectUnmoved();
}

// Arrows follow the range's ends, panning the data's.
TEST_F(GraphPan, RightEndsWhereTheDataEnds) {
    press(222, 115);  // centre 7
    press(222, 115);  // centre 9: x 10 is in column 155
    EXPECT_FALSE(isArrowAt(221, 115));
    EXPECT_EQ(tap(115, 20), L"-");
    const Picture before = image();
    press(222, 115);
    EXPECT_TRUE(SamePicture(before, image()));
}

TEST_F(GraphPan, PressOfTheOtherButtonPansNothing) {
    const Picture before = image();
    send(WM_RBUTTONDOWN, MK_RBUTTON, MAKELPARAM(8, 115));
    EXPECT_TRUE(SamePicture(before, image()));
}

}  // namespace
}  // namespace kortest

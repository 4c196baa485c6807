// The four zoom levels.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphZoom : public GraphTest {
protected:
    void zoom(LONG index) { KorGraph_SetZoom(graph, index); }
};

TEST_F(GraphZoom, IsReadAsItWasSet) {
    create();
    for (LONG index = 0; index <= 3; ++index) {
        zoom(index);
        EXPECT_EQ(KorGraph_GetZoom(graph), index);
    }
}

TEST_F(GraphZoom, OtherNumbersAreIgnored) {
    createRegular();
    zoom(KORGRAPH_ZOOM200);
    const Picture before = image();
    watchInvalidations();
    for (const LONG index : {4L, 5L, -1L, 100L}) zoom(index);
    EXPECT_EQ(KorGraph_GetZoom(graph), KORGRAPH_ZOOM200);
    EXPECT_EQ(invalidations.size(), 0u) << "nothing is drawn";
    EXPECT_TRUE(SamePicture(before, image()));
}

// Point 3 stands at x 4, one unit left of the centre (column 115), with value 4, one unit below
// the centre (row 65).
TEST_F(GraphZoom, KeepsTheCentreAndScalesTheRest) {
    createRegular();
    const struct {
        LONG zoom;
        int x, y;
    } rows[] = {{KORGRAPH_ZOOM25, 110, 67},
                {KORGRAPH_ZOOM50, 105, 70},
                {KORGRAPH_ZOOM100, 95, 75},
                {KORGRAPH_ZOOM200, 75, 85}};
    for (const auto& row : rows) {
        zoom(row.zoom);
        EXPECT_EQ(tap(row.x + 3, row.y - 3), L"Value:4") << row.zoom;
        EXPECT_NE(tap(row.x + 4, row.y - 4), L"Value:4") << row.zoom;
        EXPECT_EQ(tap(115, 65), L"Value:5") << row.zoom << " the centre";
    }
}

TEST_F(GraphZoom, DrawsAtOnce) {
    createRegular();
    for (const LONG index : {KORGRAPH_ZOOM200, KORGRAPH_ZOOM50, KORGRAPH_ZOOM25}) {
        const Picture before = image();
        zoom(index);
        EXPECT_FALSE(before == image());
        const Picture drawn = image();
        redraw();
        EXPECT_TRUE(SamePicture(drawn, image())) << "and whole";
    }
}

TEST_F(GraphZoom, BackAt100PercentIsThePictureOfBefore) {
    createRegular();
    const Picture before = image();
    zoom(KORGRAPH_ZOOM25);
    zoom(KORGRAPH_ZOOM100);
    EXPECT_TRUE(SamePicture(before, image()));
}

TEST_F(GraphZoom, SurvivesDataChangesAndResets) {
    createRegular();
    zoom(KORGRAPH_ZOOM50);
    add({1, 2});
    setValue(0, 0, 3);
    notify(GN_CLEAR);
    notify(GN_RESET, 1);
    KorGraph_SetType(graph, KORGRAPH_BAR);
    resize(200, 100);
    EXPECT_EQ(KorGraph_GetZoom(graph), KORGRAPH_ZOOM50);
}

}  // namespace
}  // namespace kortest

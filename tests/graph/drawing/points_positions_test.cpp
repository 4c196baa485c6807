// Points by the pixel that they share.
#include "graph/number_graph.h"

#include "graph/data/axes.h"
#include "graph/shapes/points.h"

#include <random>

namespace kortest {
namespace {

struct Position {
    int pixel;
    int number;
    int end;
    auto operator<=>(const Position&) const = default;
};

using Positions = std::vector<Position>;

Positions Walked(const kor::GraphRecord& graph, kor::PointRange range) {
    Positions found;
    for (kor::PositionWalk walk(kor::XAxis(graph), range); !walk.IsAtEnd(); walk.Next()) {
        found.push_back({walk.pixel(), walk.number(), walk.end()});
    }
    return found;
}

Positions PointByPoint(const kor::GraphRecord& graph, kor::PointRange range) {
    Positions found;
    for (int number = range.first; number <= range.last; ++number) {
        const int pixel = kor::xPixel(graph, number);
        if (found.empty() || found.back().pixel != pixel) found.push_back({pixel, number, number});
        found.back().end = number + 1;
    }
    return found;
}

class GraphPositions : public NumberGraph {};

TEST_F(GraphPositions, AreThoseOfEachPoint) {
    std::mt19937 random(21);
    for (int i = 0; i < 3000; ++i) {
        const int width = 1 + static_cast<int>(random() % 300);
        const int points = 1 + static_cast<int>(random() % (i % 3 == 0 ? 5000 : 400));
        resizePlot(width, 100);
        showX(0, points + 1);
        const int first = 1 + static_cast<int>(random() % static_cast<unsigned>(points));
        const kor::PointRange range = {first, points};
        ASSERT_EQ(Walked(graph, range), PointByPoint(graph, range)) << points << " in " << width;
    }
}

// Beyond the largest pixel distance all points share a position, so one long run follows short
// ones.
TEST_F(GraphPositions, MayHaveVeryDifferentNumbersOfPoints) {
    showX(1000, 1000.0000001);
    const Positions found = Walked(graph, {900, 1100});
    EXPECT_EQ(found, PointByPoint(graph, {900, 1100}));
    ASSERT_GE(found.size(), 3u);
    EXPECT_EQ(found[0].end - found[0].number, 100);
    EXPECT_EQ(found[1].end - found[1].number, 1);
}

TEST_F(GraphPositions, AreNoneInAnEmptyRange) { EXPECT_EQ(Walked(graph, {5, 4}), Positions()); }

}  // namespace
}  // namespace kortest

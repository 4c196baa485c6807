// The shape of a marker is read once in a process. A call that fails meanwhile spoils no marker, in
// this picture or a later one.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

struct Failure {
    const char* function;
    ULONG_PTR result;
    int nth;
};

class MarkerShape : public GraphTest, public ::testing::WithParamInterface<Failure> {
protected:
    // More points than are drawn as single circles.
    void SetUp() override {
        create();
        std::vector<double> values(700);
        for (size_t i = 0; i < values.size(); ++i) values[i] = static_cast<double>(i % 23);
        add(values);
        spy.watchAll({"CreateCompatibleBitmap", GetParam().function});
    }

    // Drawn by the platform, a circle for each point.
    Picture literal() {
        spy.failAlways("CreateCompatibleBitmap");
        redraw();
        spy.stopFailing("CreateCompatibleBitmap");
        return image();
    }
};

TEST_P(MarkerShape, SurvivesAFailure) {
    const Picture expected = literal();
    spy.clearCalls();
    spy.failNth(GetParam().function, GetParam().nth, GetParam().result);
    redraw();
    ASSERT_NE(spy.sequence().find(std::string(GetParam().function) + "!"), std::string::npos);
    EXPECT_TRUE(SamePicture(image(), expected));
    redraw();
    EXPECT_TRUE(SamePicture(image(), expected));
    spy.clearCalls();
    redraw();
    EXPECT_EQ(spy.count("CreateCompatibleBitmap"), 0) << "by now the shape is known";
}

constexpr ULONG_PTR kInvalid = static_cast<DWORD>(CLR_INVALID);

INSTANTIATE_TEST_SUITE_P(
    Of, MarkerShape,
    ::testing::Values(Failure{"GetPixel", kInvalid, 1}, Failure{"GetPixel", kInvalid, 20},
                      Failure{"GetPixel", kInvalid, 64}, Failure{"GetStockObject", 0, 2},
                      Failure{"PatBlt", 0, 1}, Failure{"Ellipse", 0, 1}),
    [](const auto& tested) {
        return std::string(tested.param.function) + std::to_string(tested.param.nth);
    });

}  // namespace
}  // namespace kortest

// The shape of a marker is read once in a process. A call that fails meanwhile spoils no marker, in
// this picture or a later one.
#include "graph/graph_fixture.h"

#include <algorithm>
#include <limits>

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

// Of so many points that their circles are drawn together.
class ManyMarkers : public GraphTest {
protected:
    ManyMarkers() { createPlain(); }

    // The picture, and how many circles the platform drew.
    Picture draw(const std::vector<double>& values) {
        send(WM_NOTIFY, GN_CLEAR);
        add(values);
        spy.clearCalls();
        redraw();
        return image();
    }

    static std::vector<double> waves(size_t count) {
        std::vector<double> values(count);
        for (size_t i = 0; i < count; ++i) values[i] = static_cast<double>(i % 23);
        return values;
    }
};

TEST_F(ManyMarkers, LeaveOutColumnsWithoutANumber) {
    spy.watchAll({"Ellipse", "CreateCompatibleBitmap"});
    std::vector<double> values = waves(2000);
    std::fill(values.begin() + 600, values.begin() + 1400,
              std::numeric_limits<double>::quiet_NaN());
    const Picture united = draw(values);
    const int shape = spy.count("Ellipse");
    EXPECT_LE(shape, 1) << "the shape of all";
    spy.failAlways("CreateCompatibleBitmap");
    redraw();
    spy.stopFailing("CreateCompatibleBitmap");
    EXPECT_TRUE(SamePicture(image(), united));
}

TEST_F(ManyMarkers, OnAPrinterAreThePlatformsOwn) {
    spy.watchAll({"Ellipse", "GetDeviceCaps"});
    spy.replace("GetDeviceCaps", [this](ULONG_PTR* arguments) {
        if (static_cast<int>(arguments[1]) == TECHNOLOGY) return ULONG_PTR{DT_RASPRINTER};
        return spy.callReal("GetDeviceCaps", arguments);
    });
    draw(waves(2000));
    EXPECT_EQ(spy.count("Ellipse"), 2000);
}

}  // namespace
}  // namespace kortest

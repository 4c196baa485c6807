#include "grid/geometry.h"

#include <gtest/gtest.h>

#include <random>
#include <vector>

namespace kor {
namespace {

constexpr int kColumnDefault = 60;
constexpr int kRowDefault = 16;

// An axis with its table.
class TestAxis {
public:
    explicit TestAxis(int defaultSize) : defaultSize_(defaultSize) {}

    TestAxis& with(uint16_t index, uint16_t size) {
        table_.push_back({index, size, size - defaultSize_});
        return *this;
    }
    GridAxis axis() const {
        return {table_.empty() ? nullptr : table_.data(), static_cast<uint32_t>(table_.size()),
                defaultSize_};
    }
    operator GridAxis() const { return axis(); }

private:
    int defaultSize_;
    std::vector<SizeOverride> table_;
};

TEST(GridSizes, AreTheDefaultsAtEachZoom) {
    const TestAxis columns(kColumnDefault);
    const TestAxis rows(kRowDefault);
    EXPECT_EQ(SizeOf(columns, 0, 4), 60);
    EXPECT_EQ(SizeOf(columns, 255, 2), 30);
    EXPECT_EQ(SizeOf(columns, 7, 3), 45);
    EXPECT_EQ(SizeOf(rows, 0, 4), 16);
    EXPECT_EQ(SizeOf(rows, 16383, 2), 8);
    EXPECT_EQ(SizeOf(rows, 1, 1), 4);
}

TEST(GridSizes, AreTheirOwnWhereTheyWereChanged) {
    const TestAxis columns = TestAxis(kColumnDefault).with(3, 81).with(7, 0).with(200, 65535);
    EXPECT_EQ(SizeOf(columns, 2, 4), 60);
    EXPECT_EQ(SizeOf(columns, 3, 4), 81);
    EXPECT_EQ(SizeOf(columns, 3, 2), 40);
    EXPECT_EQ(SizeOf(columns, 4, 4), 60);
    EXPECT_EQ(SizeOf(columns, 7, 4), 0);
    EXPECT_EQ(SizeOf(columns, 200, 4), 65535);
    EXPECT_EQ(SizeOf(columns, 201, 4), 60);
}

TEST(GridSizes, AddUpOverARange) {
    const TestAxis columns = TestAxis(kColumnDefault).with(3, 81).with(7, 10);
    EXPECT_EQ(SizeOfRange(columns, 0, 3, 4), 180);
    EXPECT_EQ(SizeOfRange(columns, 0, 4, 4), 261);
    EXPECT_EQ(SizeOfRange(columns, 3, 8, 4), 81 + 180 + 10);
    EXPECT_EQ(SizeOfRange(columns, 3, 8, 2), 40 + 90 + 5);
    EXPECT_EQ(SizeOfRange(columns, 4, 7, 4), 180);
    EXPECT_EQ(SizeOfRange(columns, 5, 5, 4), 0);
    EXPECT_EQ(SizeOfRange(columns, 6, 5, 4), 0);
}

TEST(GridSizes, AddUpAsOneByOne) {
    std::mt19937 random(3);
    for (int round = 0; round < 200; ++round) {
        TestAxis axis(round % 2 ? kColumnDefault : kRowDefault);
        for (uint16_t index = 0; index < 60; ++index) {
            if (random() % 4 == 0) axis.with(index, static_cast<uint16_t>(random() % 200));
        }
        const uint32_t zoom = 1 + random() % 9;
        const int first = static_cast<int>(random() % 70);
        const int end = static_cast<int>(random() % 70);
        int sum = 0;
        for (int i = first; i < end; ++i) sum += SizeOf(axis, i, zoom);
        ASSERT_EQ(SizeOfRange(axis, first, end, zoom), sum) << first << " to " << end;
    }
}

TEST(GridDistance, AddsDeltasUnscaled) {
    const TestAxis columns = TestAxis(kColumnDefault).with(3, 81).with(7, 10);
    EXPECT_EQ(RoughDistance(columns, 0, 3, 4), 180);
    EXPECT_EQ(RoughDistance(columns, 0, 4, 4), 261);
    EXPECT_EQ(RoughDistance(columns, 0, 4, 2), 120 + 21);
    EXPECT_EQ(RoughDistance(columns, 2, 9, 8), 7 * 120 + 21 - 50);
    EXPECT_EQ(RoughDistance(columns, 4, 7, 4), 180);
    const TestAxis rows = TestAxis(kRowDefault).with(2, 40);
    EXPECT_EQ(RoughDistance(rows, 0, 3, 4), 72);
    EXPECT_EQ(RoughDistance(rows, 0, 3, 1), 12 + 24);
}

TEST(GridUnits, AreCutOff) {
    EXPECT_EQ(UnitsFromPixels(60, 4), 60);
    EXPECT_EQ(UnitsFromPixels(30, 2), 60);
    EXPECT_EQ(UnitsFromPixels(41, 8), 20);
    EXPECT_EQ(UnitsFromPixels(10, 3), 13);
    EXPECT_EQ(UnitsFromPixels(0, 4), 0);
}

// Units are compared with pixels.
TEST(GridUnits, AreCutToTheAreaLessTen) {
    EXPECT_EQ(UnitsWithinArea(200, 4, 200), 200);
    EXPECT_EQ(UnitsWithinArea(201, 4, 200), 190);
    EXPECT_EQ(UnitsWithinArea(101, 2, 200), 190);  // 202 units
    EXPECT_EQ(UnitsWithinArea(400, 8, 200), 200);
    EXPECT_EQ(UnitsWithinArea(402, 8, 200), 190);
    EXPECT_EQ(UnitsWithinArea(20, 4, 8), 0);
    EXPECT_EQ(UnitsWithinArea(20, 4, -30), 0);
}

TEST(GridVisible, CountsAPartlyVisibleLastOne) {
    const TestAxis columns(kColumnDefault);
    EXPECT_EQ(CountVisible(columns, 0, 256, 120, 4), 2);
    EXPECT_EQ(CountVisible(columns, 0, 256, 121, 4), 3);
    EXPECT_EQ(CountVisible(columns, 0, 256, 1, 4), 1);
    EXPECT_EQ(CountVisible(columns, 0, 256, 0, 4), 0);
    EXPECT_EQ(CountVisible(columns, 0, 256, -5, 4), 0);
    EXPECT_EQ(CountVisible(columns, 0, 256, 120, 2), 4);
}

TEST(GridVisible, StopsAtTheSheetsEndAndAt255) {
    const TestAxis columns(kColumnDefault);
    EXPECT_EQ(CountVisible(columns, 250, 256, 6000, 4), 6);
    EXPECT_EQ(CountVisible(columns, 256, 256, 6000, 4), 0);
    EXPECT_EQ(CountVisible(columns, 300, 256, 6000, 4), 0);
    EXPECT_EQ(CountVisible(TestAxis(kRowDefault), 0, 16384, 30000, 1), 255);
}

TEST(GridVisible, EndsWithSizesOfZero) {
    TestAxis columns(kColumnDefault);
    for (uint16_t i = 0; i < 10; ++i) columns.with(i, 0);
    EXPECT_EQ(CountVisible(columns, 0, 256, 100, 4), 12);
    EXPECT_EQ(CountVisible(TestAxis(3), 0, 256, 100, 1), 255);  // 0 pixels each
}

TEST(GridIndex, IsFoundFromAPosition) {
    const TestAxis columns = TestAxis(kColumnDefault).with(6, 20);
    // Columns 5, 6, 7 at 30 to 90, 110 and 170; an edge belongs to the column before it.
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 0, 4), 5);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 31, 4), 5);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 90, 4), 5);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 91, 4), 6);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 110, 4), 6);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 111, 4), 7);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 170, 4), 7);
}

TEST(GridIndex, GoesOnePastTheVisibleOnesAndIsZeroBeyond) {
    const TestAxis columns(kColumnDefault);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 211, 4), 8);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 270, 4), 8);
    EXPECT_EQ(IndexAt(columns, 5, 3, 30, 271, 4), 0);
    EXPECT_EQ(IndexAt(columns, 5, 0, 30, 91, 4), 0);
    EXPECT_EQ(IndexAt(columns, 5, 0, 30, 90, 4), 5);
}

bool operator==(const VisibleSpan& a, const VisibleSpan& b) {
    return a.touches == b.touches && a.offset == b.offset && a.length == b.length;
}

// Columns 10 to 14 are visible, and 15 counts as well.
VisibleSpan SpanOf(int selectedFirst, int selectedLast) {
    return SelectedSpan(TestAxis(kColumnDefault).with(11, 20), selectedFirst, selectedLast, 10, 5,
                        4);
}

TEST(GridSelectedSpan, CoversTheVisiblePartOfASelection) {
    EXPECT_TRUE(SpanOf(10, 10) == (VisibleSpan{true, 0, 60}));
    EXPECT_TRUE(SpanOf(11, 11) == (VisibleSpan{true, 60, 20}));
    EXPECT_TRUE(SpanOf(11, 13) == (VisibleSpan{true, 60, 140}));
    EXPECT_TRUE(SpanOf(3, 11) == (VisibleSpan{true, 0, 80}));
    EXPECT_TRUE(SpanOf(13, 200) == (VisibleSpan{true, 140, 180}));
    EXPECT_TRUE(SpanOf(0, 255) == (VisibleSpan{true, 0, 320}));
    EXPECT_TRUE(SpanOf(10, 15) == (VisibleSpan{true, 0, 320}));
}

TEST(GridSelectedSpan, CountsTheEndOfTheVisibleRangeAsInside) {
    EXPECT_TRUE(SpanOf(15, 15) == (VisibleSpan{true, 260, 60}));
    EXPECT_TRUE(SpanOf(15, 20) == (VisibleSpan{true, 260, 60}));
}

TEST(GridSelectedSpan, IsNoneOutsideTheVisibleRange) {
    EXPECT_FALSE(SpanOf(16, 20).touches);
    EXPECT_FALSE(SpanOf(0, 9).touches);
}

TEST(GridRowHeader, WidensWithTheNumberOfDigits) {
    EXPECT_EQ(RowHeaderWidthFor(0), 30);
    EXPECT_EQ(RowHeaderWidthFor(999), 30);
    EXPECT_EQ(RowHeaderWidthFor(1000), 35);
    EXPECT_EQ(RowHeaderWidthFor(9999), 35);
    EXPECT_EQ(RowHeaderWidthFor(10000), 40);
    EXPECT_EQ(RowHeaderWidthFor(16384), 40);
}

}  // namespace
}  // namespace kor

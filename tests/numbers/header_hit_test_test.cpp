#include "header/hit_test.h"

#include <gtest/gtest.h>

#include <ostream>
#include <random>
#include <vector>

namespace kor {

bool operator==(const HeaderHit& a, const HeaderHit& b) {
    return a.item == b.item && a.onBorder == b.onBorder &&
           (!a.onBorder || a.borderItem == b.borderItem);
}

void PrintTo(const HeaderHit& hit, std::ostream* stream) {
    *stream << "item " << hit.item;
    if (hit.onBorder) *stream << ", border " << hit.borderItem;
}

namespace {

using Sizes = std::vector<uint16_t>;

HeaderHit Hit(const Sizes& sizes, int position) {
    return HitTestHeader(sizes.data(), static_cast<uint32_t>(sizes.size()), position);
}

constexpr HeaderHit Item(int item) { return {item, false, -1}; }
constexpr HeaderHit Border(int item, int borderItem) { return {item, true, borderItem}; }

TEST(HeaderHit, GripsFivePixelsBeforeABorderAndSixFromIt) {
    const Sizes sizes{60, 60};
    EXPECT_EQ(Hit(sizes, 0), Border(0, -1));
    EXPECT_EQ(Hit(sizes, 5), Border(0, -1));
    EXPECT_EQ(Hit(sizes, 6), Item(0));
    EXPECT_EQ(Hit(sizes, 54), Item(0));
    EXPECT_EQ(Hit(sizes, 55), Border(0, 0));
    EXPECT_EQ(Hit(sizes, 59), Border(0, 0));
    EXPECT_EQ(Hit(sizes, 60), Border(1, 0));
    EXPECT_EQ(Hit(sizes, 65), Border(1, 0));
    EXPECT_EQ(Hit(sizes, 66), Item(1));
    EXPECT_EQ(Hit(sizes, 114), Item(1));
    EXPECT_EQ(Hit(sizes, 115), Border(1, 1));
    EXPECT_EQ(Hit(sizes, 119), Border(1, 1));
}

TEST(HeaderHit, EndsWithTheLastItem) {
    const Sizes sizes{60, 60};
    EXPECT_EQ(Hit(sizes, 120), Item(-1));
    EXPECT_EQ(Hit(sizes, 125), Item(-1));
    EXPECT_EQ(Hit(sizes, 65535), Item(-1));
    EXPECT_EQ(Hit({}, 0), Item(-1));
    EXPECT_EQ(Hit({}, 3), Item(-1));
}

TEST(HeaderHit, IsNoneAtNegativePositions) {
    for (int position : {-1, -5, -6, -7, -32768}) EXPECT_EQ(Hit({60, 60}, position), Item(-1));
}

TEST(HeaderHit, GivesTheLaterFindingInNarrowItems) {
    const Sizes sizes{60, 4, 60};
    EXPECT_EQ(Hit(sizes, 59), Border(0, 0));
    EXPECT_EQ(Hit(sizes, 60), Border(1, 1));
    EXPECT_EQ(Hit(sizes, 63), Border(1, 1));
    EXPECT_EQ(Hit(sizes, 64), Border(2, 1));
    EXPECT_EQ(Hit(sizes, 69), Border(2, 1));
    EXPECT_EQ(Hit(sizes, 70), Item(2));
}

// The last border found on the way may lie before the position although no item does.
TEST(HeaderHit, ReachesBeyondANarrowLastItem) {
    const Sizes sizes{3, 3, 3};
    EXPECT_EQ(Hit(sizes, 2), Border(0, 0));
    EXPECT_EQ(Hit(sizes, 5), Border(1, 1));
    EXPECT_EQ(Hit(sizes, 8), Border(2, 2));
    EXPECT_EQ(Hit(sizes, 9), Border(-1, 1));
    EXPECT_EQ(Hit(sizes, 11), Border(-1, 1));
    EXPECT_EQ(Hit(sizes, 12), Item(-1));
}

// The walk as the control's description tells it, step by step.
HeaderHit WalkAlong(const Sizes& sizes, int position) {
    HeaderHit hit{-1, false, -1};
    if (position < 0) return hit;
    int start = 0;
    for (int i = 0; i < static_cast<int>(sizes.size()); ++i) {
        if (position - start < 6) {
            hit.onBorder = true;
            hit.borderItem = i - 1;
        }
        start += sizes[static_cast<size_t>(i)];
        if (start > position) {
            hit.item = i;
            break;
        }
    }
    if (start - position >= 1 && start - position < 6) {
        hit.onBorder = true;
        hit.borderItem = hit.item;
    }
    return hit;
}

TEST(HeaderHit, FollowsTheWalkForAnySizes) {
    std::mt19937 random(7);
    for (int round = 0; round < 2000; ++round) {
        const uint32_t largest = round % 2 ? 12 : 80;
        Sizes sizes(random() % 9);
        int total = 0;
        for (uint16_t& size : sizes) {
            size = static_cast<uint16_t>(random() % (largest + 1));
            total += size;
        }
        for (int position = -3; position <= total + 8; ++position) {
            ASSERT_EQ(Hit(sizes, position), WalkAlong(sizes, position))
                << "position " << position << " of " << ::testing::PrintToString(sizes);
        }
    }
}

TEST(HeaderHit, AddsUpManyLargeItems) {
    const Sizes sizes(40000, 65535);
    EXPECT_EQ(Hit(sizes, 65535 * 20000 + 100), Item(20000));
    EXPECT_EQ(Hit(sizes, 65535 * 20000 + 2), Border(20000, 19999));
}

}  // namespace
}  // namespace kor

// Where a press hits an item, a border or nothing, pixel by pixel.
#include "header_fixture.h"

#include <sstream>

namespace kortest {
namespace {

class HeaderHitTest : public HeaderTest {
protected:
    void useStrip(bool isVertical, const std::vector<int>& sizes) {
        vertical = isVertical;
        header = isVertical ? createVertical() : createHorizontal();
        AppendSizes(header, sizes);
    }

    void press(int position) { PressAt(header, vertical ? 3 : position, vertical ? position : 3); }

    // "item 2", "border 1" or "none": what a press at the position is taken for.
    std::string hit(int position) {
        press(position);
        const bool isCaptured = GetCapture() == header;
        ReleaseAt(header, 3, 3);
        const Lines lines = posted();
        if (GetCapture()) {  // nobody gives back the capture of a press at the strip's begin
            ReleaseCapture();
            return lines.empty() ? "border -1" : "captured " + lines[0];
        }
        if (lines.size() != 1) return isCaptured || !lines.empty() ? "unclear" : "none";
        std::istringstream words(lines[0]);
        std::string how, message, strip, index;
        words >> how >> message >> strip >> index;
        return (message == "HCN_ITEMCLICK" ? "item " : "border ") + index;
    }

    // Consecutive positions with the same hit as one line: "55-65 border 0".
    Lines hits(int first, int last) {
        Lines lines;
        int begin = first;
        std::string current = hit(first);
        for (int position = first + 1; position <= last + 1; ++position) {
            const std::string next = position <= last ? hit(position) : "";
            if (next == current) continue;
            lines.push_back(std::to_string(begin) + "-" + std::to_string(position - 1) + " " +
                            current);
            begin = position;
            current = next;
        }
        return lines;
    }

    HWND header = nullptr;
    bool vertical = false;
};

const Lines kHitsOfTwoItems{"0-5 border -1", "6-54 item 0",      "55-65 border 0",
                            "66-114 item 1", "115-119 border 1", "120-140 none"};

TEST_F(HeaderHitTest, GripsFivePixelsBeforeABorderAndSixFromIt) {
    useStrip(false, {60, 60});
    EXPECT_EQ(hits(0, 140), kHitsOfTwoItems);
}

TEST_F(HeaderHitTest, IsTheSameDownAVerticalStrip) {
    useStrip(true, {60, 60});
    EXPECT_EQ(hits(0, 140), kHitsOfTwoItems);
}

TEST_F(HeaderHitTest, GivesTheLaterBorderInANarrowItem) {
    useStrip(false, {60, 4, 60});
    EXPECT_EQ(hits(6, 130), (Lines{"6-54 item 0", "55-59 border 0", "60-69 border 1",
                                   "70-118 item 2", "119-123 border 2", "124-130 none"}));
}

TEST_F(HeaderHitTest, HasNothingButBordersInNarrowItems) {
    useStrip(false, {3, 3, 3});
    EXPECT_EQ(hits(0, 20), (Lines{"0-2 border 0", "3-5 border 1", "6-8 border 2", "9-11 border 1",
                                  "12-20 none"}));
}

// 11 pixels are the 6 after one border and the 5 before the next.
TEST_F(HeaderHitTest, LeavesNothingOfAnItemOf11Pixels) {
    useStrip(false, {60, 11, 12, 60});
    EXPECT_EQ(hits(50, 90), (Lines{"50-54 item 0", "55-65 border 0", "66-76 border 1",
                                   "77-77 item 2", "78-88 border 2", "89-90 item 3"}));
}

TEST_F(HeaderHitTest, PassesOverItemsWithoutSize) {
    useStrip(false, {60, 0, 60});
    EXPECT_EQ(hits(50, 70),
              (Lines{"50-54 item 0", "55-59 border 0", "60-65 border 1", "66-70 item 2"}));
}

TEST_F(HeaderHitTest, FindsNothingInAnEmptyStrip) {
    useStrip(false, {});
    EXPECT_EQ(hits(0, 20), Lines{"0-20 none"});
}

TEST_F(HeaderHitTest, FindsNothingAtNegativePositions) {
    useStrip(false, {60, 60});
    for (int position : {-1, -2, -5, -6, -100, -32768}) EXPECT_EQ(hit(position), "none");
}

TEST_F(HeaderHitTest, FindsNothingAboveAVerticalStrip) {
    useStrip(true, {60, 60});
    for (int position : {-1, -5, -6, -100}) EXPECT_EQ(hit(position), "none");
}

TEST_F(HeaderHitTest, ReachesFarItems) {
    useStrip(false, {20000, 20000, 20000});
    EXPECT_EQ(hit(30000), "item 1");
    EXPECT_EQ(hit(20003), "border 0");
    EXPECT_EQ(hit(32767), "item 1");
}

// The strip's other direction does not matter.
TEST_F(HeaderHitTest, LooksAlongTheStripOnly) {
    useStrip(false, {60, 60});
    for (int y : {-5, 0, 8, 15, 100}) {
        PressAt(header, 90, y);
        ReleaseAt(header, 90, y);
        EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 1"}) << y;
    }
}

}  // namespace
}  // namespace kortest

// A grid that its host destroys, or whose sizes it changes, inside a message that the grid sends to
// one of its own children.
#include "grid/use_grid.h"

#include "support/message_hook.h"

namespace kortest {
namespace {

class GridDestroyedInside : public GuardedGridUse {
protected:
    void SetUp() override {
        open(330, 168);
        SetColumnWidth(2, 40);
        SetRowHeight(2, 30);
        settle();
    }
};

TEST_F(GridDestroyedInside, AMessageToTheColumnStrip) {
    MessageHook hook(columnHeader);
    hook.before(HCM_SETITEM, [&](WPARAM, LPARAM) { destroy(); });
    SetFirstVisibleCell(KORGRID_CELL(1, 1));
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(heap.report(), "");
}

TEST_F(GridDestroyedInside, AMessageToTheRowStrip) {
    MessageHook hook(rowHeader);
    hook.before(HCM_SETITEM, [&](WPARAM, LPARAM) { destroy(); });
    SetFirstVisibleCell(KORGRID_CELL(1, 1));
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(heap.report(), "");
}

// The table of sizes moves when it grows.
TEST_F(GridDestroyedInside, SizesThatComeMeanwhileAreShown) {
    MessageHook hook(columnHeader);
    hook.before(HCM_SETITEM, [&](WPARAM, LPARAM) {
        for (int column = 3; column < 40; ++column) SetColumnWidth(column, 20 + column);
    });
    SetFirstVisibleCell(KORGRID_CELL(2, 0));
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(HeaderSizes(columnHeader)[4], 24);
    EXPECT_EQ(heap.report(), "");
}

TEST_F(GridDestroyedInside, SizesThatGoMeanwhileAreGone) {
    MessageHook hook(rowHeader);
    hook.before(HCM_SETITEM, [&](WPARAM, LPARAM) { ResetGrid(); });
    SetFirstVisibleCell(KORGRID_CELL(0, 1));
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(HeaderSizes(rowHeader)[1], kRowHeight);
    EXPECT_EQ(heap.report(), "");
}

}  // namespace
}  // namespace kortest

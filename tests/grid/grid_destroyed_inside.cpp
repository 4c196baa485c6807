// A grid that its host destroys, or whose sizes it changes, inside a message that the grid sends to
// one of its own children.
#include "grid/use_grid.h"

#include "support/handle_balance.h"
#include "support/message_hook.h"

#include <functional>

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

// ---- In the middle of its creation ---------------------------------------------------------------

class GridDestroyedInCreation : public GridUse {
protected:
    // What the creation of a grid leaves behind, but for the strips' font, which is never deleted.
    std::vector<std::string> leftBy(const std::function<void(HWND child)>& action) {
        MessageHook hook(host.window());
        hook.before(WM_PARENTNOTIFY,
                    [&](WPARAM, LPARAM child) { action(reinterpret_cast<HWND>(child)); });
        WatchHandles(spy);
        host.createGrid(330, 168);
        EXPECT_TRUE(hook.hasActed());
        std::vector<std::string> left = UnreturnedHandles(spy);
        std::erase_if(left, [](const std::string& handle) {
            return handle.find("CreateFontIndirectW") != std::string::npos;
        });
        return left;
    }
};

TEST_F(GridDestroyedInCreation, LeavesNothingBehind) {
    const auto left = leftBy([](HWND child) { DestroyWindow(GetParent(child)); });
    EXPECT_EQ(left, std::vector<std::string>{});
}

TEST_F(GridDestroyedInCreation, LeavesTheNextGridAlone) {
    HWND next = nullptr;
    leftBy([&](HWND child) {
        DestroyWindow(GetParent(child));
        next = CreateWindowExW(0, KORGRID_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, 200, 100,
                               host.window(), nullptr, GetModuleHandleW(nullptr), nullptr);
    });
    ASSERT_TRUE(IsWindow(next));
    DestroyWindow(next);
    EXPECT_EQ(UnreturnedHandles(spy).size(), 1u) << "the strips' font";
}

}  // namespace
}  // namespace kortest

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

// ---- In the middle of its creation
// ---------------------------------------------------------------

class GridDestroyedInCreation : public GridUse {
protected:
    void SetUp() override { RegisterGridControl(GetModuleHandleW(nullptr)); }

    HWND createGridWindow() {
        return CreateWindowExW(0, KORGRID_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, 330, 168,
                               host.window(), nullptr, GetModuleHandleW(nullptr), nullptr);
    }

    // What the creation leaves behind, but for the strips' font, which is never deleted, when a
    // host acts inside the creation of the grid's first button.
    std::vector<std::string> leftBy(const std::function<void(HWND grid)>& action) {
        constexpr size_t kParent = 8;
        int children = 0;
        WatchHandles(spy);
        spy.watch("CreateWindowExW");
        spy.replace("CreateWindowExW", [&](ULONG_PTR* arguments) {
            const ULONG_PTR child = spy.callReal("CreateWindowExW", arguments);
            if (++children == 2) action(reinterpret_cast<HWND>(arguments[kParent]));
            return child;
        });
        createGridWindow();
        EXPECT_GE(children, 2);
        std::vector<std::string> left = UnreturnedHandles(spy);
        std::erase(left, "CreateFontIndirectW");
        return left;
    }
};

TEST_F(GridDestroyedInCreation, LeavesNothingBehind) {
    const auto left = leftBy([](HWND unfinished) { DestroyWindow(unfinished); });
    EXPECT_EQ(left, std::vector<std::string>{});
}

TEST_F(GridDestroyedInCreation, LeavesTheNextGridAlone) {
    HWND next = nullptr;
    leftBy([&](HWND unfinished) {
        DestroyWindow(unfinished);
        next = createGridWindow();
    });
    ASSERT_TRUE(IsWindow(next));
    DestroyWindow(next);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{"CreateFontIndirectW"});
}

}  // namespace
}  // namespace kortest

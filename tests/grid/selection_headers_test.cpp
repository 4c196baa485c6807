// Whole rows and columns by the headers, everything by the corner button.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class HeaderSelection : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }
};

TEST_F(HeaderSelection, ColumnClickSelectsTheColumnsRows) {
    EXPECT_EQ(clickHeader(columnHeader, 2, 2), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 0, 16383));
    EXPECT_EQ(clickHeader(columnHeader, 1, 4), 0);
    EXPECT_EQ(Selection(), Block(1, 4, 0, 16383));
    EXPECT_EQ(clickHeader(columnHeader, 4, 1), 0);
    EXPECT_EQ(Selection(), Block(1, 4, 0, 16383));
}

TEST_F(HeaderSelection, RowClickSelectsTheRowsColumns) {
    EXPECT_EQ(clickHeader(rowHeader, 5, 5), 0);
    EXPECT_EQ(Selection(), Block(0, 255, 5, 5));
    EXPECT_EQ(clickHeader(rowHeader, 3, 9), 0);
    EXPECT_EQ(Selection(), Block(0, 255, 3, 9));
    EXPECT_EQ(clickHeader(rowHeader, 9, 3), 0);
    EXPECT_EQ(Selection(), Block(0, 255, 3, 9));
}

TEST_F(HeaderSelection, ItemsCountFromTheFirstVisibleCell) {
    SetFirstVisibleCell(KORGRID_CELL(10, 200));
    clickHeader(columnHeader, 0, 2);
    EXPECT_EQ(Selection(), Block(10, 12, 0, 16383));
    clickHeader(rowHeader, 1, 0);
    EXPECT_EQ(Selection(), Block(0, 255, 200, 201));
}

TEST_F(HeaderSelection, HostIsNotTold) {
    clickHeader(columnHeader, 1, 2);
    clickHeader(rowHeader, 1, 2);
    host.pump();
    EXPECT_EQ(told(), Lines{});
}

TEST_F(HeaderSelection, HighlightFollows) {
    const struct {
        bool isColumn;
        int pressed;
        int current;
    } clicks[] = {{true, 1, 1}, {true, 1, 3},   {false, 2, 2}, {false, 5, 2},
                  {true, 5, 0}, {false, 0, 10}, {true, 0, 0}};
    for (const auto& click : clicks) {
        clickHeader(click.isColumn ? columnHeader : rowHeader, click.pressed, click.current);
        model.clickHeader(click.isColumn, click.pressed, click.current);
        EXPECT_EQ(highlight(), expectedHighlight()) << click.pressed << "-" << click.current;
    }
}

TEST_F(HeaderSelection, CellAreaIsInvalidatedOnce) {
    host.pump();
    spy.watch("InvalidateRect");
    std::vector<RECT> rectangles;
    spy.replace("InvalidateRect", [&](ULONG_PTR* arguments) {
        EXPECT_EQ(reinterpret_cast<HWND>(arguments[0]), grid);
        EXPECT_EQ(static_cast<DWORD>(arguments[2]), 0u);
        rectangles.push_back(*reinterpret_cast<const RECT*>(arguments[1]));
        return spy.callReal("InvalidateRect", arguments);
    });
    clickHeader(columnHeader, 1, 1);
    clickHeader(rowHeader, 1, 1);
    const RECT cells{30, cellsTop(), clientWidth(), clientHeight()};
    EXPECT_EQ(rectangles, (std::vector<RECT>{cells, cells}));
}

TEST_F(HeaderSelection, AnchorStays) {
    anchorAt(3, 3);
    clickHeader(columnHeader, 1, 2);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_LEFT);  // anchor 3 lies right of the block, which grows
    EXPECT_EQ(Selection(), Block(0, 3, 0, 16383));
}

TEST_F(HeaderSelection, MissingAnchorStaysMissing) {
    clickHeader(rowHeader, 4, 4);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(Selection(), Block(0, 0, 5, 5));
}

TEST_F(HeaderSelection, RealPressAndDragAlongTheColumns) {
    PressAt(columnHeader, 90, 8);  // B
    host.pump();
    EXPECT_EQ(Selection(), Block(1, 1, 0, 16383));
    MoveTo(columnHeader, 210, 8);  // D
    host.pump();
    EXPECT_EQ(Selection(), Block(1, 3, 0, 16383));
    MoveTo(columnHeader, 30, 8);  // A
    host.pump();
    EXPECT_EQ(Selection(), Block(0, 1, 0, 16383));
    ReleaseAt(columnHeader, 30, 8);
    host.pump();
    EXPECT_EQ(Selection(), Block(0, 1, 0, 16383));
    EXPECT_EQ(told(), Lines{});
    model.clickHeader(true, 0, 1);
    EXPECT_EQ(highlight(), expectedHighlight());
}

TEST_F(HeaderSelection, RealPressOnARow) {
    SetRowHeight(2, 40);
    SetFirstVisibleCell(0);
    PressAt(rowHeader, 10, 32 + 20);
    ReleaseAt(rowHeader, 10, 32 + 20);
    host.pump();
    EXPECT_EQ(Selection(), Block(0, 255, 2, 2));
}

TEST_F(HeaderSelection, OtherWindowsAreNoHeaders) {
    for (HWND window : {edit, grid, host.window(), HWND{nullptr}}) {
        EXPECT_EQ(clickHeader(window, 1, 2), 0);
    }
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
}

TEST_F(HeaderSelection, BlocksPastTheSheetStayAsClicked) {
    SetFirstVisibleCell(KORGRID_CELL(250, 16380));
    EXPECT_EQ(clickHeader(columnHeader, 0, 9), 0);
    EXPECT_EQ(Selection(), Block(250, 259, 0, 16383));
    EXPECT_EQ(clickHeader(rowHeader, 0, 9), 0);
    EXPECT_EQ(Selection(), Block(0, 255, 16380, 16389));
    host.pump();
}

// ---- Corner button ----------------------------------------------------------------------------

TEST_F(HeaderSelection, CornerCommandSelectsEverything) {
    Select(1, 2, 3, 4);
    EXPECT_EQ(send(WM_COMMAND, 1), 0);
    EXPECT_EQ(Selection(), Block(0, 255, 0, 16383));
    EXPECT_EQ(GetFocus(), grid);
    ASSERT_TRUE(model.setSelection(Block(0, 255, 0, 16383)));
    EXPECT_EQ(highlight(), expectedHighlight());
    EXPECT_EQ(told(), Lines{});
}

// The test for "everything" looks for one column and row more than there are.
TEST_F(HeaderSelection, SecondCornerCommandSelectsEverythingAgain) {
    send(WM_COMMAND, 1);
    EXPECT_EQ(send(WM_COMMAND, 1), 0);
    EXPECT_EQ(Selection(), Block(0, 255, 0, 16383));
    model.selectAll();
    EXPECT_EQ(highlight(), expectedHighlight());
}

TEST_F(HeaderSelection, RealClickOnTheCornerTakesTheFocusToTheGrid) {
    SetFocus(edit);
    told();
    ClickAt(CornerButtonOf(grid), 5, 5);
    host.pump();
    EXPECT_EQ(Selection(), Block(0, 255, 0, 16383));
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(GetControlWithFocus(), grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
}

TEST_F(HeaderSelection, CornerCommandLeavesTheAnchor) {
    anchorAt(3, 3);
    send(WM_COMMAND, 1);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_LEFT);  // anchor column 3 is left of 255: the block shrinks towards it
    EXPECT_EQ(Selection(), Block(3, 254, 0, 16383));
}

TEST_F(HeaderSelection, OtherCommandsAnswerOne) {
    for (const WPARAM id : {WPARAM{0}, WPARAM{2}, WPARAM{3}, WPARAM{6}, WPARAM{9}, WPARAM{77}}) {
        EXPECT_EQ(send(WM_COMMAND, id), 1) << id;
    }
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    EXPECT_EQ(told(), Lines{});
}

}  // namespace
}  // namespace kortest

// The timer of a held button scrolls the view while the pointer is near an edge.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// The view starts at K101, so that it can scroll in all four directions.
class AutoScroll : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        start();
    }

    void start() {
        SetFirstVisibleCell(KORGRID_CELL(10, 100));
        told();
    }

    // Where the timer takes the view when the pointer is at a point; the view goes back then.
    std::string step(int x, int y) {
        move(x, y);
        timer();
        const GridVisibleRange range = VisibleRange();
        start();
        return CellName(range.firstColumn, range.firstRow);
    }
};

TEST_F(AutoScroll, LeftEdgeIsWhereTheCellsBegin) {
    const int y = middleY(4);
    EXPECT_EQ(step(0, y), "J101");
    EXPECT_EQ(step(29, y), "J101");
    EXPECT_EQ(step(30, y), "K101");
    EXPECT_EQ(step(31, y), "K101");
}

TEST_F(AutoScroll, RightEdgeIsTenPixelsWide) {
    const int y = middleY(4);
    const int right = clientWidth();
    EXPECT_EQ(step(right - 11, y), "K101");
    EXPECT_EQ(step(right - 10, y), "K101");
    EXPECT_EQ(step(right - 9, y), "L101");
    EXPECT_EQ(step(right, y), "L101");
    EXPECT_EQ(step(5000, y), "L101");
}

// The upper edge is the equation bar's: over the column header nothing scrolls.
TEST_F(AutoScroll, UpperEdgeIsTheEquationBar) {
    const int x = middleX(2);
    EXPECT_EQ(step(x, 0), "K100");
    EXPECT_EQ(step(x, barHeight() - 1), "K100");
    EXPECT_EQ(step(x, barHeight()), "K101");
    EXPECT_EQ(step(x, cellsTop() - 1), "K101");
    EXPECT_EQ(step(x, cellsTop()), "K101");
}

TEST_F(AutoScroll, LowerEdgeIsTenPixelsHigh) {
    const int x = middleX(2);
    const int bottom = clientHeight();
    EXPECT_EQ(step(x, bottom - 11), "K101");
    EXPECT_EQ(step(x, bottom - 10), "K101");
    EXPECT_EQ(step(x, bottom - 9), "K102");
    EXPECT_EQ(step(x, 5000), "K102");
}

TEST_F(AutoScroll, EdgesFollowTheHeaders) {
    ToggleViewStateOfHeaders();
    start();
    EXPECT_EQ(step(0, middleY(4)), "K101");  // nothing is left of the cells
    ToggleViewStateOfHeaders();
    SetFirstVisibleCell(KORGRID_CELL(10, 2000));  // a header of 35 pixels
    told();
    move(34, middleY(4));
    timer();
    EXPECT_EQ(VisibleRange().firstColumn, 9);
    move(35, middleY(4));
    timer();
    EXPECT_EQ(VisibleRange().firstColumn, 9);
}

TEST_F(AutoScroll, CornersScrollBothWaysColumnsFirst) {
    move(0, 0);
    told();
    timer();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 9-15 rows 100-111",
                             "sent GRIDN_PAINTCELLS columns 9-15 rows 99-110"}));
    start();
    move(5000, 5000);
    timer();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 11-17 rows 100-111",
                             "sent GRIDN_PAINTCELLS columns 11-17 rows 101-112"}));
}

TEST_F(AutoScroll, NegativePositions) {
    EXPECT_EQ(step(-1, middleY(4)), "L101");  // unsigned: far right
    EXPECT_EQ(step(middleX(2), -1), "K100");
    EXPECT_EQ(step(middleX(2), -32768), "K100");
}

TEST_F(AutoScroll, StopsAtTheFirstColumn) {
    SetFirstVisibleCell(KORGRID_CELL(2, 100));
    move(10, middleY(4));
    told();
    for (int i = 0; i < 4; ++i) timer();
    EXPECT_EQ(VisibleRange().firstColumn, 0);
    EXPECT_EQ(told().size(), 2u);
}

TEST_F(AutoScroll, RedrawsAtTheFirstRow) {
    SetFirstVisibleCell(KORGRID_CELL(10, 0));
    move(middleX(2), 3);
    told();
    timer();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 10-16 rows 0-11"}));
}

TEST_F(AutoScroll, OtherTimersAreIgnored) {
    move(0, 0);
    told();
    for (const WPARAM id : {WPARAM{0}, WPARAM{1}, WPARAM{10100}, WPARAM{10102}}) timer(id);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(AutoScroll, TimersGoOnToTheSystem) {
    spy.watch("DefWindowProcW");
    const auto passedOn = [&] {
        int found = 0;
        for (const ImportCall& call : spy.callsOf("DefWindowProcW")) {
            found += ArgumentsOf(call)[1] == static_cast<DWORD>(WM_TIMER);
        }
        return found;
    };
    timer();
    timer(5);
    EXPECT_EQ(passedOn(), 2);
}

TEST_F(AutoScroll, PressSetsThePointer) {
    press(5, middleY(4));
    timer();
    EXPECT_EQ(VisibleRange().firstColumn, 9);
    release();
}

// A release puts the remembered pointer to 0, 0: a timer message that comes late scrolls there.
TEST_F(AutoScroll, ReleaseForgetsThePointer) {
    press(middleX(2), middleY(4));
    release();
    told();
    timer();
    EXPECT_EQ(VisibleRange(), Range(9, 15, 99, 110));
}

TEST_F(AutoScroll, ScrollMessagesAreSentToTheGrid) {
    move(5000, 5000);
    host.alsoRecord(grid, "grid");
    host.leaveOut(GRIDN_PAINTCELLS);
    told();
    timer();
    EXPECT_EQ(told(), (Lines{"grid sent WM_TIMER 10101 0", "grid sent WM_HSCROLL 1 0",
                             "grid sent WM_VSCROLL 1 0"}));
    move(0, 0);
    timer();
    EXPECT_EQ(told(), (Lines{"grid sent WM_TIMER 10101 0", "grid sent WM_HSCROLL 0 0",
                             "grid sent WM_VSCROLL 0 0"}));
}

TEST_F(AutoScroll, SelectionWaitsForTheNextMove) {
    press(middleX(2), middleY(4));
    move(middleX(2), 5000);
    const GridSelection before = Selection();
    told();
    timer();
    EXPECT_EQ(Selection(), before);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 10-16 rows 101-112"}));
    move(middleX(2), 5000);
    EXPECT_EQ(Selection(), Block(12, 12, 104, 111));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTING M105:M112"}));
}

TEST_F(AutoScroll, HighlightScrollsAlong) {
    model.setFirstVisibleCell(10, 100);
    press(middleX(2), middleY(4));
    model.press(middleX(2), middleY(4), false);
    for (int i = 0; i < 4; ++i) {
        move(middleX(4), 5000);
        model.move(middleX(4), 5000);
        timer();
        model.timer();
        EXPECT_EQ(highlight(), expectedHighlight());
    }
    EXPECT_TRUE(isAsModel());
}

// In real time: half a second a step, from the press to the release. A busy machine may take
// longer, never shorter.
// The system's timer: that it fires is seen, how fast is what it was told.
TEST_F(AutoScroll, RunsEveryHalfSecondWhileTheButtonIsHeld) {
    spy.watch("SetTimer");
    host.pump();
    press(5, middleY(4));
    ASSERT_EQ(spy.count("SetTimer"), 1);
    EXPECT_EQ(NumberAt(spy.callsOf("SetTimer")[0], 2), 500u);
    const int column = VisibleRange().firstColumn;
    for (int i = 0; i < 2000 && VisibleRange().firstColumn == column; ++i) host.pumpFor(10);
    EXPECT_LT(VisibleRange().firstColumn, column);
    release();
    EXPECT_FALSE(KillTimer(grid, kAutoScrollTimer)) << "there is none any more";
}

}  // namespace
}  // namespace kortest

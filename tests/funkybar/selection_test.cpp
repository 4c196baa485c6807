// Choosing the current item, and what the parent is told.
#include "funkybar/bar_fixture.h"

#include <climits>

namespace kortest {
namespace {

constexpr char kRepaint[] = "invalidate+erase update";

class BarSelection : public GuardedBarTest {
protected:
    BarSelection() {
        create();
        insertAll({L"a", L"b", L"c"});
        settle();
    }
};

TEST_F(BarSelection, TellsTheParentAndRepaints) {
    EXPECT_EQ(select(1), 1);
    EXPECT_EQ(state(), "a [b] c");
    EXPECT_EQ(told(), (Lines{"id 5/5 from bar code 256 index 1"}));
    EXPECT_EQ(repaints(), kRepaint);
    EXPECT_EQ(host.transcript().size(), 1u);
}

TEST_F(BarSelection, IsThereWhenTheParentIsTold) {
    LONG seen = -1;
    std::string painted = "not told";
    whenTold = [&] {
        seen = current();
        painted = repaints();
    };
    select(2);
    EXPECT_EQ(seen, 2);
    EXPECT_EQ(painted, "") << "painting comes last";
}

TEST_F(BarSelection, OfTheCurrentItemTellsAgain) {
    EXPECT_EQ(select(0), 1);
    EXPECT_EQ(told(), (Lines{"id 5/5 from bar code 256 index 0"}));
}

TEST_F(BarSelection, AboveTheCountChangesNothing) {
    select(1);
    settle();
    for (const LONG index : {3L, 5L, static_cast<LONG>(INT_MAX)}) EXPECT_EQ(select(index), 0);
    EXPECT_EQ(state(), "a [b] c");
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(repaints(), "");
}

TEST_F(BarSelection, OfMinusOneChangesNothing) {
    select(1);
    settle();
    EXPECT_EQ(select(-1), 0);
    EXPECT_EQ(state(), "a [b] c");
    EXPECT_EQ(told(), Lines{});
}

TEST_F(BarSelection, BelowMinusOneLeavesNoCurrentItem) {
    for (const LONG index : {-2L, -3L, static_cast<LONG>(INT_MIN)}) {
        select(1);
        settle();
        EXPECT_EQ(select(index), 0);
        EXPECT_EQ(current(), -1);
        EXPECT_EQ(told(), Lines{});
        EXPECT_EQ(repaints(), "");
    }
}

TEST_F(BarSelection, InAnEmptyBarDoesNothing) {
    send(FBM_DELETEALL);
    settle();
    for (const LONG index : {0L, 1L, -1L, -2L}) EXPECT_EQ(select(index), 0);
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(repaints(), "");
}

TEST_F(BarSelection, CarriesTheControlId) {
    SetWindowLongPtrW(bar, GWLP_ID, 70000);
    select(0);
    SetWindowLongPtrW(bar, GWLP_ID, -3);
    select(0);
    EXPECT_EQ(told(), (Lines{"id 70000/70000 from bar code 256 index 0",
                             "id -3/-3 from bar code 256 index 0"}));
}

TEST_F(BarSelection, OfABarWithoutAParentTellsNobody) {
    const HWND child = bar;
    bar = createBar(nullptr, WS_POPUP, {0, 0, 100, 20}, 0);
    ASSERT_NE(bar, nullptr);
    spy.watch("SendMessageW");
    spy.clearCalls();
    EXPECT_EQ(select(1), 1);
    EXPECT_EQ(spy.count("SendMessageW"), 0);
    EXPECT_EQ(told(), Lines{});
    DestroyWindow(child);
}

TEST_F(BarSelection, SurvivesAParentThatDeletesAllItems) {
    whenTold = [this] { send(FBM_DELETEALL); };
    EXPECT_EQ(select(1), 1);
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(current(), -1);
}

TEST_F(BarSelection, SurvivesAParentThatDeletesTheItem) {
    whenTold = [this] { remove(1); };
    EXPECT_EQ(select(1), 1);
    EXPECT_EQ(state(), "[a] c");
}

TEST_F(BarSelection, SurvivesAParentThatDestroysTheBar) {
    whenTold = [this] { DestroyWindow(bar); };
    EXPECT_EQ(select(1), 1);
    EXPECT_FALSE(IsWindow(bar));
    EXPECT_EQ(repaints(), "") << "there is nothing to paint";
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

TEST_F(BarSelection, MayBeChangedByTheParent) {
    bool again = false;
    whenTold = [&] {
        if (again) return;
        again = true;
        select(2);
    };
    EXPECT_EQ(select(1), 1);
    EXPECT_EQ(state(), "a b [c]");
    EXPECT_EQ(told(),
              (Lines{"id 5/5 from bar code 256 index 1", "id 5/5 from bar code 256 index 2"}));
}

}  // namespace
}  // namespace kortest

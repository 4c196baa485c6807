// Removing items: what is the current one afterwards, what is painted, what is freed.
#include "funkybar/bar_fixture.h"

#include <climits>

namespace kortest {
namespace {

constexpr char kRepaint[] = "invalidate+erase update";

class BarDeletion : public GuardedBarTest {
protected:
    BarDeletion() {
        create();
        insertAll({L"a", L"b", L"c"});
        settle();
    }
};

TEST_F(BarDeletion, OfAnotherItemChangesNothingElse) {
    EXPECT_EQ(send(FBM_DELETEITEM, 1), 0);
    EXPECT_EQ(state(), "[a] c");
    EXPECT_EQ(count(), 2);
    EXPECT_EQ(repaints(), "");
}

TEST_F(BarDeletion, OfTheLastItemMovesTheEnd) {
    remove(2);
    EXPECT_EQ(state(), "[a] b");
    insert(L"d");
    EXPECT_EQ(state(), "[a] b d");
}

TEST_F(BarDeletion, OfTheCurrentItemShowsTheFirst) {
    select(2);
    settle();
    remove(2);
    EXPECT_EQ(state(), "[a] b");
    EXPECT_EQ(repaints(), kRepaint);
    EXPECT_EQ(told(), Lines{}) << "the host did it itself";
}

TEST_F(BarDeletion, OfTheFirstItemThatIsCurrentShowsTheNext) {
    remove(0);
    EXPECT_EQ(state(), "[b] c");
    EXPECT_EQ(repaints(), kRepaint);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(BarDeletion, OfTheFirstItemBeforeTheCurrentOneRepaints) {
    select(1);
    settle();
    remove(0);
    EXPECT_EQ(state(), "[b] c");
    EXPECT_EQ(repaints(), kRepaint);
}

TEST_F(BarDeletion, OfTheFirstItemFarFromTheCurrentOneDoesNot) {
    select(2);
    settle();
    remove(0);
    EXPECT_EQ(state(), "b [c]");
    EXPECT_EQ(repaints(), "");
}

TEST_F(BarDeletion, OfTheOnlyItemLeavesAnEmptyBar) {
    remove(2);
    remove(1);
    settle();
    remove(0);
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(current(), -1);
    EXPECT_EQ(repaints(), kRepaint);
    EXPECT_EQ(insert(L"new"), 0);
    EXPECT_EQ(insert(L"newer"), 1);
    EXPECT_EQ(state(), "[new] newer");
}

TEST_F(BarDeletion, WithoutACurrentItemLeavesNone) {
    select(-2);
    settle();
    remove(1);
    remove(0);
    EXPECT_EQ(state(), "c");
    EXPECT_EQ(current(), -1);
    remove(0);
    EXPECT_EQ(count(), 0);
}

TEST_F(BarDeletion, OfBadIndexesIsIgnored) {
    for (const LONG index :
         {3L, 4L, -1L, -2L, static_cast<LONG>(INT_MIN), static_cast<LONG>(INT_MAX)})
        EXPECT_EQ(send(FBM_DELETEITEM, static_cast<WPARAM>(index)), 0) << index;
    EXPECT_EQ(state(), "[a] b c");
    EXPECT_EQ(repaints(), "");
}

// The text's block stays; a host is told so.
TEST_F(BarDeletion, FreesTheRecordAlone) {
    const int live = heap->live();
    remove(1);
    EXPECT_EQ(heap->live(), live - 1) << heap->liveReport();
    remove(0);
    EXPECT_EQ(heap->live(), live - 2);
}

TEST_F(BarDeletion, OfAllItemsFreesEverything) {
    EXPECT_EQ(heap->live(), 6) << heap->liveReport();
    EXPECT_EQ(send(FBM_DELETEALL), 1);
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(current(), -1);
    EXPECT_EQ(repaints(), kRepaint);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(BarDeletion, OfAllItemsOfAnEmptyBarIsRefused) {
    send(FBM_DELETEALL);
    settle();
    EXPECT_EQ(send(FBM_DELETEALL), 0);
    EXPECT_EQ(repaints(), "");
}

TEST_F(BarDeletion, OfTheWindowFreesTheItems) {
    DestroyWindow(bar);
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
    EXPECT_EQ(repaints(), "");
}

}  // namespace
}  // namespace kortest

// Where items can be inserted, and what is copied of them.
#include "funkybar/bar_fixture.h"

#include <climits>

namespace kortest {
namespace {

class BarInsertion : public GuardedBarTest {
protected:
    BarInsertion() { create(); }
};

TEST_F(BarInsertion, AtTheEndAnswersTheCountBefore) {
    EXPECT_EQ(insert(L"one", kAppend), 0);
    EXPECT_EQ(insert(L"two", kAppend), 1);
    EXPECT_EQ(insert(L"three", kAppend), 2);
    EXPECT_EQ(state(), "[one] two three");
}

TEST_F(BarInsertion, AtTheFrontKeepsTheCurrentItem) {
    insertAll({L"a", L"b"});
    EXPECT_EQ(insert(L"first", 0), 2);
    EXPECT_EQ(state(), "first [a] b");
}

TEST_F(BarInsertion, BehindTheFirstItem) {
    insertAll({L"a", L"b", L"c"});
    EXPECT_EQ(insert(L"new", 1), 3) << "the count before, not the position";
    EXPECT_EQ(texts(), "a new b c");
}

TEST_F(BarInsertion, AtIndexOneBehindASingleItemAppends) {
    insert(L"a");
    EXPECT_EQ(insert(L"b", 1), 1);
    EXPECT_EQ(insert(L"c"), 2);
    EXPECT_EQ(texts(), "a b c");
}

TEST_F(BarInsertion, AtTheCountAppends) {
    insertAll({L"a", L"b", L"c"});
    EXPECT_EQ(insert(L"d", 3), 3);
    EXPECT_EQ(texts(), "a b c d");
}

// Only the ends and the place behind the first item can be reached, and that is wanted.
TEST_F(BarInsertion, FartherInsideIsRefused) {
    insertAll({L"a", L"b", L"c", L"d"});
    const int live = heap->live();
    EXPECT_EQ(insert(L"new", 2), -1);
    EXPECT_EQ(insert(L"new", 3), -1);
    EXPECT_EQ(state(), "[a] b c d");
    EXPECT_EQ(count(), 4);
    EXPECT_EQ(heap->live(), live) << heap->liveReport();
    EXPECT_EQ(insert(L"e"), 4);
    EXPECT_EQ(texts(), "a b c d e");
}

TEST_F(BarInsertion, BelowZeroIsRefused) {
    insertAll({L"a", L"b"});
    EXPECT_EQ(insert(L"new", -1), -1);
    EXPECT_EQ(insert(L"new", INT_MIN), -1);
    EXPECT_EQ(texts(), "a b");
}

TEST_F(BarInsertion, IntoAnEmptyBarTakesAnyIndex) {
    for (const LONG index : {0L, 1L, 2L, 7L, -1L, static_cast<LONG>(INT_MIN)}) {
        EXPECT_EQ(insert(L"only", index), 0) << index;
        EXPECT_EQ(state(), "[only]");
        KorFunkyBar_DeleteAll(bar);
    }
}

TEST_F(BarInsertion, NeedsATextAndADescription) {
    FunkyBarItemDesc item = described(L"text");
    item.mask = FBIF_IMAGE | FBIF_COLOURS | FBIF_USERDATA;
    EXPECT_EQ(insert(item), -1);
    item.mask = FBIF_TEXT;
    item.text = nullptr;
    EXPECT_EQ(insert(item), -1);
    EXPECT_EQ(send(FBM_INSERTITEM), -1);
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(current(), -1);
}

TEST_F(BarInsertion, CopiesTheText) {
    wchar_t text[] = L"mine";
    insert(text);
    text[0] = L'l';
    EXPECT_EQ(textOf(0), L"mine");
    EXPECT_EQ(insert(L""), 1);
    EXPECT_EQ(textOf(1), L"");
    const std::wstring longText(200, L'm');
    insert(longText.c_str());
    EXPECT_EQ(textOf(2), longText);
}

TEST_F(BarInsertion, KeepsTheTextInABlockOfItsOwnSize) {
    spy.watch("LocalAlloc");
    spy.clearCalls();
    insert(L"four");
    const auto blocks = spy.callsOf("LocalAlloc");
    ASSERT_EQ(blocks.size(), 2u);
    EXPECT_EQ(blocks[1].arguments[1], 5 * sizeof(wchar_t));
    for (const auto& block : blocks)
        EXPECT_EQ(static_cast<UINT>(block.arguments[0]), UINT{LMEM_ZEROINIT});
}

TEST_F(BarInsertion, TakesWhatTheMaskNames) {
    FunkyBarItemDesc item = {FBIF_TEXT,    0, const_cast<wchar_t*>(L"a"), 0, 7, RGB(1, 2, 3),
                             RGB(4, 5, 6), 99};
    const DWORD parts[] = {FBIF_IMAGE, FBIF_COLOURS, FBIF_USERDATA};
    for (const DWORD part : parts) {
        item.mask = FBIF_TEXT | part;
        insert(item);
        FunkyBarItemDesc got = {
            FBIF_IMAGE | FBIF_COLOURS | FBIF_USERDATA, 0, nullptr, 0, -1, 1, 1, 1};
        ASSERT_TRUE(KorFunkyBar_GetItem(bar, &got));
        EXPECT_EQ(got.image, part == FBIF_IMAGE ? 7 : 0);
        EXPECT_EQ(got.textColour, part == FBIF_COLOURS ? RGB(1, 2, 3) : 0);
        EXPECT_EQ(got.backgroundColour, part == FBIF_COLOURS ? RGB(4, 5, 6) : 0);
        EXPECT_EQ(got.userData, part == FBIF_USERDATA ? 99u : 0u);
    }
}

TEST_F(BarInsertion, OfTheFirstItemShowsIt) {
    insert(L"a");
    EXPECT_EQ(repaints(), "invalidate+erase");
    spy.clearCalls();
    insert(L"b");
    insert(L"c", 0);
    EXPECT_EQ(repaints(), "") << "the same item is shown";
    EXPECT_EQ(told(), Lines{});
}

TEST_F(BarInsertion, WithoutACurrentItemMakesTheFirstOneCurrent) {
    insertAll({L"a", L"b"});
    select(-2);
    ASSERT_EQ(current(), -1);
    insert(L"c");
    EXPECT_EQ(state(), "[a] b c");
}

TEST_F(BarInsertion, WithoutMemoryChangesNothing) {
    insert(L"a");
    spy.watch("LocalAlloc");
    const int live = heap->live();
    for (int nth = 1; nth <= 2; ++nth) {
        spy.failNth("LocalAlloc", nth);
        EXPECT_EQ(insert(L"b", 0), -1) << nth;
        EXPECT_EQ(heap->live(), live) << heap->liveReport();
        EXPECT_EQ(state(), "[a]");
        EXPECT_EQ(count(), 1);
    }
    EXPECT_EQ(insert(L"b"), 1);
}

}  // namespace
}  // namespace kortest

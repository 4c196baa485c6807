// The item messages and their results.
#include "header_fixture.h"

namespace kortest {
namespace {

using Labels = std::vector<std::wstring>;
using Sizes = std::vector<int>;

class HeaderItems : public HeaderTest {
protected:
    void appendLabels(const Labels& labels) {
        for (const std::wstring& label : labels) AppendItem(header, label.c_str(), 20);
    }

    HWND header = createHorizontal();
};

TEST_F(HeaderItems, AreNoneAtFirst) {
    EXPECT_EQ(SendMessageW(header, HCM_GETITEMCOUNT, 0, 0), 0);
    EXPECT_EQ(KorHeader_DeleteItem(header, 0), 0);
    EXPECT_EQ(KorHeader_GetItemCount(header), 0);
}

TEST_F(HeaderItems, AppendAtMinusOne) {
    EXPECT_EQ(InsertItem(header, -1, L"A", 60), 0);
    EXPECT_EQ(KorHeader_GetItemCount(header), 1);
    EXPECT_EQ(InsertItem(header, -1, L"B", 61), 1);
    EXPECT_EQ(InsertItem(header, -1000, L"C", 62), 2);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"B", L"C"}));
    EXPECT_EQ(SizesOf(header), (Sizes{60, 61, 62}));
}

TEST_F(HeaderItems, MoveUpToMakeRoom) {
    AppendItem(header, L"A", 1);
    AppendItem(header, L"B", 2);
    EXPECT_EQ(InsertItem(header, 1, L"C", 3), 1);
    EXPECT_EQ(InsertItem(header, 0, L"D", 4), 0);
    EXPECT_EQ(LabelsOf(header), (Labels{L"D", L"A", L"C", L"B"}));
    EXPECT_EQ(SizesOf(header), (Sizes{4, 1, 3, 2}));
}

TEST_F(HeaderItems, MoveDownWhenOneGoes) {
    AppendItem(header, L"A", 1);
    AppendItem(header, L"B", 2);
    AppendItem(header, L"C", 3);
    AppendItem(header, L"D", 4);
    EXPECT_EQ(KorHeader_DeleteItem(header, 1), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"C", L"D"}));
    EXPECT_EQ(SizesOf(header), (Sizes{1, 3, 4}));
    EXPECT_EQ(KorHeader_DeleteItem(header, 0), 1);
    EXPECT_EQ(KorHeader_DeleteItem(header, 1), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"C"}));
    EXPECT_EQ(KorHeader_DeleteItem(header, 0), 1);
    EXPECT_EQ(KorHeader_GetItemCount(header), 0);
}

TEST_F(HeaderItems, AreKeptWhenTheElventhGrowsTheArrays) {
    Labels labels;
    Sizes sizes;
    for (int i = 0; i < 90; ++i) {
        labels.push_back(L"item " + std::to_wstring(i));
        sizes.push_back(100 + i);
        ASSERT_EQ(AppendItem(header, labels.back().c_str(), sizes.back()), i);
    }
    EXPECT_EQ(KorHeader_GetItemCount(header), 90);
    EXPECT_EQ(LabelsOf(header), labels);
    EXPECT_EQ(SizesOf(header), sizes);
}

TEST_F(HeaderItems, GrowFromTenPlacesBy25) {
    spy.watch("LocalReAlloc");
    spy.clearCalls();
    AppendSizes(header, Sizes(10, 20));
    EXPECT_EQ(spy.count("LocalReAlloc"), 0);
    AppendItem(header, L"", 20);
    EXPECT_EQ(spy.count("LocalReAlloc"), 3);
    for (const ImportCall& call : spy.callsOf("LocalReAlloc")) {
        EXPECT_TRUE(call.arguments[2] & LMEM_MOVEABLE);
    }
    AppendSizes(header, Sizes(24, 20));
    EXPECT_EQ(KorHeader_GetItemCount(header), 35);
    EXPECT_EQ(spy.count("LocalReAlloc"), 3);
    AppendItem(header, L"", 20);
    EXPECT_EQ(spy.count("LocalReAlloc"), 6);
}

TEST_F(HeaderItems, AppendWhenTheIndexIsAboveTheCapacity) {
    AppendItem(header, L"A", 20);
    EXPECT_EQ(InsertItem(header, 11, L"B", 20), 1);
    EXPECT_EQ(InsertItem(header, 0x7FFFFFFF, L"C", 20), 2);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"B", L"C"}));
}

TEST_F(HeaderItems, AppendAboveTheGrownCapacity) {
    AppendSizes(header, Sizes(11, 20));
    EXPECT_EQ(InsertItem(header, 36, L"appended", 20), 11);
    EXPECT_EQ(InsertItem(header, 35, L"far", 20), 35);
    EXPECT_EQ(KorHeader_GetItemCount(header), 13);
}

TEST_F(HeaderItems, StandWhereTheyArePutUpToTheCapacity) {
    AppendItem(header, L"A", 20);
    EXPECT_EQ(InsertItem(header, 2, L"B", 21), 2);  // leaves a gap at 1
    EXPECT_EQ(KorHeader_GetItemCount(header), 2);
    EXPECT_EQ(GetItem(header, 1).text, L"");
    EXPECT_EQ(KorHeader_GetItemSize(header, 1), 0);
    EXPECT_EQ(GetItem(header, 2).text, L"B");
    EXPECT_EQ(KorHeader_GetItemSize(header, 2), 21);
    EXPECT_EQ(InsertItem(header, 10, L"C", 22), 10);
    EXPECT_EQ(KorHeader_GetItemCount(header), 3);
}

TEST_F(HeaderItems, HaveASparePlaceAtTheCount) {
    appendLabels({L"A", L"B"});
    EXPECT_EQ(GetItem(header, 2).result, 1);
    EXPECT_EQ(GetItem(header, 2).text, L"");
    EXPECT_EQ(KorHeader_GetItemSize(header, 2), 0);
    EXPECT_EQ(SetItem(header, 2, L"spare", 33), 1);
    EXPECT_EQ(GetItem(header, 2).text, L"spare");
    EXPECT_EQ(KorHeader_GetItemSize(header, 2), 33);
    EXPECT_EQ(KorHeader_SetItemState(header, 2, HIS_SELECTED), 1);
    EXPECT_EQ(KorHeader_GetItemCount(header), 2);
}

TEST_F(HeaderItems, MoveTheSparePlaceUpAsWell) {
    appendLabels({L"A"});
    SetItem(header, 1, L"spare", 33);
    AppendItem(header, L"B", 20);
    EXPECT_EQ(GetItem(header, 1).text, L"B");
    EXPECT_EQ(GetItem(header, 2).text, L"spare");
    EXPECT_EQ(KorHeader_GetItemSize(header, 2), 33);
}

TEST_F(HeaderItems, HaveASparePlaceBehindFullArrays) {
    AppendSizes(header, Sizes(10, 20));
    EXPECT_EQ(SetItem(header, 10, L"spare", 33), 1);
    EXPECT_EQ(KorHeader_SetItemState(header, 10, HIS_FRAMED), 1);
    EXPECT_EQ(GetItem(header, 10).text, L"spare");
    EXPECT_EQ(KorHeader_GetItemSize(header, 10), 33);
    EXPECT_EQ(AppendItem(header, L"ten", 20), 10);
    EXPECT_EQ(GetItem(header, 10).text, L"ten");
}

TEST_F(HeaderItems, DoNotLoseTheSpareLabelWhenItIsPushedOut) {
    AppendSizes(header, Sizes(9, 20));
    SetItem(header, 9, L"spare", 33);
    EXPECT_EQ(AppendItem(header, L"nine", 20), 9);
    EXPECT_EQ(GetItem(header, 9).text, L"nine");
}

TEST_F(HeaderItems, LoseTheLastOneToADeleteAtTheCount) {
    appendLabels({L"A", L"B", L"C"});
    SetItem(header, 3, L"spare", 33);
    EXPECT_EQ(KorHeader_DeleteItem(header, 3), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"B"}));
    EXPECT_EQ(AppendItem(header, L"D", 20), 2);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"B", L"D"}));
}

TEST_F(HeaderItems, ShareNoLabelWithTheSparePlaceAfterADelete) {
    appendLabels({L"A", L"B", L"C"});
    EXPECT_EQ(KorHeader_DeleteItem(header, 0), 1);
    EXPECT_EQ(SetItem(header, 2, L"other", 20), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"B", L"C"}));
    EXPECT_EQ(GetItem(header, 2).text, L"other");
}

TEST_F(HeaderItems, AreReplacedBySet) {
    appendLabels({L"A", L"B"});
    EXPECT_EQ(SetItem(header, 1, L"a much longer label than before", 65535), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"a much longer label than before"}));
    EXPECT_EQ(SizesOf(header), (Sizes{20, 65535}));
    EXPECT_EQ(SetItem(header, 0, L"", 0), 1);
    EXPECT_EQ(LabelsOf(header)[0], L"");
    EXPECT_EQ(SizesOf(header)[0], 0);
}

TEST_F(HeaderItems, RejectBadIndexes) {
    appendLabels({L"A", L"B"});
    for (int index : {-1, -2, -0x7FFFFFFF - 1, 3, 10, 11, 0x7FFFFFFF}) {
        EXPECT_EQ(KorHeader_DeleteItem(header, index), 0) << index;
        EXPECT_EQ(SetItem(header, index, L"X", 1), 0) << index;
        EXPECT_EQ(KorHeader_SetItemState(header, index, HIS_SELECTED), 0) << index;
        EXPECT_EQ(KorHeader_SetItemState(header, index, 0), 0) << index;
        EXPECT_EQ(SendMessageW(header, HCM_GETITEMSIZE, static_cast<WPARAM>(index), 0), -1)
            << index;
        HeaderItemDesc item{const_cast<LPWSTR>(L"untouched"), 7};
        EXPECT_EQ(KorHeader_GetItem(header, index, &item), 0) << index;
        EXPECT_STREQ(item.text, L"untouched");
        EXPECT_EQ(item.size, 7);
    }
    EXPECT_EQ(LabelsOf(header), (Labels{L"A", L"B"}));
    EXPECT_EQ(SizesOf(header), (Sizes{20, 20}));
}

TEST_F(HeaderItems, RejectNullPointers) {
    appendLabels({L"A"});
    EXPECT_EQ(SendMessageW(header, HCM_INSERTITEM, 0, 0), -1);
    EXPECT_EQ(SendMessageW(header, HCM_SETITEM, 0, 0), 0);
    EXPECT_EQ(SendMessageW(header, HCM_GETITEM, 0, 0), 0);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A"}));
}

TEST_F(HeaderItems, TakeANullTextForAnEmptyLabel) {
    EXPECT_EQ(AppendItem(header, nullptr, 20), 0);
    EXPECT_EQ(AppendItem(header, L"B", 21), 1);
    EXPECT_EQ(SetItem(header, 1, nullptr, 22), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"", L""}));
    EXPECT_EQ(SizesOf(header), (Sizes{20, 22}));
}

TEST_F(HeaderItems, CopyTheTextTheyAreGiven) {
    wchar_t text[] = L"before";
    AppendItem(header, text, 20);
    text[0] = L'X';
    EXPECT_EQ(LabelsOf(header), (Labels{L"before"}));
}

TEST_F(HeaderItems, GiveAwayACopyThatLocalFreeFrees) {
    AppendItem(header, L"label", 44);
    const int before = heap.live();
    HeaderItemDesc first{};
    HeaderItemDesc second{};
    ASSERT_EQ(KorHeader_GetItem(header, 0, &first), 1);
    ASSERT_EQ(KorHeader_GetItem(header, 0, &second), 1);
    EXPECT_STREQ(first.text, L"label");
    EXPECT_EQ(first.size, 44);
    EXPECT_NE(first.text, second.text);
    EXPECT_EQ(heap.live(), before + 2);
    EXPECT_GE(heap.localSize(first.text), 12);
    first.text[0] = L'X';
    EXPECT_EQ(LabelsOf(header), (Labels{L"label"}));
    ReleaseLocal(first.text);
    ReleaseLocal(second.text);
    EXPECT_EQ(heap.live(), before);
}

TEST_F(HeaderItems, GiveAwayAnEmptyCopyOfAnEmptyLabel) {
    AppendItem(header, L"", 44);
    HeaderItemDesc item{};
    ASSERT_EQ(KorHeader_GetItem(header, 0, &item), 1);
    ASSERT_NE(item.text, nullptr);
    EXPECT_STREQ(item.text, L"");
    EXPECT_GE(heap.localSize(item.text), 2);
    ReleaseLocal(item.text);
}

// Twice what the text needs, and wanted so.
TEST_F(HeaderItems, ReserveFourBytesForACharacter) {
    spy.clearCalls();
    AppendItem(header, L"label", 20);
    const auto calls = spy.callsOf("LocalAlloc");
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(calls[0].arguments[1], 24u);
}

TEST_F(HeaderItems, DoNotRepaintByThemselves) {
    AppendItem(header, L"A", 20);
    Repaint(header);
    AppendItem(header, L"B", 20);
    SetItem(header, 0, L"C", 30);
    KorHeader_SetItemState(header, 0, HIS_SELECTED);
    KorHeader_DeleteItem(header, 1);
    GetItem(header, 0);
    EXPECT_FALSE(GetUpdateRect(header, nullptr, FALSE));
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderItems, BelongToTheirStripAlone) {
    HWND other = createVertical();
    AppendItem(header, L"A", 20);
    AppendItem(other, L"1", 16);
    AppendItem(other, L"2", 17);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A"}));
    EXPECT_EQ(LabelsOf(other), (Labels{L"1", L"2"}));
    KorHeader_DeleteItem(other, 0);
    EXPECT_EQ(LabelsOf(header), (Labels{L"A"}));
    EXPECT_EQ(LabelsOf(other), (Labels{L"2"}));
}

}  // namespace
}  // namespace kortest

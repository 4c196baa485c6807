// Item messages when memory runs out, and messages at random.
#include "header_fixture.h"

#include <random>

namespace kortest {
namespace {

using Labels = std::vector<std::wstring>;
using Sizes = std::vector<int>;

class HeaderItemFaults : public HeaderTest {
protected:
    HWND header = createHorizontal();
};

TEST_F(HeaderItemFaults, KeepAnInsertedItemWithoutItsLabel) {
    AppendItem(header, L"A", 20);
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(InsertItem(header, 0, L"B", 30), -1);
    EXPECT_EQ(KorHeader_GetItemCount(header), 2);
    EXPECT_EQ(LabelsOf(header), (Labels{L"", L"A"}));
    EXPECT_EQ(SetItem(header, 0, L"C", 30), 1);
    EXPECT_EQ(LabelsOf(header), (Labels{L"C", L"A"}));
    Repaint(header);
}

TEST_F(HeaderItemFaults, KeepEverythingWhenAnArrayCannotGrow) {
    AppendSizes(header, Sizes(10, 20));
    const Labels labels = LabelsOf(header);
    for (int failing = 1; failing <= 3; ++failing) {
        spy.failNth("LocalReAlloc", failing);
        EXPECT_EQ(AppendItem(header, L"X", 20), -1) << failing;
        EXPECT_EQ(KorHeader_GetItemCount(header), 10) << failing;
        EXPECT_EQ(LabelsOf(header), labels) << failing;
        EXPECT_EQ(SizesOf(header), Sizes(10, 20)) << failing;
        Repaint(header);
    }
    EXPECT_EQ(AppendItem(header, L"X", 21), 10);
    EXPECT_EQ(LabelsOf(header).back(), L"X");
    AppendSizes(header, Sizes(24, 20));
    EXPECT_EQ(KorHeader_GetItemCount(header), 35);
    EXPECT_EQ(LabelsOf(header)[0], L"0");
}

TEST_F(HeaderItemFaults, KeepAnItemThatCannotBeReplaced) {
    AppendItem(header, L"A", 20);
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(SetItem(header, 0, L"B", 30), 0);
    EXPECT_EQ(LabelsOf(header), Labels{L"A"});
    EXPECT_EQ(SizesOf(header), Sizes{20});
}

TEST_F(HeaderItemFaults, LeaveTheCallersItemAloneWithoutMemoryForACopy) {
    AppendItem(header, L"A", 20);
    spy.failNth("LocalAlloc", 1);
    HeaderItemDesc item{const_cast<LPWSTR>(L"untouched"), 7};
    EXPECT_EQ(KorHeader_GetItem(header, 0, &item), 0);
    EXPECT_STREQ(item.text, L"untouched");
    EXPECT_EQ(item.size, 7);
}

// Counts what random messages must leave behind and checks that no block is overrun.
class RandomMessages : public HeaderTest {
protected:
    int pick(int low, int high) { return std::uniform_int_distribution<int>(low, high)(random); }

    // Mostly near the valid ones.
    int pickIndex() {
        switch (pick(0, 9)) {
        case 0: return pick(-0x7FFFFFFF, 0x7FFFFFFF);
        case 1: return -1;
        case 2: return count;
        default: return pick(-2, count + 2);
        }
    }

    int pickPosition() { return pick(0, 9) ? pick(-20, 420) : pick(-32768, 32767); }

    void sendOne() {
        static const wchar_t* const kLabels[] = {L"", L"A", L"AB", L"12345", L"a long label"};
        HWND header = pick(0, 1) ? first : second;
        count = KorHeader_GetItemCount(header);
        const int index = pickIndex();
        switch (pick(0, 11)) {
        case 0:
        case 1:
            expectCount(header, InsertItem(header, index, kLabels[pick(0, 4)], pick(0, 300)) >= 0);
            break;
        case 2: expectCount(header, -KorHeader_DeleteItem(header, index)); break;
        case 3: SetItem(header, index, kLabels[pick(0, 4)], pick(0, 300)); break;
        case 4: KorHeader_SetItemState(header, index, static_cast<DWORD>(pick(0, 7))); break;
        case 5: GetItem(header, index); break;
        case 6: KorHeader_GetItemSize(header, index); break;
        case 7: PressAt(header, pickPosition(), pickPosition()); break;
        case 8: MoveTo(header, pickPosition(), pickPosition()); break;
        case 9: ReleaseAt(header, pickPosition(), pickPosition()); break;
        case 10: sendOddMessage(header); break;
        default: Repaint(header); break;
        }
    }

    void expectCount(HWND header, int change) {
        EXPECT_EQ(KorHeader_GetItemCount(header), count + change);
    }

    void sendOddMessage(HWND header) {
        const int offset = pick(0, 2000);
        const bool takesPointer = offset == 1 || offset == 3 || offset == 6;
        SendMessageW(header, WM_USER + static_cast<UINT>(offset), static_cast<WPARAM>(pickIndex()),
                     takesPointer ? 0 : pickIndex());
        SendMessageW(header, WM_SIZE, static_cast<WPARAM>(pick(0, 4)),
                     MAKELPARAM(pick(0, 65535), pick(0, 65535)));
        SendMessageW(header, WM_LBUTTONDBLCLK, 0, pick(-100000, 100000));
        MoveWindow(header, 0, 0, pick(0, 500), pick(0, 300), TRUE);
    }

    HWND first = createHorizontal();
    HWND second = createVertical();
    std::mt19937 random;
    int count = 0;
};

TEST_F(RandomMessages, DoNoHarm) {
    for (unsigned seed = 1; seed <= 12; ++seed) {
        random.seed(seed);
        for (int step = 0; step < 400; ++step) sendOne();
        posted();
        ASSERT_EQ(heap.report(), "") << "seed " << seed;
        SetGridZoomLevel(static_cast<DWORD>(pick(1, 16)));
    }
    ReleaseCapture();
    SetGridZoomLevel(4);
}

}  // namespace
}  // namespace kortest

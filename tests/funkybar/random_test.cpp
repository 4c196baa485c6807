// Thousands of messages in random order, with fixed seeds, against a simple model of the bar.
#include "funkybar/bar_fixture.h"

#include <climits>
#include <random>

namespace kortest {
namespace {

struct ModelItem {
    int number;  // every insertion's own; the item's text is "item <number>"
    LONG image;
    COLORREF colour;
    DWORD userData;
};

// What a host may expect, over a plain array.
class BarModel {
public:
    LONG insert(const ModelItem& item, LONG index) {
        const LONG before = size();
        const bool atEnd = before == 0 || index > before - 1;
        if (!atEnd && index != 0 && index != 1) return -1;
        items.insert(atEnd ? items.end() : items.begin() + index, item);
        if (current == 0) current = items[0].number;
        return before;
    }

    void remove(LONG index) {
        if (index < 0 || index >= size()) return;
        const bool wasCurrent = items[static_cast<size_t>(index)].number == current;
        items.erase(items.begin() + index);
        if (wasCurrent) current = items.empty() ? 0 : items[0].number;
    }

    LONG removeAll() {
        const LONG result = items.empty() ? 0 : 1;
        items.clear();
        current = 0;
        return result;
    }

    LONG select(LONG index) {
        if (items.empty() || index == -1 || index >= size()) return 0;
        current = index < 0 ? 0 : items[static_cast<size_t>(index)].number;
        return index < 0 ? 0 : 1;
    }

    LONG currentIndex() const {
        for (LONG i = 0; i < size(); ++i)
            if (items[static_cast<size_t>(i)].number == current) return i;
        return -1;
    }

    LONG size() const { return static_cast<LONG>(items.size()); }

    std::vector<ModelItem> items;
    int current = 0;  // number of the current item; 0: none
};

class BarRandom : public GuardedBarTest, public ::testing::WithParamInterface<unsigned> {
protected:
    int below(int limit) { return static_cast<int>(random() % static_cast<unsigned>(limit)); }

    LONG someIndex() {
        static const LONG kExtremes[] = {-1, -2, -3, INT_MIN, INT_MAX, INT_MAX - 1};
        if (below(8) == 0) return kExtremes[below(6)];
        return below(static_cast<int>(model.size()) + 2);
    }

    void insertOne() {
        const ModelItem item = {++lastNumber, below(5) - 1, random() & 0xFFFFFF,
                                static_cast<DWORD>(random())};
        const std::wstring text = L"item " + std::to_wstring(item.number);
        const FunkyBarItemDesc description = {FBIF_TEXT | FBIF_IMAGE | FBIF_COLOURS | FBIF_USERDATA,
                                              below(3) ? someIndex() : kAppend,
                                              const_cast<wchar_t*>(text.c_str()),
                                              0,
                                              item.image,
                                              item.colour,
                                              ~item.colour & 0xFFFFFF,
                                              item.userData};
        const LONG expected = model.insert(item, description.index);
        EXPECT_EQ(insert(description), expected);
    }

    void selectOne() {
        const LONG index = someIndex();
        const LONG expected = model.select(index);
        EXPECT_EQ(select(index), expected);
        if (expected) expectTold(index);
        settleTold();
    }

    // Things happen while the menu is open, too.
    void chooseOne() {
        duringMenu = below(3);
        command = below(static_cast<int>(model.size()) + 3) - 1;
        const LONG sizeAtOpening = model.size();
        press();
        EXPECT_EQ(static_cast<LONG>(entries.size()), sizeAtOpening);
        if (command > 0 && model.select(command - 1)) expectTold(command - 1);
        settleTold();
    }

    BOOL useMenu() {
        const std::vector<MenuEntry> opened = entries;
        if (duringMenu == 1) removeOne();
        if (duringMenu == 2) insertOne();
        Canvas canvas(100, 20, 0);
        for (const MenuEntry& entry : opened) {
            SIZE size{};
            measure(entry.data, &size);
            draw(canvas.dc(), {0, 0, 100, 20}, entry.data, below(2) ? ODS_SELECTED : 0u);
        }
        return command;
    }

    void removeOne() {
        const LONG index = someIndex();
        model.remove(index);
        remove(index);
    }

    void removeEverything() {
        const LONG expected = model.removeAll();
        EXPECT_EQ(send(FBM_DELETEALL), expected);
    }

    void recreate() {
        DestroyWindow(bar);
        model.removeAll();
        bar = createBar(host.window(), WS_CHILD | WS_VISIBLE, {10, 20, 210, 44});
        ASSERT_NE(bar, nullptr);
    }

    void expectTold(LONG index) const {
        EXPECT_EQ(told(), (Lines{"id 5/5 from bar code 256 index " + std::to_string(index)}));
    }

    void settleTold() {
        InvalidateRect(bar, nullptr, below(2));
        UpdateWindow(bar);
        settle();
    }

    void step() {
        switch (below(16)) {
        case 0:
        case 1:
        case 2:
        case 3:
        case 4:
        case 5: insertOne(); break;
        case 6:
        case 7:
        case 8: removeOne(); break;
        case 9:
        case 10:
        case 11: selectOne(); break;
        case 12:
        case 13: chooseOne(); break;
        case 14:
            if (below(8) == 0) removeEverything();
            break;
        default:
            if (below(40) == 0) recreate();
            KorFunkyBar_SetImageList(bar, below(2) ? images : nullptr);
        }
    }

    void expectAsModelled() const {
        ASSERT_EQ(count(), model.size());
        ASSERT_EQ(current(), model.currentIndex());
        for (LONG i = 0; i < model.size(); ++i) {
            const ModelItem& item = model.items[static_cast<size_t>(i)];
            FunkyBarItemDesc got = {
                FBIF_IMAGE | FBIF_COLOURS | FBIF_USERDATA, i, nullptr, 0, 0, 0, 0, 0};
            ASSERT_TRUE(KorFunkyBar_GetItem(bar, &got));
            ASSERT_EQ(textOf(i), L"item " + std::to_wstring(item.number));
            ASSERT_EQ(got.image, item.image);
            ASSERT_EQ(got.textColour, item.colour);
            ASSERT_EQ(got.backgroundColour, ~item.colour & 0xFFFFFF);
            ASSERT_EQ(got.userData, item.userData);
        }
    }

    std::mt19937 random;
    BarModel model;
    HIMAGELIST images = nullptr;
    int lastNumber = 0;
    int duringMenu = 0;
    BOOL command = 0;
};

TEST_P(BarRandom, MessagesLeaveWhatTheModelHolds) {
    random.seed(GetParam() * 7919);
    create();
    images = makeImages(10, 10, {RGB(255, 0, 0), RGB(0, 255, 0), RGB(0, 0, 255)});
    replaceMenu([this] { return useMenu(); });
    for (int i = 0; i < 1500; ++i) {
        step();
        expectAsModelled();
        ASSERT_EQ(heap->report(), "");
        if (HasFailure()) FAIL() << "at step " << i;
        if (i % 50 == 0) settle();
    }
    EXPECT_GT(lastNumber, 300);
}

INSTANTIATE_TEST_SUITE_P(Seeds, BarRandom, ::testing::Range(1u, 5u));

}  // namespace
}  // namespace kortest

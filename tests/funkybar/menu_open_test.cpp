// The menu itself, opened by a press and used with keys and the pointer.
#include "funkybar/bar_fixture.h"
#include "funkybar/menu_driver.h"

namespace kortest {
namespace {

class BarMenuOpen : public GuardedBarTest {
protected:
    BarMenuOpen() {
        create();
        insertAll({L"one", L"two", L"three"});
        settle();
    }

    // A press, with something done in the menu that it opens.
    void pressAnd(const std::function<void(HWND popup)>& act) {
        MenuDriver menu(act);
        EXPECT_EQ(press(), 0);
        EXPECT_TRUE(menu.wasOpen());
        EXPECT_FALSE(menu.gaveUp());
        EXPECT_EQ(OpenPopup(), nullptr);
    }
};

TEST_F(BarMenuOpen, ChoosesByKeys) {
    pressAnd([this](HWND) { PostKeys(bar, {VK_DOWN, VK_DOWN, VK_RETURN}); });
    EXPECT_EQ(state(), "one [two] three");
    EXPECT_EQ(told(), (Lines{"id 5/5 from bar code 256 index 1"}));
}

TEST_F(BarMenuOpen, ChangesNothingWhenItIsLeft) {
    pressAnd([this](HWND) { PostKeys(bar, {VK_DOWN, VK_ESCAPE}); });
    EXPECT_EQ(state(), "[one] two three");
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(repaints(), "");
}

TEST_F(BarMenuOpen, ChoosesByTheHostsOwnEnd) {
    pressAnd([](HWND) { EndMenu(); });
    EXPECT_EQ(state(), "[one] two three");
}

TEST_F(BarMenuOpen, StandsAtTheScreensEdgeBelowTheBar) {
    RECT barPlace{};
    RECT place{};
    GetWindowRect(bar, &barPlace);
    pressAnd([&](HWND popup) {
        GetWindowRect(popup, &place);
        EndMenu();
    });
    EXPECT_EQ(place.left, 3);
    EXPECT_EQ(place.top, barPlace.bottom);
}

TEST_F(BarMenuOpen, ListsTheItemsAsOwnerDrawnEntries) {
    pressAnd([&](HWND popup) {
        const HMENU menu = MenuOf(popup);
        EXPECT_EQ(GetMenuItemCount(menu), 3);
        for (UINT i = 0; i < 3; ++i) {
            MENUITEMINFOW info{};
            info.cbSize = sizeof info;
            info.fMask = MIIM_FTYPE | MIIM_ID;
            EXPECT_TRUE(GetMenuItemInfoW(menu, i, TRUE, &info));
            EXPECT_EQ(info.fType, UINT{MFT_OWNERDRAW});
            EXPECT_EQ(info.wID, i + 1);
        }
        EndMenu();
    });
}

TEST_F(BarMenuOpen, MayLoseItsItems) {
    pressAnd([&](HWND popup) {
        KorFunkyBar_DeleteAll(bar);
        insert(L"new");
        RedrawWindow(popup, nullptr, nullptr, RDW_INVALIDATE | RDW_UPDATENOW);
        PostKeys(bar, {VK_DOWN, VK_DOWN, VK_RETURN});
    });
    EXPECT_EQ(state(), "[new]") << "there is no second item any more";
    EXPECT_EQ(told(), Lines{});
}

TEST_F(BarMenuOpen, MayLoseOneItem) {
    pressAnd([&](HWND popup) {
        remove(1);
        RedrawWindow(popup, nullptr, nullptr, RDW_INVALIDATE | RDW_UPDATENOW);
        PostKeys(bar, {VK_DOWN, VK_DOWN, VK_RETURN});
    });
    EXPECT_EQ(state(), "one [three]") << "the position counts";
}

TEST_F(BarMenuOpen, EndsWithTheWindow) {
    pressAnd([this](HWND) { DestroyWindow(bar); });
    EXPECT_FALSE(IsWindow(bar));
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

TEST_F(BarMenuOpen, OpensNoSecondOne) {
    pressAnd([this](HWND) {
        press();
        EndMenu();
    });
    EXPECT_EQ(state(), "[one] two three");
}

TEST_F(BarMenuOpen, OfAnEmptyBarEndsAtOnce) {
    KorFunkyBar_DeleteAll(bar);
    settle();
    MenuDriver menu([](HWND) { EndMenu(); });
    EXPECT_EQ(press(), 0);
    EXPECT_FALSE(menu.gaveUp());
    EXPECT_EQ(told(), Lines{});
}

}  // namespace
}  // namespace kortest

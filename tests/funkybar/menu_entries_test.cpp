// What the library asks of the menu, and what it answers the menu's questions; no menu is opened.
#include "funkybar/bar_fixture.h"

namespace kortest {
namespace {

class BarMenu : public GuardedBarTest {
protected:
    BarMenu() {
        create();
        insertAll({L"one", L"two", L"three"});
        replaceMenu([this] {
            if (whenOpen) whenOpen();
            return command;
        });
        settle();
    }

    std::function<void()> whenOpen;
    BOOL command = 0;
};

TEST_F(BarMenu, IsOpenedBelowTheBarForACommand) {
    RECT place{};
    GetWindowRect(bar, &place);
    EXPECT_EQ(press(), 0);
    ASSERT_EQ(tracking.size(), 6u);
    EXPECT_EQ(tracking[0], spy.callsOf("CreatePopupMenu")[0].result);
    EXPECT_EQ(static_cast<UINT>(tracking[1]), UINT{TPM_RETURNCMD});
    EXPECT_EQ(static_cast<int>(tracking[2]), 3);
    EXPECT_EQ(static_cast<int>(tracking[3]), place.bottom);
    EXPECT_EQ(reinterpret_cast<HWND>(tracking[4]), bar);
    EXPECT_EQ(tracking[5], 0u);
}

TEST_F(BarMenu, HasAnEntryForEachItemInOrder) {
    press();
    ASSERT_EQ(entries.size(), 3u);
    for (size_t i = 0; i < 3; ++i) {
        EXPECT_EQ(entries[i].flags, UINT{MF_OWNERDRAW});
        EXPECT_EQ(entries[i].command, i + 1);
        EXPECT_NE(entries[i].data, 0u);
    }
    EXPECT_NE(entries[0].data, entries[1].data);
}

TEST_F(BarMenu, SelectsTheChosenEntry) {
    command = 2;
    press();
    EXPECT_EQ(state(), "one [two] three");
    EXPECT_EQ(told(), (Lines{"id 5/5 from bar code 256 index 1"}));
    EXPECT_EQ(repaints(), "invalidate+erase update");
}

TEST_F(BarMenu, WithoutAChoiceChangesNothing) {
    for (const BOOL none : {0, -1}) {
        command = none;
        press();
        EXPECT_EQ(state(), "[one] two three");
        EXPECT_EQ(told(), Lines{});
    }
}

TEST_F(BarMenu, IsDestroyed) {
    for (const BOOL chosen : {0, 1, 9}) {
        command = chosen;
        spy.clearCalls();
        press();
        const auto destroyed = spy.callsOf("DestroyMenu");
        ASSERT_EQ(destroyed.size(), 1u);
        EXPECT_EQ(destroyed[0].arguments[0], spy.callsOf("CreatePopupMenu")[0].result);
    }
}

TEST_F(BarMenu, IsDestroyedAlsoWhenTheWindowIs) {
    command = 1;
    whenOpen = [this] { DestroyWindow(bar); };
    press();
    EXPECT_EQ(spy.count("DestroyMenu"), 1);
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

TEST_F(BarMenu, IsDestroyedAlsoWhenTheParentDestroysTheBar) {
    command = 1;
    whenTold = [this] { DestroyWindow(bar); };
    press();
    EXPECT_EQ(spy.count("DestroyMenu"), 1);
    EXPECT_EQ(told().size(), 1u);
}

TEST_F(BarMenu, OfAVanishedItemChangesNothing) {
    command = 3;
    whenOpen = [this] { remove(2); };
    press();
    EXPECT_EQ(state(), "[one] two");
    EXPECT_EQ(told(), Lines{});
}

TEST_F(BarMenu, MeasuresAndDrawsNothingOfAVanishedItem) {
    Picture drawn;
    SIZE size = {9, 9};
    whenOpen = [&] {
        remove(1);
        Canvas canvas(60, 20, RGB(1, 2, 3));
        EXPECT_EQ(draw(canvas.dc(), {0, 0, 60, 20}, entries[1].data, 0), 1);
        drawn = canvas.picture();
        EXPECT_EQ(measure(entries[1].data, &size), 1);
    };
    press();
    EXPECT_EQ(drawn.count(GetSysColor(COLOR_MENU)), 60 * 20);
    EXPECT_EQ(size.cx, 0);
    EXPECT_EQ(size.cy, 0);
}

TEST_F(BarMenu, RefusesNullPointers) {
    EXPECT_EQ(send(WM_MEASUREITEM), 0);
    EXPECT_EQ(send(WM_DRAWITEM), 0);
}

TEST_F(BarMenu, RefusesEntriesThatAreNotItsOwn) {
    SIZE size = {9, 9};
    for (const ULONG_PTR data : {ULONG_PTR{0}, ULONG_PTR{1}, ~ULONG_PTR{0}}) {
        EXPECT_EQ(measure(data, &size), 1);
        EXPECT_EQ(size.cx, 0);
        EXPECT_EQ(draw(nullptr, {0, 0, 10, 10}, data, ODS_SELECTED), 1);
    }
}

TEST_F(BarMenu, WithoutAMenuDoesNothing) {
    spy.failNth("CreatePopupMenu", 1);
    command = 2;
    EXPECT_EQ(press(), 0);
    EXPECT_EQ(spy.count("TrackPopupMenuEx"), 0);
    EXPECT_EQ(state(), "[one] two three");
}

TEST_F(BarMenu, ThatLacksAnEntryKeepsTheOthersCommands) {
    spy.failNth("AppendMenuW", 1);
    press();
    ASSERT_EQ(entries.size(), 2u);
    EXPECT_EQ(entries[0].command, 2u);
    EXPECT_EQ(entries[1].command, 3u);
}

}  // namespace
}  // namespace kortest

// The page of ranges, type and zoom.
#include "graph/tools/properties_fixture.h"

#include <commctrl.h>
#include <prsht.h>

namespace kortest {
namespace {

// Line charts at 25 %, so that both combo boxes start on 0, which counts as applied already: these
// tests see nothing but what they typed.
class RangeEdits : public PropertiesTest {
protected:
    RangeEdits() {
        createRecorded();
        KorGraph_SetZoom(graph, KORGRAPH_ZOOM25);
        KorGraph_SetRange(graph, KORGRAPH_X, 0, 12);
        KorGraph_SetRange(graph, KORGRAPH_Y, -5, 50);
        sent.clear();
    }
};

TEST_F(RangeEdits, ShowTheRanges) {
    KorGraph_SetRange(graph, KORGRAPH_X, -0.5, 123456789);
    openSheet([](HWND sheet) {
        const HWND page = ShowPage(sheet, kDataPage);
        EXPECT_EQ(TextIn(page, kXMinEdit), L"-0.5");
        EXPECT_EQ(TextIn(page, kXMaxEdit), L"1.2346E+08");
        EXPECT_EQ(TextIn(page, kYMinEdit), L"-5");
        EXPECT_EQ(TextIn(page, kYMaxEdit), L"50");
    });
}

TEST_F(RangeEdits, UntouchedSendNothing) {
    typeOnDataPage({});
    EXPECT_EQ(sent, Lines{});
}

TEST_F(RangeEdits, BothEndsOfX) {
    typeOnDataPage({{kXMinEdit, L"2.5"}, {kXMaxEdit, L"7"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE x 2.5 7", "GN_REDRAW"}));
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.5, 7.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-5.0, 50.0}));
}

TEST_F(RangeEdits, AnXEndThatWasNotTypedIsTheChartsOwn) {
    typeOnDataPage({{kXMinEdit, L"3"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE x 3 12", "GN_REDRAW"}));
    sent.clear();
    typeOnDataPage({{kXMaxEdit, L"9"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE x 3 9", "GN_REDRAW"}));
}

// The shown text has five digits; the chart's own number goes back whole.
TEST_F(RangeEdits, AnXEndThatWasNotTypedKeepsItsDigits) {
    KorGraph_SetRange(graph, KORGRAPH_X, 0.123456789, 12);
    typeOnDataPage({{kXMaxEdit, L"9"}});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.123456789, 9.0}));
}

TEST_F(RangeEdits, BothEndsOfY) {
    typeOnDataPage({{kYMinEdit, L"-1e2"}, {kYMaxEdit, L"40"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE y -100 40", "GN_REDRAW"}));
}

// Looks like a mistake and is wanted.
TEST_F(RangeEdits, AYEndThatWasNotTypedIsTheXRanges) {
    typeOnDataPage({{kYMaxEdit, L"100"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE y 0 100", "GN_REDRAW"}));
    sent.clear();
    typeOnDataPage({{kYMinEdit, L"-7"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE y -7 12", "GN_REDRAW"}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-7.0, 12.0}));
}

TEST_F(RangeEdits, YReadsTheXRangeOfTheSameApply) {
    typeOnDataPage({{kXMinEdit, L"4"}, {kYMaxEdit, L"100"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE x 4 12", "GM_SETRANGE y 4 100", "GN_REDRAW"}));
}

TEST_F(RangeEdits, AReversedXRangeIsRefusedAndTheRestApplied) {
    openSheet([](HWND sheet) {
        TypeInto(ShowPage(sheet, kTitlesPage), kTitleEdit, L"Rain");
        const HWND page = ShowPage(sheet, kDataPage);
        TypeInto(page, kXMinEdit, L"10");
        TypeInto(page, kXMaxEdit, L"5");
        TypeInto(page, kYMinEdit, L"1");
        TypeInto(page, kYMaxEdit, L"2");
        Choose(page, kTypeCombo, KORGRAPH_COLUMN);
        PressOk(sheet);
    });
    ASSERT_EQ(driver.boxes().size(), 1u);
    EXPECT_EQ(driver.boxes()[0].text, L"Incorrect Range Entered.");
    EXPECT_EQ(driver.boxes()[0].caption, L"Range Error");
    EXPECT_EQ(driver.boxes()[0].buttons, std::vector<int>{IDOK});
    EXPECT_EQ(sent, (Lines{"GM_SETTITLE \"Rain\"", "GN_REDRAW", "GM_SETRANGE y 1 2", "GM_SETTYPE 3",
                           "GM_SETZOOM 0", "GN_REDRAW"}));
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 12.0}));
}

TEST_F(RangeEdits, AReversedYRangeIsRefusedAndDrawnAllTheSame) {
    typeOnDataPage({{kYMinEdit, L"6"}, {kYMaxEdit, L"5.9"}});
    EXPECT_EQ(driver.boxes().size(), 1u);
    EXPECT_EQ(sent, Lines{"GN_REDRAW"});
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-5.0, 50.0}));
}

TEST_F(RangeEdits, BothReversedGiveABoxEach) {
    typeOnDataPage({{kXMaxEdit, L"-1"}, {kYMaxEdit, L"-1"}});
    EXPECT_EQ(driver.boxes().size(), 2u);
    EXPECT_EQ(sent, Lines{"GN_REDRAW"});
}

TEST_F(RangeEdits, TheBoxIsTheChartsOwn) {
    spy.watch("MessageBoxW");
    typeOnDataPage({{kXMaxEdit, L"-1"}});
    const auto calls = spy.callsOf("MessageBoxW");
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(reinterpret_cast<HWND>(calls[0].arguments[0]), graph);
    EXPECT_EQ(NumberAt(calls[0], 3), static_cast<DWORD>(MB_OK));
}

// The dead page's combo boxes would answer 0, the first type and the first zoom.
TEST_F(RangeEdits, APageThatGoesWhileTheBoxIsOpenAppliesNoMore) {
    openSheet([](HWND sheet) {
        Choose(ShowPage(sheet, kDataPage), kZoomCombo, KORGRAPH_ZOOM50);
        PressOk(sheet);
    });
    sent.clear();
    spy.watch("MessageBoxW");
    openSheet([this](HWND sheet) {
        const HWND page = ShowPage(sheet, kDataPage);
        spy.replace("MessageBoxW", [page](ULONG_PTR*) -> ULONG_PTR {
            DestroyWindow(page);
            return IDOK;
        });
        TypeInto(page, kXMaxEdit, L"-1");
        NMHDR apply = {sheet, 0, static_cast<UINT>(PSN_APPLY)};
        SendMessageW(page, WM_NOTIFY, 0, reinterpret_cast<LPARAM>(&apply));
        EXPECT_FALSE(IsWindow(page));
    });
    EXPECT_EQ(spy.count("MessageBoxW"), 1);
    EXPECT_EQ(sent, Lines{});
}

TEST_F(RangeEdits, EqualEndsShowOneUnit) {
    typeOnDataPage({{kXMinEdit, L"3"}, {kXMaxEdit, L"3"}});
    EXPECT_EQ(driver.boxes().size(), 0u);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{3.0, 4.0}));
}

TEST_F(RangeEdits, WhatIsNoNumberIsZero) {
    typeOnDataPage({{kXMinEdit, L"none"}, {kXMaxEdit, L"8 apples"}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE x 0 8", "GN_REDRAW"}));
    sent.clear();
    typeOnDataPage({{kXMinEdit, L"-4"}, {kXMaxEdit, L""}});
    EXPECT_EQ(sent, (Lines{"GM_SETRANGE x -4 0", "GN_REDRAW"}));
}

TEST_F(RangeEdits, TheRangeCheckSeesTheZero) {
    typeOnDataPage({{kXMinEdit, L"1"}, {kXMaxEdit, L"many"}});
    EXPECT_EQ(driver.boxes().size(), 1u);
}

// ---- Type and zoom ----------------------------------------------------------------------------

class TypeAndZoom : public PropertiesTest {
protected:
    TypeAndZoom() { createRecorded(); }

    // What OK sends with these two selections.
    Lines apply(int type, int zoom) {
        sent.clear();
        openSheet([=](HWND sheet) {
            const HWND page = ShowPage(sheet, kDataPage);
            Choose(page, kTypeCombo, type);
            Choose(page, kZoomCombo, zoom);
            PressOk(sheet);
        });
        return sent;
    }
};

TEST_F(TypeAndZoom, AreListed) {
    openSheet([](HWND sheet) {
        const HWND page = ShowPage(sheet, kDataPage);
        EXPECT_EQ(ItemsOf(GetDlgItem(page, kTypeCombo)),
                  (std::vector<std::wstring>{L"Line", L"Area", L"Bar", L"Column", L"Pie"}));
        EXPECT_EQ(ItemsOf(GetDlgItem(page, kZoomCombo)),
                  (std::vector<std::wstring>{L"25%", L"50%", L"100%", L"200%"}));
    });
}

TEST_F(TypeAndZoom, ShowTheChartsOwn) {
    for (LONG type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        const LONG zoom = type % 4;
        KorGraph_SetType(graph, type);
        KorGraph_SetZoom(graph, zoom);
        openSheet([=](HWND sheet) {
            const HWND page = ShowPage(sheet, kDataPage);
            EXPECT_EQ(Chosen(page, kTypeCombo), type);
            EXPECT_EQ(Chosen(page, kZoomCombo), zoom);
        });
    }
}

TEST_F(TypeAndZoom, ATypeWithoutANameIsLeftAlone) {
    KorGraph_SetType(graph, 7);
    openSheet([](HWND sheet) {
        EXPECT_EQ(Chosen(ShowPage(sheet, kDataPage), kTypeCombo), CB_ERR);
        PressOk(sheet);
    });
    EXPECT_EQ(KorGraph_GetType(graph), 7);
}

// One stored selection serves both combo boxes; it is 0 at first.
TEST_F(TypeAndZoom, TheFirstApplySendsTheZoomOfAnUntouchedSheet) {
    EXPECT_EQ(apply(KORGRAPH_LINE, KORGRAPH_ZOOM100), (Lines{"GM_SETZOOM 2", "GN_REDRAW"}));
}

TEST_F(TypeAndZoom, AreSentAgainWheneverTheyDiffer) {
    apply(KORGRAPH_LINE, KORGRAPH_ZOOM100);
    EXPECT_EQ(apply(KORGRAPH_LINE, KORGRAPH_ZOOM100),
              (Lines{"GM_SETTYPE 0", "GM_SETZOOM 2", "GN_REDRAW"}));
    EXPECT_EQ(apply(KORGRAPH_PIE, KORGRAPH_ZOOM50),
              (Lines{"GM_SETTYPE 4", "GM_SETZOOM 1", "GN_REDRAW"}));
}

TEST_F(TypeAndZoom, AreNotSentWhenBothEqualTheStoredOne) {
    EXPECT_EQ(apply(KORGRAPH_BAR, KORGRAPH_ZOOM100), (Lines{"GM_SETTYPE 2", "GN_REDRAW"}));
    EXPECT_EQ(apply(KORGRAPH_BAR, KORGRAPH_ZOOM100), Lines{});
    EXPECT_EQ(apply(KORGRAPH_LINE, KORGRAPH_ZOOM25), (Lines{"GM_SETTYPE 0", "GN_REDRAW"}));
}

// The stored selection belongs to the process, not to a chart.
TEST_F(TypeAndZoom, AnotherChartSeesTheSameStoredOne) {
    apply(KORGRAPH_BAR, KORGRAPH_ZOOM100);
    destroy();
    createRecorded();
    EXPECT_EQ(apply(KORGRAPH_BAR, KORGRAPH_ZOOM200), (Lines{"GM_SETZOOM 3", "GN_REDRAW"}));
}

TEST_F(TypeAndZoom, ReachTheChart) {
    apply(KORGRAPH_PIE, KORGRAPH_ZOOM200);
    EXPECT_EQ(KorGraph_GetType(graph), KORGRAPH_PIE);
    EXPECT_EQ(KorGraph_GetZoom(graph), KORGRAPH_ZOOM200);
}

}  // namespace
}  // namespace kortest

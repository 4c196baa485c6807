// The legend's scroll bar and its first entry.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class LegendScroll : public GraphTest {
protected:
    void open(const RECT& place = {10, 5, 160, 90}) {
        legend = showLegend(place);
        ASSERT_NE(legend, nullptr);
        host.pump();
    }

    void addNamed(int count) {
        for (int i = 0; i < count; ++i) add({1}, std::wstring(1, wchar_t(L'A' + i)).c_str());
    }

    SCROLLINFO info() const {
        SCROLLINFO read{};
        read.cbSize = sizeof read;
        read.fMask = SIF_RANGE | SIF_PAGE | SIF_POS;
        GetScrollInfo(legend, SB_VERT, &read);
        return read;
    }

    LRESULT scroll(int request, int position = 0) const {
        return SendMessageW(legend, WM_VSCROLL, MAKEWPARAM(request, position), 0);
    }

    // The name of the first entry shown.
    std::wstring first() {
        const auto texts = textsOf([this] {
            InvalidateRect(legend, nullptr, TRUE);
            UpdateWindow(legend);
        });
        return texts.empty() ? L"" : texts[0];
    }

    int pitch() const {
        const HDC dc = GetDC(legend);
        RECT measured{};
        DrawTextW(dc, L"M", 1, &measured, DT_CALCRECT);
        ReleaseDC(legend, dc);
        return static_cast<int>(measured.bottom) + 5;
    }

    int fitting() const { return static_cast<int>(ClientOf(legend).bottom) / pitch(); }

    HWND legend = nullptr;
};

TEST_F(LegendScroll, EntriesThatFitHaveTheRangeOne) {
    create(230, 220);
    addNamed(2);
    open();
    ASSERT_GE(fitting(), 2);
    EXPECT_EQ(info().nMin, 0);
    EXPECT_EQ(info().nMax, 1);
}

TEST_F(LegendScroll, TooManySeriesHaveTheirNumberLessOneAsMaximum) {
    create(230, 220);
    addNamed(9);
    open();
    ASSERT_LT(fitting(), 9);
    EXPECT_EQ(info().nMin, 0);
    EXPECT_EQ(info().nMax, 8);
    EXPECT_EQ(info().nPage, static_cast<UINT>(fitting()));
    EXPECT_EQ(info().nPos, 0);
}

// The maximum differs by type: a pie's is the number of its entries.
TEST_F(LegendScroll, TooManySlicesHaveTheirNumberAsMaximum) {
    create(230, 220);
    add(std::vector<double>(9, 1.0));
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    ASSERT_LT(fitting(), 9);
    EXPECT_EQ(info().nMax, 9);
    EXPECT_EQ(info().nPage, static_cast<UINT>(fitting()));
}

TEST_F(LegendScroll, EntriesThatJustFitHaveNoBar) {
    create(230, 220);
    open();
    addNamed(fitting());
    first();
    EXPECT_EQ(info().nMax, 1);
    addNamed(1);
    first();
    EXPECT_EQ(info().nMax, fitting());
}

TEST_F(LegendScroll, PageIsAtLeastOne) {
    create(230, 220);
    addNamed(9);
    open();
    SetWindowPos(legend, nullptr, 0, 0, 150, 45, SWP_NOMOVE | SWP_NOZORDER);
    ASSERT_EQ(fitting(), 0);
    addNamed(1);
    first();
    EXPECT_EQ(info().nPage, 1u);
}

TEST_F(LegendScroll, SetUpNamesEverythingOnce) {
    create(230, 220);
    addNamed(9);
    UINT mask = 0;
    spy.watchAll({"SetScrollInfo", "SetScrollPos", "SetScrollRange"});
    spy.replace("SetScrollInfo", [&](ULONG_PTR* arguments) {
        mask = reinterpret_cast<const SCROLLINFO*>(arguments[2])->fMask;
        EXPECT_NE(static_cast<BOOL>(arguments[3]), FALSE) << "with redraw";
        return spy.callReal("SetScrollInfo", arguments);
    });
    open();
    first();
    first();
    EXPECT_EQ(mask & (SIF_RANGE | SIF_PAGE | SIF_POS), UINT{SIF_RANGE | SIF_PAGE | SIF_POS});
    EXPECT_EQ(spy.count("SetScrollInfo"), 1) << "not at every paint";
    EXPECT_EQ(spy.count("SetScrollPos"), 1);
    EXPECT_EQ(spy.count("SetScrollRange"), 0);
}

TEST_F(LegendScroll, LinesAndPagesMoveByOneEntry) {
    create(230, 220);
    addNamed(5);
    open();
    EXPECT_EQ(first(), L"A");
    EXPECT_EQ(scroll(SB_LINEDOWN), 0);
    EXPECT_EQ(first(), L"B");
    EXPECT_EQ(scroll(SB_PAGEDOWN), 0);
    EXPECT_EQ(first(), L"C");
    EXPECT_EQ(scroll(SB_LINEUP), 0);
    EXPECT_EQ(first(), L"B");
    EXPECT_EQ(scroll(SB_PAGEUP), 0);
    EXPECT_EQ(first(), L"A");
}

TEST_F(LegendScroll, StopsAtBothEnds) {
    create(230, 220);
    addNamed(3);
    open();
    for (const int request : {SB_LINEUP, SB_PAGEUP}) {
        scroll(request);
        EXPECT_EQ(first(), L"A");
    }
    scroll(SB_LINEDOWN);
    scroll(SB_LINEDOWN);
    EXPECT_EQ(first(), L"C");
    for (const int request : {SB_LINEDOWN, SB_PAGEDOWN}) {
        scroll(request);
        EXPECT_EQ(first(), L"C");
    }
}

// Whatever the thumb's position, the list goes back to its first entry.
TEST_F(LegendScroll, ThumbAlwaysGoesToTheStart) {
    create(230, 220);
    addNamed(5);
    open();
    for (const int request : {SB_THUMBPOSITION, SB_THUMBTRACK}) {
        scroll(SB_LINEDOWN);
        scroll(SB_LINEDOWN);
        EXPECT_EQ(first(), L"C");
        EXPECT_EQ(scroll(request, 3), 0);
        EXPECT_EQ(first(), L"A");
    }
}

TEST_F(LegendScroll, TopGoesToTheStartAndOthersChangeNothing) {
    create(230, 220);
    addNamed(5);
    open();
    scroll(SB_LINEDOWN);
    for (const int request : {SB_BOTTOM, SB_ENDSCROLL, 9, 100}) {
        EXPECT_EQ(scroll(request, 3), 0);
        EXPECT_EQ(first(), L"B") << request;
    }
    EXPECT_EQ(scroll(SB_TOP), 0);
    EXPECT_EQ(first(), L"A");
}

TEST_F(LegendScroll, ShowsTheMoveAtOnceAndLeavesTheBar) {
    create(230, 220);
    addNamed(9);
    open();
    watchInvalidations();
    const Picture before = ReadWindow(legend);
    scroll(SB_LINEDOWN);
    EXPECT_FALSE(before == ReadWindow(legend));
    EXPECT_FALSE(GetUpdateRect(legend, nullptr, FALSE));
    EXPECT_EQ(info().nPos, 0);
    const auto calls = invalidationsOf(legend);
    ASSERT_GE(calls.size(), 1u);
    EXPECT_TRUE(calls[0].isWhole);
    EXPECT_TRUE(calls[0].erases);
}

TEST_F(LegendScroll, HorizontalRequestsDoNothing) {
    create(230, 220);
    addNamed(3);
    open();
    for (WPARAM request = 0; request < 9; ++request)
        EXPECT_EQ(SendMessageW(legend, WM_HSCROLL, request, 0), 0);
    EXPECT_EQ(first(), L"A");
}

TEST_F(LegendScroll, NewNumberOfEntriesBeginsAtTheFirst) {
    create(230, 220);
    addNamed(5);
    open();
    scroll(SB_LINEDOWN);
    EXPECT_EQ(first(), L"B");
    add({1}, L"Z");
    EXPECT_EQ(first(), L"A");
}

TEST_F(LegendScroll, SameNumberOfEntriesStaysWhereItIs) {
    create(230, 220);
    addNamed(5);
    open();
    scroll(SB_LINEDOWN);
    replace(0, {3});
    EXPECT_EQ(first(), L"B");
}

TEST_F(LegendScroll, TypeChangePutsTheBarToZeroAndPaints) {
    create(230, 220);
    addNamed(9);
    open();
    SetScrollPos(legend, SB_VERT, 2, TRUE);
    ASSERT_EQ(info().nPos, 2);
    watchInvalidations();
    spy.watch("BeginPaint");
    spy.clearCalls();
    KorGraph_SetType(graph, KORGRAPH_COLUMN);
    EXPECT_EQ(info().nPos, 0);
    const auto calls = invalidationsOf(legend);
    ASSERT_GE(calls.size(), 1u);
    EXPECT_TRUE(calls[0].isWhole);
    EXPECT_FALSE(calls[0].erases);
    ASSERT_EQ(spy.count("BeginPaint"), 1) << "painted before the chart is drawn";
    EXPECT_EQ(reinterpret_cast<HWND>(spy.callsOf("BeginPaint")[0].arguments[0]), legend);
}

}  // namespace
}  // namespace kortest

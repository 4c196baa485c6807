// What the legend lists, compared with the same picture drawn by the test.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kPalette[] = {RGB(255, 0, 0), RGB(0, 255, 0), RGB(0, 0, 255), RGB(255, 255, 0),
                                 RGB(255, 0, 255)};

struct Entry {
    const wchar_t* name;
    COLORREF colour;
};

class LegendPicture : public GraphTest {
protected:
    // A legend that is high enough for five lines and wide enough for short names.
    void open() {
        legend = showLegend({10, 5, 160, 150});
        ASSERT_NE(legend, nullptr);
        host.pump();
    }

    // White; per entry a framed swatch at column 3 and the name at column 16, one below the other.
    Picture expected(const std::vector<Entry>& entries) const {
        const RECT client = ClientOf(legend);
        Canvas canvas(static_cast<int>(client.right), static_cast<int>(client.bottom),
                      RGB(255, 255, 255));
        RECT measured{};
        DrawTextW(canvas.dc(), L"M", 1, &measured, DT_CALCRECT);
        int top = 5;
        for (const Entry& entry : entries) {
            const HBRUSH brush = CreateSolidBrush(entry.colour);
            const HGDIOBJ previous = SelectObject(canvas.dc(), brush);
            Rectangle(canvas.dc(), 3, top, 13, top + 10);
            SelectObject(canvas.dc(), previous);
            DeleteObject(brush);
            RECT text = {16, top, client.right - 3, top + measured.bottom};
            DrawTextW(canvas.dc(), entry.name, -1, &text, 0);
            top = text.bottom + 5;
        }
        return canvas.picture();
    }

    Picture painted() {
        InvalidateRect(legend, nullptr, TRUE);
        UpdateWindow(legend);
        return ReadWindow(legend);
    }

    void expectEntries(const std::vector<Entry>& entries) {
        EXPECT_TRUE(SamePicture(expected(entries), painted()));
    }

    HWND legend = nullptr;
};

TEST_F(LegendPicture, ListsTheSeries) {
    create(230, 220);
    add({1}, L"North");
    add({1}, L"South");
    open();
    expectEntries({{L"North", RGB(0, 255, 0)}, {L"South", RGB(0, 0, 255)}});
}

TEST_F(LegendPicture, IsRightAfterItsFirstPaint) {
    create(230, 220);
    add({1}, L"North");
    open();
    EXPECT_TRUE(SamePicture(expected({{L"North", RGB(0, 255, 0)}}), ReadWindow(legend)));
}

TEST_F(LegendPicture, OfAPieIsRightAfterItsFirstPaint) {
    create(230, 220);
    add({1, 2}, L"North");
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    EXPECT_TRUE(
        SamePicture(expected({{L"1", kPalette[0]}, {L"2", kPalette[1]}}), ReadWindow(legend)));
}

TEST_F(LegendPicture, WithoutEntriesIsWhite) {
    create(230, 220);
    open();
    expectEntries({});
}

TEST_F(LegendPicture, LeavesSeriesWithoutANameOut) {
    create(230, 220);
    add({1}, L"North");
    add({1});
    add({1}, L"South");
    open();
    expectEntries({{L"North", RGB(0, 255, 0)}, {L"South", RGB(255, 255, 0)}});
}

TEST_F(LegendPicture, OfAPieListsTheCategories) {
    create(230, 220);
    add({1, 2, 3}, L"North");
    categories({L"Jan", nullptr, L"Mar"});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    expectEntries({{L"Jan", kPalette[0]}, {L"Mar", kPalette[2]}});
}

TEST_F(LegendPicture, OfAPieWithoutCategoriesListsNumbers) {
    create(230, 220);
    add({1, 2, 3}, L"North");
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    expectEntries({{L"1", kPalette[0]}, {L"2", kPalette[1]}, {L"3", kPalette[2]}});
}

TEST_F(LegendPicture, OfAPieCountsItsCategoriesWhateverThePoints) {
    create(230, 220);
    add({1, 2, 3, 4}, L"North");
    categories({L"only"});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    expectEntries({{L"only", kPalette[0]}});
}

// The number of categories is stale after a removal; the labels are gone, so points are listed.
TEST_F(LegendPicture, OfAPieIgnoresTheCountThatARemovalLeaves) {
    create(230, 220);
    add({1, 2}, L"North");
    categories({L"Jan", L"Feb", L"Mar", L"Apr"});
    notify(GN_CLEAR);
    add({5, 6}, L"South");
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    expectEntries({{L"1", kPalette[0]}, {L"2", kPalette[1]}});
}

TEST_F(LegendPicture, OfAPieWithoutSeriesIsWhite) {
    create(230, 220);
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    expectEntries({});
}

TEST_F(LegendPicture, SixteenthSliceHasTheColourOfTheFirst) {
    create(230, 220);
    add(std::vector<double>(17, 1.0));
    KorGraph_SetType(graph, KORGRAPH_PIE);
    open();
    for (int i = 0; i < 15; ++i) SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0);
    expectEntries({{L"16", kPalette[0]}, {L"17", kPalette[1]}});
}

TEST_F(LegendPicture, FollowsTheChart) {
    create(230, 220);
    add({1, 2}, L"North");
    open();
    add({1}, L"South");
    expectEntries({{L"North", RGB(0, 255, 0)}, {L"South", RGB(0, 0, 255)}});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    expectEntries({{L"1", kPalette[0]}, {L"2", kPalette[1]}});
    notify(GN_CLEAR);
    expectEntries({});
}

TEST_F(LegendPicture, LongNamesAreCutAtTheRight) {
    create(230, 220);
    add({1}, L"A name that is far too long for a legend of this width, really");
    open();
    expectEntries(
        {{L"A name that is far too long for a legend of this width, really", RGB(0, 255, 0)}});
}

// ---- Before the chart is attached -------------------------------------------------------------

class LegendAlone : public GraphTest {
protected:
    // Made by a host itself: no chart is attached.
    HWND createAlone() {
        create();
        showLegend({10, 5, 90, 90});  // registers the class
        host.pump();
        return CreateWindowExW(0, KORLEGEND_CLASS, L"alone", WS_CHILD | WS_VSCROLL, 240, 0, 100,
                               100, host.window(), nullptr, GetModuleHandleW(nullptr), nullptr);
    }
};

TEST_F(LegendAlone, ShowsItself) { EXPECT_TRUE(IsWindowVisible(createAlone())); }

TEST_F(LegendAlone, IsWhiteAndSetsNoScrollBarUp) {
    const HWND legend = createAlone();
    spy.watchAll({"SetScrollInfo", "SetScrollRange", "SetScrollPos"});
    InvalidateRect(legend, nullptr, TRUE);
    UpdateWindow(legend);
    EXPECT_EQ(spy.sequence(), "");
    const Picture picture = ReadWindow(legend);
    EXPECT_EQ(picture.count(RGB(255, 255, 255)), picture.width() * picture.height());
}

TEST_F(LegendAlone, ScrollingIsSurvived) {
    const HWND legend = createAlone();
    for (WPARAM request = 0; request < 10; ++request) {
        EXPECT_EQ(SendMessageW(legend, WM_VSCROLL, request, 0), 0);
        EXPECT_EQ(SendMessageW(legend, WM_HSCROLL, request, 0), 0);
    }
}

TEST_F(LegendAlone, OutlivesItsChartsRecord) {
    create(230, 220);
    add({1, 2}, L"North");
    const HWND legend = showLegend({10, 5, 160, 150});
    host.pump();
    SetParent(legend, host.window());
    DestroyWindow(graph);
    ASSERT_TRUE(IsWindow(legend));
    InvalidateRect(legend, nullptr, TRUE);
    UpdateWindow(legend);
    SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0);
    const Picture picture = ReadWindow(legend);
    EXPECT_EQ(picture.count(RGB(0, 255, 0)), 0) << "nothing of the chart is left";
}

}  // namespace
}  // namespace kortest

// A print lets other messages through: in its dialog, and where a printer driver waits.
#include "graph/output/printing_fixture.h"

namespace kortest {
namespace {

class PrintInterruption : public GuardedPrintingTest {
protected:
    void createWithData() {
        create();
        KorGraph_SetTitle(graph, L"Harvest");
        add({3, 5, 2, 8}, L"wheat");
        redraw();
        settle();
        transcript.clear();
    }

    // Those that say that nothing was taken.
    static bool takesData(UINT message) {
        return message == GM_ADDSERIES || message == GM_SETCATEGORIES;
    }
};

TEST_F(PrintInterruption, SecondPrintInsideTheDialogIsRefused) {
    createWithData();
    inside[kPrintDialog] = [this] { EXPECT_EQ(notify(GN_PRINT), 0); };
    print();
    EXPECT_EQ(linesOf({"PrintDlg", "StartDoc", "EndDoc", "DeleteDC"}),
              (Lines{"PrintDlg", "StartDoc", "EndDoc", "DeleteDC"}));
}

TEST_F(PrintInterruption, SecondPrintInsideTheJobIsRefused) {
    createWithData();
    for (const Function function : {kStartDocument, kStartPage, kEndPage, kEndDocument})
        inside[function] = [this] { notify(GN_PRINT); };
    print();
    EXPECT_EQ(linesOf({"PrintDlg", "StartDoc", "EndDoc", "DeleteDC"}),
              (Lines{"PrintDlg", "StartDoc", "EndDoc", "DeleteDC"}));
}

TEST_F(PrintInterruption, DataThatComesDuringTheDialogIsPrinted) {
    createWithData();
    KorGraph_SetType(graph, KORGRAPH_COLUMN);
    inside[kPrintDialog] = [this] { add({4, 4, 4, 4}, L"rye"); };
    print();
    EXPECT_GT(printed.count(colour(1)), 100);
}

TEST_F(PrintInterruption, SizeThatChangesDuringTheDialogStays) {
    createWithData();
    inside[kPrintDialog] = [this] { resize(120, 90); };
    print();
    EXPECT_EQ(record().rcPlot, (RECT{0, 0, 120, 90}));
    EXPECT_EQ(image().area(), (RECT{0, 0, 120, 90}));
}

TEST_F(PrintInterruption, MessagesCannotReachARecordThatStandsForThePage) {
    createWithData();
    const Picture before = image();
    inside[kEndPage] = [this] {
        for (UINT message = GM_ADDSERIES; message <= WM_USER + 6030; ++message)
            EXPECT_EQ(send(message), takesData(message) ? 1 : 0) << message;
        for (UINT code = GN_RESET; code <= GN_CLEAR; ++code) notify(code);
        PressAt(graph, 2, 60);
        ReleaseAt(graph, 2, 60);
        UpdateWindow(graph);
        send(WM_SIZE, 0, MAKELPARAM(50, 40));
    };
    print();
    redraw();
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(KorGraph_GetType(graph), KORGRAPH_LINE);
}

TEST_F(PrintInterruption, DataThatComesOnThePageIsRefused) {
    createWithData();
    inside[kEndPage] = [this] {
        EXPECT_EQ(add({4, 4, 4, 4}, L"rye"), 1);
        EXPECT_EQ(categories({L"a", L"b"}), 1);
    };
    print();
    EXPECT_EQ(record().seriesCount, 1);
    EXPECT_EQ(record().categoryCount, 0);
}

TEST_F(PrintInterruption, PaintThatComesOnThePageIsMadeUpFor) {
    createWithData();
    const Picture before = ReadWindow(graph);
    inside[kEndPage] = [this] {
        EXPECT_TRUE(GetUpdateRect(graph, nullptr, FALSE));
        const HDC dc = GetDC(graph);
        PatBlt(dc, 0, 0, 230, 130, BLACKNESS);  // what a menu over the window may leave
        ReleaseDC(graph, dc);
        UpdateWindow(graph);
        EXPECT_FALSE(GetUpdateRect(graph, nullptr, FALSE));
    };
    print();
    RECT waiting{};
    EXPECT_TRUE(GetUpdateRect(graph, &waiting, FALSE));
    EXPECT_EQ(waiting, ClientOf(graph));
    UpdateWindow(graph);
    EXPECT_TRUE(SamePicture(before, ReadWindow(graph)));
    UpdateWindow(graph);
    watchInvalidations();
    inside[kEndPage] = nullptr;
    print();
    EXPECT_EQ(invalidationsOf(graph).size(), 1u) << "the next print has missed nothing";
}

class PrintWithResize : public PrintInterruption, public ::testing::WithParamInterface<bool> {};

TEST_P(PrintWithResize, OnThePageIsFollowed) {
    createWithData();
    inside[kEndPage] = [this] {
        resize(120, 90);
        if (GetParam()) UpdateWindow(graph);
    };
    print();
    EXPECT_EQ(record().rcPlot, (RECT{0, 0, 120, 90}));
    EXPECT_EQ(bitmapSize().cx, 120);
    EXPECT_EQ(bitmapSize().cy, 92);
    EXPECT_TRUE(GetUpdateRect(graph, nullptr, FALSE));
    const Picture followed = image();
    resize(60, 50);
    resize(120, 90);
    EXPECT_TRUE(SamePicture(image(), followed));
}

TEST_F(PrintInterruption, HeightAloneThatChangesOnThePageIsFollowed) {
    createWithData();
    const LONG width = record().rcPlot.right;
    inside[kEndPage] = [this, width] { resize(width, 90); };
    print();
    EXPECT_EQ(record().rcPlot, (RECT{0, 0, width, 90}));
    EXPECT_EQ(bitmapSize().cy, 92);
}

INSTANTIATE_TEST_SUITE_P(Painted, PrintWithResize, ::testing::Bool());

// ---- The window goes --------------------------------------------------------------------------

class PrintWithoutWindow : public PrintInterruption, public ::testing::WithParamInterface<int> {};

TEST_P(PrintWithoutWindow, EndsAndLeavesNothingBehind) {
    RegisterGraphClass();
    WatchHandles(spy);
    createWithData();
    // What was made before settle() is not on the list; what goes with the chart is.
    inside[GetParam()] = [this] { destroy(); };
    print();
    const Lines jobs = linesOf({"StartDoc", "StartPage", "EndPage", "EndDoc"});
    if (GetParam() == kPrintDialog) {
        EXPECT_EQ(jobs, Lines{}) << "there is no chart any more";
    } else {
        EXPECT_EQ(jobs, (Lines{"StartDoc", "StartPage", "EndPage", "EndDoc"}));
    }
    EXPECT_EQ(pagesDeleted, 1);
    EXPECT_FALSE(IsWindow(graph));
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
    // The next chart prints.
    inside[GetParam()] = nullptr;
    createWithData();
    print();
    EXPECT_EQ(linesOf({"EndDoc"}).size(), 1u);
}

std::string NameOfFunction(const ::testing::TestParamInfo<int>& tested) {
    constexpr const char* kNames[] = {"PrintDlg", "StartDoc", "StartPage", "EndPage", "EndDoc"};
    return kNames[tested.param];
}

INSTANTIATE_TEST_SUITE_P(Inside, PrintWithoutWindow, ::testing::Range(0, 5), NameOfFunction);

TEST_F(PrintInterruption, WindowThatGoesInACancelledDialogLeavesNothingBehind) {
    createWithData();
    isChosen = FALSE;
    inside[kPrintDialog] = [this] { destroy(); };
    print();
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

TEST_F(PrintInterruption, LegendThatGoesWithTheWindowIsHarmless) {
    createWithData();
    const HWND legend = showLegend({5, 5, 90, 90});
    ASSERT_NE(legend, nullptr);
    inside[kEndPage] = [&] {
        UpdateWindow(legend);
        destroy();
    };
    print();
    EXPECT_FALSE(IsWindow(legend));
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

}  // namespace
}  // namespace kortest

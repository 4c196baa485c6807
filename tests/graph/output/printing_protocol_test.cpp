// Which functions a print calls, in which order and with what.
#include "graph/output/printing_fixture.h"

#include <cstring>

namespace kortest {
namespace {

const Lines kWholePrint = {"find PrintDlg",  "PrintDlg", "EnableWindow 0", "find StartDoc",
                           "find StartPage", "StartDoc", "StartPage",      "find EndDoc",
                           "find EndPage",   "EndPage",  "EndDoc",         "DeleteDC"};

INT_PTR CALLBACK LeaveToTheSystem(HWND, UINT, WPARAM, LPARAM) { return FALSE; }

class PrintProtocol : public PrintingTest {
protected:
    void createWithData() {
        create();
        add({3, 5, 2, 8});
        redraw();
        settle();
        transcript.clear();
    }

    // kWholePrint without the calls of some functions.
    static Lines printWithout(const std::set<std::string>& calls) {
        Lines lines;
        for (const std::string& line : kWholePrint)
            if (!calls.count(line)) lines.push_back(line);
        return lines;
    }

    template <typename Value>
    static Value at(const std::vector<BYTE>& bytes, size_t offset) {
        Value value{};
        std::memcpy(&value, bytes.data() + offset, sizeof value);
        return value;
    }
};

TEST_F(PrintProtocol, CallsEachFunctionInOrder) {
    createWithData();
    print();
    EXPECT_EQ(transcript, kWholePrint);
    EXPECT_EQ(printAnswer, 0);
}

TEST_F(PrintProtocol, ActsOnlyInsideANotification) {
    createWithData();
    EXPECT_EQ(send(GN_PRINT), 0);
    EXPECT_EQ(transcript, Lines{});
}

TEST_F(PrintProtocol, AsksWithAnEmptyRecordOwnedByTheChart) {
    createWithData();
    print();
    const size_t expectedSize = sizeof(void*) == 4 ? 68 : 104;
    ASSERT_EQ(dialogRecord.size(), expectedSize);
    EXPECT_EQ(at<DWORD>(dialogRecord, 0), expectedSize);
    EXPECT_EQ(at<HWND>(dialogRecord, sizeof(void*)), graph);
    for (size_t offset = 2 * sizeof(void*); offset < expectedSize; ++offset)
        EXPECT_EQ(dialogRecord[offset], 0) << offset;
}

TEST_F(PrintProtocol, NamesTheDocumentGraph) {
    createWithData();
    print();
    EXPECT_EQ(documentName, L"Graph");
    ASSERT_EQ(document.size(), sizeof(void*) == 4 ? 20u : 40u);
    EXPECT_EQ(at<DWORD>(document, 0), document.size());
    for (size_t offset = 2 * sizeof(void*); offset < document.size(); ++offset)
        EXPECT_EQ(document[offset], 0) << offset;
}

TEST_F(PrintProtocol, DrawsBetweenTheStartAndTheEndOfThePage) {
    createWithData();
    std::string seen;
    spy.watch("Polyline");
    inside[kStartPage] = [&] { spy.clearCalls(); };
    inside[kEndPage] = [&] { seen = spy.sequence(); };
    print();
    EXPECT_NE(seen.find("Polyline"), std::string::npos);
}

TEST_F(PrintProtocol, CancelledDialogChangesNothing) {
    createWithData();
    isChosen = FALSE;
    fontHeights.clear();
    const Picture before = image();
    print();
    EXPECT_EQ(transcript, (Lines{"find PrintDlg", "PrintDlg"}));
    EXPECT_TRUE(IsWindowEnabled(graph));
    EXPECT_TRUE(fontHeights.empty());
    EXPECT_TRUE(SamePicture(before, image()));
}

TEST_F(PrintProtocol, DialogWithoutAPrinterChangesNothing) {
    createWithData();
    givesDC = false;
    print();
    EXPECT_EQ(transcript, (Lines{"find PrintDlg", "PrintDlg"}));
    EXPECT_TRUE(IsWindowEnabled(graph));
}

TEST_F(PrintProtocol, PrintsAgainAfterACancelledDialog) {
    createWithData();
    isChosen = FALSE;
    print();
    isChosen = TRUE;
    transcript.clear();
    print();
    EXPECT_EQ(transcript, kWholePrint);
}

TEST_F(PrintProtocol, WindowStaysDisabledUntilTheHostEnablesIt) {
    createWithData();
    print();
    host.pump();
    EXPECT_FALSE(IsWindowEnabled(graph));
    notify(GN_REDRAW);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    EXPECT_FALSE(IsWindowEnabled(graph));
    EnableWindow(graph, TRUE);
    transcript.clear();
    print();
    EXPECT_EQ(transcript, kWholePrint) << "and it can print again";
}

TEST_F(PrintProtocol, PrintsWhileTheWindowIsDisabled) {
    createWithData();
    print();
    transcript.clear();
    print();
    EXPECT_EQ(transcript, kWholePrint);
}

TEST_F(PrintProtocol, TellsTheParentNothing) {
    createWithData();
    print();
    host.pump();
    EXPECT_EQ(host.transcript(), Lines{});
}

class PrintResults : public PrintProtocol, public ::testing::WithParamInterface<int> {};

TEST_P(PrintResults, AreIgnored) {
    createWithData();
    jobResult = GetParam();
    print();
    EXPECT_EQ(transcript, kWholePrint);
    EXPECT_FALSE(IsWindowEnabled(graph));
}

INSTANTIATE_TEST_SUITE_P(Values, PrintResults, ::testing::Values(0, -1, 1), [](const auto& tested) {
    return tested.param < 0 ? "Error" : tested.param > 0 ? "Success" : "Failure";
});

class PrintWithout : public PrintProtocol, public ::testing::WithParamInterface<const char*> {};

TEST_P(PrintWithout, AJobFunctionCallsTheOthers) {
    createWithData();
    missingFunctions = {GetParam()};
    print();
    EXPECT_EQ(transcript, printWithout({GetParam()}));
    EXPECT_EQ(pagesDeleted, 1);
}

INSTANTIATE_TEST_SUITE_P(Functions, PrintWithout,
                         ::testing::Values("StartDoc", "StartPage", "EndPage", "EndDoc"),
                         [](const auto& tested) { return std::string(tested.param); });

TEST_F(PrintProtocol, WithoutADialogFunctionNothingHappens) {
    createWithData();
    missingFunctions = {"PrintDlg"};
    print();
    EXPECT_EQ(transcript, Lines{"find PrintDlg"});
    EXPECT_TRUE(IsWindowEnabled(graph));
}

TEST_F(PrintProtocol, ChartThatCouldNotBeFinishedPrintsWhatItHas) {
    createWithData();
    const HWND whole = graph;
    graph = CreateGraphWindow(nullptr, WS_POPUP, {0, 0, 60, 60}, GetModuleHandleW(nullptr));
    add({1, 2, 3});
    transcript.clear();
    print();
    EXPECT_EQ(transcript, printWithout({"EnableWindow 0"}));
    EXPECT_GT(printed.count(RGB(0, 0, 0)), 100) << "axes at least";
    DestroyWindow(graph);
    graph = whole;
}

TEST_F(PrintProtocol, UnknownChartTypeGivesAnEmptyPage) {
    createWithData();
    send(GM_SETTYPE, 0, 9);
    transcript.clear();
    print();
    EXPECT_EQ(transcript, kWholePrint);
    EXPECT_EQ(printed.count(kPaper), printer.width * printer.height);
}

TEST_F(PrintProtocol, DialogResourceIsThere) {
    const HWND dialog = CreateDialogParamW(LibraryModule(), MAKEINTRESOURCEW(4050), host.window(),
                                           &LeaveToTheSystem, 0);
    ASSERT_NE(dialog, nullptr);
    EXPECT_EQ(TextOf(dialog), L"Graph Print");
    EXPECT_EQ(TextOf(GetDlgItem(dialog, 4060)), L"&Cancel");
    EXPECT_EQ(TextOf(GetWindow(dialog, GW_CHILD)), L"Printing document....");
    RECT expected = {0, 0, 102, 59};
    MapDialogRect(dialog, &expected);
    EXPECT_EQ(ClientOf(dialog), expected);
    DestroyWindow(dialog);
}

}  // namespace
}  // namespace kortest

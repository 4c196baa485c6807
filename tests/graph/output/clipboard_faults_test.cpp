// GM_COPY when something fails, and what it gives back.
#include "graph/output/clipboard_fixture.h"

namespace kortest {
namespace {

// A black picture, with its head, of a chart of 101 by 50 pixels.
void ExpectBlackDib() {
    const ColourDib dib = ParseDib(ReadClipboard());
    EXPECT_EQ(dib.header.biWidth, 104);
    EXPECT_EQ(dib.header.biHeight, 52);
    ASSERT_EQ(dib.colours.size(), 19u);
    EXPECT_EQ(dib.colours[1], RGB(255, 255, 255));
    EXPECT_EQ(dib.picture.count(RGB(0, 0, 0)), 104 * 52);
}

class ClipboardFaults : public GraphTest {
protected:
    ClipboardFaults() {
        PutText(L"before");
        create(101, 50);
        spy.watchAll({"LocalAlloc", "LocalFree", "GlobalAlloc", "GlobalLock", "GlobalFree",
                      "CreateDIBSection", "OpenClipboard", "EmptyClipboard", "SetClipboardData",
                      "CloseClipboard", "SetLastError"});
        spy.clearCalls();
    }

    // The clipboard was emptied and given nothing.
    void expectNullDib() {
        EXPECT_EQ(spy.callsOf("SetClipboardData").size(), 1u);
        if (spy.count("SetClipboardData") == 0) return;
        const ImportCall call = spy.callsOf("SetClipboardData").at(0);
        EXPECT_EQ(NumberAt(call, 0), static_cast<DWORD>(CF_DIB));
        EXPECT_EQ(call.arguments.at(1), 0u);
        EXPECT_EQ(spy.count("EmptyClipboard"), 1);
        EXPECT_EQ(spy.count("CloseClipboard"), 1);
        EXPECT_EQ(ClipboardText(), L"");
    }

    ClipboardTurn turn;
};

TEST_F(ClipboardFaults, WithoutMemoryTheClipboardIsEmptied) {
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(send(GM_COPY), 0);
    EXPECT_EQ(spy.sequence(),
              "LocalAlloc! SetLastError OpenClipboard EmptyClipboard SetClipboardData "
              "CloseClipboard");
    EXPECT_EQ(NumberAt(spy.callsOf("SetLastError").at(0), 0), 14u);
    expectNullDib();
}

TEST_F(ClipboardFaults, WithoutMemoryForTheMovableBlockToo) {
    spy.failNth("GlobalAlloc", 1);
    EXPECT_EQ(send(GM_COPY), 0);
    EXPECT_EQ(spy.count("LocalFree"), 1);
    expectNullDib();
}

TEST_F(ClipboardFaults, ABlockThatCannotBeWrittenIsFreed) {
    spy.failNth("GlobalLock", 1);
    EXPECT_EQ(send(GM_COPY), 0);
    ASSERT_EQ(spy.count("GlobalFree"), 1);
    EXPECT_EQ(spy.callsOf("GlobalFree").at(0).arguments.at(0),
              spy.callsOf("GlobalAlloc").at(0).result);
    EXPECT_EQ(spy.count("LocalFree"), 1);
    expectNullDib();
}

TEST_F(ClipboardFaults, WithoutASectionTheBitmapIsBlack) {
    spy.failNth("CreateDIBSection", 1);
    EXPECT_EQ(send(GM_COPY), 0);
    ExpectBlackDib();
}

TEST_F(ClipboardFaults, WithoutADcTheBitmapIsBlack) {
    spy.failNth("CreateCompatibleDC", 1);
    EXPECT_EQ(send(GM_COPY), 0);
    ExpectBlackDib();
}

TEST_F(ClipboardFaults, ABlockThatIsNotTakenIsFreed) {
    spy.failNth("SetClipboardData", 1);
    EXPECT_EQ(send(GM_COPY), 0);
    ASSERT_EQ(spy.count("GlobalFree"), 1);
    EXPECT_EQ(spy.callsOf("GlobalFree").at(0).arguments.at(0),
              spy.callsOf("GlobalAlloc").at(0).result);
}

TEST_F(ClipboardFaults, ATakenBlockIsTheClipboards) {
    send(GM_COPY);
    EXPECT_EQ(spy.count("GlobalFree"), 0);
    EXPECT_EQ(spy.count("LocalFree"), 1) << "what was copied from";
}

TEST_F(ClipboardFaults, AClipboardInOtherHandsStaysAsItIs) {
    {
        ClipboardHeldElsewhere held;
        EXPECT_EQ(send(GM_COPY), 0);
    }
    EXPECT_EQ(spy.callsOf("OpenClipboard").at(0).result, 0u);
    EXPECT_EQ(spy.count("EmptyClipboard"), 0);
    EXPECT_EQ(spy.count("CloseClipboard"), 0) << "it is not the chart's to close";
    EXPECT_EQ(spy.count("GlobalFree"), 1);
    EXPECT_EQ(ClipboardText(), L"before");
    send(GM_COPY);
    EXPECT_EQ(ParseDib(ReadClipboard()).header.biWidth, 104) << "and afterwards it works again";
}

TEST_F(ClipboardFaults, EveryHandleIsGivenBack) {
    WatchHandles(spy);
    for (const char* const failing : {"", "CreateCompatibleDC", "CreateDIBSection", "BitBlt"}) {
        spy.clearCalls();
        if (*failing) spy.watch(failing);
        if (*failing) spy.failNth(failing, 1);
        send(GM_COPY);
        EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{}) << failing;
    }
}

// ---- Charts that could not be finished --------------------------------------------------------

class ClipboardOfAnUnfinishedChart : public GuardedGraphTest {
protected:
    void createUnfinished(HWND parent, DWORD style) {
        RegisterGraphClass();
        graph = CreateGraphWindow(parent, style, {0, 0, 101, 50}, GetModuleHandleW(nullptr));
        ASSERT_NE(graph, nullptr);
    }

    ClipboardTurn turn;
};

TEST_F(ClipboardOfAnUnfinishedChart, WithoutAParentIsAHeadAlone) {
    PutText(L"before");
    createUnfinished(nullptr, WS_POPUP);
    EXPECT_EQ(send(GM_COPY), 0);
    const Bytes bytes = ReadClipboard();
    EXPECT_EQ(bytes.size(), 116u);
    EXPECT_EQ(ParseDib(bytes).header.biHeight, 0) << "it does not know its window";
    DestroyWindow(graph);
}

TEST_F(ClipboardOfAnUnfinishedChart, WithoutAnImageIsBlack) {
    spy.failNth("CreateCompatibleDC", 1);
    createUnfinished(host.window(), WS_CHILD | WS_VISIBLE);
    EXPECT_EQ(send(GM_COPY), 0);
    ExpectBlackDib();
}

class GuardedClipboard : public GuardedGraphTest {
protected:
    ClipboardTurn turn;
};

TEST_F(GuardedClipboard, OfManySizesStaysInsideTheBlocks) {
    create();
    const int before = heap->live();
    for (int size = 0; size < 9; ++size) {
        resize(40 + size, 30 + 2 * size);
        send(GM_COPY);
        EXPECT_EQ(heap->live(), before) << heap->liveReport();
    }
}

}  // namespace
}  // namespace kortest

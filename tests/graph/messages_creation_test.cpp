// The class, creation and destruction, creation that fails half-way.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphCreation : public GraphTest {
protected:
    // A chart straight from the class, without a look at what came out.
    void createAnyhow() {
        RegisterGraphClass();
        graph = CreateGraphWindow(host.window(), WS_CHILD | WS_VISIBLE, {0, 0, 230, 130},
                                  GetModuleHandleW(nullptr));
    }
};

TEST_F(GraphCreation, ClassHasItsAttributes) {
    EXPECT_NE(RegisterGraphControl(GetModuleHandleW(nullptr)), 0u);
    WNDCLASSW attributes{};
    ASSERT_TRUE(
        GetClassInfoW(GetModuleHandleW(nullptr), L"KORVANE Corporation GraphControl", &attributes));
    EXPECT_EQ(attributes.style, UINT{CS_HREDRAW | CS_VREDRAW});
    EXPECT_EQ(attributes.cbClsExtra, 0);
    EXPECT_EQ(attributes.cbWndExtra, 0);
    EXPECT_EQ(attributes.hIcon, nullptr);
    EXPECT_EQ(attributes.hCursor, nullptr);
    EXPECT_EQ(attributes.hbrBackground, nullptr);
    EXPECT_EQ(attributes.lpszMenuName, nullptr);
}

TEST_F(GraphCreation, ClassIsRegisteredOnce) {
    spy.watch("RegisterClassW");
    EXPECT_NE(RegisterGraphControl(GetModuleHandleW(nullptr)), 0u);
    EXPECT_EQ(RegisterGraphControl(GetModuleHandleW(nullptr)), 1u);
    EXPECT_EQ(spy.count("RegisterClassW"), 1);
}

TEST_F(GraphCreation, ClassThatCannotBeRegisteredGivesZero) {
    spy.watch("RegisterClassW");
    spy.failNth("RegisterClassW", 1);
    EXPECT_EQ(RegisterGraphControl(GetModuleHandleW(nullptr)), 0u);
}

TEST_F(GraphCreation, ClassNameIsGivenOut) {
    EXPECT_STREQ(GetGraphControlClassName(), L"KORVANE Corporation GraphControl");
    EXPECT_EQ(GetGraphControlClassName(), GetGraphControlClassName());
}

TEST_F(GraphCreation, MakesAHiddenTooltipInTheParent) {
    create(200, 100, 30, 40);
    EXPECT_EQ(GetParent(tip), host.window());
    wchar_t name[64]{};
    GetClassNameW(tip, name, 64);
    EXPECT_STREQ(name, L"KORVANE Corporation ToolTipControl");
    EXPECT_EQ(GetWindowLongW(tip, GWL_STYLE) & ~WS_CLIPSIBLINGS, LONG{WS_CHILD});
    EXPECT_FALSE(IsWindowVisible(tip));
    EXPECT_EQ(PlaceIn(host.window(), tip), (RECT{0, 0, 25, 15}));
    EXPECT_EQ(TextOf(tip), L"");
}

TEST_F(GraphCreation, DrawsTextsTransparently) {
    create();
    EXPECT_EQ(GetBkMode(imageDC), TRANSPARENT);
}

TEST_F(GraphCreation, TellsTheParentNothing) {
    create();
    add({1, 2, 3});
    send(GM_SETTYPE, 0, KORGRAPH_PIE);
    showLegend({10, 10, 60, 60});
    tap(100, 60);
    tap(2, 2);
    send(GM_SETZOOM, 0, 3);
    host.pump();
    EXPECT_EQ(host.transcript(), Lines{});
}

TEST_F(GraphCreation, TooltipOutlivesTheChart) {
    create();
    DestroyWindow(graph);
    EXPECT_TRUE(IsWindow(tip));
    const ToolTipRequest request = {L"alone", 10, 60, 300};
    KorToolTip_Show(tip, &request);
    EXPECT_TRUE(IsWindowVisible(tip));
}

TEST_F(GraphCreation, EndGivesEveryHandleBack) {
    RegisterGraphClass();
    WatchHandles(spy);
    create(200, 100);
    add({1, 2, 3}, L"one");
    categories({L"a", L"b", L"c"});
    for (LPARAM type = 0; type <= 4; ++type) {
        send(GM_SETTYPE, 0, type);
        UpdateWindow(graph);
    }
    send(GM_SETBKCOLOR, 0, RGB(1, 2, 3));
    showLegend({20, 10, 90, 80});
    host.pump();
    destroy();
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

class GraphCreationHeap : public GuardedGraphTest {};

TEST_F(GraphCreationHeap, EndFreesEveryBlock) {
    create();
    const int before = heap->live();
    for (int round = 0; round < 3; ++round) {
        destroy();
        spy.clearCalls();
        create();
        send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
        add({1, 2, 3}, L"one");
        add({4, 5});
        categories({L"a", nullptr, L"c"});
        for (const UINT setter : {GM_SETTITLE, GM_SETXTITLE, GM_SETYTITLE}) {
            send(setter, 0, reinterpret_cast<LPARAM>(L"text"));
            send(setter, 0, reinterpret_cast<LPARAM>(L"another text"));
        }
        showLegend({10, 10, 90, 80});
        notify(GN_LIVEUPDATE, 5);
        host.pump();
    }
    destroy();
    EXPECT_LT(heap->live(), before) << heap->liveReport();
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

// ---- Failures ---------------------------------------------------------------------------------

TEST_F(GraphCreation, WithoutARecordTheWindowExistsAndOnlyPassesMessagesOn) {
    RegisterGraphClass();
    spy.watch("malloc");
    spy.failNth("malloc", 1);
    createAnyhow();
    ASSERT_NE(graph, nullptr);
    EXPECT_EQ(GetWindowLongPtrW(graph, GWLP_USERDATA), 0);
    EXPECT_EQ(GetDlgItem(host.window(), KORTOOLTIP_ID), nullptr);
    DWORD options = 77;
    EXPECT_EQ(send(GM_GETOPTIONS, 0, reinterpret_cast<LPARAM>(&options)), 0);
    EXPECT_EQ(options, 77u) << "nothing is stored";
    spy.watch("DefWindowProcW");
    spy.clearCalls();
    for (UINT message = GM_ADDSERIES; message <= WM_USER + 6030; ++message)
        EXPECT_EQ(send(message), 0) << message;
    EXPECT_EQ(spy.count("DefWindowProcW"), 31);
    for (UINT code = GN_RESET; code <= GN_CLEAR; ++code) notify(code);
    for (const UINT message : {WM_LBUTTONDOWN, WM_LBUTTONUP, WM_PAINT, WM_SIZE, WM_ERASEBKGND})
        send(message);
    DestroyWindow(graph);
}

TEST_F(GraphCreation, WithoutAParentTheRecordStays) {
    RegisterGraphClass();
    graph = CreateGraphWindow(nullptr, WS_POPUP, {0, 0, 200, 100}, GetModuleHandleW(nullptr));
    ASSERT_NE(graph, nullptr);
    EXPECT_EQ(KorGraph_GetOptions(graph), kAllOptions);
    EXPECT_EQ(KorGraph_GetZoom(graph), 2);
    EXPECT_EQ(spy.count("CreateCompatibleDC"), 0) << "nothing more is built";
    EXPECT_EQ(add({1, 2, 3}), 0);
    EXPECT_EQ(colour(0), RGB(0, 255, 0));
    send(GM_SETTYPE, 0, KORGRAPH_COLUMN);
    resize(150, 90);
    tap(50, 50);
    redraw();
    InvalidateRect(graph, nullptr, FALSE);
    EXPECT_EQ(send(WM_PAINT), 0);
    EXPECT_EQ(showLegend({10, 10, 60, 60}), nullptr);
    EXPECT_EQ(notify(GN_PROPERTIES), 0) << "no sheet, which would wait for its user";
    DestroyWindow(graph);
}

TEST_F(GraphCreation, WithoutAnImageTheRestStillAnswers) {
    RegisterGraphClass();
    spy.failNth("CreateCompatibleDC", 1);
    createAnyhow();
    ASSERT_NE(graph, nullptr);
    EXPECT_EQ(KorGraph_GetOptions(graph), kAllOptions);
    EXPECT_EQ(GetDlgItem(host.window(), KORTOOLTIP_ID), nullptr) << "creation stopped before";
    EXPECT_EQ(add({1, 2, 3}), 0);
    EXPECT_EQ(range(KORGRAPH_X).second, 0 + 4.0);
    for (LPARAM type = 0; type <= 4; ++type) send(GM_SETTYPE, 0, type);
    resize(150, 90);
    host.pump();
    tap(50, 50);
    DestroyWindow(graph);
}

TEST_F(GraphCreation, WithoutATooltipClassTheChartStillWorks) {
    RegisterGraphClass();
    spy.watch("RegisterClassW");
    spy.failAlways("RegisterClassW");
    createAnyhow();
    ASSERT_NE(graph, nullptr);
    EXPECT_EQ(GetDlgItem(host.window(), KORTOOLTIP_ID), nullptr);
    send(GM_TOGGLEOPTIONS, 0, kAllOptions);
    add({1, 2, 3, 4, 5, 6, 7, 8, 10});
    PressAt(graph, 95, 75);
    ReleaseAt(graph, 95, 75);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 10.0}));
    EXPECT_EQ(showLegend({10, 10, 60, 60}), nullptr) << "its class cannot be registered either";
    spy.stopFailing("RegisterClassW");
}

TEST_F(GraphCreation, CreationAnswersOneForItsFailuresAndZeroElse) {
    RegisterGraphClass();
    createAnyhow();
    const auto proc = reinterpret_cast<WNDPROC>(GetWindowLongPtrW(graph, GWLP_WNDPROC));
    DestroyWindow(graph);
    // A window of another class, so that the procedure meets an empty slot.
    const auto blank = [this] {
        return CreateWindowExW(0, L"STATIC", L"", WS_CHILD, 0, 0, 50, 50, host.window(), nullptr,
                               nullptr, nullptr);
    };
    CREATESTRUCTW creation{};
    creation.hInstance = GetModuleHandleW(nullptr);
    creation.hwndParent = host.window();
    const auto answer = [&](const CREATESTRUCTW& parameters) {
        const HWND window = blank();
        SetWindowLongPtrW(window, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(proc));
        const LRESULT result =
            SendMessageW(window, WM_CREATE, 0, reinterpret_cast<LPARAM>(&parameters));
        DestroyWindow(window);
        return result;
    };
    EXPECT_EQ(answer(creation), 0);
    CREATESTRUCTW noInstance = creation;
    noInstance.hInstance = nullptr;
    EXPECT_EQ(answer(noInstance), 1);
    CREATESTRUCTW noParent = creation;
    noParent.hwndParent = nullptr;
    EXPECT_EQ(answer(noParent), 1);
    spy.failNth("CreateCompatibleDC", 1);
    EXPECT_EQ(answer(creation), 1);
    spy.watch("malloc");
    spy.failNth("malloc", 1);
    EXPECT_EQ(answer(creation), 1);
}

// ---- The palette ------------------------------------------------------------------------------

class GraphPaletteChoice : public GraphTest {
protected:
    void createWithDepth(ULONG_PTR bitsPerPixel) {
        spy.watch("GetDeviceCaps");
        spy.replace("GetDeviceCaps", [=, this](ULONG_PTR* arguments) {
            if (static_cast<int>(arguments[1]) == BITSPIXEL) return bitsPerPixel;
            return spy.callReal("GetDeviceCaps", arguments);
        });
        create();
        spy.restore("GetDeviceCaps");
    }
};

TEST_F(GraphPaletteChoice, FourBitsAreGrey) {
    createWithDepth(4);
    for (int i = 0; i < 17; ++i) add({1});
    constexpr COLORREF kGreys[] = {0xC0C0C0, 0x000000, 0x808080};
    for (int i = 0; i < 16; ++i) EXPECT_EQ(colour(i), kGreys[i % 3]) << i;
    send(GM_SETTYPE, 0, KORGRAPH_PIE);
    EXPECT_EQ(colour(0), 0x808080u);
    EXPECT_EQ(colour(1), 0xC0C0C0u);
    EXPECT_EQ(colour(2), 0x000000u);
}

TEST_F(GraphPaletteChoice, FiveBitsAreColoured) {
    createWithDepth(5);
    add({1});
    EXPECT_EQ(colour(0), RGB(0, 255, 0));
}

TEST_F(GraphPaletteChoice, LastCreatedChartDecidesForAll) {
    create();
    add({1});
    const HWND first = graph;
    createWithDepth(1);
    graph = first;
    EXPECT_EQ(colour(0), RGB(0, 255, 0)) << "a series keeps its colour";
    add({1});
    EXPECT_EQ(colour(1), 0x000000u);
    send(GM_SETTYPE, 0, KORGRAPH_PIE);
    EXPECT_EQ(colour(0), 0x808080u);
}

}  // namespace
}  // namespace kortest

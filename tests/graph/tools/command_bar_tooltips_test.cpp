// The tooltip texts: what the bar is handed, who may be sent the message, how the first text
// follows the chart.
#include "graph/tools/command_bar_fixture.h"

namespace kortest {
namespace {

class CommandBarToolTips : public CommandBarTest {
protected:
    // What a bar of the test's own was handed; the message ends there.
    struct Handed {
        int count = 0;
        const wchar_t* const* texts = nullptr;
        std::vector<std::wstring> atOnce;
    };

    // A toolbar that answers the message and has not said so yet.
    void createSilentBar() {
        bar = CreatePlainToolbar(host.window());
        SetPropW(bar, kProperty, this);
        toolbarProc_ = reinterpret_cast<WNDPROC>(
            SetWindowLongPtrW(bar, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&barProc)));
    }

    void createOwnBar() {
        createSilentBar();
        SetPropW(bar, kAsksForTexts, bar);
    }

    Handed handed;
    int times = 0;

private:
    static constexpr wchar_t kProperty[] = L"tooltip test";
    static constexpr wchar_t kAsksForTexts[] = L"korcontrols tooltips";

    static LRESULT CALLBACK barProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
        auto* test = static_cast<CommandBarToolTips*>(GetPropW(window, kProperty));
        const WNDPROC original = test->toolbarProc_;
        if (message == kSetToolTips) return test->take(wParam, lParam);
        if (message == WM_NCDESTROY) {
            RemovePropW(window, kProperty);
            RemovePropW(window, kAsksForTexts);
        }
        return CallWindowProcW(original, window, message, wParam, lParam);
    }

    LRESULT take(WPARAM count, LPARAM texts) {
        ++times;
        handed.count = static_cast<int>(count);
        handed.texts = reinterpret_cast<const wchar_t* const*>(texts);
        for (int i = 0; i < handed.count; ++i)
            handed.atOnce.push_back(handed.texts[i] ? handed.texts[i] : L"(null)");
        return 1;
    }

    WNDPROC toolbarProc_ = nullptr;
};

TEST_F(CommandBarToolTips, AreHandedOverFilled) {
    createOwnBar();
    setUp();
    EXPECT_EQ(times, 1);
    EXPECT_EQ(handed.atOnce,
              (std::vector<std::wstring>{L"Show Graph", L"Graph Properties", L"Graph Zoom Level",
                                         L"Graph Type", L"Line"}));
}

// A bar reads the array whenever it shows a tooltip, so the array itself must change.
TEST_F(CommandBarToolTips, FirstOneFollowsTheChart) {
    createOwnBar();
    setUp();
    create();
    ShowWindow(graph, SW_HIDE);
    EXPECT_STREQ(handed.texts[0], L"Show Graph");
    ShowWindow(graph, SW_SHOW);
    EXPECT_STREQ(handed.texts[0], L"Show Grid");
    ShowWindow(graph, SW_HIDE);
    EXPECT_STREQ(handed.texts[0], L"Show Graph");
    EXPECT_STREQ(handed.texts[1], L"Graph Properties") << "the others stay";
}

TEST_F(CommandBarToolTips, FirstOneIsForTheHiddenChartAfterASetUp) {
    createOwnBar();
    create();
    setUp();
    EXPECT_STREQ(handed.texts[0], L"Show Graph");
}

TEST_F(CommandBarToolTips, ShowingIsDefaultProcessingToo) {
    create();
    spy.watch("DefWindowProcW");
    ShowWindow(graph, SW_HIDE);
    ShowWindow(graph, SW_SHOW);
    EXPECT_EQ(defaultCalls(WM_SHOWWINDOW), 2);
}

TEST_F(CommandBarToolTips, AreOneArrayForAllBars) {
    createOwnBar();
    setUp();
    const auto first = handed.texts;
    setUp();
    EXPECT_EQ(handed.texts, first);
}

// The toolbar's own procedure takes the message for another and reads the count as a pointer.
TEST_F(CommandBarToolTips, APlainToolbarIsSpared) {
    bar = CreatePlainToolbar(host.window());
    watchMessages();
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(messages, (Lines{"TB_ADDBITMAP 3", "TB_ADDBUTTONS 3", "TB_INSERTBUTTON 3",
                               "TB_INSERTBUTTON 3"}));
    EXPECT_EQ(TextOf(zoom), L"100%");
    EXPECT_GE(PlaceIn(bar, type).left, PlaceIn(bar, zoom).right);
}

// It may have been subclassed for anything, and pass the message on.
TEST_F(CommandBarToolTips, AToolbarWithAnotherProcedureIsSparedToo) {
    createSilentBar();
    watchMessages();
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(times, 0);
    EXPECT_EQ(messages.back(), "TB_INSERTBUTTON 3");
}

TEST_F(CommandBarToolTips, AWindowOfAnotherClassIsTold) {
    bar = host.window();
    watchMessages();
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(messages.back(), "tooltips 5");
}

TEST_F(CommandBarToolTips, AreLoadedIntoEightyCharacters) {
    createOwnBar();
    create();
    ShowWindow(graph, SW_HIDE);
    spy.watch("LoadStringW");
    setUp();
    ShowWindow(graph, SW_SHOW);
    std::vector<DWORD> ids;
    for (const ImportCall& call : spy.callsOf("LoadStringW")) {
        ids.push_back(NumberAt(call, 1));
        EXPECT_EQ(NumberAt(call, 3), 80u) << ids.back();
    }
    EXPECT_EQ(ids, (std::vector<DWORD>{1, 2, 3, 4, 5, 10}));
}

TEST_F(CommandBarToolTips, WithoutStringsTheTextsAreEmpty) {
    createOwnBar();
    spy.watch("LoadStringW");
    spy.failAlways("LoadStringW");
    setUp();
    EXPECT_EQ(handed.atOnce, std::vector<std::wstring>(5, L""));
}

TEST_F(CommandBarToolTips, StringTable) {
    const wchar_t* const expected[] = {L"Show Graph",
                                       L"Graph Properties",
                                       L"Graph Zoom Level",
                                       L"Graph Type",
                                       L"Line",
                                       L"Bar",
                                       L"Column",
                                       L"Pie",
                                       L"Legend",
                                       L"Show Grid"};
    UINT id = 1;
    for (const wchar_t* const text : expected) {
        wchar_t loaded[80] = {};
        LoadStringW(spy.module(), id++, loaded, 80);
        EXPECT_STREQ(loaded, text);
    }
}

// ---- The desktop host's bar -------------------------------------------------------------------

class CommandBarOfAHost : public CommandBarTest {
protected:
    CommandBarOfAHost() {
        createBar();
        setUp();
    }
};

TEST_F(CommandBarOfAHost, ShowsTheTextsOverButtonsAndCombos) {
    EXPECT_EQ(toolTipOf(kShowCommand), L"Show Graph");
    EXPECT_EQ(toolTipOf(kPropertiesCommand), L"Graph Properties");
    EXPECT_EQ(toolTipOf(zoom), L"Graph Zoom Level");
    EXPECT_EQ(toolTipOf(type), L"Graph Type");
    EXPECT_EQ(toolTipOf(999), L"-") << "no such button";
}

TEST_F(CommandBarOfAHost, KnowsTheCombosAsTools) {
    const auto window = reinterpret_cast<HWND>(SendMessageW(bar, TB_GETTOOLTIPS, 0, 0));
    ASSERT_NE(window, nullptr);
    EXPECT_EQ(SendMessageW(window, TTM_GETTOOLCOUNT, 0, 0), 4) << "two buttons, two combo boxes";
}

TEST_F(CommandBarOfAHost, ReadsTheFirstTextAnew) {
    create();
    ShowWindow(graph, SW_HIDE);
    ShowWindow(graph, SW_SHOW);
    EXPECT_EQ(toolTipOf(kShowCommand), L"Show Grid");
}

TEST_F(CommandBarOfAHost, HasNoTextBeyondTheArray) {
    std::vector<TBBUTTON> more(6, HostButtons()[0]);
    for (size_t i = 0; i < more.size(); ++i) more[i].idCommand = 600 + static_cast<int>(i);
    createBar();
    setUp(more);
    EXPECT_EQ(toolTipOf(604), L"Line");
    EXPECT_EQ(toolTipOf(605), L"-");
    EXPECT_EQ(toolTipOf(zoom), L"-");
}

TEST_F(CommandBarOfAHost, CanBeTakenItsTexts) {
    SendMessageW(bar, kSetToolTips, 5, 0);
    EXPECT_EQ(toolTipOf(kShowCommand), L"-");
}

}  // namespace
}  // namespace kortest

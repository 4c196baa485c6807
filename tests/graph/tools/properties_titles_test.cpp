// The page of titles: what it shows, and what OK sends.
#include "graph/tools/properties_fixture.h"

namespace kortest {
namespace {

class TitlesPage : public PropertiesTest {
protected:
    void typeAndPressOk(const std::vector<std::pair<int, std::wstring>>& texts) {
        openSheet([&](HWND sheet) {
            const HWND page = ShowPage(sheet, kTitlesPage);
            for (const auto& [edit, text] : texts) TypeInto(page, edit, text);
            PressOk(sheet);
        });
    }
};

TEST_F(TitlesPage, ShowsTheTitles) {
    createRecorded();
    KorGraph_SetTitle(graph, L"Sunspots");
    KorGraph_SetYTitle(graph, L"Number");
    openSheet([](HWND sheet) {
        const HWND page = ShowPage(sheet, kTitlesPage);
        EXPECT_EQ(TextIn(page, kTitleEdit), L"Sunspots");
        EXPECT_EQ(TextIn(page, kXTitleEdit), L"") << "no title";
        EXPECT_EQ(TextIn(page, kYTitleEdit), L"Number");
    });
}

TEST_F(TitlesPage, TakesTwentyTypedCharacters) {
    createRecorded();
    openSheet([](HWND sheet) {
        const HWND page = ShowPage(sheet, kTitlesPage);
        for (const int edit : {kTitleEdit, kXTitleEdit, kYTitleEdit}) {
            EXPECT_EQ(SendDlgItemMessageW(page, edit, EM_GETLIMITTEXT, 0, 0), 20);
            TypeInto(page, edit, L"abcdefghijklmnopqrstuvwxyz");
            EXPECT_EQ(TextIn(page, edit), L"abcdefghijklmnopqrst");
        }
    });
}

TEST_F(TitlesPage, AChangedTitleIsSentAloneWithOneRedraw) {
    createRecorded();
    KorGraph_SetXTitle(graph, L"across");
    sent.clear();
    typeAndPressOk({{kTitleEdit, L"Rain"}});
    EXPECT_EQ(sent, (Lines{"GM_SETTITLE \"Rain\"", "GN_REDRAW"}));
    EXPECT_STREQ(title(GM_GETTITLE), L"Rain");
    EXPECT_STREQ(title(GM_GETXTITLE), L"across");
    EXPECT_EQ(title(GM_GETYTITLE), nullptr);
}

TEST_F(TitlesPage, EachEditHasItsMessage) {
    createRecorded();
    typeAndPressOk({{kYTitleEdit, L"c"}, {kXTitleEdit, L"b"}, {kTitleEdit, L"a"}});
    EXPECT_EQ(sent, (Lines{"GM_SETTITLE \"a\"", "GM_SETXTITLE \"b\"", "GM_SETYTITLE \"c\"",
                           "GN_REDRAW"}));
}

TEST_F(TitlesPage, AnEmptiedEditRemovesTheTitle) {
    createRecorded();
    KorGraph_SetYTitle(graph, L"gone soon");
    sent.clear();
    typeAndPressOk({{kYTitleEdit, L""}});
    EXPECT_EQ(sent, (Lines{"GM_SETYTITLE \"\"", "GN_REDRAW"}));
    EXPECT_EQ(title(GM_GETYTITLE), nullptr);
}

TEST_F(TitlesPage, UntouchedSendsNothing) {
    createRecorded();
    KorGraph_SetTitle(graph, L"Sunspots");
    sent.clear();
    typeAndPressOk({});
    EXPECT_EQ(sent, Lines{});
}

TEST_F(TitlesPage, CancelSendsNothing) {
    createRecorded();
    openSheet([](HWND sheet) { TypeInto(ShowPage(sheet, kTitlesPage), kTitleEdit, L"Rain"); });
    EXPECT_EQ(sent, Lines{});
    EXPECT_EQ(title(GM_GETTITLE), nullptr);
}

TEST_F(TitlesPage, ALongTitleOfTheHostIsShownWholeAndLeftAlone) {
    createRecorded();
    const std::wstring longTitle(60, L'x');
    KorGraph_SetTitle(graph, longTitle.c_str());
    openSheet([&](HWND sheet) {
        const HWND page = ShowPage(sheet, kTitlesPage);
        EXPECT_EQ(TextIn(page, kTitleEdit), longTitle);
        TypeInto(page, kXTitleEdit, L"b");
        PressOk(sheet);
    });
    EXPECT_EQ(title(GM_GETTITLE), longTitle);
}

TEST_F(TitlesPage, OfAnEditedLongTitle512CharactersAreRead) {
    createRecorded();
    KorGraph_SetTitle(graph, std::wstring(600, L'x').c_str());
    openSheet([&](HWND sheet) {
        const HWND edit = GetDlgItem(ShowPage(sheet, kTitlesPage), kTitleEdit);
        SendMessageW(edit, EM_SETSEL, 0, 0);
        SendMessageW(edit, WM_KEYDOWN, VK_DELETE, 1);
        PressOk(sheet);
    });
    EXPECT_EQ(title(GM_GETTITLE), std::wstring(512, L'x'));
}

}  // namespace
}  // namespace kortest

// The three titles.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

struct TitlePair {
    const char* name;
    UINT setter;
    UINT getter;
};

constexpr TitlePair kTitles[] = {{"Chart", GM_SETTITLE, GM_GETTITLE},
                                 {"X", GM_SETXTITLE, GM_GETXTITLE},
                                 {"Y", GM_SETYTITLE, GM_GETYTITLE}};

class GraphTitle : public GuardedGraphTest, public ::testing::WithParamInterface<TitlePair> {
protected:
    GraphTitle() { create(); }
    LRESULT set(const wchar_t* words) {
        return send(GetParam().setter, 0, reinterpret_cast<LPARAM>(words));
    }
    const wchar_t* read() const { return title(GetParam().getter); }
};

TEST_P(GraphTitle, IsACopy) {
    wchar_t words[] = L"Sales";
    EXPECT_EQ(set(words), 0);
    words[0] = L'X';
    EXPECT_STREQ(read(), L"Sales");
}

TEST_P(GraphTitle, LeavesTheOthersAlone) {
    set(L"Sales");
    for (const TitlePair& other : kTitles) {
        const bool isThis = other.getter == GetParam().getter;
        EXPECT_EQ(title(other.getter) != nullptr, isThis) << other.name;
    }
}

TEST_P(GraphTitle, IsReplaced) {
    set(L"A rather long title");
    set(L"Short");
    EXPECT_STREQ(read(), L"Short");
}

TEST_P(GraphTitle, GivenNullIsRemoved) {
    set(L"Sales");
    EXPECT_EQ(set(nullptr), 0);
    EXPECT_EQ(read(), nullptr);
}

TEST_P(GraphTitle, GivenEmptyIsRemoved) {
    set(L"Sales");
    EXPECT_EQ(set(L""), 0);
    EXPECT_EQ(read(), nullptr);
}

TEST_P(GraphTitle, WithoutMemoryIsNoneAndStillASuccess) {
    set(L"Sales");
    spy.watch("LocalAlloc");
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(set(L"Costs"), 0);
    EXPECT_EQ(read(), nullptr);
}

TEST_P(GraphTitle, StaysWhenAllSeriesAreRemoved) {
    set(L"Sales");
    notify(GN_RESET, 1);
    EXPECT_STREQ(read(), L"Sales");
}

TEST_P(GraphTitle, GivenItsOwnTextKeepsIt) {
    set(L"Sales");
    set(read());
    EXPECT_STREQ(read(), L"Sales");
}

TEST_P(GraphTitle, Of100000CharactersIsSurvived) {
    const std::wstring words(100000, L'W');
    EXPECT_EQ(set(words.c_str()), 0);
    EXPECT_EQ(read(), words);
    for (LPARAM type = 0; type <= 4; ++type) send(GM_SETTYPE, 0, type);
    resize(120, 90);
    host.pump();
}

TEST_P(GraphTitle, LaysOutAndScalesButDrawsNothing) {
    add({5, 5, 5});
    redraw();
    const Picture before = image();
    watchInvalidations();
    spy.watch("DrawTextW");
    set(L"Sales");
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 0u);
    EXPECT_GT(spy.count("DrawTextW"), 0) << "the margins are measured again";
}

std::string NameOf(const ::testing::TestParamInfo<TitlePair>& info) { return info.param.name; }

INSTANTIATE_TEST_SUITE_P(Of, GraphTitle, ::testing::ValuesIn(kTitles), NameOf);

}  // namespace
}  // namespace kortest

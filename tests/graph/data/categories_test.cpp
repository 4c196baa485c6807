// Category labels, seen through what is drawn and through a pie's legend.
#include "graph/graph_fixture.h"

#include <algorithm>

namespace kortest {
namespace {

class GraphCategoryMessages : public GraphTest {
protected:
    bool draws(const wchar_t* text) {
        const auto texts = textsOf([this] { redraw(); });
        return std::find(texts.begin(), texts.end(), text) != texts.end();
    }
};

TEST_F(GraphCategoryMessages, LabelTheXAxis) {
    create();
    add({1, 2, 3});
    EXPECT_FALSE(draws(L"Jan"));
    EXPECT_EQ(categories({L"Jan", L"Feb", L"Mar"}), 0);
    EXPECT_TRUE(draws(L"Jan"));
    EXPECT_TRUE(draws(L"Mar"));
}

// Of several that share the plot's last row each is drawn.
TEST_F(GraphCategoryMessages, LabelTheLastRowOfABarChart) {
    create();
    add(std::vector<double>(1000, 1.0));
    KorGraph_SetType(graph, KORGRAPH_BAR);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    std::vector<const wchar_t*> labels(1000, nullptr);
    std::vector<int> drawn;
    for (int number = 241; number <= 252; ++number) {
        labels[static_cast<size_t>(number - 1)] = L"here";
        categories(labels);
        if (draws(L"here")) drawn.push_back(number);
        labels[static_cast<size_t>(number - 1)] = nullptr;
    }
    // Nearly eight share a row; 250 lies on the edge of the plot, and 243 begins that row.
    EXPECT_EQ(drawn, (std::vector<int>{243, 244, 245, 246, 247, 248, 249, 250, 251, 252}));
}

TEST_F(GraphCategoryMessages, AreCopies) {
    create();
    add({1, 2, 3});
    wchar_t label[] = L"Jan";
    categories({label});
    label[0] = L'X';
    EXPECT_TRUE(draws(L"Jan"));
}

TEST_F(GraphCategoryMessages, AreReplacedAndRemoved) {
    create();
    add({1, 2, 3});
    categories({L"Jan", L"Feb"});
    categories({L"Apr"});
    EXPECT_FALSE(draws(L"Feb"));
    EXPECT_TRUE(draws(L"Apr"));
    EXPECT_EQ(send(GM_SETCATEGORIES, 0, 0), 0);
    EXPECT_FALSE(draws(L"Apr"));
    EXPECT_TRUE(draws(L"2")) << "numbers again";
}

TEST_F(GraphCategoryMessages, GoWithTheSeries) {
    create();
    add({1, 2, 3});
    categories({L"Jan", L"Feb"});
    notify(GN_CLEAR);
    EXPECT_FALSE(draws(L"Jan"));
}

// Although the count stays, nothing is read where the labels were.
TEST_F(GraphCategoryMessages, CountThatStaysAfterAClearDoesNoHarm) {
    create();
    add({1, 2, 3});
    categories({L"Jan", L"Feb"});
    notify(GN_CLEAR);
    add({4, 5, 6});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    const HWND legend = showLegend({10, 5, 120, 110});
    UpdateWindow(legend);
    for (LONG type = 0; type <= 4; ++type) {
        KorGraph_SetType(graph, type);
        UpdateWindow(legend);
    }
    EXPECT_FALSE(draws(L"Jan"));
}

TEST_F(GraphCategoryMessages, NoMemoryKeepsTheLabelsCopiedSoFar) {
    create();
    add({1, 2, 3});
    spy.watch("LocalAlloc");
    spy.failNth("LocalAlloc", 3);  // the array, Jan, Feb
    EXPECT_EQ(categories({L"Jan", L"Feb", L"Mar"}), 1);
    EXPECT_TRUE(draws(L"Jan"));
    EXPECT_FALSE(draws(L"Feb"));
    EXPECT_FALSE(draws(L"Mar"));
}

TEST_F(GraphCategoryMessages, NoMemoryForTheArrayLeavesNone) {
    create();
    add({1, 2, 3});
    categories({L"Apr"});
    spy.watch("LocalAlloc");
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(categories({L"Jan", L"Feb"}), 1);
    EXPECT_FALSE(draws(L"Apr"));
    EXPECT_FALSE(draws(L"Jan"));
    EXPECT_TRUE(draws(L"2")) << "numbers again";
}

}  // namespace
}  // namespace kortest

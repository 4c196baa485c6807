// Data that cannot be stored for want of memory.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphDataFailures : public GuardedGraphTest {
protected:
    // How many blocks of each kind adding a series takes.
    int blocksOf(const char* name, const wchar_t* seriesName) {
        spy.watch(name);
        spy.clearCalls();
        EXPECT_EQ(add({1, 2, 3}, seriesName), 0);
        return spy.count(name);
    }

    void expectNothingAdded() {
        COLORREF found = 0x123456;
        send(GM_GETSERIESCOLOR, 1, reinterpret_cast<LPARAM>(&found));
        EXPECT_EQ(found, 0u);
        EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
        EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 3.0}));
    }

    void failEachOf(const char* name) {
        create();
        const int blocks = blocksOf(name, L"one");
        const int live = heap->live();
        for (int nth = 1; nth <= blocks; ++nth) {
            spy.failNth(name, nth);
            EXPECT_EQ(add({9, 9, 9, 9, 9}, L"two"), 1) << nth;
            spy.stopFailing(name);
            expectNothingAdded();
            EXPECT_EQ(heap->live(), live) << nth << heap->liveReport();
        }
        EXPECT_EQ(add({1, 1, 1, 1, 1}, L"two"), 0);
        EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 6.0}));
        EXPECT_EQ(colour(1), RGB(0, 0, 255)) << "the second series";
    }
};

TEST_F(GraphDataFailures, NoLocalMemoryAddsNothing) { failEachOf("LocalAlloc"); }

TEST_F(GraphDataFailures, NoGlobalMemoryAddsNothing) { failEachOf("malloc"); }

TEST_F(GraphDataFailures, NoLiveBufferAddsNothing) {
    create();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    const int blocks = blocksOf("LocalAlloc", nullptr);
    EXPECT_GE(blocks, 2);
    for (int nth = 1; nth <= blocks; ++nth) {
        spy.failNth("LocalAlloc", nth);
        EXPECT_EQ(add({9, 9, 9, 9, 9}), 1) << nth;
        spy.stopFailing("LocalAlloc");
        expectNothingAdded();
    }
}

// A redraw without memory for its points leaves the series out.
TEST_F(GraphDataFailures, RedrawWithoutMemoryIsSurvived) {
    createRegular();
    const Picture before = image();
    spy.watchAll({"LocalAlloc", "malloc"});
    for (LONG type = 0; type <= 4; ++type) {
        spy.failAlways("LocalAlloc");
        spy.failAlways("malloc");
        KorGraph_SetType(graph, type);
        spy.stopFailing("LocalAlloc");
        spy.stopFailing("malloc");
    }
    KorGraph_SetType(graph, KORGRAPH_LINE);
    EXPECT_TRUE(SamePicture(before, image()));
}

}  // namespace
}  // namespace kortest

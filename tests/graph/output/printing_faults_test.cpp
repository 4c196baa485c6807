// Prints in which the platform's calls fail one by one, and many prints in a row.
#include "graph/output/printing_fixture.h"

namespace kortest {
namespace {

class PrintFaults : public GuardedPrintingTest {
protected:
    void createWithData() {
        RegisterGraphClass();
        create();
        KorGraph_SetTitle(graph, L"Harvest");
        KorGraph_SetYTitle(graph, L"tons");
        add({3, 5, 2, 8}, L"wheat");
        const std::vector<const wchar_t*> labels = {L"a", L"b", L"c", L"d"};
        categories(labels);
        printer = {200, 240, 150};
        settle();
    }

    void printAllTypes() {
        for (LONG type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
            KorGraph_SetType(graph, type);
            print();
        }
    }
};

TEST_F(PrintFaults, ManyPrintsLeaveNothingBehind) {
    createWithData();
    WatchHandles(spy);
    printAllTypes();
    const int blocks = heap->live();
    // Each print replaces the fonts of the one before.
    const std::vector<std::string> onlyFonts = {"CreateFontIndirectW", "CreateFontIndirectW"};
    EXPECT_EQ(UnreturnedHandles(spy), onlyFonts);
    for (int round = 0; round < 10; ++round) printAllTypes();
    EXPECT_EQ(UnreturnedHandles(spy), onlyFonts);
    EXPECT_EQ(heap->live(), blocks) << heap->liveReport();
    EXPECT_EQ(pagesDeleted, 55);
    destroy();
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

class PrintFault : public PrintFaults, public ::testing::WithParamInterface<const char*> {};

TEST_P(PrintFault, IsSurvivedOneByOne) {
    createWithData();
    const std::string name = GetParam();
    ASSERT_TRUE(spy.watch(name)) << "the library does not call " << name;
    int failures = 0;
    for (int nth = 1; nth <= 400; nth += 1 + nth / 8) {
        spy.clearCalls();
        spy.failNth(name, nth);
        printAllTypes();
        spy.stopFailing(name);
        const auto calls = spy.callsOf(name);
        const bool hasFailed = std::any_of(calls.begin(), calls.end(),
                                           [](const ImportCall& call) { return call.failed; });
        ASSERT_EQ(heap->report(), "") << name << " " << nth;
        if (!hasFailed) break;
        ++failures;
    }
    EXPECT_GT(failures, 0) << name << " was never called";
    pagesDeleted = 0;
    printAllTypes();
    EXPECT_EQ(pagesDeleted, 5) << "the next ones are whole";
    destroy();
    EXPECT_EQ(heap->live(), 0) << heap->liveReport();
}

INSTANTIATE_TEST_SUITE_P(Imports, PrintFault,
                         ::testing::Values("GetProcAddress", "EnableWindow", "GetDeviceCaps",
                                           "CreateFontIndirectW", "CreatePen", "CreateSolidBrush",
                                           "SelectObject", "DrawTextW", "LocalAlloc"),
                         [](const auto& tested) { return std::string(tested.param); });

}  // namespace
}  // namespace kortest

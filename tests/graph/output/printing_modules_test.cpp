// The two modules that printing needs: when they are loaded, and what their absence means.
#include "graph/output/printing_fixture.h"

#include <algorithm>

namespace kortest {
namespace {

class PrintModules : public PrintingTest {
protected:
    void createAnyhow() {
        RegisterGraphClass();
        createAnother();
    }
    void createAnother() {
        CreateGraphWindow(host.window(), WS_CHILD, {0, 0, 50, 50}, GetModuleHandleW(nullptr));
    }
};

TEST_F(PrintModules, AreLoadedWithTheFirstChart) {
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 0u) << "no chart was created";
    create();
    EXPECT_EQ(transcript, (Lines{"load commdlg.dll", "load wingdi.dll"}));
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 1u);
}

TEST_F(PrintModules, AreLoadedOnceForAllCharts) {
    create();
    transcript.clear();
    createAnother();
    EXPECT_EQ(transcript, Lines{});
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 1u);
}

TEST_F(PrintModules, AreNotLoadedForAChartWithoutAParent) {
    RegisterGraphClass();
    CreateGraphWindow(nullptr, WS_POPUP, {0, 0, 50, 50}, GetModuleHandleW(nullptr));
    EXPECT_EQ(transcript, Lines{});
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 0u);
}

TEST_F(PrintModules, StayAfterTheLastChart) {
    spy.watch("FreeLibrary");
    create();
    destroy();
    EXPECT_EQ(spy.count("FreeLibrary"), 0);
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 1u);
}

// The folder of a program far down is cut off, and that of another module is not known.
TEST_F(PrintModules, AreNotLookedForInAFolderThatIsNotKnown) {
    spy.watch("GetModuleFileNameW", 3, CallingConvention::Stdcall);
    for (const ULONG_PTR length : {0, MAX_PATH, MAX_PATH - 3}) {
        spy.replace("GetModuleFileNameW", [length](ULONG_PTR* arguments) {
            auto* path = reinterpret_cast<wchar_t*>(arguments[1]);
            std::fill_n(path, length, L'x');
            if (length > 0) path[length == MAX_PATH ? 2 : length - 1] = L'\\';
            return length;
        });
        createAnyhow();
        EXPECT_EQ(transcript, Lines{}) << length;
        EXPECT_EQ(IsPrintingAvailableForGraphControl(), 0u);
    }
}

class MissingPrintModule : public PrintModules,
                           public ::testing::WithParamInterface<const char*> {};

TEST_P(MissingPrintModule, MakesPrintingUnavailable) {
    missingModules = {GetParam()};
    create();
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 0u);
    transcript.clear();
    print();
    EXPECT_EQ(printAnswer, 0);
    EXPECT_EQ(transcript, Lines{}) << "nothing is even looked for";
    EXPECT_TRUE(IsWindowEnabled(graph));
}

TEST_P(MissingPrintModule, IsTriedAgainWithTheNextChart) {
    missingModules = {GetParam()};
    create();
    transcript.clear();
    createAnother();
    EXPECT_EQ(transcript, Lines{std::string("load ") + GetParam()}) << "the other one is there";
    missingModules.clear();
    createAnother();
    EXPECT_EQ(IsPrintingAvailableForGraphControl(), 1u);
    print();
    EXPECT_FALSE(IsWindowEnabled(graph)) << "the first chart prints as well";
}

INSTANTIATE_TEST_SUITE_P(Both, MissingPrintModule, ::testing::Values("commdlg.dll", "wingdi.dll"),
                         [](const auto& tested) {
                             return std::string(tested.param, std::string(tested.param).find('.'));
                         });

}  // namespace
}  // namespace kortest

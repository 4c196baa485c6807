#include "support/import_spy.h"

#include "faulty_library.h"
#include "support/handle_balance.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace kortest {
namespace {

using Names = std::vector<std::string>;

HMODULE FaultyModule() { return GetModuleHandleW(L"faulty_library.dll"); }

class ImportSpyTest : public ::testing::Test {
protected:
    ImportSpy spy{FaultyModule()};
};

TEST_F(ImportSpyTest, ListsTheImports) {
    const Names names = ImportNames(FaultyModule());
    EXPECT_NE(std::find(names.begin(), names.end(), "GDI32.dll!BitBlt"), names.end());
    EXPECT_TRUE(spy.isImported("BitBlt"));
    EXPECT_FALSE(spy.isImported("StretchBlt"));
    EXPECT_FALSE(spy.watch("StretchBlt"));
}

TEST_F(ImportSpyTest, RecordsNamesArgumentsAndResultsInOrder) {
    spy.watchAll({"GetDC", "CreatePen", "ReleaseDC", "StretchBlt"});
    FaultyHandles(0);
    EXPECT_EQ(spy.sequence(), "CreatePen GetDC ReleaseDC");
    EXPECT_EQ(spy.calls()[0].arguments, (std::vector<ULONG_PTR>{PS_SOLID, 1, 0}));
    EXPECT_NE(spy.calls()[1].result, 0u);
    EXPECT_EQ(spy.calls()[2].arguments[1], spy.calls()[1].result);
    EXPECT_EQ(spy.calls()[2].result, 1u);
    spy.clearCalls();
    EXPECT_EQ(spy.sequence(), "");
}

TEST_F(ImportSpyTest, FailsFromTheNthCallOn) {
    spy.watch("CreatePen");
    int answered = 0;
    const auto failure = [&](ULONG_PTR*) -> ULONG_PTR { return ++answered, 0; };
    spy.failNth("CreatePen", 2, ImportSpy::Failing::kForEver, failure);
    for (int i = 0; i < 4; ++i) FaultyHandles(0);
    EXPECT_EQ(spy.sequence(), "CreatePen CreatePen! CreatePen! CreatePen!");
    EXPECT_EQ(answered, 3);
    spy.failNth("CreatePen", 1, ImportSpy::Failing::kOnce, failure);
    spy.stopFailing("CreatePen");
    spy.clearCalls();
    FaultyHandles(0);
    EXPECT_EQ(spy.sequence(), "CreatePen");
}

TEST_F(ImportSpyTest, TellsAnObserverAndKeepsNoCalls) {
    spy.watchAll({"CreatePen", "GetDC"});
    spy.keepCalls(false);
    std::string seen;
    spy.observe([&](const WatchedCall& call) {
        EXPECT_EQ(call.index, spy.indexOf(call.name));
        seen += call.name + (call.failed ? "! " : call.result ? " " : "0 ");
    });
    spy.failNth("GetDC", 1);
    FaultyHandles(0);
    EXPECT_EQ(seen, "CreatePen GetDC! ");
    EXPECT_TRUE(spy.calls().empty());
    EXPECT_EQ(spy.indexOf("BitBlt"), -1);
}

TEST_F(ImportSpyTest, HandsOnAllNineArguments) {
    spy.watch("BitBlt");
    std::vector<ULONG_PTR> seen;
    spy.replace("BitBlt", [&](ULONG_PTR* a) -> ULONG_PTR {
        seen.assign(a, a + 9);
        return 77;
    });
    auto* to = reinterpret_cast<HDC>(ULONG_PTR{11});
    auto* from = reinterpret_cast<HDC>(ULONG_PTR{12});
    EXPECT_EQ(FaultyBlit(to, 1, 2, from), 77);
    for (size_t i : {1u, 2u, 3u, 4u, 6u, 7u, 8u}) seen[i] &= 0xFFFFFFFF;
    EXPECT_EQ(seen, (std::vector<ULONG_PTR>{11, 1, 2, 3, 4, 12, 5, 6, SRCCOPY}));
}

TEST_F(ImportSpyTest, ReachesTheRealFunctionWithAllNineArguments) {
    HDC to = CreateCompatibleDC(nullptr);
    HDC from = CreateCompatibleDC(nullptr);
    HBITMAP toBitmap = CreateBitmap(20, 20, 1, 32, nullptr);
    HBITMAP fromBitmap = CreateBitmap(20, 20, 1, 32, nullptr);
    SelectObject(to, toBitmap);
    SelectObject(from, fromBitmap);
    SetPixel(from, 7, 9, RGB(1, 2, 3));  // third column, fourth row of the 3 x 4 part at 5, 6
    spy.watch("BitBlt");
    EXPECT_TRUE(FaultyBlit(to, 10, 11, from));
    EXPECT_EQ(GetPixel(to, 12, 14), RGB(1, 2, 3));
    EXPECT_EQ(spy.count("BitBlt"), 1);
    DeleteDC(to);
    DeleteDC(from);
    DeleteObject(toBitmap);
    DeleteObject(fromBitmap);
}

TEST_F(ImportSpyTest, ReachesRealFunctionsOfTheCCallingConvention) {
    spy.watchAll({"malloc", "calloc", "realloc", "free"});
    for (int i = 0; i < 100; ++i) EXPECT_EQ(FaultyMalloc(), 7);
    EXPECT_EQ(spy.count("calloc"), 100);
    EXPECT_EQ(spy.count("free"), 200);
}

TEST_F(ImportSpyTest, FailsTheNthCallOrAll) {
    spy.watch("LocalAlloc");
    spy.failNth("LocalAlloc", 2, 0, ERROR_NOT_ENOUGH_MEMORY);
    EXPECT_NE(FaultyLeak(1), nullptr);
    SetLastError(0);
    EXPECT_EQ(FaultyLeak(1), nullptr);
    EXPECT_EQ(GetLastError(), DWORD{ERROR_NOT_ENOUGH_MEMORY});
    EXPECT_NE(FaultyLeak(1), nullptr);
    spy.failAlways("LocalAlloc");
    EXPECT_EQ(FaultyLeak(1), nullptr);
    EXPECT_EQ(FaultyLeak(1), nullptr);
    spy.stopFailing("LocalAlloc");
    EXPECT_NE(FaultyLeak(1), nullptr);
    EXPECT_EQ(spy.sequence(),
              "LocalAlloc LocalAlloc! LocalAlloc LocalAlloc! LocalAlloc! LocalAlloc");
}

TEST_F(ImportSpyTest, ReplacesAndRestores) {
    spy.watch("LocalAlloc");
    spy.replace("LocalAlloc", [this](ULONG_PTR* a) {
        a[1] += 100;
        return spy.callReal("LocalAlloc", a);
    });
    EXPECT_EQ(LocalSize(FaultyLeak(5)), 105u);
    spy.restore("LocalAlloc");
    EXPECT_EQ(LocalSize(FaultyLeak(5)), 5u);
}

TEST(ImportSpy, PutsTheImportsBackInTheEnd) {
    {
        ImportSpy spy(FaultyModule());
        spy.watch("LocalAlloc");
        spy.failAlways("LocalAlloc");
        EXPECT_EQ(FaultyLeak(1), nullptr);
    }
    EXPECT_NE(FaultyLeak(1), nullptr);
    ImportSpy another(FaultyModule());
    another.watch("LocalAlloc");
    EXPECT_NE(FaultyLeak(1), nullptr);
    EXPECT_EQ(another.count("LocalAlloc"), 1);
}

TEST_F(ImportSpyTest, FindsHandlesThatAreNotGivenBack) {
    WatchHandles(spy);
    FaultyHandles(0);
    EXPECT_EQ(UnreturnedHandles(spy), Names{});
    FaultyHandles(FAULTY_KEEP_PEN);
    EXPECT_EQ(UnreturnedHandles(spy), Names{"CreatePen"});
    spy.clearCalls();
    FaultyHandles(FAULTY_KEEP_WINDOW_DC | FAULTY_KEEP_MEMORY_DC);
    EXPECT_EQ(UnreturnedHandles(spy), (Names{"GetDC", "CreateCompatibleDC"}));
}

}  // namespace
}  // namespace kortest

// The blocks that hold the sizes that were changed: order, growth and failing memory.
#include "grid/grid_fixture.h"

#include <algorithm>
#include <random>

namespace kortest {
namespace {

using GridOverrides = GridTest;
using GuardedGridOverrides = GuardedGridTest;

TEST_F(GridOverrides, FirstSizeAllocates128ZeroedBytes) {
    create(400, 300);
    spy.watchAll({"LocalAlloc", "LocalReAlloc"});
    ASSERT_EQ(SetColumnWidth(3, 70), 1u);
    ASSERT_EQ(spy.sequence(), "LocalAlloc");
    EXPECT_EQ(NumberAt(spy.calls()[0], 0), static_cast<DWORD>(LMEM_ZEROINIT));
    EXPECT_EQ(spy.calls()[0].arguments[1], 128u);
    spy.clearCalls();
    ASSERT_EQ(SetRowHeight(3, 70), 1u);
    ASSERT_EQ(spy.sequence(), "LocalAlloc");
    EXPECT_EQ(NumberAt(spy.calls()[0], 0), static_cast<DWORD>(LMEM_ZEROINIT));
    EXPECT_EQ(spy.calls()[0].arguments[1], 128u);
}

struct Growth {
    int countBefore;
    ULONG_PTR bytes;
    DWORD flags;
    bool operator==(const Growth&) const = default;
};

std::ostream& operator<<(std::ostream& stream, const Growth& growth) {
    return stream << growth.bytes << " bytes at " << growth.countBefore;
}

// Which insertions grew the block, and to what.
template <typename Insert>
std::vector<Growth> Growths(ImportSpy& spy, int count, Insert insert) {
    std::vector<Growth> found;
    for (int i = 0; i < count; ++i) {
        spy.clearCalls();
        insert(i);
        for (const auto& call : spy.callsOf("LocalReAlloc"))
            found.push_back({i, call.arguments[1], NumberAt(call, 2)});
    }
    return found;
}

const std::vector<Growth> kGrowths = {
    {15, 248, LMEM_MOVEABLE}, {31, 376, LMEM_MOVEABLE}, {47, 504, LMEM_MOVEABLE}};

// The block grows when it is one entry short of full.
TEST_F(GridOverrides, BlockGrowsAtEverySixteenthSizeLessOne) {
    create(400, 300);
    spy.watchAll({"LocalAlloc", "LocalReAlloc"});
    EXPECT_EQ(Growths(spy, 60, [](int i) { SetColumnWidth(i, 70); }), kGrowths);
    EXPECT_EQ(Growths(spy, 60, [](int i) { SetRowHeight(i, 70); }), kGrowths);
}

// Setting the size that a column has anyway stores it: only a reset takes sizes away.
TEST_F(GridOverrides, DefaultSizesAreStoredLikeOthers) {
    create(400, 300);
    spy.watchAll({"LocalAlloc", "LocalReAlloc"});
    EXPECT_EQ(Growths(spy, 60, [](int i) { SetColumnWidth(i, 60); }), kGrowths);
    EXPECT_EQ(Growths(spy, 60, [](int i) { SetRowHeight(i, 16); }), kGrowths);
}

TEST_F(GridOverrides, ResizeMessagesStoreInTheSameBlocks) {
    create(400, 300);
    spy.watch("LocalReAlloc");
    const auto resize = [this](int i) { SendResized(grid, rowHeader, 100 + i, 20); };
    EXPECT_EQ(Growths(spy, 60, resize), kGrowths);
}

TEST_F(GridOverrides, ReplacingASizeAllocatesNothing) {
    create(400, 300);
    for (int i = 0; i < 15; ++i) SetColumnWidth(i, 70 + i);
    spy.watchAll({"LocalAlloc", "LocalReAlloc", "LocalFree"});
    for (int i = 0; i < 15; ++i) EXPECT_EQ(SetColumnWidth(i, 40 + i), 1u);
    EXPECT_EQ(spy.sequence(), "");
    SetFirstVisibleCell(0);
    for (int i = 0; i < 6; ++i) EXPECT_EQ(KorHeader_GetItemSize(columnHeader, i), 40 + i);
}

TEST_F(GridOverrides, OneEntryPerIndex) {
    create(400, 300);
    spy.watch("LocalReAlloc");
    for (int i = 0; i < 100; ++i) EXPECT_EQ(SetColumnWidth(7, 20 + i), 1u);
    EXPECT_EQ(spy.count("LocalReAlloc"), 0);
    SetFirstVisibleCell(7);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 119);
}

// A size in front of others must not hide them, nor one behind.
TEST_F(GridOverrides, AnyOrderOfInsertionFindsEverySize) {
    create(640, 300);
    std::mt19937 random(20250);
    std::vector<int> columns(KORGRID_COLUMNS);
    for (size_t i = 0; i < columns.size(); ++i) columns[i] = static_cast<int>(i);
    for (int round = 0; round < 4; ++round) {
        ResetGrid();
        expected.columns.clear();
        SetFirstVisibleCell(0);
        std::shuffle(columns.begin(), columns.end(), random);
        for (int i = 0; i < 120; ++i) {
            const int column = columns[static_cast<size_t>(i)];
            const int width = 5 + static_cast<int>(random() % 300);
            ASSERT_EQ(SetColumnWidth(column, width), 1u);
            expected.columns[column] = static_cast<unsigned>(width);
        }
        for (int first = 0; first < KORGRID_COLUMNS; first += 7) {
            SetFirstVisibleCell(KORGRID_CELL(first, 0));
            expected.firstColumn = first;
            expected.fitColumns(expected.clientWidth);
            ASSERT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected)) << first;
        }
    }
}

TEST_F(GuardedGridOverrides, AllColumnsAndManyRowsFit) {
    create(640, 300);
    for (int i = 0; i < KORGRID_COLUMNS; ++i)
        ASSERT_EQ(SetColumnWidth(KORGRID_COLUMNS - 1 - i, 20 + i % 50), 1u);
    for (int i = 0; i < 1500; ++i) ASSERT_EQ(SetRowHeight((i * 7) % 1500, 10 + i % 30), 1u);
    SetFirstVisibleCell(KORGRID_CELL(250, 1490));
    EXPECT_EQ(HeaderSizes(columnHeader), (std::vector<int>{25, 24, 23, 22, 21, 20}));
}

TEST_F(GuardedGridOverrides, LastColumnAndRowCanBeResized) {
    create(640, 300);
    SetFirstVisibleCell(KORGRID_CELL(255, 16383));
    for (int i = 0; i < 20; ++i) {
        EXPECT_EQ(SetColumnWidth(0, 50 + i), 1u);
        EXPECT_EQ(SetRowHeight(0, 50 + i), 1u);
        SetColumnWidth(-i - 1, 40);
        SetRowHeight(-i - 1, 40);
    }
    SetFirstVisibleCell(KORGRID_CELL(254, 16382));
    EXPECT_EQ(HeaderSizes(columnHeader), (std::vector<int>{40, 69}));
    EXPECT_EQ(HeaderSizes(rowHeader), (std::vector<int>{40, 69}));
}

// ---- Failing memory -----------------------------------------------------------------------------

TEST_F(GuardedGridOverrides, NoMemoryForTheFirstBlockGivesZero) {
    create(400, 300);
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(SetColumnWidth(0, 90), 0u);
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(SetRowHeight(0, 90), 0u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 60);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 16);
    EXPECT_EQ(SetColumnWidth(0, 90), 1u) << "memory is back";
    EXPECT_EQ(SetRowHeight(0, 90), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 90);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 90);
}

TEST_F(GuardedGridOverrides, FailedGrowthLosesTheBlock) {
    create(400, 300);
    for (int i = 0; i < 15; ++i) ASSERT_EQ(SetColumnWidth(i, 70 + i), 1u);
    spy.failNth("LocalReAlloc", 1);
    EXPECT_EQ(SetColumnWidth(15, 90), 0u);
    SetFirstVisibleCell(0);
    for (const int size : HeaderSizes(columnHeader)) EXPECT_EQ(size, 60);
    spy.clearCalls();
    EXPECT_EQ(SetColumnWidth(2, 77), 1u) << "a new block begins";
    EXPECT_EQ(spy.sequence(), "LocalAlloc");
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 60);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 2), 77);
    for (int i = 0; i < 40; ++i) EXPECT_EQ(SetColumnWidth(i, 50), 1u);
}

TEST_F(GuardedGridOverrides, FailedGrowthOfTheRowsLosesThatBlockAlone) {
    create(400, 300);
    for (int i = 0; i < 15; ++i) ASSERT_EQ(SetRowHeight(i, 20 + i), 1u);
    SetColumnWidth(0, 99);
    spy.failNth("LocalReAlloc", 1);
    EXPECT_EQ(SetRowHeight(15, 90), 0u);
    SetFirstVisibleCell(0);
    for (const int size : HeaderSizes(rowHeader)) EXPECT_EQ(size, 16);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 99);
    ResetGrid();
    for (int i = 0; i < 40; ++i) EXPECT_EQ(SetRowHeight(i, 20), 1u);
}

TEST_F(GuardedGridOverrides, FailedMemoryInAResizeMessageStillNotifies) {
    create(400, 300);
    host.leaveOut(GRIDN_PAINTCELLS);
    spy.failNth("LocalAlloc", 1);
    EXPECT_EQ(SendResized(grid, columnHeader, 2, 90), 0);
    EXPECT_EQ(host.transcript(), (Lines{"sent GRIDN_COLUMNRESIZED 2 90"}));
    spy.stopFailing("LocalAlloc");
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 2), 60);
}

}  // namespace
}  // namespace kortest

#include "support/guard_heap.h"

#include "faulty_library.h"

#include <gtest/gtest.h>

namespace kortest {
namespace {

HMODULE FaultyModule() { return GetModuleHandleW(L"faulty_library.dll"); }

class GuardHeapTest : public ::testing::Test {
protected:
    explicit GuardHeapTest(GuardedSide side = GuardedSide::End) : heap(spy, side) {}

    std::string kinds() const {
        std::string text;
        for (const HeapFault& fault : heap.faults()) {
            if (!text.empty()) text += ", ";
            text += fault.kind;
        }
        return text;
    }

    ImportSpy spy{FaultyModule()};
    GuardHeap heap;
};

TEST_F(GuardHeapTest, LetsProperUsePass) {
    FaultyWrite(40, 0);
    FaultyWrite(40, 39);
    FaultyRead(5000, 4999);
    EXPECT_EQ(heap.report(), "");
    EXPECT_EQ(heap.live(), 0);
}

TEST_F(GuardHeapTest, StartsOverOnlyWhenNothingLives) {
    void* first = FaultyLeak(40);
    EXPECT_FALSE(heap.startOver());
    EXPECT_EQ(heap.live(), 1);
    ReleaseLocal(first);
    EXPECT_TRUE(heap.startOver());
    FaultyWrite(48, 48);
    ASSERT_EQ(kinds(), "overrun");
    EXPECT_EQ(heap.faults()[0].block, 1) << "counted anew";
}

TEST_F(GuardHeapTest, SeesAWriteBehindABlock) {
    FaultyWrite(48, 48);
    ASSERT_EQ(kinds(), "overrun");
    EXPECT_EQ(heap.faults()[0].offset, 48);
    EXPECT_EQ(heap.faults()[0].blockSize, 48u);
    EXPECT_TRUE(heap.faults()[0].isWrite);
    EXPECT_NE(heap.faults()[0].codeOffset, 0u);
}

TEST_F(GuardHeapTest, SeesAReadBehindABlock) {
    FaultyRead(48, 48);
    ASSERT_EQ(kinds(), "overrun");
    EXPECT_FALSE(heap.faults()[0].isWrite);
}

TEST_F(GuardHeapTest, SeesAWriteBehindABlockOfOddSize) {
    FaultyWrite(7, 7);
    EXPECT_EQ(kinds(), sizeof(void*) == 4 ? "overrun" : "overrun, seen when freed");
}

TEST_F(GuardHeapTest, SeesAWriteBeforeABlock) {
    FaultyWrite(48, -1);
    ASSERT_EQ(kinds(), "underrun, seen when freed");
    EXPECT_EQ(heap.faults()[0].offset, -1);
}

TEST_F(GuardHeapTest, SeesUseAfterFree) {
    FaultyUseAfterFree();
    ASSERT_EQ(kinds(), "use after free");
    EXPECT_EQ(heap.faults()[0].offset, 12);
}

TEST_F(GuardHeapTest, SeesADoubleFree) {
    FaultyDoubleFree();
    EXPECT_EQ(kinds(), "double free");
}

TEST_F(GuardHeapTest, SeesTheWrongWayOfFreeing) {
    FaultyWrongFamily();
    EXPECT_EQ(kinds(), "freed by the other family");
}

TEST_F(GuardHeapTest, CountsWhatIsStillAllocated) {
    void* block = FaultyLeak(33);
    EXPECT_EQ(heap.live(), 1);
    EXPECT_EQ(heap.localSize(block), 33);
    EXPECT_NE(heap.liveReport().find("33 bytes"), std::string::npos);
    ReleaseLocal(block);
    EXPECT_EQ(heap.live(), 0);
    EXPECT_EQ(heap.localSize(block), -1);
    EXPECT_EQ(heap.report(), "");
}

TEST_F(GuardHeapTest, KeepsContentsAndZeroesTheRestWhenABlockGrows) {
    EXPECT_EQ(FaultyGrow(20, LMEM_MOVEABLE | LMEM_ZEROINIT), 55);
    EXPECT_EQ(FaultyGrow(20, LMEM_MOVEABLE), 55 + 10 * 0xCD);
    EXPECT_EQ(FaultyGrow(4, LMEM_MOVEABLE), 10);
    EXPECT_EQ(heap.report(), "");
}

TEST_F(GuardHeapTest, RefusesToGrowABlockThatMayNotMove) { EXPECT_EQ(FaultyGrow(20, 0), -1); }

TEST_F(GuardHeapTest, ServesTheMallocFamily) {
    EXPECT_EQ(FaultyMalloc(), 7);
    EXPECT_EQ(spy.count("malloc"), 1);
    EXPECT_EQ(heap.report(), "");
    EXPECT_EQ(heap.live(), 0);
}

class GuardHeapAtTheBegin : public GuardHeapTest {
protected:
    GuardHeapAtTheBegin() : GuardHeapTest(GuardedSide::Begin) {}
};

TEST_F(GuardHeapAtTheBegin, LetsProperUsePass) {
    FaultyWrite(40, 0);
    FaultyWrite(40, 39);
    FaultyRead(5000, 4999);
    EXPECT_EQ(FaultyGrow(20, LMEM_MOVEABLE | LMEM_ZEROINIT), 55);
    EXPECT_EQ(heap.report(), "");
    EXPECT_EQ(heap.live(), 0);
}

TEST_F(GuardHeapAtTheBegin, SeesAReadBeforeABlock) {
    FaultyRead(48, -1);
    ASSERT_EQ(kinds(), "underrun");
    EXPECT_EQ(heap.faults()[0].offset, -1);
    EXPECT_EQ(heap.faults()[0].blockSize, 48u);
    EXPECT_FALSE(heap.faults()[0].isWrite);
}

TEST_F(GuardHeapAtTheBegin, SeesAReadBeforeTheSecondBlock) {
    void* first = FaultyLeak(4096);
    FaultyRead(8192, -4096);
    ASSERT_EQ(kinds(), "underrun");
    EXPECT_EQ(heap.faults()[0].blockSize, 8192u);
    ReleaseLocal(first);
}

TEST_F(GuardHeapAtTheBegin, SeesAWriteBehindABlockWhenItIsFreed) {
    FaultyWrite(48, 48);
    ASSERT_EQ(kinds(), "overrun, seen when freed");
    EXPECT_EQ(heap.faults()[0].offset, 48);
}

TEST_F(GuardHeapAtTheBegin, SeesUseAfterFree) {
    FaultyUseAfterFree();
    ASSERT_EQ(kinds(), "use after free");
    EXPECT_EQ(heap.faults()[0].offset, 12);
}

TEST_F(GuardHeapTest, FailsAnAllocationWhenTheSpySaysSo) {
    spy.failNth("LocalAlloc", 2);
    void* first = FaultyLeak(8);
    EXPECT_NE(first, nullptr);
    EXPECT_EQ(FaultyLeak(8), nullptr);
    EXPECT_EQ(heap.live(), 1);
    ReleaseLocal(first);
}

}  // namespace
}  // namespace kortest

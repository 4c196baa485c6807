// Arrays on the local heap: their bytes are counted before they are asked for.
#include "base/local_heap.h"

#include <gtest/gtest.h>

namespace {

// Four of these have as many bytes as there are addresses, which wraps round to none.
struct QuarterOfAllAddresses {
    char bytes[SIZE_MAX / 4 + 1];
};

TEST(LocalHeap, GivesZeroes) {
    auto* values = kor::AllocateLocal<int32_t>(100);
    ASSERT_NE(values, nullptr);
    for (int i = 0; i < 100; ++i) EXPECT_EQ(values[i], 0);
    LocalFree(values);
}

TEST(LocalHeap, RefusesACountWhoseBytesWouldWrapRound) {
    EXPECT_EQ(kor::AllocateLocal<QuarterOfAllAddresses>(4), nullptr);
}

TEST(LocalHeap, KeepsTheArrayWhenItsNewBytesWouldWrapRound) {
    auto* block = LocalAlloc(LMEM_ZEROINIT, 8);
    ASSERT_NE(block, nullptr);
    EXPECT_EQ(kor::ReallocateLocal(static_cast<QuarterOfAllAddresses*>(block), 4), nullptr);
    EXPECT_EQ(LocalSize(block), 8u);
    LocalFree(block);
}

}  // namespace

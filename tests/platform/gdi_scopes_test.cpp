// Scopes of drawing, where the system refuses what they ask for.
#include "base/gdi_scopes.h"

#include <gtest/gtest.h>

#include <cstring>
#include <new>

namespace {

TEST(PaintScope, HasAnEmptyAreaWhenPaintingCannotBegin) {
    alignas(kor::PaintScope) unsigned char memory[sizeof(kor::PaintScope)];
    std::memset(memory, 0xCC, sizeof memory);
    auto* paint = ::new (memory) kor::PaintScope(nullptr);
    EXPECT_EQ(paint->dc(), nullptr);
    const RECT& area = paint->area();
    EXPECT_EQ(area.left, 0);
    EXPECT_EQ(area.top, 0);
    EXPECT_EQ(area.right, 0);
    EXPECT_EQ(area.bottom, 0);
    paint->~PaintScope();
}

}  // namespace

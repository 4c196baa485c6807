// Keys on a selection: always a block of the sheet, but for the row past the last.
#include "fuzz_input.h"

#include "grid/block.h"
#include "grid/moves.h"

namespace korfuzz {
namespace {

// A page down from near the end goes one past the last row, and is no block then.
bool IsPastTheEnd(const kor::CellBlock& block) {
    return block.left == block.right && block.top == kor::kRowLimit && block.bottom == block.top;
}

kor::CellBlock AnyBlock(Input& input) {
    const auto column = [&] {
        return input.ConsumeBool() ? input.ConsumeIntegralInRange(0, 2)
                                   : input.ConsumeIntegralInRange(0, kor::kColumnLimit - 1);
    };
    const auto row = [&] {
        return input.ConsumeBool() ? kor::kRowLimit - 1 - input.ConsumeIntegralInRange(0, 2)
                                   : input.ConsumeIntegralInRange(0, kor::kRowLimit - 1);
    };
    const int columnA = column(), columnB = column(), rowA = row(), rowB = row();
    kor::CellBlock block;
    block.left = static_cast<uint16_t>(std::min(columnA, columnB));
    block.right = static_cast<uint16_t>(std::max(columnA, columnB));
    block.top = static_cast<uint16_t>(std::min(rowA, rowB));
    block.bottom = static_cast<uint16_t>(std::max(rowA, rowB));
    return block;
}

// The anchor stands at one of the block's corners, or there is none.
kor::Anchor AnyAnchor(Input& input, const kor::CellBlock& block) {
    if (input.ConsumeBool()) return {kor::kNoAnchor, kor::kNoAnchor};
    return {input.ConsumeBool() ? block.left : block.right,
            input.ConsumeBool() ? block.top : block.bottom};
}

bool HasAnchor(kor::Anchor anchor) { return anchor.column != kor::kNoAnchor; }

// Without an anchor the cell itself moves by one, or stays at the sheet's edge.
void CheckCell(const kor::CellBlock& from, const kor::CellBlock& to, int dx, int dy) {
    const int left = std::clamp(from.left + dx, 0, kor::kColumnLimit - 1);
    const int top = std::clamp(from.top + dy, 0, kor::kRowLimit - 1);
    EXPECT_THAT(to.left == left && to.right == left && to.top == top && to.bottom == top);
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    kor::CellBlock block = AnyBlock(input);
    const kor::Anchor anchor = AnyAnchor(input, block);
    while (input.remaining_bytes() > 0) {
        const kor::CellBlock before = block;
        const bool single = !HasAnchor(anchor);
        switch (input.ConsumeIntegralInRange(0, 5)) {
        case 0:
            block = kor::MoveLeft(before, anchor);
            if (single) CheckCell(before, block, -1, 0);
            break;
        case 1:
            block = kor::MoveRight(before, anchor);
            if (single) CheckCell(before, block, 1, 0);
            break;
        case 2:
            block = kor::MoveUp(before, anchor);
            if (single) CheckCell(before, block, 0, -1);
            break;
        case 3:
            block = kor::MoveDown(before, anchor);
            if (single) CheckCell(before, block, 0, 1);
            break;
        case 4: block = kor::MovePageUp(before, input.ConsumeIntegralInRange(0, 255)); break;
        default: block = kor::MovePageDown(before, input.ConsumeIntegralInRange(0, 255)); break;
        }
        if (IsPastTheEnd(block)) return 0;
        if (single) EXPECT_THAT(kor::IsValidRange(block));
        // With an anchor a block may come out that is none: the grid asks before it shows one.
        if (!kor::IsValidRange(block)) return 0;
    }
    return 0;
}

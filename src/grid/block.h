// Cells and blocks of cells: pure calculations, without a window.
#pragma once

#include <algorithm>
#include <cstdint>

namespace kor {

constexpr int kColumnLimit = 256;
constexpr int kRowLimit = 16384;
constexpr int kNoAnchor = -1;

struct Cell {
    uint16_t column;
    uint16_t row;
};

// Both ends inclusive; the current cell is (left, top).
struct CellBlock {
    uint16_t left;
    uint16_t right;
    uint16_t top;
    uint16_t bottom;

    bool operator==(const CellBlock&) const = default;
};

// Where an extension with Shift began; both are kNoAnchor when there is none.
struct Anchor {
    int column;
    int row;
};

// Whether a block lies within the sheet and is not inverted.
constexpr bool IsValidRange(const CellBlock& block) {
    return block.left <= block.right && block.right < kColumnLimit && block.top <= block.bottom &&
           block.bottom < kRowLimit;
}

// The smallest block that contains both cells; each index is truncated to 16 bits.
constexpr CellBlock BlockBetween(int columnA, int rowA, int columnB, int rowB) {
    return {static_cast<uint16_t>(std::min(columnA, columnB)),
            static_cast<uint16_t>(std::max(columnA, columnB)),
            static_cast<uint16_t>(std::min(rowA, rowB)),
            static_cast<uint16_t>(std::max(rowA, rowB))};
}

}  // namespace kor

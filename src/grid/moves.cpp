// Indexes wrap round below 0, as 16-bit integers do, and are invalid then.
#include "grid/moves.h"

#include <cstdint>

namespace kor {

namespace {

bool Extends(Anchor anchor) { return anchor.column != kNoAnchor && anchor.row != kNoAnchor; }

uint16_t Word(int value) { return static_cast<uint16_t>(value); }

}  // namespace

CellBlock MoveLeft(CellBlock block, Anchor anchor) {
    if (!Extends(anchor)) {
        --block.left;
        block.right = block.left;
        block.bottom = block.top;
        if (!IsValidRange(block)) block.right = ++block.left;
    } else if (anchor.column >= block.right) {
        --block.left;
        block.right = Word(anchor.column);
        if (!IsValidRange(block)) ++block.left;
    } else {
        block.left = Word(anchor.column);
        --block.right;
        if (!IsValidRange(block)) ++block.right;
    }
    return block;
}

CellBlock MoveUp(CellBlock block, Anchor anchor) {
    if (!Extends(anchor)) {
        --block.top;
        block.bottom = block.top;
        block.right = block.left;
        if (!IsValidRange(block)) block.bottom = ++block.top;
    } else if (anchor.row >= block.bottom) {
        --block.top;
        block.bottom = Word(anchor.row);
        if (!IsValidRange(block)) ++block.top;
    } else {
        block.top = Word(anchor.row);
        --block.bottom;
        // Compatibility: the right column is restored here, not the bottom row; pinned by
        // GridMovesUp.RestoreTheRightColumnWhenABlockIsTurnedRound.
        if (!IsValidRange(block)) block.right = Word(block.bottom + 1);
    }
    return block;
}

CellBlock MoveRight(CellBlock block, Anchor anchor) {
    if (!Extends(anchor)) {
        ++block.left;
        block.right = block.left;
        block.bottom = block.top;
        if (!IsValidRange(block)) block.right = --block.left;
    } else if (anchor.column == block.left) {
        ++block.right;
        if (!IsValidRange(block)) --block.right;
    } else {
        ++block.left;
        block.right = Word(anchor.column);
        if (!IsValidRange(block)) --block.left;
    }
    return block;
}

CellBlock MoveDown(CellBlock block, Anchor anchor) {
    if (!Extends(anchor)) {
        ++block.top;
        block.bottom = block.top;
        block.right = block.left;
        if (!IsValidRange(block)) block.bottom = --block.top;
    } else if (anchor.row != block.top) {
        ++block.top;
        block.bottom = Word(anchor.row);
        if (!IsValidRange(block)) --block.top;
    } else {
        ++block.bottom;
        if (!IsValidRange(block)) --block.bottom;
    }
    return block;
}

CellBlock MovePageUp(CellBlock block, int rows) {
    block.top = Word(block.top - rows);
    block.bottom = block.top;
    block.right = block.left;
    if (!IsValidRange(block)) block.bottom = block.top = 0;
    return block;
}

CellBlock MovePageDown(CellBlock block, int rows) {
    block.top = Word(block.top + rows);
    block.bottom = block.top;
    block.right = block.left;
    // Compatibility: one past the last row, which is not a valid selection; the next key leads to
    // A1; pinned by GridPages.StopAtTheTopAndRunPastTheBottom.
    if (!IsValidRange(block)) block.bottom = block.top = Word(kRowLimit);
    return block;
}

}  // namespace kor

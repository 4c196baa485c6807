// The keyboard's half of the model.
#include "grid/use_model.h"

namespace kortest {

namespace {

WORD Word(int value) { return static_cast<WORD>(value); }

}  // namespace

bool UseModel::isPageUpOpen() const { return !isSelectionValid() && selection.top <= rows.count; }

int UseModel::key(int virtualKey, bool shift) {
    if (virtualKey == VK_TAB || virtualKey == VK_RETURN) {
        if (columns.first < 0 || rows.first < 0) return 1;
        anchorColumn = anchorRow = -1;
        if (virtualKey == VK_RETURN) return key(VK_DOWN, shift);
        return key(shift ? VK_LEFT : VK_RIGHT, shift);
    }
    if (virtualKey == VK_DELETE) {
        transcript.push_back("sent WM_KEYDOWN 46 1");
        return 0;
    }
    if (virtualKey == VK_PRIOR && isSelectionValid() && selection.top <= rows.count) {
        scrollRows(SB_PAGEUP, 0);
        return 0;
    }
    const bool extend = shift && hasAnchor();
    switch (virtualKey) {
    case VK_PRIOR: pageUp(); break;
    case VK_NEXT: pageDown(); break;
    case VK_LEFT: left(extend); break;
    case VK_UP: up(extend); break;
    case VK_RIGHT: right(extend); break;
    case VK_DOWN: down(extend); break;
    default: return 0;
    }
    tellCurrentCell();
    return 0;
}

void UseModel::pageUp() {
    if (isSelectionValid()) {
        const WORD top = Word(selection.top - rows.count);
        select({selection.left, selection.left, top, top});
    } else {
        select({});
    }
    if (selection.bottom >= rows.end()) scrollRows(SB_LINEDOWN, 0);
    scrollRows(SB_PAGEUP, 0);
}

void UseModel::pageDown() {
    if (isSelectionValid()) {
        const int top = selection.top + rows.count;
        const WORD row = Word(top < 16384 ? top : 16384);
        select({selection.left, selection.left, row, row});
    } else {
        select({});
    }
    if (selection.bottom >= rows.end()) scrollRows(SB_LINEDOWN, 0);
    scrollRows(SB_PAGEDOWN, 0);
}

void UseModel::left(bool extend) {
    if (!isSelectionValid()) {
        select({});
    } else if (!extend) {
        const WORD column = Word(selection.left == 0 ? 0 : selection.left - 1);
        select({column, column, selection.top, selection.top});
    } else if (anchorColumn >= selection.right) {
        const WORD edge = Word(anchorColumn);
        const GridSelection wider{Word(selection.left - 1), edge, selection.top, selection.bottom};
        select(isValid(wider)
                   ? wider
                   : GridSelection{selection.left, edge, selection.top, selection.bottom});
    } else {
        const WORD edge = Word(anchorColumn);
        const GridSelection narrower{edge, Word(selection.right - 1), selection.top,
                                     selection.bottom};
        select(isValid(narrower)
                   ? narrower
                   : GridSelection{edge, selection.right, selection.top, selection.bottom});
    }
    if (selection.left < columns.first) scrollColumns(SB_LINEUP, 0);
}

void UseModel::up(bool extend) {
    if (!isSelectionValid()) {
        select({});
    } else if (!extend) {
        const WORD row = Word(selection.top == 0 ? 0 : selection.top - 1);
        select({selection.left, selection.left, row, row});
    } else if (anchorRow >= selection.bottom) {
        const WORD edge = Word(anchorRow);
        const GridSelection wider{selection.left, selection.right, Word(selection.top - 1), edge};
        select(isValid(wider)
                   ? wider
                   : GridSelection{selection.left, selection.right, selection.top, edge});
    } else {
        const WORD bottom = Word(selection.bottom - 1);
        const GridSelection narrower{selection.left, selection.right, Word(anchorRow), bottom};
        // What is put back when that fails is the right column.
        select(isValid(narrower)
                   ? narrower
                   : GridSelection{selection.left, Word(bottom + 1), Word(anchorRow), bottom});
    }
    if (selection.top < rows.first) scrollRows(SB_LINEUP, 0);
}

void UseModel::right(bool extend) {
    if (!isSelectionValid()) {
        select({});
    } else if (!extend) {
        const WORD column = Word(selection.left == 255 ? 255 : selection.left + 1);
        select({column, column, selection.top, selection.top});
    } else if (anchorColumn == selection.left) {
        GridSelection wider = selection;
        ++wider.right;
        if (isValid(wider)) select(wider);
    } else {
        const WORD edge = Word(anchorColumn);
        const GridSelection narrower{Word(selection.left + 1), edge, selection.top,
                                     selection.bottom};
        select(isValid(narrower)
                   ? narrower
                   : GridSelection{selection.left, edge, selection.top, selection.bottom});
    }
    if (selection.right >= columns.end()) scrollColumns(SB_LINEDOWN, 0);
}

void UseModel::down(bool extend) {
    if (!isSelectionValid()) {
        select({});
    } else if (!extend) {
        const WORD row = Word(selection.top == 16383 ? 16383 : selection.top + 1);
        select({selection.left, selection.left, row, row});
    } else if (anchorRow != selection.top) {
        const WORD edge = Word(anchorRow);
        const GridSelection narrower{selection.left, selection.right, Word(selection.top + 1),
                                     edge};
        select(isValid(narrower)
                   ? narrower
                   : GridSelection{selection.left, selection.right, selection.top, edge});
    } else {
        GridSelection taller = selection;
        ++taller.bottom;
        if (isValid(taller)) select(taller);
    }
    if (selection.bottom >= rows.end()) scrollRows(SB_LINEDOWN, 0);
}

}  // namespace kortest

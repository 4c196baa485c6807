// The sheet: what was typed into each cell, and what it comes to.
//
// Cells are kept sparsely, and formulas are calculated when their value is first asked for. A
// change makes the formulas that depend on the cell forget their results, and no others. So reading
// a value may calculate: a sheet must not be read from two threads at once.
//
// What is typed:  ""         nothing, the cell is empty
//                 12.5e3     a number (see ReadNumber); 12% is one too
//                 true       TRUE or FALSE in any mixture of capital and small letters
//                 =A1+1      a formula; a single "=" is text
//                 '12        text, without the apostrophe
//                 others     text
#ifndef WORKBOOK_MODEL_SHEET_H
#define WORKBOOK_MODEL_SHEET_H

#include "address.h"
#include "value.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace workbook {

struct Cell;
class CellStore;
class DependencyIndex;

// The longest text a cell takes, in UTF-16 units.
constexpr size_t kLongestCellText = 32767;

struct CellText {
    CellAddress cell;
    std::wstring text;
};

// How many columns and rows, counted from A1, the occupied cells reach over.
struct SheetExtent {
    int columns = 0;
    int rows = 0;

    friend bool operator==(const SheetExtent&, const SheetExtent&) = default;
};

class Sheet {
public:
    Sheet();
    ~Sheet();
    Sheet(Sheet&& other) noexcept;
    Sheet& operator=(Sheet&& other) noexcept;

    // Sets what was typed into a cell; an empty text empties it. The cell must be in the sheet and
    // the text not longer than kLongestCellText, or nothing happens. Throws std::bad_alloc without
    // having changed anything. (Edits with undo go through Document.)
    void setText(CellAddress cell, std::wstring text);

    // Gives each cell its text, and each text becomes the one that the cell had before. All cells
    // must be different ones in the sheet, and no text too long; their order may change. Throws
    // std::bad_alloc without having changed anything.
    void exchangeTexts(std::vector<CellText>& cells);

    // What was typed, as the equation bar shows it; empty for an empty cell.
    const std::wstring& text(CellAddress cell) const;

    // The computed value.
    Value value(CellAddress cell) const;

    // The same without a copy; the text in it is valid until the sheet is changed.
    ValueView view(CellAddress cell) const;

    // What the cell shows. Numbers stand on the right, texts on the left, truth values and errors
    // in the centre: ask value().kind.
    std::wstring display(CellAddress cell) const;

    bool isEmpty(CellAddress cell) const;
    bool isFormula(CellAddress cell) const;

    // Why a formula cannot be read ("A closing parenthesis is missing."), for the status line;
    // empty when the cell holds no formula or a readable one.
    std::wstring formulaProblem(CellAddress cell) const;

    SheetExtent extent() const;
    size_t occupiedCells() const;

    // The occupied cells of a block, column by column from the left, each from top to bottom.
    std::vector<CellAddress> occupiedIn(const Block& block) const;

    // Calls visit(cell, value) for them in that order until it returns false. It must not change
    // the sheet; it may read other cells.
    void visit(const Block& block,
               const std::function<bool(CellAddress, const ValueView&)>& visit) const;

private:
    Cell prepare(CellAddress cell, std::wstring& text);
    void commit(CellAddress cell, Cell content, std::wstring& formerText) noexcept;

    // Cells with formulas keep their results here, so reading changes it.
    std::unique_ptr<CellStore> store_;
    std::unique_ptr<DependencyIndex> dependents_;
};

}  // namespace workbook

#endif

// The sheets that are open in the workbook, one of which is shown. No windows.
#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "chart_data.h"
#include "column_widths.h"
#include "model/document.h"

namespace workbook {

// Sheets have colours by which they are told apart; with more sheets colours come again.
constexpr int kSheetColours = 8;

// What of a sheet is charted, and what its user chose about it.
struct ChartChoice {
    std::optional<Block> block;           // nothing: the whole sheet
    std::optional<ChartTitles> titles;    // otherwise they follow the sheet
    std::optional<ValueRange> values;     // of the value axis; otherwise automatic
    std::optional<ValueRange> positions;  // of the category axis; likewise
};

// How a sheet is shown, to show it so again after another one. The grid's own part of it, selection
// and first visible cell, is noted when the sheet is left.
struct SheetView {
    ColumnWidths widths;
    std::map<int, int> heights;  // in units, of the rows that do not have the default height
    bool titleRow = false;       // row 1 in bold on a tinted background
    Block selection;
    CellAddress firstVisible;
    ChartChoice chart;
};

struct OpenSheet {
    explicit OpenSheet(int number = 1) : document(number) {}

    Document document;
    SheetView view;
    int colour = 0;  // below kSheetColours
};

// Never empty: in place of the last sheet to be closed there is a new one.
class OpenSheets {
public:
    OpenSheets();

    size_t count() const { return sheets_.size(); }
    OpenSheet& at(size_t index) { return *sheets_[index]; }
    const OpenSheet& at(size_t index) const { return *sheets_[index]; }

    size_t currentIndex() const { return current_; }
    OpenSheet& current() { return at(current_); }
    const OpenSheet& current() const { return at(current_); }
    void select(size_t index) { current_ = index; }

    // A new, unnamed sheet behind the others; it becomes the current one. Throws std::bad_alloc.
    OpenSheet& addNew();

    // Likewise for a sheet with a file. It takes the place of the current one when that one is new
    // and untouched. Throws std::bad_alloc.
    OpenSheet& add(std::unique_ptr<OpenSheet> sheet);

    // The sheet with this file, in whatever letters; paths are compared, not files.
    std::optional<size_t> find(const std::wstring& path) const;

    // Closes the current sheet; the next one becomes current, or the one before the last. Throws
    // std::bad_alloc when a new one is needed, and has changed nothing then.
    void closeCurrent();

private:
    int freeNumber() const;
    int rarestColour() const;

    std::vector<std::unique_ptr<OpenSheet>> sheets_;
    size_t current_ = 0;
};

}  // namespace workbook

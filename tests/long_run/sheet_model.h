// A sheet as the workbook's page describes it, in the simplest way: texts by cell, and lists of
// steps to undo and to redo. It shares nothing with the workbook.
#pragma once

#include <deque>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace longrun {

struct Place {
    int row;
    int column;
    friend auto operator<=>(const Place&, const Place&) = default;
};

struct Area {
    Place first;
    Place last;
};

using Texts = std::vector<std::pair<Place, std::wstring>>;
using Rows = std::vector<std::vector<std::wstring>>;

class SheetModel {
public:
    static constexpr int kRows = 16384;
    static constexpr int kColumns = 256;

    std::wstring path;  // empty while it has never been saved

    std::wstring at(Place place) const;
    int usedRows() const;
    int usedColumns() const;
    bool hasFormulaIn(const Area& area) const;

    // One step to undo; none when nothing changes or a cell lies outside the sheet.
    void write(const Texts& texts);
    void clear(const Area& area);
    void undo();
    void redo();
    bool canUndo() const { return !done_.empty(); }
    bool canRedo() const { return !undone_.empty(); }

    void markSaved() { saved_ = now_; }
    bool isModified() const { return saved_ != now_; }

    // Cells of the area, as far as the sheet is used.
    Rows copy(const Area& area) const;

    // UTF-8, a rectangle of all that is occupied.
    std::string csv() const;
    // Of such a file.
    static SheetModel read(const std::wstring& path, const std::string& csv);

private:
    struct Change {
        Place place;
        std::wstring before;
        std::wstring after;
    };
    using Step = std::vector<Change>;

    void put(Place place, const std::wstring& text);

    std::map<Place, std::wstring> texts_;  // of the occupied cells
    std::deque<Step> done_;
    std::vector<Step> undone_;
    long now_ = 0;  // counts steps since the beginning
    std::optional<long> saved_ = 0;
};

}  // namespace longrun

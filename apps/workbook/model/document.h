// An open document: sheet, file, edits with undo and redo. This is what the window talks to.
#ifndef WORKBOOK_MODEL_DOCUMENT_H
#define WORKBOOK_MODEL_DOCUMENT_H

#include "csv.h"
#include "edit_history.h"
#include "file_io.h"
#include "sheet.h"

#include <optional>
#include <string>
#include <vector>

namespace workbook {

enum class EditResult {
    Done,
    Unchanged,     // the cells hold that already: no step was made
    OutsideSheet,  // some cell lies outside the sheet: nothing was changed
    TooLong,       // some text is longer than kLongestCellText: nothing was changed
    NoMemory       // nothing was changed
};

// A sentence for the user; empty for Done and Unchanged.
std::wstring EditMessage(EditResult result);

class Document {
public:
    // `number` tells unnamed documents apart: "Untitled", "Untitled 2", "Untitled 3"...
    explicit Document(int number = 1) : number_(number) {}

    const Sheet& sheet() const { return sheet_; }

    // ---- File. Nothing is thrown; a problem leaves the document, and the file, as they were.

    // An empty, unnamed document.
    void startNew();

    std::optional<FileProblem> open(const std::wstring& path) noexcept;

    // Writes the file and makes `path` the document's own. When that is its own already and
    // somebody else has changed or removed it since it was read or written, the problem tells so.
    std::optional<FileProblem> save(const std::wstring& path) noexcept;

    // The same whatever is there: its user wants it replaced.
    std::optional<FileProblem> saveOver(const std::wstring& path) noexcept;

    const std::wstring& path() const { return path_; }  // empty while unnamed
    std::wstring name() const;                          // without folders; "Untitled" while unnamed
    int number() const { return number_; }
    const CsvFormat& format() const { return format_; }

    // Whether the sheet differs from the file. Undoing (or redoing) to the state that was saved
    // makes it false again; an edit that happens to restore the same texts does not.
    bool isModified() const { return !history_.isSavedState(); }

    // ---- Edits. Each is one step for undo.

    // "typing in B4", or "clearing B4" for an empty text.
    EditResult setCell(CellAddress cell, std::wstring text) noexcept;

    // Several cells at once. `what` completes the menu's text: "pasting into A1:C3" is shown as
    // "Undo pasting into A1:C3". When a cell comes twice, the last one counts.
    EditResult setCells(std::vector<CellText> cells, std::wstring what) noexcept;

    // "clearing A1:C3".
    EditResult clear(const Block& block) noexcept;

    // ---- Undo

    bool canUndo() const { return history_.stepToUndo() != nullptr; }
    bool canRedo() const { return history_.stepToRedo() != nullptr; }
    std::wstring undoText() const;  // "Undo typing in B4"; "Undo" when there is nothing to undo
    std::wstring redoText() const;  // "Redo typing in B4"; "Redo" likewise

    // The block that was changed, to be selected and shown; nothing when there was no step to take
    // (or no memory to take it, in which case the sheet is as before).
    std::optional<Block> undo() noexcept;
    std::optional<Block> redo() noexcept;

private:
    std::optional<FileProblem> write(const std::wstring& path,
                                     const std::optional<FileMark>& expected) noexcept;
    EditResult apply(EditStep step);
    bool exchange(EditStep& step) noexcept;

    Sheet sheet_;
    CsvFormat format_;
    std::wstring path_;
    std::optional<FileMark> mark_;  // what the file held when it was read or written
    int number_;
    EditHistory history_;
};

}  // namespace workbook

#endif

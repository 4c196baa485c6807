// The list of edits behind Undo and Redo, and where in it the saved file stands.
#ifndef WORKBOOK_MODEL_EDIT_HISTORY_H
#define WORKBOOK_MODEL_EDIT_HISTORY_H

#include "sheet.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace workbook {

// One edit. Each cell keeps the text that the sheet does not have at the moment: the former one
// while the step is done, the later one while it is undone.
struct EditStep {
    std::wstring what;  // "typing in B4"
    std::vector<CellText> cells;
};

class EditHistory {
public:
    // The oldest steps beyond this many are forgotten.
    static constexpr size_t kMostSteps = 1000;

    // Makes room, so that add() cannot fail. Throws std::bad_alloc.
    void reserve();

    // A step was done. Undone ones are forgotten.
    void add(EditStep step) noexcept;

    // The step to undo or redo, or null. Exchange its texts with the sheet's, then call moved...().
    EditStep* stepToUndo() noexcept;
    EditStep* stepToRedo() noexcept;
    const EditStep* stepToUndo() const noexcept;
    const EditStep* stepToRedo() const noexcept;
    void movedBack() noexcept { --done_; }
    void movedForward() noexcept { ++done_; }

    // The sheet as it is now is what the file holds.
    void markSaved() noexcept { saved_ = done_; }
    bool isSavedState() const noexcept { return saved_ == done_; }

    void forgetAll() noexcept;

private:
    std::vector<EditStep> steps_;
    size_t done_ = 0;                   // steps_[0 .. done_) are done, the rest undone
    std::optional<size_t> saved_ = 0u;  // like done_; nothing when that state cannot be reached
};

}  // namespace workbook

#endif

#include "edit_history.h"

#include <iterator>
#include <utility>

namespace workbook {

void EditHistory::reserve() { steps_.reserve(kMostSteps + 1); }

void EditHistory::add(EditStep step) noexcept {
    if (saved_ && *saved_ > done_) saved_.reset();
    steps_.erase(std::next(steps_.begin(), static_cast<std::ptrdiff_t>(done_)), steps_.end());
    steps_.push_back(std::move(step));
    ++done_;
    if (steps_.size() <= kMostSteps) return;

    steps_.erase(steps_.begin());
    --done_;
    if (saved_ == 0u) saved_.reset();
    if (saved_) --*saved_;
}

EditStep* EditHistory::stepToUndo() noexcept { return done_ == 0 ? nullptr : &steps_[done_ - 1]; }

EditStep* EditHistory::stepToRedo() noexcept {
    return done_ == steps_.size() ? nullptr : &steps_[done_];
}

const EditStep* EditHistory::stepToUndo() const noexcept {
    return const_cast<EditHistory*>(this)->stepToUndo();
}

const EditStep* EditHistory::stepToRedo() const noexcept {
    return const_cast<EditHistory*>(this)->stepToRedo();
}

void EditHistory::forgetAll() noexcept {
    steps_.clear();
    done_ = 0;
    saved_ = 0u;
}

}  // namespace workbook

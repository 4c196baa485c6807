#include "open_sheets.h"

#include <algorithm>
#include <array>
#include <cwctype>
#include <utility>

namespace workbook {

namespace {

bool AreSamePaths(const std::wstring& one, const std::wstring& other) {
    return std::ranges::equal(one, other, [](wchar_t left, wchar_t right) {
        return std::towlower(left) == std::towlower(right);
    });
}

// Nothing would be lost without it: no file, nothing typed, nothing to undo.
bool IsUntouched(const Document& document) {
    return document.path().empty() && !document.canUndo() && !document.canRedo();
}

}  // namespace

OpenSheets::OpenSheets() { addNew(); }

OpenSheet& OpenSheets::addNew() {
    auto sheet = std::make_unique<OpenSheet>(freeNumber());
    sheet->colour = rarestColour();
    sheets_.push_back(std::move(sheet));
    current_ = sheets_.size() - 1;
    return current();
}

OpenSheet& OpenSheets::add(std::unique_ptr<OpenSheet> sheet) {
    if (IsUntouched(current().document)) {
        sheet->colour = current().colour;
        sheets_[current_] = std::move(sheet);
    } else {
        sheet->colour = rarestColour();
        sheets_.push_back(std::move(sheet));
        current_ = sheets_.size() - 1;
    }
    return current();
}

std::optional<size_t> OpenSheets::find(const std::wstring& path) const {
    if (path.empty()) return std::nullopt;
    for (size_t index = 0; index < count(); ++index) {
        if (AreSamePaths(at(index).document.path(), path)) return index;
    }
    return std::nullopt;
}

void OpenSheets::closeCurrent() {
    if (count() == 1) {
        sheets_.front() = std::make_unique<OpenSheet>();
        return;
    }
    sheets_.erase(sheets_.begin() + static_cast<std::ptrdiff_t>(current_));
    current_ = std::min(current_, count() - 1);
}

// The least number that no unnamed sheet has.
int OpenSheets::freeNumber() const {
    const auto isTaken = [this](int number) {
        return std::ranges::any_of(sheets_, [number](const auto& sheet) {
            return sheet->document.path().empty() && sheet->document.number() == number;
        });
    };
    int number = 1;
    while (isTaken(number)) ++number;
    return number;
}

int OpenSheets::rarestColour() const {
    std::array<int, kSheetColours> uses = {};
    for (const auto& sheet : sheets_) ++uses[static_cast<size_t>(sheet->colour)];
    return static_cast<int>(std::ranges::min_element(uses) - uses.begin());
}

}  // namespace workbook

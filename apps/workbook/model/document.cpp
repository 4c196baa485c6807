#include "document.h"

#include "last_words.h"

#include <algorithm>
#include <new>
#include <utility>

namespace workbook {

namespace {

Block BlockAround(const std::vector<CellText>& cells) {
    Block block = BlockOf(cells.front().cell);
    for (const CellText& each : cells) {
        block.left = std::min(block.left, each.cell.column);
        block.right = std::max(block.right, each.cell.column);
        block.top = std::min(block.top, each.cell.row);
        block.bottom = std::max(block.bottom, each.cell.row);
    }
    return block;
}

bool ComesBefore(const CellText& one, const CellText& other) {
    if (one.cell.column != other.cell.column) return one.cell.column < other.cell.column;
    return one.cell.row < other.cell.row;
}

// Leaves the last text for each cell, ordered by column, then row.
void KeepLastOfEach(std::vector<CellText>& cells) {
    std::stable_sort(cells.begin(), cells.end(), ComesBefore);
    const auto sameCell = [](const CellText& one, const CellText& other) {
        return one.cell == other.cell;
    };
    // Of equal neighbours unique() keeps the first, which from behind is the last.
    const auto first = std::unique(cells.rbegin(), cells.rend(), sameCell).base();
    cells.erase(cells.begin(), first);
}

std::wstring FileNameOf(const std::wstring& path) {
    const size_t slash = path.find_last_of(L"\\/:");
    return slash == std::wstring::npos ? path : path.substr(slash + 1);
}

FileProblem OutOfMemory() noexcept { return {TextOrNothing(L"There is not enough memory.")}; }

}  // namespace

std::wstring EditMessage(EditResult result) {
    switch (result) {
    case EditResult::OutsideSheet:
        return L"The cells reach beyond the sheet, which has 256 columns and 16,384 rows.";
    case EditResult::TooLong: return L"A cell takes at most 32,767 characters.";
    case EditResult::NoMemory: return L"There is not enough memory for this change.";
    case EditResult::Done:
    case EditResult::Unchanged: break;
    }
    return {};
}

void Document::startNew() {
    Sheet empty;
    sheet_ = std::move(empty);
    format_ = {};
    path_.clear();
    mark_.reset();
    history_.forgetAll();
}

std::optional<FileProblem> Document::open(const std::wstring& path) noexcept {
    try {
        std::wstring ownPath = path;
        FileContents contents = ReadWholeFile(path, kLargestFile);
        if (contents.problem) return contents.problem;
        CsvResult result = ReadCsv(contents.bytes);
        if (result.problem)
            return FileProblem{L"Cannot open \"" + path + L"\": " + result.problem->message};
        sheet_ = std::move(result.document->sheet);
        format_ = std::move(result.document->format);
        path_ = std::move(ownPath);
        mark_ = MarkOf(contents.bytes);
        history_.forgetAll();
        return std::nullopt;
    } catch (const std::bad_alloc&) {
        return OutOfMemory();
    }
}

std::optional<FileProblem> Document::save(const std::wstring& path) noexcept {
    return write(path, path == path_ ? mark_ : std::nullopt);
}

std::optional<FileProblem> Document::saveOver(const std::wstring& path) noexcept {
    return write(path, std::nullopt);
}

std::optional<FileProblem> Document::write(const std::wstring& path,
                                           const std::optional<FileMark>& expected) noexcept {
    try {
        std::wstring ownPath = path;
        const std::string bytes = WriteCsv(sheet_, format_);
        if (bytes.size() > kLargestFile)
            return FileProblem{L"Cannot write \"" + path +
                               L"\": the file would be larger than 64 MB, and could not be opened "
                               L"again."};
        if (auto problem = ReplaceFileBytes(path, bytes, expected)) return problem;
        path_ = std::move(ownPath);
        mark_ = MarkOf(bytes);
        history_.markSaved();
        return std::nullopt;
    } catch (const std::bad_alloc&) {
        return OutOfMemory();
    }
}

std::wstring Document::name() const {
    if (!path_.empty()) return FileNameOf(path_);
    return number_ == 1 ? L"Untitled" : L"Untitled " + std::to_wstring(number_);
}

EditResult Document::setCell(CellAddress cell, std::wstring text) noexcept {
    try {
        const std::wstring what =
            (text.empty() ? L"clearing " : L"typing in ") + FormatAddress(cell);
        std::vector<CellText> cells;
        cells.push_back({cell, std::move(text)});
        return setCells(std::move(cells), what);
    } catch (const std::bad_alloc&) {
        return EditResult::NoMemory;
    }
}

EditResult Document::setCells(std::vector<CellText> cells, std::wstring what) noexcept {
    const auto isOutside = [](const CellText& each) { return !IsInSheet(each.cell); };
    const auto isTooLong = [](const CellText& each) { return each.text.size() > kLongestCellText; };
    if (std::ranges::any_of(cells, isOutside)) return EditResult::OutsideSheet;
    if (std::ranges::any_of(cells, isTooLong)) return EditResult::TooLong;
    try {
        KeepLastOfEach(cells);
        std::erase_if(cells,
                      [this](const CellText& each) { return sheet_.text(each.cell) == each.text; });
        return apply({std::move(what), std::move(cells)});
    } catch (const std::bad_alloc&) {
        return EditResult::NoMemory;
    }
}

EditResult Document::clear(const Block& block) noexcept {
    try {
        std::vector<CellText> cells;
        for (const CellAddress cell : sheet_.occupiedIn(block)) cells.push_back({cell, {}});
        return apply({L"clearing " + FormatBlock(block), std::move(cells)});
    } catch (const std::bad_alloc&) {
        return EditResult::NoMemory;
    }
}

EditResult Document::apply(EditStep step) {
    if (step.cells.empty()) return EditResult::Unchanged;
    history_.reserve();
    if (!exchange(step)) return EditResult::NoMemory;
    history_.add(std::move(step));
    return EditResult::Done;
}

// Exchanges the step's texts with those of the sheet, or does nothing when memory runs out.
bool Document::exchange(EditStep& step) noexcept {
    try {
        sheet_.exchangeTexts(step.cells);
        return true;
    } catch (const std::bad_alloc&) {
        return false;
    }
}

std::wstring Document::undoText() const {
    const EditStep* step = history_.stepToUndo();
    return step ? L"Undo " + step->what : L"Undo";
}

std::wstring Document::redoText() const {
    const EditStep* step = history_.stepToRedo();
    return step ? L"Redo " + step->what : L"Redo";
}

std::optional<Block> Document::undo() noexcept {
    EditStep* step = history_.stepToUndo();
    if (!step || !exchange(*step)) return std::nullopt;
    history_.movedBack();
    return BlockAround(step->cells);
}

std::optional<Block> Document::redo() noexcept {
    EditStep* step = history_.stepToRedo();
    if (!step || !exchange(*step)) return std::nullopt;
    history_.movedForward();
    return BlockAround(step->cells);
}

}  // namespace workbook

#include "sheet.h"

#include "calculation.h"
#include "cell_store.h"
#include "dependency_index.h"
#include "number_text.h"

#include <algorithm>
#include <utility>

namespace workbook {

namespace {

bool EqualsIgnoringCase(std::wstring_view text, std::wstring_view capitals) {
    return std::ranges::equal(text, capitals, [](wchar_t one, wchar_t capital) {
        return one == capital || one == capital - L'A' + L'a';
    });
}

bool IsFormulaText(std::wstring_view typed) { return typed.size() > 1 && typed.front() == L'='; }

// For numbers, truth values and texts.
void Classify(Cell& cell, std::wstring_view typed) {
    cell.kind = ValueKind::Text;
    if (typed.front() == L'\'') return;
    if (const auto number = ReadNumber(typed)) {
        cell.kind = ValueKind::Number;
        cell.number = *number;
    } else if (EqualsIgnoringCase(typed, L"TRUE") || EqualsIgnoringCase(typed, L"FALSE")) {
        cell.kind = ValueKind::Boolean;
        cell.number = typed.size() == 4 ? 1 : 0;
    }
}

}  // namespace

Sheet::Sheet()
    : store_(std::make_unique<CellStore>()), dependents_(std::make_unique<DependencyIndex>()) {}
Sheet::~Sheet() = default;
Sheet::Sheet(Sheet&& other) noexcept = default;
Sheet& Sheet::operator=(Sheet&& other) noexcept = default;

void Sheet::setText(CellAddress cell, std::wstring text) {
    if (!IsInSheet(cell) || text.size() > kLongestCellText) return;
    Cell content = prepare(cell, text);
    if (content.formula) dependents_->tie(*content.formula);
    commit(cell, std::move(content), text);
}

void Sheet::exchangeTexts(std::vector<CellText>& cells) {
    // Emptied cells go last: taking a page's last cell throws the page away, and another cell of
    // this exchange may count on its room.
    std::partition(cells.begin(), cells.end(),
                   [](const CellText& each) { return !each.text.empty(); });

    std::vector<Cell> contents;
    contents.reserve(cells.size());
    try {
        for (CellText& each : cells) contents.push_back(prepare(each.cell, each.text));
    } catch (...) {
        for (size_t i = 0; i < contents.size(); ++i) cells[i].text = std::move(contents[i].typed);
        throw;
    }
    // All new formulas are tied before the first old one is untied.
    for (Cell& content : contents)
        if (content.formula) dependents_->tie(*content.formula);
    for (size_t i = 0; i < cells.size(); ++i)
        commit(cells[i].cell, std::move(contents[i]), cells[i].text);
}

// All that needs memory. The text is taken only when nothing can fail any more.
Cell Sheet::prepare(CellAddress cell, std::wstring& text) {
    Cell content;
    if (IsFormulaText(text)) {
        content.formula = std::make_unique<FormulaCell>();
        content.formula->cell = cell;
        content.formula->program = CompileFormula(std::wstring_view(text).substr(1));
        dependents_->prepare(*content.formula);
    } else if (!text.empty()) {
        Classify(content, text);
    }
    if (!text.empty()) store_->makeRoom(cell);
    content.typed = std::move(text);
    return content;
}

// For prepared content whose formula is tied.
void Sheet::commit(CellAddress cell, Cell content, std::wstring& formerText) noexcept {
    dependents_->invalidateReadersOf(cell, *store_);
    const bool isFormula = content.formula != nullptr;
    Cell old = content.typed.empty() ? store_->take(cell) : store_->put(cell, std::move(content));
    if (old.formula) dependents_->untie(*old.formula);
    if (isFormula) store_->setPending(cell, true);
    formerText = std::move(old.typed);
}

const std::wstring& Sheet::text(CellAddress cell) const {
    static const std::wstring empty;
    const Cell* found = store_->find(cell);
    return found ? found->typed : empty;
}

ValueView Sheet::view(CellAddress cell) const {
    const Cell* found = store_->find(cell);
    if (!found) return {};
    if (store_->isPending(cell)) {
        Calculation(*store_).run(*found->formula);
        dependents_->startNewPeriod();
    }
    return ViewOf(*found);
}

Value Sheet::value(CellAddress cell) const { return Value::of(view(cell)); }

std::wstring Sheet::display(CellAddress cell) const { return DisplayText(view(cell)); }

bool Sheet::isEmpty(CellAddress cell) const { return store_->find(cell) == nullptr; }

bool Sheet::isFormula(CellAddress cell) const {
    const Cell* found = store_->find(cell);
    return found && found->formula;
}

std::wstring Sheet::formulaProblem(CellAddress cell) const {
    if (!isFormula(cell)) return {};
    return std::wstring(ProblemMessage(store_->find(cell)->formula->program.problem));
}

SheetExtent Sheet::extent() const { return {store_->columns(), store_->rows()}; }

size_t Sheet::occupiedCells() const { return store_->occupiedCells(); }

std::vector<CellAddress> Sheet::occupiedIn(const Block& block) const {
    std::vector<CellAddress> cells;
    if (const auto clipped = ClipToSheet(block)) {
        store_->walk(*clipped, [&cells](CellAddress cell, const Cell&) {
            cells.push_back(cell);
            return true;
        });
    }
    return cells;
}

void Sheet::visit(const Block& block,
                  const std::function<bool(CellAddress, const ValueView&)>& visit) const {
    const auto clipped = ClipToSheet(block);
    if (!clipped) return;
    // Calculating changes results, never which cells are occupied, so it does not upset the walk.
    store_->walk(*clipped, [&](CellAddress cell, const Cell&) { return visit(cell, view(cell)); });
}

}  // namespace workbook

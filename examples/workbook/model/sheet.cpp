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

// Numbers, truth values and texts; formulas are made by the caller.
void Classify(Cell& cell) {
    cell.kind = ValueKind::Text;
    if (cell.typed.front() == L'\'') return;
    if (const auto number = ReadNumber(cell.typed)) {
        cell.kind = ValueKind::Number;
        cell.number = *number;
    } else if (EqualsIgnoringCase(cell.typed, L"TRUE") || EqualsIgnoringCase(cell.typed, L"FALSE")) {
        cell.kind = ValueKind::Boolean;
        cell.number = cell.typed.size() == 4 ? 1 : 0;
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

    // All that needs memory comes first.
    Cell content;
    content.typed = std::move(text);
    if (IsFormulaText(content.typed)) {
        content.formula = std::make_unique<FormulaCell>();
        content.formula->cell = cell;
        content.formula->program = CompileFormula(std::wstring_view(content.typed).substr(1));
        dependents_->prepare(*content.formula);
    } else if (!content.typed.empty()) {
        Classify(content);
    }
    if (!content.typed.empty()) store_->makeRoom(cell);

    dependents_->invalidateReadersOf(cell, *store_);
    FormulaCell* formula = content.formula.get();
    if (formula) dependents_->tie(*formula);
    const Cell old = content.typed.empty() ? store_->take(cell)
                                           : store_->put(cell, std::move(content));
    if (old.formula) dependents_->untie(*old.formula);
    if (formula) store_->setPending(cell, true);
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

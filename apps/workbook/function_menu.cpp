#include "function_menu.h"

#include <algorithm>
#include <optional>
#include <string>

#include "equation_bar.h"
#include "model/functions.h"
#include "resource.h"
#include "selection.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr int kButtonWidth = 25;  // of "fx", which lies left of the equation bar's text

POINT BelowFunctionButton() {
    RECT edit = {};
    GetWindowRect(GetHandleToEquationControl(), &edit);
    return {edit.left - kButtonWidth, edit.bottom};
}

// Functions of any number of values work on a block.
bool TakesBlock(const FunctionDescription& function) {
    return function.fewestArguments == 1 && function.mostArguments > 2;
}

bool IsSingleCell(const Block& block) { return block == BlockOf({block.left, block.top}); }

// The used part of the selected block; nothing for a single cell or an unused block.
std::optional<Block> BlockToCalculate(const Sheet& sheet) {
    Block block = SelectedBlock();
    if (IsSingleCell(block)) return std::nullopt;
    const SheetExtent extent = sheet.extent();
    block.right = std::min(block.right, extent.columns - 1);
    block.bottom = std::min(block.bottom, extent.rows - 1);
    if (block.right < block.left || block.bottom < block.top) return std::nullopt;
    return block;
}

// The first free cell below a block's first column.
std::optional<CellAddress> PlaceBelow(const Sheet& sheet, const Block& block) {
    CellAddress cell = {block.left, block.bottom + 1};
    while (IsInSheet(cell) && !sheet.isEmpty(cell)) ++cell.row;
    return IsInSheet(cell) ? std::optional(cell) : std::nullopt;
}

std::wstring FormulaSoFar(const Sheet& sheet) {
    const std::wstring& text = sheet.text(CurrentCell());
    return text.starts_with(L'=') ? text : L"=";
}

}  // namespace

void ShowFunctionMenu(Workbook& workbook) {
    CommitTyping(workbook);
    const HMENU menu = CreatePopupMenu();
    if (!menu) return;
    UINT command = IDM_FUNCTION_FIRST;
    for (const FunctionDescription& function : Functions()) {
        std::wstring text(function.arguments);
        text += L'\t';
        text += function.help;
        AppendMenuW(menu, MF_STRING, command++, text.c_str());
    }
    const POINT place = BelowFunctionButton();
    TrackPopupMenuEx(menu, TPM_LEFTALIGN | TPM_TOPALIGN | TPM_LEFTBUTTON, place.x, place.y,
                     workbook.window, nullptr);
    DestroyMenu(menu);
}

void InsertFunction(Workbook& workbook, UINT command) {
    const size_t index = command - IDM_FUNCTION_FIRST;
    if (index >= Functions().size()) return;
    const FunctionDescription& function = Functions()[index];
    const Sheet& sheet = workbook.sheet();
    const std::wstring call = std::wstring(function.name) + L"(";

    const std::optional<Block> block = BlockToCalculate(sheet);
    const std::optional<CellAddress> place = block ? PlaceBelow(sheet, *block) : std::nullopt;
    if (place && TakesBlock(function)) {
        GoTo(workbook, BlockOf(*place));
        BeginTyping(workbook, L"=" + call + FormatBlock(*block) + L")");
    } else {
        BeginTyping(workbook, FormulaSoFar(sheet) + call);
    }
}

}  // namespace workbook

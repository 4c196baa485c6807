#include "clipboard.h"

#include <windows.h>

#include <algorithm>
#include <cstring>
#include <string>
#include <utility>
#include <vector>

#include "edit_commands.h"
#include "selection.h"
#include "tab_text.h"
#include "workbook.h"

namespace workbook {

namespace {

// The clipboard, open for as long as it lives.
class OpenedClipboard {
public:
    explicit OpenedClipboard(HWND owner) : isOpen_(OpenClipboard(owner) != FALSE) {}
    ~OpenedClipboard() {
        if (isOpen_) CloseClipboard();
    }
    OpenedClipboard(const OpenedClipboard&) = delete;
    OpenedClipboard& operator=(const OpenedClipboard&) = delete;

    explicit operator bool() const { return isOpen_; }

private:
    bool isOpen_;
};

bool PutText(HWND owner, const std::wstring& text) {
    const OpenedClipboard clipboard(owner);
    if (!clipboard || !EmptyClipboard()) return false;
    const size_t bytes = (text.size() + 1) * sizeof(wchar_t);
    const HGLOBAL block = GlobalAlloc(GMEM_MOVEABLE, bytes);
    void* const memory = block ? GlobalLock(block) : nullptr;
    if (memory) {
        std::memcpy(memory, text.c_str(), bytes);
        GlobalUnlock(block);
        if (SetClipboardData(CF_UNICODETEXT, block)) return true;  // the system's block from now on
    }
    GlobalFree(block);
    return false;
}

std::wstring TakeText(HWND owner) {
    const OpenedClipboard clipboard(owner);
    const HANDLE block = clipboard ? GetClipboardData(CF_UNICODETEXT) : nullptr;
    const auto* const memory = block ? static_cast<const wchar_t*>(GlobalLock(block)) : nullptr;
    if (!memory) return {};
    // The block may be larger than the text, and need not be terminated.
    const size_t limit = GlobalSize(block) / sizeof(wchar_t);
    const std::wstring text(memory, std::find(memory, memory + limit, L'\0'));
    GlobalUnlock(block);
    return text;
}

// A formula gives its result, anything else what was typed.
std::wstring CopiedText(const Sheet& sheet, CellAddress cell) {
    return sheet.isFormula(cell) ? sheet.display(cell) : sheet.text(cell);
}

// Whole columns and rows are copied as far as the sheet is used.
std::vector<TextRow> CopiedRows(const Sheet& sheet, const Block& block) {
    const SheetExtent extent = sheet.extent();
    const int right = std::min(block.right, std::max(extent.columns - 1, block.left));
    const int bottom = std::min(block.bottom, std::max(extent.rows - 1, block.top));
    std::vector<TextRow> rows;
    for (int row = block.top; row <= bottom; ++row) {
        TextRow texts;
        for (int column = block.left; column <= right; ++column) {
            texts.push_back(CopiedText(sheet, {column, row}));
        }
        rows.push_back(std::move(texts));
    }
    return rows;
}

std::vector<CellText> CellsFrom(CellAddress first, std::vector<TextRow> rows) {
    std::vector<CellText> cells;
    CellAddress cell = first;
    for (TextRow& row : rows) {
        cell.column = first.column;
        for (std::wstring& text : row) {
            cells.push_back({cell, std::move(text)});
            ++cell.column;
        }
        ++cell.row;
    }
    return cells;
}

Block ExtentOf(const std::vector<CellText>& cells) {
    Block block = BlockOf(cells.front().cell);
    for (const CellText& entry : cells) {
        block.right = std::max(block.right, entry.cell.column);
        block.bottom = std::max(block.bottom, entry.cell.row);
    }
    return block;
}

bool Copy(const Workbook& workbook) {
    const Sheet& sheet = workbook.sheet();
    return PutText(workbook.window, WriteTabText(CopiedRows(sheet, SelectedBlock())));
}

}  // namespace

void CopySelection(Workbook& workbook) {
    if (!Copy(workbook)) MessageBeep(MB_ICONWARNING);
}

void CutSelection(Workbook& workbook) {
    if (Copy(workbook)) {
        ClearSelection(workbook);
    } else {
        MessageBeep(MB_ICONWARNING);
    }
}

void PasteAtCurrentCell(Workbook& workbook) {
    const std::wstring text = TakeText(workbook.window);
    std::vector<CellText> cells = CellsFrom(CurrentCell(), ReadTabText(text));
    if (cells.empty()) return;
    const Block block = ExtentOf(cells);
    StoreCells(workbook, std::move(cells), L"pasting into " + FormatBlock(block));
    if (ClipToSheet(block) == block) Select(workbook, block);
}

bool CanPaste() { return IsClipboardFormatAvailable(CF_UNICODETEXT) != FALSE; }

}  // namespace workbook

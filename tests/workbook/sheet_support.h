// Short ways to write sheets in tests.
#ifndef TESTS_WORKBOOK_SHEET_SUPPORT_H
#define TESTS_WORKBOOK_SHEET_SUPPORT_H

#include "sheet.h"

#include <initializer_list>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>

namespace workbook {

inline CellAddress At(std::wstring_view address) {
    const auto cell = ParseAddress(address);
    if (!cell) throw std::invalid_argument("no address");  // fails the test that wrote it
    return *cell;
}

inline Block BlockAt(std::wstring_view text) {
    const auto block = ParseBlock(text);
    if (!block) throw std::invalid_argument("no block");
    return *block;
}

using CellList = std::initializer_list<std::pair<std::wstring_view, std::wstring_view>>;

inline Sheet SheetOf(CellList cells) {
    Sheet sheet;
    for (const auto& [address, text] : cells) sheet.setText(At(address), std::wstring(text));
    return sheet;
}

inline std::wstring Show(const Sheet& sheet, std::wstring_view address) {
    return sheet.display(At(address));
}

inline Value ValueAt(const Sheet& sheet, std::wstring_view address) {
    return sheet.value(At(address));
}

// What a formula shows in a cell of a sheet of its own (in IV16384, out of the way of `others`).
inline std::wstring Result(std::wstring_view formula, CellList others = {}) {
    Sheet sheet = SheetOf(others);
    sheet.setText(At(L"IV16384"), std::wstring(formula));
    return Show(sheet, L"IV16384");
}

}  // namespace workbook

#endif

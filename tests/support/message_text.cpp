#include "support/message_text.h"

#include <korcontrols/grid.h>
#include <korcontrols/header.h>

#include <algorithm>
#include <iterator>

namespace kortest {
namespace {

struct MessageName {
    UINT number;
    const char* name;
};

constexpr MessageName kTellingMessages[] = {
    {WM_DESTROY, "WM_DESTROY"},
    {WM_SIZE, "WM_SIZE"},
    {WM_SETFOCUS, "WM_SETFOCUS"},
    {WM_KILLFOCUS, "WM_KILLFOCUS"},
    {WM_SETTEXT, "WM_SETTEXT"},
    {WM_SETFONT, "WM_SETFONT"},
    {WM_NOTIFY, "WM_NOTIFY"},
    {EM_GETMODIFY, "EM_GETMODIFY"},
    {EM_SETMODIFY, "EM_SETMODIFY"},
    {EM_LIMITTEXT, "EM_LIMITTEXT"},
    {WM_KEYDOWN, "WM_KEYDOWN"},
    {WM_KEYUP, "WM_KEYUP"},
    {WM_CHAR, "WM_CHAR"},
    {WM_COMMAND, "WM_COMMAND"},
    {WM_TIMER, "WM_TIMER"},
    {WM_HSCROLL, "WM_HSCROLL"},
    {WM_VSCROLL, "WM_VSCROLL"},
    {GRIDM_REDRAW, "GRIDM_REDRAW"},
    {GRIDM_SETEQUATIONTEXT, "GRIDM_SETEQUATIONTEXT"},
    {GRIDN_EQUATIONENTERED, "GRIDN_EQUATIONENTERED"},
    {GRIDN_EQUATIONEMPTY, "GRIDN_EQUATIONEMPTY"},
    {HCM_INSERTITEM, "HCM_INSERTITEM"},
    {HCM_DELETEITEM, "HCM_DELETEITEM"},
    {HCM_SETITEM, "HCM_SETITEM"},
    {HCM_SETITEMSTATE, "HCM_SETITEMSTATE"},
    {HCM_GETITEMCOUNT, "HCM_GETITEMCOUNT"},
    {HCM_GETITEM, "HCM_GETITEM"},
    {HCM_GETITEMSIZE, "HCM_GETITEMSIZE"},
    {HCN_ITEMCLICK, "HCN_ITEMCLICK"},
    {HCN_ITEMRESIZING, "HCN_ITEMRESIZING"},
    {HCN_ITEMRESIZED, "HCN_ITEMRESIZED"},
};

const MessageName* FindMessage(UINT number) {
    const auto found =
        std::find_if(std::begin(kTellingMessages), std::end(kTellingMessages),
                     [number](const MessageName& entry) { return entry.number == number; });
    return found == std::end(kTellingMessages) ? nullptr : found;
}

std::string Number(LONG_PTR value) { return std::to_string(static_cast<long long>(value)); }

std::string Words(LPARAM words) {
    return std::to_string(LOWORD(words)) + " " + std::to_string(HIWORD(words));
}

template <typename Data>
const Data* Pointed(LPARAM data) {
    return reinterpret_cast<const Data*>(data);
}

std::string RangeText(const GridVisibleRange* range) {
    if (!range) return "null";
    return "columns " + std::to_string(range->firstColumn) + "-" +
           std::to_string(range->endColumn) + " rows " + std::to_string(range->firstRow) + "-" +
           std::to_string(range->endRow);
}

std::string CellText(const GridCellPair* cell) {
    return cell ? CellName(cell->column, cell->row) : "null";
}

std::string SelectionText(const GridSelection* selection) {
    if (!selection) return "null";
    return CellName(selection->left, selection->top) + ":" +
           CellName(selection->right, selection->bottom);
}

// Absolute index, then units.
std::string ResizedText(LPARAM data) {
    return std::to_string(HIWORD(data)) + " " + std::to_string(LOWORD(data));
}

}  // namespace

std::string CellName(int column, int row) {
    std::string letters;
    for (int rest = column + 1; rest > 0; rest = (rest - 1) / 26) {
        letters.insert(letters.begin(), static_cast<char>('A' + (rest - 1) % 26));
    }
    return letters + std::to_string(row + 1);
}

std::string Narrow(const wchar_t* text) {
    if (!text) return "null";
    const int bytes = WideCharToMultiByte(CP_UTF8, 0, text, -1, nullptr, 0, nullptr, nullptr);
    std::string narrow(static_cast<size_t>(bytes), '\0');
    WideCharToMultiByte(CP_UTF8, 0, text, -1, narrow.data(), bytes, nullptr, nullptr);
    narrow.pop_back();  // the terminator
    return narrow;
}

std::string GridNotificationText(WPARAM code, LPARAM data) {
    switch (code) {
    case GRIDN_PAINTCELLS: return "GRIDN_PAINTCELLS " + RangeText(Pointed<GridVisibleRange>(data));
    case GRIDN_CELLCLICKED: return "GRIDN_CELLCLICKED " + CellText(Pointed<GridCellPair>(data));
    case GRIDN_COLUMNRESIZED: return "GRIDN_COLUMNRESIZED " + ResizedText(data);
    case GRIDN_ROWRESIZED: return "GRIDN_ROWRESIZED " + ResizedText(data);
    case GRIDN_CURRENTCELL: return "GRIDN_CURRENTCELL " + CellText(Pointed<GridCellPair>(data));
    case GRIDN_SELECTING: return "GRIDN_SELECTING " + SelectionText(Pointed<GridSelection>(data));
    case GRIDN_SELECTIONDONE:
        return "GRIDN_SELECTIONDONE " + SelectionText(Pointed<GridSelection>(data));
    case GRIDN_EDITFOCUS: return "GRIDN_EDITFOCUS " + Number(data);
    case GRIDN_EDITKILLFOCUS: return "GRIDN_EDITKILLFOCUS " + Number(data);
    default: return PlainMessageText(WM_NOTIFY, code, data);
    }
}

std::string EquationText(UINT message, WPARAM text, LPARAM cell) {
    const std::string name = CellName(HIWORD(cell), LOWORD(cell));
    if (message == GRIDN_EQUATIONENTERED) {
        return "GRIDN_EQUATIONENTERED \"" + Narrow(reinterpret_cast<const wchar_t*>(text)) + "\" " +
               name;
    }
    return "GRIDN_EQUATIONEMPTY " + name + (text ? " with wParam" : "");
}

std::string HeaderNotificationText(UINT message, const std::string& header, LPARAM words) {
    return std::string(FindMessage(message)->name) + " " + header + " " + Words(words);
}

std::string PlainMessageText(UINT message, WPARAM wParam, LPARAM lParam) {
    const MessageName* known = FindMessage(message);
    const std::string name = known ? known->name : "message " + std::to_string(message);
    return name + " " + Number(static_cast<LONG_PTR>(wParam)) + " " + Number(lParam);
}

bool IsTelling(UINT message) { return FindMessage(message) != nullptr; }

}  // namespace kortest

#include "file_tree.h"

#include <commctrl.h>
#include <korcontrols/listhelpers.h>

#include <algorithm>
#include <utility>

#include "resource.h"
#include "selection.h"
#include "sheet_images.h"
#include "sheet_switch.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr DWORD kTreeStyle = WS_CHILD | WS_VISIBLE | WS_TABSTOP | TVS_HASBUTTONS | TVS_HASLINES |
                             TVS_LINESATROOT | TVS_SHOWSELALWAYS;

// What an item stands for, packed into its data.
struct TreePlace {
    size_t sheet = 0;
    int column = kNone;

    static constexpr int kNone = -1;
};

LPARAM Pack(const TreePlace& place) {
    return MAKELONG(static_cast<WORD>(place.column + 1), static_cast<WORD>(place.sheet));
}

TreePlace Unpack(LPARAM data) {
    const auto packed = static_cast<DWORD>(data);
    return {HIWORD(packed), static_cast<int>(LOWORD(packed)) - 1};
}

HTREEITEM NextItem(HWND tree, UINT relation, HTREEITEM item = nullptr) {
    return reinterpret_cast<HTREEITEM>(
        SendMessageW(tree, TVM_GETNEXTITEM, relation, reinterpret_cast<LPARAM>(item)));
}

TVITEMW ItemAt(HWND tree, HTREEITEM handle) {
    TVITEMW item = {};
    item.mask = TVIF_HANDLE | TVIF_PARAM | TVIF_STATE;
    item.hItem = handle;
    item.stateMask = TVIS_EXPANDED;
    SendMessageW(tree, TVM_GETITEMW, 0, reinterpret_cast<LPARAM>(&item));
    return item;
}

// ---- What is to be shown ----

std::wstring ColumnText(const OpenSheet& sheet, int column) {
    const std::wstring letters = ColumnName(column);
    if (!sheet.view.titleRow) return letters;
    return letters + L"  " + sheet.document.sheet().display({column, 0});
}

int ColumnImageOf(const OpenSheet& sheet, int column) {
    const CellAddress first = {column, sheet.view.titleRow ? 1 : 0};
    const bool isNumber = sheet.document.sheet().view(first).kind == ValueKind::Number;
    return isNumber ? kTreeNumbersImage : kTreeTextsImage;
}

TreeSheet Describe(const OpenSheet& sheet) {
    const bool isModified = sheet.document.isModified();
    TreeSheet shown;
    shown.sheet = &sheet;
    shown.name = (isModified ? L"*" : L"") + sheet.document.name();
    shown.image = SheetImage(sheet.colour, isModified);
    for (int column = 0; column < sheet.document.sheet().extent().columns; ++column) {
        shown.columns.push_back({ColumnText(sheet, column), ColumnImageOf(sheet, column)});
    }
    return shown;
}

std::vector<TreeSheet> DescribeAll(const OpenSheets& sheets) {
    std::vector<TreeSheet> shown;
    for (size_t index = 0; index < sheets.count(); ++index) {
        shown.push_back(Describe(sheets.at(index)));
    }
    return shown;
}

// ---- Filling ----

// A sheet's columns are added when it is unfolded first; until then its button alone tells of them.
void AddColumns(const SidePanel& panel, HTREEITEM parent, size_t sheet) {
    if (NextItem(panel.tree, TVGN_CHILD, parent)) return;
    int column = 0;
    for (const TreeColumn& shown : panel.sheets[sheet].columns) {
        KorTreeView_AddItem(panel.tree, parent, shown.text.c_str(), shown.image,
                            Pack({sheet, column}), TVI_LAST, FALSE);
        ++column;
    }
}

std::vector<const OpenSheet*> UnfoldedSheets(const SidePanel& panel) {
    std::vector<const OpenSheet*> unfolded;
    for (HTREEITEM item = NextItem(panel.tree, TVGN_ROOT); item;
         item = NextItem(panel.tree, TVGN_NEXT, item)) {
        const TVITEMW shown = ItemAt(panel.tree, item);
        if (shown.state & TVIS_EXPANDED) {
            unfolded.push_back(panel.sheets[Unpack(shown.lParam).sheet].sheet);
        }
    }
    return unfolded;
}

void AddSheet(const SidePanel& panel, size_t index, bool isUnfolded) {
    const TreeSheet& sheet = panel.sheets[index];
    const HTREEITEM item =
        KorTreeView_AddItem(panel.tree, nullptr, sheet.name.c_str(), sheet.image,
                            Pack({index, TreePlace::kNone}), TVI_LAST, !sheet.columns.empty());
    if (!isUnfolded) return;
    AddColumns(panel, item, index);
    SendMessageW(panel.tree, TVM_EXPAND, TVE_EXPAND, reinterpret_cast<LPARAM>(item));
}

void FillTree(SidePanel& panel, std::vector<TreeSheet> sheets) {
    const std::vector<const OpenSheet*> unfolded = UnfoldedSheets(panel);
    panel.sheets = std::move(sheets);
    SendMessageW(panel.tree, WM_SETREDRAW, FALSE, 0);
    SendMessageW(panel.tree, TVM_DELETEITEM, 0, reinterpret_cast<LPARAM>(TVI_ROOT));
    for (size_t index = 0; index < panel.sheets.size(); ++index) {
        const bool isUnfolded =
            std::ranges::find(unfolded, panel.sheets[index].sheet) != unfolded.end();
        AddSheet(panel, index, isUnfolded);
    }
    SendMessageW(panel.tree, WM_SETREDRAW, TRUE, 0);
    InvalidateRect(panel.tree, nullptr, TRUE);
}

// ---- Choosing ----

void Choose(Workbook& workbook, LPARAM data) {
    const TreePlace place = Unpack(data);
    if (place.sheet >= workbook.sheets.count()) return;
    SelectSheet(workbook, place.sheet);
    if (place.column != TreePlace::kNone) GoToColumn(workbook, place.column);
}

// A click on what is selected in the tree already changes nothing there, but means it again.
void OnClick(Workbook& workbook) {
    const HWND tree = workbook.panel.tree;
    const DWORD position = GetMessagePos();
    TVHITTESTINFO hit = {};
    hit.pt = {static_cast<short>(LOWORD(position)), static_cast<short>(HIWORD(position))};
    ScreenToClient(tree, &hit.pt);
    SendMessageW(tree, TVM_HITTEST, 0, reinterpret_cast<LPARAM>(&hit));
    if (!(hit.flags & TVHT_ONITEM) || hit.hItem != NextItem(tree, TVGN_CARET)) return;
    Choose(workbook, ItemAt(tree, hit.hItem).lParam);
}

void OnSelected(Workbook& workbook, const NMTREEVIEWW& change) {
    const bool isByUser = change.action == TVC_BYMOUSE || change.action == TVC_BYKEYBOARD;
    if (isByUser && change.itemNew.hItem) Choose(workbook, change.itemNew.lParam);
}

}  // namespace

HWND CreateFileTree(const Workbook& workbook) {
    const HWND tree = CreateWindowExW(
        WS_EX_CLIENTEDGE, WC_TREEVIEWW, nullptr, kTreeStyle, 0, 0, 0, 0, workbook.panel.window,
        reinterpret_cast<HMENU>(INT_PTR{IDC_FILE_TREE}), workbook.instance, nullptr);
    SendMessageW(tree, TVM_SETIMAGELIST, TVSIL_NORMAL,
                 reinterpret_cast<LPARAM>(workbook.sheetImages));
    return tree;
}

void RefreshFileTree(Workbook& workbook) {
    std::vector<TreeSheet> sheets = DescribeAll(workbook.sheets);
    if (sheets != workbook.panel.sheets) FillTree(workbook.panel, std::move(sheets));
}

void OnTreeNotify(Workbook& workbook, const NMHDR& notification) {
    const auto& change = reinterpret_cast<const NMTREEVIEWW&>(notification);
    switch (notification.code) {
    case TVN_ITEMEXPANDINGW:
        AddColumns(workbook.panel, change.itemNew.hItem, Unpack(change.itemNew.lParam).sheet);
        break;
    case TVN_SELCHANGEDW: OnSelected(workbook, change); break;
    case NM_CLICK: OnClick(workbook); break;
    default: break;
    }
}

}  // namespace workbook

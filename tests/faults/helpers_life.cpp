// The helpers for list views and tree views.
#include "faults/scenarios.h"

#include <korcontrols/listhelpers.h>

namespace kortest {

namespace {

constexpr int kColumns = 2;

HWND CreateView(const Life& life, const wchar_t* className, DWORD style) {
    INITCOMMONCONTROLSEX controls = {sizeof controls, ICC_LISTVIEW_CLASSES | ICC_TREEVIEW_CLASSES};
    InitCommonControlsEx(&controls);
    life.host->leaveOut(0);  // what a view without an id tells
    return CreateControl(life, className, style, 150, 80);
}

HWND CreateList(const Life& life) {
    const HWND list = CreateView(life, WC_LISTVIEWW, LVS_REPORT);
    for (int i = 0; i < kColumns; ++i) {
        LVCOLUMNW column{};
        column.mask = LVCF_WIDTH | LVCF_SUBITEM;
        column.cx = 60;
        column.iSubItem = i;
        SendMessageW(list, LVM_INSERTCOLUMNW, static_cast<WPARAM>(i),
                     reinterpret_cast<LPARAM>(&column));
    }
    return list;
}

int RowCount(HWND list) { return static_cast<int>(SendMessageW(list, LVM_GETITEMCOUNT, 0, 0)); }

// What a row's index can be when something inside may have failed: there is such a row, or -1.
Life::Possible RowOrNone(HWND list) {
    return [list](LRESULT row) { return row >= -1 && row < RowCount(list); };
}

void NoteRows(Life& life, HWND list) {
    for (int row = 0; row < RowCount(list); ++row) {
        wchar_t text[20] = {};
        LVITEMW item{};
        item.iSubItem = 1;
        item.pszText = text;
        item.cchTextMax = 20;
        SendMessageW(list, LVM_GETITEMTEXTW, static_cast<WPARAM>(row),
                     reinterpret_cast<LPARAM>(&item));
        life.note(Narrow(item.pszText));
    }
}

}  // namespace

void LiveLists(Life& life) {
    const HWND list = CreateList(life);
    for (LONG row = 0; row < 3; ++row) {
        const LPCWSTR texts[kColumns] = {L"a", row == 1 ? nullptr : L"b"};
        const DWORD selected = row == 1 ? LVIS_SELECTED : 0;
        auto* object = ::operator new(8);
        life.mayFail("KorListView_UpdateItem", row, RowOrNone(list), [&] {
            return LRESULT{KorListView_UpdateItem(list, -1, texts, kColumns,
                                                  reinterpret_cast<LPARAM>(object), 0, selected,
                                                  LVIS_SELECTED)};
        });
    }
    const LPCWSTR other[kColumns] = {L"c", L"d"};
    life.mayFail("KorListView_UpdateItem", 2, RowOrNone(list), [&] {
        return LRESULT{KorListView_UpdateItem(list, 2, other, kColumns, 0, 0, 0, 0)};
    });
    life.mayFail("KorListView_GetSelection", 1, RowOrNone(list),
                 [&] { return LRESULT{KorListView_GetSelection(list)}; });
    KorListView_GetIndexFromCurrentPosition(list);
    NoteRows(life, list);
    KorListView_DeleteAll(list, TRUE, TRUE);
    life.mayFail(
        "KorListView_DeleteAll", 1, [](LRESULT result) { return result == 0; },
        [&] { return LRESULT{KorListView_DeleteAll(list, FALSE, TRUE)}; });
    life.note("rows " + std::to_string(RowCount(list)));
    DestroyWindow(list);
}

void LiveTrees(Life& life) {
    const HWND tree = CreateView(life, WC_TREEVIEWW, TVS_HASBUTTONS);
    HTREEITEM parent = nullptr;
    for (const wchar_t* text : {L"top", L"below", L"deep"}) {
        life.statedNot("KorTreeView_AddItem", 0, {"SendMessageW"}, [&] {
            parent = KorTreeView_AddItem(tree, parent, text, 0, 0, TVI_LAST, TRUE);
            return reinterpret_cast<LRESULT>(parent);
        });
    }
    life.note("items " + std::to_string(SendMessageW(tree, TVM_GETCOUNT, 0, 0)));
    DestroyWindow(tree);
}

}  // namespace kortest

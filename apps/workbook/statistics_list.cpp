#include "statistics_list.h"

#include <commctrl.h>
#include <korcontrols/graph.h>
#include <korcontrols/listhelpers.h>

#include <algorithm>
#include <array>
#include <utility>

#include "column_menu.h"
#include "number_fit.h"
#include "resource.h"
#include "selection.h"
#include "sheet_images.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr DWORD kListStyle = WS_CHILD | WS_VISIBLE | WS_TABSTOP | LVS_REPORT | LVS_SHOWSELALWAYS;

constexpr int kFigureLength = 9;  // characters that a figure is rounded to

struct ListColumn {
    const wchar_t* title;
    int width;
};

constexpr std::array<ListColumn, 9> kListColumns = {{{L"Column", 92},
                                                     {L"Count", 52},
                                                     {L"Numbers", 64},
                                                     {L"Minimum", 70},
                                                     {L"Maximum", 70},
                                                     {L"Mean", 70},
                                                     {L"Median", 70},
                                                     {L"Std. Dev.", 70},
                                                     {L"Sum", 72}}};

using RowTexts = std::array<std::wstring, kListColumns.size()>;

// What a row of the list knows, as its data. Made with `new`; the library's helper deletes it with
// the row.
struct RowData {
    int column;
};

// ---- What is to be shown ----

std::wstring FigureText(double figure) { return FitNumber(figure, kFigureLength); }

RowTexts TextsOf(const ColumnEntry& entry) {
    const ColumnStatistics& statistics = entry.statistics;
    const BlockStatistics& cells = statistics.cells;
    RowTexts texts = {ColumnName(entry.column) + L"  " + statistics.name,
                      std::to_wstring(cells.occupied), std::to_wstring(cells.numbers)};
    if (cells.numbers == 0) return texts;
    const std::array<double, 6> figures = {cells.lowest,      cells.highest,        cells.average,
                                           statistics.median, statistics.deviation, cells.sum};
    std::ranges::transform(figures, texts.begin() + 3, FigureText);
    return texts;
}

// The colours of the series that are charted, by their columns. Slices of a pie are no columns.
std::vector<std::pair<int, COLORREF>> ChartedColumns(const Chart& chart) {
    std::vector<std::pair<int, COLORREF>> columns;
    if (!chart.isShown || KorGraph_GetType(chart.graph) == KORGRAPH_PIE) return columns;
    LONG index = 0;
    for (const ChartSeries& series : chart.data.series) {
        columns.emplace_back(series.column, KorGraph_GetSeriesColour(chart.graph, index));
        ++index;
    }
    return columns;
}

LONG ImageOf(const ColumnEntry& entry, const std::vector<std::pair<int, COLORREF>>& charted) {
    const auto found = std::ranges::find(charted, entry.column, &std::pair<int, COLORREF>::first);
    if (found != charted.end()) {
        return kSeriesImages + static_cast<LONG>(found - charted.begin());
    }
    return entry.statistics.cells.numbers > 0 ? kNumbersImage : kTextsImage;
}

std::vector<ColumnEntry> WantedEntries(const Workbook& workbook,
                                       const std::vector<std::pair<int, COLORREF>>& charted) {
    std::vector<ColumnEntry> entries;
    const Sheet& sheet = workbook.sheet();
    for (int column = 0; column < sheet.extent().columns; ++column) {
        if (workbook.panel.hidden.contains(column)) continue;
        ColumnEntry entry = {column, 0,
                             StatisticsOfColumn(sheet, column, workbook.sheetView().titleRow)};
        entry.image = ImageOf(entry, charted);
        entries.push_back(std::move(entry));
    }
    return entries;
}

// ---- Rows ----

RowData* DataOf(HWND list, LONG row) {
    LVITEMW item = {};
    item.mask = LVIF_PARAM;
    item.iItem = row;
    SendMessageW(list, LVM_GETITEMW, 0, reinterpret_cast<LPARAM>(&item));
    return reinterpret_cast<RowData*>(item.lParam);
}

// Replaces a row, or appends one when `row` is -1.
void SetRow(HWND list, LONG row, const ColumnEntry& entry, RowData* data) {
    const RowTexts texts = TextsOf(entry);
    std::array<LPCWSTR, kListColumns.size()> pointers = {};
    std::ranges::transform(texts, pointers.begin(), &std::wstring::c_str);
    KorListView_UpdateItem(list, row, pointers.data(), static_cast<DWORD>(pointers.size()),
                           reinterpret_cast<LPARAM>(data), entry.image, 0, 0);
}

bool AreSameColumns(const std::vector<ColumnEntry>& one, const std::vector<ColumnEntry>& other) {
    return std::ranges::equal(one, other, {}, &ColumnEntry::column, &ColumnEntry::column);
}

void UpdateRows(const SidePanel& panel, const std::vector<ColumnEntry>& entries) {
    for (size_t i = 0; i < entries.size(); ++i) {
        if (entries[i] == panel.entries[i]) continue;
        const auto row = static_cast<LONG>(i);
        SetRow(panel.list, row, entries[i], DataOf(panel.list, row));
    }
}

void FillRows(const SidePanel& panel, const std::vector<ColumnEntry>& entries) {
    SendMessageW(panel.list, WM_SETREDRAW, FALSE, 0);
    KorListView_DeleteAll(panel.list, FALSE, TRUE);
    for (const ColumnEntry& entry : entries) {
        SetRow(panel.list, -1, entry, new RowData{entry.column});
    }
    SendMessageW(panel.list, WM_SETREDRAW, TRUE, 0);
}

void UpdateImages(SidePanel& panel, const std::vector<std::pair<int, COLORREF>>& charted) {
    std::vector<COLORREF> colours(charted.size());
    std::ranges::transform(charted, colours.begin(), &std::pair<int, COLORREF>::second);
    if (colours == panel.seriesColours && !panel.entries.empty()) return;
    panel.seriesColours = std::move(colours);
    const HIMAGELIST images = CreateColumnImages(panel.seriesColours);
    const LRESULT old =
        SendMessageW(panel.list, LVM_SETIMAGELIST, LVSIL_SMALL, reinterpret_cast<LPARAM>(images));
    if (old) ImageList_Destroy(reinterpret_cast<HIMAGELIST>(old));
}

// ---- What the user does ----

void GoToRow(Workbook& workbook, LONG row) {
    if (row < 0) return;
    GoToColumn(workbook, DataOf(workbook.panel.list, row)->column);
}

void RemoveSelectedRows(SidePanel& panel) {
    LONG row = -1;
    const auto next = [&panel](LONG after) {
        return static_cast<LONG>(
            SendMessageW(panel.list, LVM_GETNEXTITEM, static_cast<WPARAM>(after), LVNI_SELECTED));
    };
    while ((row = next(row)) >= 0) panel.hidden.insert(DataOf(panel.list, row)->column);
    panel.isFilling = true;
    KorListView_DeleteAll(panel.list, TRUE, TRUE);
    panel.isFilling = false;
    std::erase_if(panel.entries, [&panel](const ColumnEntry& entry) {
        return panel.hidden.contains(entry.column);
    });
}

void OnRightClick(Workbook& workbook) {
    SidePanel& panel = workbook.panel;
    const LONG row = KorListView_GetIndexFromCurrentPosition(panel.list);
    switch (AskColumnMenu(panel.window, row >= 0, !panel.hidden.empty())) {
    case IDM_COLUMN_GO: return GoToRow(workbook, row);
    case IDM_COLUMN_REMOVE: return RemoveSelectedRows(panel);
    case IDM_COLUMN_SHOW_ALL:
        panel.hidden.clear();
        panel.isStale = true;
        return;
    default: return;
    }
}

void OnChanged(Workbook& workbook, const NMLISTVIEW& change) {
    const bool becameSelected = (change.uNewState & ~change.uOldState & LVIS_SELECTED) != 0;
    if (!becameSelected || workbook.panel.isFilling) return;
    GoToRow(workbook, KorListView_GetSelection(workbook.panel.list));
}

}  // namespace

HWND CreateStatisticsList(const Workbook& workbook) {
    const HWND list = CreateWindowExW(
        WS_EX_CLIENTEDGE, WC_LISTVIEWW, nullptr, kListStyle, 0, 0, 0, 0, workbook.panel.window,
        reinterpret_cast<HMENU>(INT_PTR{IDC_STATISTICS}), workbook.instance, nullptr);
    SendMessageW(list, LVM_SETEXTENDEDLISTVIEWSTYLE, LVS_EX_FULLROWSELECT, LVS_EX_FULLROWSELECT);
    int index = 0;
    for (const ListColumn& each : kListColumns) {
        LVCOLUMNW column = {};
        column.mask = LVCF_TEXT | LVCF_WIDTH | LVCF_FMT;
        column.fmt = index == 0 ? LVCFMT_LEFT : LVCFMT_RIGHT;
        column.pszText = const_cast<wchar_t*>(each.title);
        column.cx = each.width;
        SendMessageW(list, LVM_INSERTCOLUMNW, static_cast<WPARAM>(index),
                     reinterpret_cast<LPARAM>(&column));
        ++index;
    }
    return list;
}

void RefreshStatisticsList(Workbook& workbook) {
    SidePanel& panel = workbook.panel;
    const auto charted = ChartedColumns(workbook.chart);
    std::vector<ColumnEntry> entries = WantedEntries(workbook, charted);
    UpdateImages(panel, charted);
    panel.isFilling = true;
    if (AreSameColumns(entries, panel.entries)) {
        UpdateRows(panel, entries);
    } else {
        FillRows(panel, entries);
    }
    panel.isFilling = false;
    panel.entries = std::move(entries);
}

void ClearStatisticsList(SidePanel& panel) {
    KorListView_DeleteAll(panel.list, FALSE, TRUE);
    panel.entries.clear();
}

void OnListNotify(Workbook& workbook, const NMHDR& notification) {
    switch (notification.code) {
    case LVN_ITEMCHANGED:
        OnChanged(workbook, reinterpret_cast<const NMLISTVIEW&>(notification));
        break;
    case LVN_KEYDOWN:
        if (reinterpret_cast<const NMLVKEYDOWN&>(notification).wVKey == VK_DELETE) {
            RemoveSelectedRows(workbook.panel);
        }
        break;
    // A click on a row that is selected already means its column again.
    case NM_CLICK:
        GoToRow(workbook, KorListView_GetIndexFromCurrentPosition(workbook.panel.list));
        break;
    case NM_RCLICK: OnRightClick(workbook); break;
    default: break;
    }
}

}  // namespace workbook

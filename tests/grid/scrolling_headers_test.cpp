// The header strips hold as many items as fit; counting them is what finds the visible cells.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class HeaderRefresh : public GridUse {
protected:
    struct Sent {
        UINT message;
        int index;
        std::wstring text;
        int size;
        bool operator==(const Sent&) const = default;
    };

    // Records the item messages to a header from now on.
    void recordItems(HWND header) {
        spy.watch("SendMessageW");
        spy.replace("SendMessageW", [this, header](ULONG_PTR* arguments) {
            const auto message = static_cast<UINT>(arguments[1]);
            if (arguments[0] == reinterpret_cast<ULONG_PTR>(header) &&
                (message == HCM_INSERTITEM || message == HCM_SETITEM ||
                 message == HCM_DELETEITEM)) {
                Sent sent{message, static_cast<int>(arguments[2]), L"",
                          static_cast<int>(arguments[3])};
                if (message != HCM_DELETEITEM) {
                    const auto* item = reinterpret_cast<const HeaderItemDesc*>(arguments[3]);
                    if (item->text) sent.text = item->text;
                    sent.size = item->size;
                }
                items_.push_back(sent);
            }
            return spy.callReal("SendMessageW", arguments);
        });
    }

    std::vector<Sent> items_;
};

TEST_F(HeaderRefresh, PartlyVisibleLastItemsCount) {
    open(360, 176);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));  // 6 and 11 fit exactly
    const int width = 30 + GetSystemMetrics(SM_CXVSCROLL);
    const int height = cellsTop() + GetSystemMetrics(SM_CYHSCROLL);
    resize(width + 361, height + 177);
    EXPECT_EQ(VisibleRange(), Range(0, 7, 0, 12));
    resize(width + 359, height + 175);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
    resize(width + 1, height + 1);
    EXPECT_EQ(VisibleRange(), Range(0, 1, 0, 1));
    resize(width, height);
    EXPECT_EQ(VisibleRange(), Range(0, 0, 0, 0));
    EXPECT_EQ(HeaderItems(columnHeader), Lines{});
    EXPECT_EQ(HeaderItems(rowHeader), Lines{});
    resize(width - 10, height - 10);
    EXPECT_EQ(VisibleRange(), Range(0, 0, 0, 0));
}

TEST_F(HeaderRefresh, ItemsCarryLabelsAndSizes) {
    open(200, 50);
    EXPECT_EQ(HeaderItems(columnHeader), (Lines{"A 60", "B 60", "C 60", "D 60"}));
    EXPECT_EQ(HeaderItems(rowHeader), (Lines{"1 16", "2 16", "3 16", "4 16"}));
}

TEST_F(HeaderRefresh, ResizedCellsAndZoomGiveTheItemsTheirSizes) {
    open(400, 120);
    SetColumnWidth(1, 101);
    SetRowHeight(1, 33);
    SetGridZoomLevel(2);
    EXPECT_EQ(HeaderItems(columnHeader)[0], "A 30");
    EXPECT_EQ(HeaderItems(columnHeader)[1], "B 50");
    EXPECT_EQ(HeaderItems(rowHeader)[0], "1 8");
    EXPECT_EQ(HeaderItems(rowHeader)[1], "2 16");
    SetGridZoomLevel(8);
    EXPECT_EQ(HeaderItems(columnHeader), (Lines{"A 120", "B 202", "C 120"}));
    EXPECT_EQ(HeaderItems(rowHeader), (Lines{"1 32", "2 66", "3 32"}));
}

TEST_F(HeaderRefresh, MissingItemsAreAppendedEmptyAndThenAllAreSet) {
    open(170, 40);  // 3 columns, 3 rows
    recordItems(columnHeader);
    resize(30 + 290 + GetSystemMetrics(SM_CXVSCROLL), 200);  // 5 columns
    EXPECT_EQ(items_, (std::vector<Sent>{{HCM_INSERTITEM, -1, L"", 60},
                                         {HCM_INSERTITEM, -1, L"", 60},
                                         {HCM_SETITEM, 0, L"A", 60},
                                         {HCM_SETITEM, 1, L"B", 60},
                                         {HCM_SETITEM, 2, L"C", 60},
                                         {HCM_SETITEM, 3, L"D", 60},
                                         {HCM_SETITEM, 4, L"E", 60}}));
}

TEST_F(HeaderRefresh, SurplusItemsAreDeletedFromTheBegin) {
    open(290, 40);
    recordItems(columnHeader);
    resize(30 + 110 + GetSystemMetrics(SM_CXVSCROLL), 200);  // 2 columns
    EXPECT_EQ(items_, (std::vector<Sent>{{HCM_DELETEITEM, 0, L"", 0},
                                         {HCM_DELETEITEM, 0, L"", 0},
                                         {HCM_DELETEITEM, 0, L"", 0},
                                         {HCM_SETITEM, 0, L"A", 60},
                                         {HCM_SETITEM, 1, L"B", 60}}));
}

TEST_F(HeaderRefresh, RowItemsAreAppendedAndDeletedAlike) {
    open(170, 40);  // 3 rows
    const int above = cellsTop() + GetSystemMetrics(SM_CYHSCROLL);
    recordItems(rowHeader);
    resize(400, above + 60);  // 4 rows
    resize(400, above + 20);  // 2 rows
    EXPECT_EQ(items_, (std::vector<Sent>{{HCM_INSERTITEM, -1, L"", 16},
                                         {HCM_SETITEM, 0, L"1", 16},
                                         {HCM_SETITEM, 1, L"2", 16},
                                         {HCM_SETITEM, 2, L"3", 16},
                                         {HCM_SETITEM, 3, L"4", 16},
                                         {HCM_DELETEITEM, 0, L"", 0},
                                         {HCM_DELETEITEM, 0, L"", 0},
                                         {HCM_SETITEM, 0, L"1", 16},
                                         {HCM_SETITEM, 1, L"2", 16}}));
}

TEST_F(HeaderRefresh, AppendedItemsHaveTheZoomedDefaultSize) {
    open(330, 168);
    SetGridZoomLevel(8);
    resize(100, 100);
    recordItems(columnHeader);
    resize(300, 100);
    ASSERT_FALSE(items_.empty());
    EXPECT_EQ(items_[0], (Sent{HCM_INSERTITEM, -1, L"", 120}));
    items_.clear();
    recordItems(rowHeader);
    resize(300, 300);
    ASSERT_FALSE(items_.empty());
    EXPECT_EQ(items_[0], (Sent{HCM_INSERTITEM, -1, L"", 32}));
}

TEST_F(HeaderRefresh, StripsAreInvalidatedWhole) {
    open(330, 168);
    host.pump();
    spy.watch("InvalidateRect");
    const auto invalidated = [&](HWND header) {
        for (const ImportCall& call : spy.callsOf("InvalidateRect")) {
            if (ArgumentsOf(call) == std::vector<DWORD>{HandleValue(header), 0, TRUE}) return true;
        }
        return false;
    };
    scrollColumns(SB_LINEDOWN);
    EXPECT_TRUE(invalidated(columnHeader));
    EXPECT_FALSE(invalidated(rowHeader));
    spy.clearCalls();
    scrollRows(SB_LINEDOWN);
    EXPECT_FALSE(invalidated(columnHeader));
    EXPECT_TRUE(invalidated(rowHeader));
}

TEST_F(HeaderRefresh, EveryColumnHasItsLetters) {
    open(330, 168);
    for (int column = 0; column < 256; ++column) {
        SetFirstVisibleCell(KORGRID_CELL(column, 0));
        EXPECT_EQ(HeaderItems(columnHeader)[0], ColumnLabel(column) + " 60");
    }
}

TEST_F(HeaderRefresh, LettersOfTheKnownColumns) {
    open(330, 168);
    const struct {
        int column;
        const wchar_t* label;
    } known[] = {{0, L"A"},   {25, L"Z"},  {26, L"AA"},  {51, L"AZ"},
                 {52, L"BA"}, {77, L"BZ"}, {255, L"IV"}, {234, L"IA"}};
    for (const auto& one : known) {
        SetFirstVisibleCell(KORGRID_CELL(one.column, 0));
        EXPECT_EQ(HeaderLabel(columnHeader, 0), one.label);
    }
}

TEST_F(HeaderRefresh, RowsAreNumberedFromOne) {
    open(330, 168);
    for (const int row : {0, 8, 9, 98, 99, 998, 999, 9998, 9999, 16382, 16383}) {
        SetFirstVisibleCell(KORGRID_CELL(0, row));
        EXPECT_EQ(HeaderLabel(rowHeader, 0), std::to_wstring(row + 1));
    }
}

TEST_F(HeaderRefresh, AtMost255OfEachAreVisible) {
    open(330, 168);
    SetGridZoomLevel(1);
    resize(3900, 1100);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 255u);
    EXPECT_EQ(GetNumberOfVisibleRows(), 255u);
    EXPECT_EQ(VisibleRange(), Range(0, 255, 0, 255));
    EXPECT_EQ(HeaderItems(columnHeader).size(), 255u);
    EXPECT_EQ(HeaderItems(rowHeader).size(), 255u);
    EXPECT_EQ(HeaderItems(columnHeader).back(), "IU 15");
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(VisibleRange().endColumn, 256);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 255u);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(VisibleRange(), Range(2, 256, 0, 255));
    EXPECT_EQ(scrollColumns(SB_LINEDOWN), 0);  // 255 + 2 reach the end
    EXPECT_EQ(VisibleRange().firstColumn, 2);
}

TEST_F(HeaderRefresh, ColumnsWithoutWidthAreCountedUpTo255) {
    open(330, 168);
    for (int column = 0; column < 256; ++column) ASSERT_EQ(SetColumnWidth(column, 0), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(VisibleRange(), Range(0, 255, 0, 11));
    SetFirstVisibleCell(KORGRID_CELL(10, 0));
    EXPECT_EQ(VisibleRange(), Range(10, 256, 0, 11));
    Lines items = HeaderItems(columnHeader);
    ASSERT_EQ(items.size(), 246u);
    EXPECT_EQ(items.front(), "K 0");
    EXPECT_EQ(items.back(), "IV 0");
}

TEST_F(HeaderRefresh, RowsWithoutHeightAreCountedUpTo255) {
    open(330, 168);
    for (int row = 0; row < 300; ++row) ASSERT_EQ(SetRowHeight(row, 0), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 255));
    SetFirstVisibleCell(KORGRID_CELL(0, 100));  // 200 without height, then 10.5
    EXPECT_EQ(VisibleRange(), Range(0, 6, 100, 311));
}

}  // namespace
}  // namespace kortest

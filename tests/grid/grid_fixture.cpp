#include "grid/grid_fixture.h"

#include <ostream>

namespace kortest {

GridTest::GridTest(int hostWidth, int hostHeight) : host(hostWidth, hostHeight) {
    spy.watch("CreateCompatibleDC");
}

void GridTest::create(int width, int height, DWORD style) {
    grid = host.createGrid(width, height, style);
    ASSERT_NE(grid, nullptr);
    columnHeader = ColumnHeaderOf(grid);
    rowHeader = RowHeaderOf(grid);
    edit = EquationEditOf(grid);
    const auto made = spy.callsOf("CreateCompatibleDC");
    ASSERT_FALSE(made.empty());
    imageDC = reinterpret_cast<HDC>(made.back().result);
    expected.equationBarHeight = EquationBarHeightFor(host.window());
    settle();
    refit();
}

void GridTest::destroy() {
    DestroyWindow(grid);
    settle();
}

void GridTest::resize(int width, int height) {
    SetWindowPos(grid, nullptr, 0, 0, width, height, SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
    refit();
}

void GridTest::settle() {
    host.pump();
    host.clear();
    spy.clearCalls();
}

void GridTest::refit() {
    const RECT area = client();
    expected.clientWidth = static_cast<int>(area.right);
    expected.clientHeight = static_cast<int>(area.bottom);
    expected.fit();
}

Picture GridTest::image() const { return ReadDC(imageDC, client()); }

RECT GridTest::client() const {
    RECT area{};
    GetClientRect(grid, &area);
    return area;
}

void GridTest::endColumnResize(int item, int units) {
    EXPECT_EQ(SendResized(grid, columnHeader, item, units), 0);
    expected.columns[expected.firstColumn + item] = static_cast<unsigned>(units);
}

void GridTest::endRowResize(int item, int units) {
    EXPECT_EQ(SendResized(grid, rowHeader, item, units), 0);
    expected.rows[expected.firstRow + item] = static_cast<unsigned>(units);
}

GuardedGridTest::GuardedGridTest(int hostWidth, int hostHeight)
    : GridTest(hostWidth, hostHeight), heap(spy) {}

GuardedGridTest::~GuardedGridTest() {
    // The guard heap outlives the library's windows.
    if (IsWindow(grid)) DestroyWindow(grid);
}

void GuardedGridTest::TearDown() { EXPECT_EQ(heap.report(), ""); }

GridVisibleRange VisibleRange() {
    GridVisibleRange range{};
    GetVisibleRange(&range);
    return range;
}

GridSelection Selection() {
    GridSelection selection{};
    GetSelectedRanged(&selection);
    return selection;
}

RECT ChildRect(HWND child) {
    RECT area{};
    GetWindowRect(child, &area);
    MapWindowPoints(nullptr, GetParent(child), reinterpret_cast<POINT*>(&area), 2);
    return area;
}

int EquationBarHeightFor(HWND parent) {
    TEXTMETRICW metrics{};
    const HDC dc = GetDC(parent);
    GetTextMetricsW(dc, &metrics);
    ReleaseDC(parent, dc);
    return static_cast<int>(metrics.tmHeight) + 4;
}

std::wstring HeaderLabel(HWND header, int item) {
    HeaderItemDesc read{};
    if (!KorHeader_GetItem(header, item, &read)) return L"(no item)";
    const std::wstring label = read.text ? read.text : L"(no label)";
    ReleaseLocal(read.text);
    return label;
}

std::vector<std::wstring> HeaderLabels(HWND header) {
    std::vector<std::wstring> labels;
    for (int i = 0; i < KorHeader_GetItemCount(header); ++i)
        labels.push_back(HeaderLabel(header, i));
    return labels;
}

std::vector<int> HeaderSizes(HWND header) {
    std::vector<int> sizes;
    for (int i = 0; i < KorHeader_GetItemCount(header); ++i)
        sizes.push_back(KorHeader_GetItemSize(header, i));
    return sizes;
}

std::optional<RECT> TakeInvalid(HWND window) {
    RECT area{};
    const bool any = GetUpdateRect(window, &area, FALSE) != FALSE;
    ValidateRect(window, nullptr);
    return any ? std::optional(area) : std::nullopt;
}

std::vector<int> ExpectedColumnSizes(const ExpectedGrid& grid) {
    std::vector<int> sizes;
    for (int i = 0; i < grid.columnCount; ++i) sizes.push_back(grid.width(grid.firstColumn + i));
    return sizes;
}

std::vector<int> ExpectedRowSizes(const ExpectedGrid& grid) {
    std::vector<int> sizes;
    for (int i = 0; i < grid.rowCount; ++i) sizes.push_back(grid.height(grid.firstRow + i));
    return sizes;
}

DWORD NumberAt(const ImportCall& call, size_t place) {
    return static_cast<DWORD>(call.arguments.at(place));
}

LRESULT SendResizing(HWND grid, HWND header, int end) {
    return SendMessageW(grid, HCN_ITEMRESIZING, reinterpret_cast<WPARAM>(header),
                        MAKELPARAM(0, end));
}

LRESULT SendResized(HWND grid, HWND header, int item, int units) {
    return SendMessageW(grid, HCN_ITEMRESIZED, reinterpret_cast<WPARAM>(header),
                        MAKELPARAM(item, units));
}

}  // namespace kortest

bool operator==(const GridVisibleRange& a, const GridVisibleRange& b) {
    return a.firstColumn == b.firstColumn && a.endColumn == b.endColumn &&
           a.firstRow == b.firstRow && a.endRow == b.endRow;
}

bool operator==(const GridSelection& a, const GridSelection& b) {
    return a.left == b.left && a.right == b.right && a.top == b.top && a.bottom == b.bottom;
}

void PrintTo(const GridVisibleRange& range, std::ostream* stream) {
    *stream << "columns " << range.firstColumn << "-" << range.endColumn << " rows "
            << range.firstRow << "-" << range.endRow;
}

void PrintTo(const GridSelection& selection, std::ostream* stream) {
    *stream << "columns " << selection.left << "-" << selection.right << " rows " << selection.top
            << "-" << selection.bottom;
}

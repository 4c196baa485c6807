// The grid with its strips and its equation bar, one subject after the other.
#include "faults/scenarios.h"

#include "support/input.h"

#include <algorithm>

namespace kortest {

namespace {

constexpr int kWidth = 110;
constexpr int kHeight = 78;
constexpr WPARAM kAutoScrollTimer = 10101;

// A font, a brush and a pen of the host's.
struct Tools {
    Tools()
        : font(CreateFontW(-11, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"")),
          brush(CreateSolidBrush(RGB(250, 250, 200))), pen(CreatePen(PS_SOLID, 1, RGB(200, 0, 0))) {
    }
    ~Tools() {
        DeleteObject(font);
        DeleteObject(brush);
        DeleteObject(pen);
    }
    Tools(const Tools&) = delete;
    Tools& operator=(const Tools&) = delete;

    HFONT font;
    HBRUSH brush;
    HPEN pen;
};

// The first visible cells, drawn in every way.
void PaintCells(const Tools& tools, const GridVisibleRange& range) {
    const CellIndex first = KORGRID_CELL(range.firstColumn, range.firstRow);
    const CellIndex below = KORGRID_CELL(range.firstColumn, range.firstRow + 1);
    SetCellBackGroundColor(first, tools.brush);
    SetCellValue(first, L"1234567890", tools.font, 0, 0xFFFFFF, 0, 0, 0, TRUE, FALSE);
    SetCellValue(below, L"mid", tools.font, 0, 0xFFFFFF, 0, 1, 1, FALSE, TRUE);
    SetCellValue(below, L"plain", nullptr, 0, 0xFFFFFF, DT_LEFT, 0, 0, FALSE, FALSE);
    SetCellBorder(first, tools.pen, 1, 1, 1, 1);
}

// What the grid keeps between two lives. Even numbers of toggles are the scenarios' business.
void ResetState() {
    ResetGrid();
    SetGridZoomLevel(4);
    SetHorizontalDataRange(0);
    SetVerticalDataRange(0);
    SetSelectedRanged(0, 0);
    SetFunctionButtonMessageID(0);
}

struct GridParts {
    HWND grid = nullptr;
    HWND columns = nullptr;
    HWND rows = nullptr;
    HWND edit = nullptr;
};

// The grid as hosts make it; one font of its headers stays for good.
GridParts CreateGrid(Life& life) {
    RegisterGridClass(life);
    ResetState();
    const HWND grid = CreateControl(life, KORGRID_CLASS, WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL,
                                    kWidth, kHeight);
    life.ledger.forgetOldest("CreateFontIndirectW");
    if (!grid) return {};
    SetHorizontalDataRange(20);
    SetVerticalDataRange(40);
    life.host->pump();
    return {grid, ColumnHeaderOf(grid), RowHeaderOf(grid), GetHandleToEquationControl()};
}

void NoteState(Life& life) {
    GridVisibleRange range{};
    GridSelection selection{};
    GetVisibleRange(&range);
    GetSelectedRanged(&selection);
    life.note("first " + CellName(range.firstColumn, range.firstRow) + " end " +
              CellName(range.endColumn, range.endRow) + " selected " +
              CellName(selection.left, selection.top) + ":" +
              CellName(selection.right, selection.bottom));
}

void EndGrid(Life& life, const GridParts& parts, const char* what) {
    life.host->pump();
    NoteState(life);
    life.look(parts.grid, what);
    if (parts.grid) DestroyWindow(parts.grid);
    ResetGrid();
}

void EndResizing(const GridParts& parts, HWND header, int units) {
    SendMessageW(parts.grid, HCN_ITEMRESIZING, reinterpret_cast<WPARAM>(header), MAKELPARAM(0, 50));
    SendMessageW(parts.grid, HCN_ITEMRESIZED, reinterpret_cast<WPARAM>(header),
                 MAKELPARAM(0, units));
}

}  // namespace

void RegisterGridClass(Life& life) {
    if (IsClassRegistered(KORGRID_CLASS)) return;
    life.stated("RegisterGridControl", 1, 0, {"RegisterClassW"},
                [] { return static_cast<LRESULT>(RegisterGridControl(ProgramInstance())); });
}

// What can be made of a grid whose creation has failed somewhere is then used in every way.
void LiveGridCreation(Life& life) {
    const GridParts parts = CreateGrid(life);
    life.count(false);
    SetColumnWidth(0, 40);
    PressAt(parts.grid, 50, 50);
    MoveTo(parts.grid, 95, 60);
    SendMessageW(parts.grid, WM_TIMER, kAutoScrollTimer, 0);
    ReleaseAt(parts.grid, 105, 75);
    TypeCharacter(parts.grid, L'5');
    PressKey(parts.edit, VK_RETURN);
    SendMessageW(parts.grid, WM_VSCROLL, SB_LINEDOWN, 0);
    EndResizing(parts, parts.columns, 40);
    SetGridZoomLevel(3);
    ToggleViewStateOfHeaders();
    ToggleViewStateOfHeaders();
    EndGrid(life, parts, "created");
}

void LiveGridDrawing(Life& life) {
    life.count(false);
    const Tools tools;
    life.host->onPaintCells = [&](const GridVisibleRange& range) { PaintCells(tools, range); };
    const GridParts parts = CreateGrid(life);
    life.count(true);
    KorGrid_Redraw(parts.grid);
    Paint(parts.grid);
    SetGridZoomLevel(3);
    SetWindowPos(parts.grid, nullptr, 0, 0, kWidth + 10, kHeight - 10, SWP_NOMOVE);
    EndGrid(life, parts, "drawn");
}

void LiveGridSizes(Life& life) {
    life.count(false);
    const GridParts parts = CreateGrid(life);
    life.count(true);
    const auto fails = {"LocalAlloc", "LocalReAlloc"};
    for (LONG i = 0; i < 16; ++i) {
        life.stated("SetColumnWidth", 1, 0, fails,
                    [i] { return static_cast<LRESULT>(SetColumnWidth(i, 30)); });
        life.stated("SetRowHeight", 1, 0, fails,
                    [i] { return static_cast<LRESULT>(SetRowHeight(i, 14)); });
    }
    KorGrid_Redraw(parts.grid);
    EndResizing(parts, parts.columns, 40);
    EndResizing(parts, parts.rows, 20);
    life.count(false);
    EndGrid(life, parts, "sized");
}

void LiveGridView(Life& life) {
    life.count(false);
    const GridParts parts = CreateGrid(life);
    life.count(true);
    ToggleGridLines();
    ToggleViewStateOfHeaders();
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    life.count(false);
    ToggleGridLines();
    ToggleViewStateOfHeaders();
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    EndGrid(life, parts, "shown");
}

void LiveGridSelection(Life& life) {
    life.count(false);
    const GridParts parts = CreateGrid(life);
    life.count(true);
    life.statedNot("SetSelectedRanged", 0, {}, [] {
        return static_cast<LRESULT>(SetSelectedRanged(KORGRID_PAIR(0, 1), KORGRID_PAIR(0, 2)));
    });
    PressAt(parts.grid, 50, 50);
    MoveTo(parts.grid, 95, 60);
    MoveTo(parts.grid, 105, 75);
    SendMessageW(parts.grid, WM_TIMER, kAutoScrollTimer, 0);
    ReleaseAt(parts.grid, 105, 75);
    PressKey(parts.grid, VK_RIGHT);
    PressKey(parts.grid, VK_DELETE);
    {
        const KeyHeld shift(VK_SHIFT);
        PressKey(parts.grid, VK_DOWN);
    }
    PressAt(parts.columns, 20, 5);
    ReleaseAt(parts.columns, 20, 5);
    SendMessageW(parts.grid, WM_COMMAND, 1, 0);
    life.host->pump();
    life.count(false);
    SetSelectedRanged(0, 0);
    EndGrid(life, parts, "selected");
}

void LiveGridScrolling(Life& life) {
    life.count(false);
    const GridParts parts = CreateGrid(life);
    // The row header is as wide as the last life's row numbers wanted until it is scrolled.
    SetFirstVisibleCell(0);
    life.host->pump();
    life.host->clear();
    life.count(true);
    SendMessageW(parts.grid, WM_HSCROLL, SB_LINEDOWN, 0);
    SendMessageW(parts.grid, WM_VSCROLL, SB_PAGEDOWN, 0);
    SendMessageW(parts.grid, WM_VSCROLL, MAKEWPARAM(SB_THUMBPOSITION, 9), 0);
    PressKey(parts.grid, VK_NEXT);
    PressKey(parts.grid, VK_HOME);
    SetFirstVisibleCell(KORGRID_CELL(2, 998));
    life.count(false);
    EndGrid(life, parts, "scrolled");
}

void LiveGridEquation(Life& life) {
    life.count(false);
    const GridParts parts = CreateGrid(life);
    life.count(true);
    SetFocus(parts.grid);
    TypeCharacter(parts.grid, L'5');
    PressKey(parts.edit, VK_RETURN);
    KorGrid_SetEquationText(parts.grid, L"=A1");
    PressKey(parts.edit, VK_BACK);
    life.note("pressed OK: " + std::to_string(PressOKButton()));
    PressKey(parts.edit, VK_ESCAPE);
    SetFunctionButtonMessageID(77);
    for (const HWND button :
         {FunctionButtonOf(parts.grid), OkButtonOf(parts.grid), CancelButtonOf(parts.grid)}) {
        PressAt(button, 3, 3);
        ReleaseAt(button, 3, 3);
    }
    life.host->pump();
    life.count(false);
    EndGrid(life, parts, "edited");
}

}  // namespace kortest

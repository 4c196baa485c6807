#include "interactions.h"

#include "stage.h"

#include <korcontrols/funkybar.h>
#include <korcontrols/grid.h>
#include <korcontrols/listhelpers.h>

namespace footprint {
namespace {

HWND window;  // the control of this run

using Step = std::function<void()>;

// ---- Grid ----

void PrepareGrid() {
    window = CreateGrid();
    Settle();
}

// With this cell as the current one.
Step GridAt(int column, int row) {
    return [=] {
        PrepareGrid();
        SetSelectedRanged(KORGRID_PAIR(column, column), KORGRID_PAIR(row, row));
        Settle();
    };
}

// With the last whole row, or column, as the current one.
void PrepareGridAtBottom() {
    PrepareGrid();
    const DWORD row = GetNumberOfVisibleRows() - 1;
    SetSelectedRanged(0, KORGRID_PAIR(row, row));
    Settle();
}

void PrepareGridAtRight() {
    PrepareGrid();
    const DWORD column = GetNumberOfVisibleColumns() - 1;
    SetSelectedRanged(KORGRID_PAIR(column, column), 0);
    Settle();
}

constexpr WPARAM kCornerButton = 1;
constexpr int kColumnBorder = 60;  // in the column strip
constexpr int kDragged = 20;

void PrepareBorderDrag() {
    PrepareGrid();
    Press(ColumnStrip(window), kColumnBorder, 5);
    Settle();
}

void DragBorder() {
    SendMessageW(ColumnStrip(window), WM_MOUSEMOVE, MK_LBUTTON,
                 MAKELPARAM(kColumnBorder + kDragged, 5));
    Settle();
}

void PrepareSelectionDrag() {
    PrepareGrid();
    Press(window, 60, 60);
    Settle();
}

Step Send(UINT message, WPARAM wParam) {
    return [=] {
        SendMessageW(window, message, wParam, 0);
        Settle();
    };
}

Step Key(int key) { return Send(WM_KEYDOWN, static_cast<WPARAM>(key)); }

void PrepareTypedText() {
    PrepareGrid();
    SendMessageW(GetHandleToEquationControl(), WM_CHAR, L'7', 1);
    Settle();
}

Step Repaint(HWND (*strip)(HWND)) {
    return [=] {
        InvalidateRect(strip(window), nullptr, TRUE);
        Settle();
    };
}

HWND Itself(HWND control) { return control; }

std::vector<Interaction> GridInteractions() {
    const auto zoom = [](DWORD level) {
        return [=] {
            SetGridZoomLevel(level);
            Settle();
        };
    };
    return {
        {"redraw of all cells", PrepareGrid, Send(GRIDM_REDRAW, 0)},
        {"scroll by one row", PrepareGrid, Send(WM_VSCROLL, SB_LINEDOWN)},
        {"scroll by one column", PrepareGrid, Send(WM_HSCROLL, SB_LINEDOWN)},
        {"scroll by a page", PrepareGrid, Send(WM_VSCROLL, SB_PAGEDOWN)},
        {"arrow key within the view", GridAt(1, 1), Key(VK_DOWN)},
        {"arrow key that scrolls by a row", PrepareGridAtBottom, Key(VK_DOWN)},
        {"arrow key that scrolls by a column", PrepareGridAtRight, Key(VK_RIGHT)},
        {"page down key", GridAt(1, 1), Key(VK_NEXT)},
        {"tap on a cell", PrepareGrid,
         [] {
             Press(window, 100, 150);
             Release(window, 100, 150);
             Settle();
         }},
        {"selection dragged to another cell", PrepareSelectionDrag,
         [] {
             SendMessageW(window, WM_MOUSEMOVE, MK_LBUTTON, MAKELPARAM(150, 150));
             Settle();
         }},
        {"column border dragged", PrepareBorderDrag, DragBorder},
        {"column border let go",
         [] {
             PrepareBorderDrag();
             DragBorder();
         },
         [] {
             Release(ColumnStrip(window), kColumnBorder + kDragged, 5);
             Settle();
         }},
        {"column selected by its header", PrepareGrid,
         [] {
             Press(ColumnStrip(window), 30, 5);
             Release(ColumnStrip(window), 30, 5);
             Settle();
         }},
        {"whole sheet selected", PrepareGrid, Send(WM_COMMAND, kCornerButton)},
        {"room for an input panel made", PrepareGrid,
         [] {
             MoveWindow(window, 0, 0, kWidth, kHeight - kInputPanelHeight, TRUE);
             Settle();
         }},
        {"zoom from 100 to 200 %", PrepareGrid, zoom(8)},
        {"zoom from 100 to 50 %", PrepareGrid, zoom(2)},
        {"character typed into the equation bar", PrepareGrid,
         [] {
             SendMessageW(GetHandleToEquationControl(), WM_CHAR, L'7', 1);
             Settle();
         }},
        {"equation committed", PrepareTypedText,
         [] {
             PressOKButton();
             Settle();
         }},
        {"column strip repainted", PrepareGrid, Repaint(ColumnStrip)},
        {"row strip repainted", PrepareGrid, Repaint(RowStrip)},
    };
}

// ---- Function bar ----

void PrepareBar() {
    window = CreateFunctionBar();
    Settle();
}

// Opens the menu with keys that wait for it.
Step OpenMenu(std::vector<WPARAM> keys) {
    return [=] {
        for (const WPARAM key : keys) PostMessageW(window, WM_KEYDOWN, key, 1);
        Press(window, 10, 10);
        Settle();
    };
}

std::vector<Interaction> BarInteractions() {
    return {
        {"function bar repainted", PrepareBar, Repaint(Itself)},
        {"function bar's menu opened and left", PrepareBar, OpenMenu({VK_ESCAPE})},
        {"function chosen from the menu", PrepareBar, OpenMenu({VK_DOWN, VK_DOWN, VK_RETURN})},
    };
}

// ---- List helpers ----

constexpr int kRows = 100;

void AddRows() {
    for (int row = 0; row < kRows; ++row) {
        const LPCWSTR texts[] = {L"Name", L"Value"};
        KorListView_UpdateItem(window, -1, texts, 2, 0, 0, 0, 0);
    }
    Settle();
}

void PrepareList() {
    window = CreateListView();
    AddRows();
}

std::vector<Interaction> ListInteractions() {
    return {
        {"100 rows added to a list", [] { window = CreateListView(); }, AddRows},
        {"100 rows removed from a list", PrepareList,
         [] {
             KorListView_DeleteAll(window, FALSE, FALSE);
             Settle();
         }},
    };
}

}  // namespace

std::vector<Interaction> PlainInteractions() {
    std::vector<Interaction> all;
    for (const auto& some : {GridInteractions(), BarInteractions(), ListInteractions()}) {
        all.insert(all.end(), some.begin(), some.end());
    }
    return all;
}

}  // namespace footprint

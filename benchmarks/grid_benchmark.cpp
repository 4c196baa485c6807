// What the grid's own work costs: each step as a ratio to the floor, which is the same picture
// drawn with bare GDI calls into a memory DC and copied to the window once.
#include <korcontrols/grid.h>

#include <cstdio>

#include "grid_cells.h"
#include "interleaved.h"

namespace {

constexpr int kWidth = 640;
constexpr int kHeight = 480;

HWND host;
HWND grid;
HFONT font;

LRESULT CALLBACK HostProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_NOTIFY && wParam == GRIDN_PAINTCELLS) {
        PaintCells(*reinterpret_cast<const GridVisibleRange*>(lParam), font);
        return 0;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

void CreateWindows() {
    WNDCLASSW windowClass = {};
    windowClass.lpfnWndProc = HostProc;
    windowClass.hInstance = GetModuleHandleW(nullptr);
    windowClass.lpszClassName = L"Grid benchmark";
    RegisterClassW(&windowClass);
    RegisterGridControl(windowClass.hInstance);
    host = CreateWindowW(windowClass.lpszClassName, L"", WS_POPUP | WS_VISIBLE, 0, 0, kWidth,
                         kHeight, nullptr, nullptr, windowClass.hInstance, nullptr);
    grid = CreateWindowW(KORGRID_CLASS, L"",
                         WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL, 0, 0,
                         kWidth, kHeight, host, nullptr, windowClass.hInstance, nullptr);
    SetHorizontalDataRange(KORGRID_COLUMNS);
    SetVerticalDataRange(KORGRID_ROWS);
}

// The floor: white, lines, one DrawTextW per cell, one copy.
class Floor {
public:
    Floor() {
        HDC window = GetDC(host);
        dc_ = CreateCompatibleDC(window);
        bitmap_ = CreateCompatibleBitmap(window, kWidth, kHeight);
        ReleaseDC(host, window);
        SelectObject(dc_, bitmap_);
        SelectObject(dc_, font);
        pen_ = CreatePen(PS_SOLID, 1, RGB(176, 176, 176));
    }
    Floor(const Floor&) = delete;
    Floor& operator=(const Floor&) = delete;

    void Draw(const GridVisibleRange& range) {
        PatBlt(dc_, 0, 0, kWidth, kHeight, WHITENESS);
        HGDIOBJ previous = SelectObject(dc_, pen_);
        for (int x = 30; x < kWidth; x += 60) Line({x, 0}, {x, kHeight});
        for (int y = 36; y < kHeight; y += 16) Line({0, y}, {kWidth, y});
        SelectObject(dc_, previous);
        for (int row = range.firstRow; row < range.endRow; ++row) {
            for (int column = range.firstColumn; column < range.endColumn; ++column) {
                wchar_t text[16];
                FormatCell(column, row, text);
                const int x = 30 + 60 * (column - range.firstColumn);
                const int y = 36 + 16 * (row - range.firstRow);
                RECT box = {x + 3, y + 1, x + 57, y + 16};
                DrawTextW(dc_, text, -1, &box, DT_NOPREFIX | DT_CENTER | DT_VCENTER);
            }
        }
        HDC window = GetDC(grid);
        BitBlt(window, 0, 0, kWidth, kHeight, dc_, 0, 0, SRCCOPY);
        ReleaseDC(grid, window);
    }

private:
    void Line(POINT from, POINT to) {
        const POINT ends[] = {from, to};
        Polyline(dc_, ends, 2);
    }

    HDC dc_;
    HBITMAP bitmap_;
    HPEN pen_;
};

void PressKey(int key) {
    SendMessageW(grid, WM_KEYDOWN, static_cast<WPARAM>(key), 1);
    UpdateWindow(grid);
}

}  // namespace

int main() {
    CreateWindows();
    LOGFONTW description = {};
    description.lfHeight = -12;
    font = CreateFontIndirectW(&description);
    GridVisibleRange range;
    GetVisibleRange(&range);
    Floor floor;
    bool down = false;
    std::vector<bench::Way> ways = {
        {"floor: bare GDI calls", [&] { floor.Draw(range); }},
        {"redraw of all cells",
         [] {
             KorGrid_Redraw(grid);
             UpdateWindow(grid);
         }},
        {"scroll by one row",
         [&] {
             down = !down;
             SendMessageW(grid, WM_VSCROLL, down ? SB_LINEDOWN : SB_LINEUP, 0);
             UpdateWindow(grid);
         }},
        {"arrow key within the view", [&] { PressKey(down ? VK_RIGHT : VK_LEFT); }},
        {"zoom to 200 % and back",
         [] {
             SetGridZoomLevel(8);
             SetGridZoomLevel(4);
             UpdateWindow(grid);
         }},
    };
    bench::TimeInTurns(ways, 60);
    std::printf("grid, %d x %d, %d cells in view, %d bits\n", kWidth, kHeight,
                (range.endColumn - range.firstColumn) * (range.endRow - range.firstRow),
                static_cast<int>(8 * sizeof(void*)));
    std::printf("%-28s %10s %8s\n", "", "us", "x floor");
    for (const bench::Way& way : ways) {
        std::printf("%-28s %10.0f %8.2f\n", way.name.c_str(), way.fastest,
                    way.fastest / ways[0].fastest);
    }
    DestroyWindow(host);
    return 0;
}

/* The smallest host: a grid that fills a window and shows each cell's own address. */
#include <korcontrols/grid.h>

static HWND grid;

static void PaintCells(const GridVisibleRange *range)
{
    WORD column, row;
    WCHAR text[16];
    for (row = range->firstRow; row < range->endRow; ++row) {
        for (column = range->firstColumn; column < range->endColumn; ++column) {
            wsprintfW(text, L"%d, %d", column, row);
            SetCellValue(KORGRID_CELL(column, row), text, NULL, RGB(0, 0, 0), RGB(255, 255, 255),
                         0, 0, 0, FALSE, FALSE);
        }
    }
}

static LRESULT CALLBACK HostProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam)
{
    switch (message) {
    case WM_NOTIFY:
        if (wParam == GRIDN_PAINTCELLS) PaintCells((const GridVisibleRange *)lParam);
        return 0;
    case WM_SIZE:
        MoveWindow(grid, 0, 0, LOWORD(lParam), HIWORD(lParam), TRUE);
        SetHorizontalDataRange(KORGRID_COLUMNS); /* the scroll bars' thumbs follow the size */
        SetVerticalDataRange(KORGRID_ROWS);
        return 0;
    case WM_SETFOCUS:
        SetFocus(grid);
        return 0;
    case WM_DESTROY:
        PostQuitMessage(0);
        return 0;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

int WINAPI WinMain(HINSTANCE instance, HINSTANCE previous, LPSTR commandLine, int show)
{
    WNDCLASSW host = {0, HostProc, 0, 0, 0, NULL, NULL, NULL, NULL, L"Smallest host"};
    MSG message;
    HWND window;
    host.hInstance = instance;
    RegisterClassW(&host);
    RegisterGridControl(instance);
    window = CreateWindowW(host.lpszClassName, L"Smallest host", WS_OVERLAPPEDWINDOW, 40, 40, 480,
                           320, NULL, NULL, instance, NULL);
    grid = CreateWindowW(KORGRID_CLASS, L"",
                         WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL, 0, 0, 0,
                         0, window, NULL, instance, NULL);
    ShowWindow(window, show);
    while (GetMessageW(&message, NULL, 0, 0) > 0) {
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
    (void)previous;
    (void)commandLine;
    return 0;
}

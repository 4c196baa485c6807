/* A function bar over a view: choosing an item fills the view with its colour. */
#include <korcontrols/funkybar.h>

#define BAR_ID 1
#define BAR_HEIGHT 18
#define IMAGE_SIDE 12

static const struct {
    LPCWSTR name;
    COLORREF colour;
} views[] = {{L"Calendar", RGB(70, 120, 200)},
             {L"Contacts", RGB(90, 160, 80)},
             {L"Expenses", RGB(210, 140, 40)},
             {L"Notes", RGB(160, 90, 160)}};

#define VIEW_COUNT ((int)(sizeof views / sizeof views[0]))

static HWND bar;
static HIMAGELIST images;

static void FillWith(HDC dc, const RECT* area, COLORREF colour) {
    HBRUSH brush = CreateSolidBrush(colour);
    FillRect(dc, area, brush);
    DeleteObject(brush);
}

/* A square of each view's colour. */
static HIMAGELIST MakeImages(HWND hwnd) {
    RECT square = {0, 0, IMAGE_SIDE, IMAGE_SIDE};
    HIMAGELIST list = ImageList_Create(IMAGE_SIDE, IMAGE_SIDE, ILC_COLOR24, VIEW_COUNT, 0);
    HDC screen = GetDC(hwnd);
    HDC dc = CreateCompatibleDC(screen);
    int i;
    for (i = 0; i < VIEW_COUNT; ++i) {
        HBITMAP bitmap = CreateCompatibleBitmap(screen, IMAGE_SIDE, IMAGE_SIDE);
        HGDIOBJ previous = SelectObject(dc, bitmap);
        FillWith(dc, &square, views[i].colour);
        SelectObject(dc, previous);
        ImageList_Add(list, bitmap, NULL);
        DeleteObject(bitmap);
    }
    DeleteDC(dc);
    ReleaseDC(hwnd, screen);
    return list;
}

static void CreateBar(HWND hwnd, HINSTANCE instance) {
    int i;
    InitFunkyControl(instance);
    bar = CreateWindowW(KORFUNKYBAR_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, 0, 0, hwnd,
                        (HMENU)BAR_ID, instance, NULL);
    images = MakeImages(hwnd);
    KorFunkyBar_SetImageList(bar, images);
    for (i = 0; i < VIEW_COUNT; ++i) {
        FunkyBarItemDesc item = {FBIF_TEXT | FBIF_IMAGE, KORFUNKYBAR_APPEND, NULL, 0, 0, 0, 0, 0};
        item.text = (LPWSTR)views[i].name; /* only read */
        item.image = i;
        KorFunkyBar_InsertItem(bar, &item);
    }
}

static void PaintView(HWND hwnd) {
    PAINTSTRUCT paint;
    RECT area;
    LONG view = KorFunkyBar_GetCurrent(bar);
    BeginPaint(hwnd, &paint);
    GetClientRect(hwnd, &area);
    if (view >= 0) FillWith(paint.hdc, &area, views[view].colour);
    EndPaint(hwnd, &paint);
}

static LRESULT CALLBACK HostProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_CREATE: CreateBar(hwnd, ((const CREATESTRUCTW*)lParam)->hInstance); return 0;
    case WM_NOTIFY:
        if (((const NMHDR*)lParam)->code == FBN_SELECTED) InvalidateRect(hwnd, NULL, FALSE);
        return 0;
    case WM_PAINT: PaintView(hwnd); return 0;
    case WM_SIZE: MoveWindow(bar, 0, 0, LOWORD(lParam), BAR_HEIGHT, TRUE); return 0;
    case WM_DESTROY:
        ImageList_Destroy(images);
        PostQuitMessage(0);
        return 0;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

int WINAPI WinMain(HINSTANCE instance, HINSTANCE previous, LPSTR commandLine, int show) {
    WNDCLASSW host = {0, HostProc, 0, 0, 0, NULL, NULL, NULL, NULL, L"Function bar"};
    MSG message;
    HWND window;
    host.hInstance = instance;
    RegisterClassW(&host);
    window =
        CreateWindowW(host.lpszClassName, L"Function bar", WS_OVERLAPPEDWINDOW | WS_CLIPCHILDREN, 0,
                      0, 240, 200, NULL, NULL, instance, NULL);
    ShowWindow(window, show);
    while (GetMessageW(&message, NULL, 0, 0) > 0) {
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
    (void)previous;
    (void)commandLine;
    return 0;
}

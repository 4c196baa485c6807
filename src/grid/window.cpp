// The grid: one window procedure over the module-wide GridState. It answers every message it knows
// itself and is silent otherwise; all drawing goes to an off-screen image that WM_PAINT copies.
#include <korcontrols/grid.h>
#include <korcontrols/header.h>

#include <algorithm>

#include "base/gdi_scopes.h"
#include "base/runtime.h"
#include "base/windows_helpers.h"
#include "grid/equation.h"
#include "grid/keyboard.h"
#include "grid/layout.h"
#include "grid/mouse.h"
#include "grid/resize.h"
#include "grid/scrolling.h"
#include "grid/selection.h"
#include "grid/sizes.h"
#include "grid/state.h"
#include "header/window.h"

namespace kor {

namespace {

constinit wchar_t className[] = KORGRID_CLASS;

constexpr COLORREF kGridLineColour = RGB(176, 176, 176);
constexpr int kEquationTextLimit = 260;  // characters
constexpr int kEquationBarMargin = 4;

// Ids of the children. "OK" and "fx" share one, so a click on either of them commits.
enum ChildId {
    kCornerButtonId = 1,
    kColumnHeaderId = 2,
    kRowHeaderId = 3,
    kEquationId = 6,
    kCommitButtonId = 7,
    kCancelButtonId = 8,
};

HWND CreateChild(const wchar_t* windowClass, const wchar_t* text, DWORD style, ChildId id,
                 HINSTANCE instance) {
    return CreateWindowExW(0, windowClass, text, WS_CHILD | WS_VISIBLE | style, 0, 0, 0, 0,
                           grid.hwndGrid, reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)),
                           instance, nullptr);
}

// All buttons are of one class, so the procedure that was replaced last serves all three.
HWND CreateBarButton(const wchar_t* text, DWORD style, ChildId id, WNDPROC procedure,
                     HINSTANCE instance) {
    HWND button = CreateChild(L"BUTTON", text, style, id, instance);
    const WNDPROC replaced = Subclass(button, procedure);
    if (replaced) grid.savedButtonProc = replaced;
    return button;
}

void CreateChildren(HINSTANCE instance) {
    grid.hwndEquation =
        CreateChild(L"EDIT", L"", WS_BORDER | ES_AUTOHSCROLL, kEquationId, instance);
    SendMessageW(grid.hwndEquation, EM_LIMITTEXT, kEquationTextLimit, 0);
    grid.savedEditProc = Subclass(grid.hwndEquation, EquationEditProc);
    grid.hwndOkButton =
        CreateBarButton(L"OK", BS_DEFPUSHBUTTON, kCommitButtonId, OkButtonProc, instance);
    grid.hwndFunctionButton =
        CreateBarButton(L"fx", BS_DEFPUSHBUTTON, kCommitButtonId, FunctionButtonProc, instance);
    grid.hwndCancelButton =
        CreateBarButton(L"X", BS_PUSHBUTTON, kCancelButtonId, CancelButtonProc, instance);
    grid.hwndCornerButton = CreateChild(L"BUTTON", L"", BS_PUSHBUTTON, kCornerButtonId, instance);
    grid.hwndColumnHeader = CreateChild(KORHEADER_CLASS, L"", 1, kColumnHeaderId, instance);
    grid.hwndRowHeader = CreateChild(KORHEADER_CLASS, L"", HCS_VERTICAL, kRowHeaderId, instance);
}

// The font is never deleted: the headers keep it for the life of the process.
void SetHeaderFont() {
    LOGFONTW description = {};
    description.lfWeight = FW_BOLD;
    description.lfCharSet = DEFAULT_CHARSET;
    // Compatibility: five bytes of an 8-bit string in a wide field name no face that exists, so the
    // system picks its own; pinned by GridCreation.DescribesABoldFontWithANarrowFaceName.
    memcpy(description.lfFaceName, "Arial", 5);
    HFONT font = CreateFontIndirectW(&description);
    if (!font) return;
    SendMessageW(grid.hwndRowHeader, WM_SETFONT, reinterpret_cast<WPARAM>(font), 0);
    SendMessageW(grid.hwndColumnHeader, WM_SETFONT, reinterpret_cast<WPARAM>(font), 0);
}

void CreateImageDC() {
    HDC parentDC = GetDC(grid.hwndParent);
    grid.memoryDC = CreateCompatibleDC(parentDC);
    SetHeaderFont();
    TEXTMETRICW metrics = {};
    GetTextMetricsW(parentDC, &metrics);
    grid.equationBarHeight = metrics.tmHeight + kEquationBarMargin;
    // Compatibility: the parent's DC is released in the grid's name; the platform goes by the DC;
    // pinned by GridCreation.TakesTheParentsDCAndReleasesItInTheGridsName.
    ReleaseDC(grid.hwndGrid, parentDC);
}

void ReleaseDrawingObjects() {
    if (grid.memoryBitmap) {
        SelectObject(grid.memoryDC, grid.blankBitmap);
        DeleteObject(grid.memoryBitmap);
    }
    if (grid.memoryDC) DeleteDC(grid.memoryDC);
    if (grid.gridLinePen) DeleteObject(grid.gridLinePen);
    grid.memoryBitmap = nullptr;
    grid.memoryDC = nullptr;
    grid.gridLinePen = nullptr;
}

// Places no child: the WM_SIZE that follows does.
LRESULT OnCreate(HWND hwnd, const CREATESTRUCTW* creation) {
    if (!creation) return 0;
    grid.life.retired = false;
    ReleaseDrawingObjects();  // of an earlier grid that still exists
    // Fails when the class is already registered; then it need not succeed.
    RegisterHeaderClass(creation->hInstance);
    grid.hwndParent = creation->hwndParent;
    grid.hwndGrid = hwnd;
    WhenHeaderResizeIsLost(OnHeaderResizeLost);
    CreateChildren(creation->hInstance);
    if (grid.life.retired || grid.hwndGrid != hwnd) return 0;  // a host has destroyed it meanwhile
    grid.gridLinePen = CreatePen(PS_SOLID, 1, kGridLineColour);
    CreateImageDC();
    return 0;
}

LRESULT OnDestroy() {
    LoseGridDrag();
    ReleaseDrawingObjects();
    ForgetSizes();
    if (!grid.life.retired) RetireRecord(grid);
    return 0;
}

void OnPaint(HWND hwnd) {
    PaintScope paint(hwnd);
    const RECT& area = paint.area();
    BitBlt(paint.dc(), area.left, area.top, area.right - area.left, area.bottom - area.top,
           grid.memoryDC, area.left, area.top, SRCCOPY);
}

LRESULT OnCommand(int id) {
    switch (id) {
    case kCornerButtonId: return SelectAll();
    case kCommitButtonId: return CommitEquation();
    case kCancelButtonId: return CancelEquation();
    default: return 1;
    }
}

LRESULT OnRedraw() {
    RedrawHeadersAndCells();
    return 0;
}

LRESULT OnSetEquationText(WPARAM mark, LPARAM text) {
    if (text) SendMessageW(grid.hwndEquation, WM_SETTEXT, mark, text);
    return 0;
}

LRESULT CALLBACK GridProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    const RecordUse use(&grid);
    const int lowWord = LowWord(static_cast<WPARAM>(lParam));
    const int highWord = HighWord(static_cast<WPARAM>(lParam));
    const auto sender = reinterpret_cast<HWND>(wParam);
    switch (message) {
    case WM_CREATE: return OnCreate(hwnd, reinterpret_cast<CREATESTRUCTW*>(lParam));
    case WM_DESTROY: return OnDestroy();
    case WM_SIZE: return OnGridSize();
    case WM_SETFOCUS: grid.focusWindow = grid.hwndGrid; break;
    case WM_PAINT: OnPaint(hwnd); break;
    case WM_KEYDOWN: return OnGridKeyDown(wParam, lParam);
    case WM_KEYUP: return 0;
    case WM_CHAR: TypeIntoEquation(wParam, lParam); break;
    case WM_COMMAND: return OnCommand(LowWord(wParam));
    case WM_TIMER:
        if (wParam == kAutoScrollTimerId) OnAutoScroll();
        break;
    case WM_HSCROLL: return OnHorizontalScroll(LowWord(wParam), HighWord(wParam));
    case WM_VSCROLL: return OnVerticalScroll(LowWord(wParam), HighWord(wParam));
    case WM_MOUSEMOVE: return OnGridPointerMove(lowWord, SignedHighWord(lParam));
    case WM_LBUTTONDOWN: return OnGridButtonDown(wParam, lowWord, SignedHighWord(lParam));
    case WM_LBUTTONUP: return OnGridButtonUp(wParam);
    case WM_CAPTURECHANGED:
        if (reinterpret_cast<HWND>(lParam) != hwnd) LoseGridDrag();
        break;
    case WM_CANCELMODE: LoseGridDrag(); break;
    case HCN_ITEMCLICK: return OnHeaderClick(sender, lowWord, highWord);
    case HCN_ITEMRESIZING: return OnHeaderResizing(sender, highWord);
    case HCN_ITEMRESIZED: return OnHeaderResized(sender, lowWord, highWord);
    case GRIDM_REDRAW: return OnRedraw();
    case GRIDM_SETEQUATIONTEXT: return OnSetEquationText(wParam, lParam);
    default: break;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

}  // namespace

void FreeRecord(GridState* state) {
    ReleaseDrawingObjects();
    state->life.retired = false;
}

}  // namespace kor

using namespace kor;

extern "C" DWORD KORCONTROLS_API RegisterGridControl(HINSTANCE instance) {
    WNDCLASSW windowClass = {};
    windowClass.style = CS_VREDRAW | CS_HREDRAW | CS_DBLCLKS;
    windowClass.lpfnWndProc = GridProc;
    windowClass.hInstance = instance;
    windowClass.hbrBackground = static_cast<HBRUSH>(GetStockObject(WHITE_BRUSH));
    windowClass.lpszClassName = className;
    return RegisterClassW(&windowClass) != 0;
}

extern "C" void KORCONTROLS_API ResetGrid(void) {
    grid.firstVisibleColumn = 0;
    grid.firstVisibleRow = 0;
    ForgetSizes();
    ClearEquationText();
}

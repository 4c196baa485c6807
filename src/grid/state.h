// The whole state of the process's one grid. Its zoom is in zoom/zoom.h, where the header strips
// read it too.
#pragma once

#include <korcontrols/grid.h>

#include "base/records.h"
#include "grid/block.h"
#include "grid/geometry.h"
#include "platform/platform.h"

namespace kor {

static_assert(kColumnLimit == KORGRID_COLUMNS && kRowLimit == KORGRID_ROWS);
// Notifications pass the parent a block's address as a GridSelection*.
static_assert(sizeof(CellBlock) == sizeof(GridSelection));
constexpr int kNoResizeLine = -1;
constexpr int kEditBufferBytes = 260;

// Window handles keep their values after WM_DESTROY, when they no longer name windows. The grid
// owns the drawing objects and heap blocks: they are created in WM_CREATE, WM_SIZE or on demand,
// and are null again after WM_DESTROY.
struct GridState {
    HWND hwndGrid = nullptr;
    HWND hwndParent = nullptr;  // receives every notification
    HWND hwndEquation = nullptr;
    HWND hwndOkButton = nullptr;
    HWND hwndFunctionButton = nullptr;
    HWND hwndCancelButton = nullptr;
    HWND hwndCornerButton = nullptr;  // between the two headers
    HWND hwndColumnHeader = nullptr;
    HWND hwndRowHeader = nullptr;
    WNDPROC savedEditProc = nullptr;
    WNDPROC savedButtonProc = nullptr;
    HDC memoryDC = nullptr;          // everything is drawn here; WM_PAINT copies from it
    HBITMAP memoryBitmap = nullptr;  // client size, selected into memoryDC
    HGDIOBJ blankBitmap = nullptr;   // memoryDC's first bitmap; reselected before memoryBitmap goes
    HPEN gridLinePen = nullptr;
    int32_t firstVisibleColumn = 0;
    int32_t firstVisibleRow = 0;
    uint8_t visibleColumnCount = 0;  // a partly visible last one included
    uint8_t visibleRowCount = 0;
    uint8_t maxVisibleColumnCount = 0;  // largest ever reached; limits scrolling
    uint8_t maxVisibleRowCount = 0;
    int32_t horizontalDataRange = 0;
    int32_t verticalDataRange = 0;
    SizeOverride* columnWidths = nullptr;  // local heap, sorted by index
    SizeOverride* rowHeights = nullptr;
    uint32_t columnOverrideCount = 0;
    uint32_t rowOverrideCount = 0;
    CellBlock selection = {0, 0, 0, 0};
    int32_t anchorColumn = kNoAnchor;
    int32_t anchorRow = kNoAnchor;
    int32_t cellsLeft = 0;           // client x of the first visible column; set at load
    int32_t cellsTop = 0;            // client y of the first visible row
    int32_t rowHeaderWidth = 30;     // 30, 35 or 40 pixels, at any zoom
    int32_t columnHeaderHeight = 0;  // pixels; set at load
    int32_t equationBarHeight = 0;   // pixels
    bool headersHidden = false;
    bool horizontalScrollBarHidden = false;
    bool verticalScrollBarHidden = false;
    bool gridLinesHidden = false;
    HWND focusWindow = nullptr;  // the grid or the edit, whichever had the focus last
    uint32_t functionButtonMessageId = 0;
    bool editCaretMode = false;  // the user clicked into the edit: arrows move its caret
    bool focusByMouse = false;   // while a press in the grid takes the focus
    bool isDragging = false;     // from a press to its release, while the grid has the capture
    int32_t lastMouseX = 0;
    int32_t lastMouseY = 0;
    int32_t resizeLinePos = kNoResizeLine;  // client x or y of the inverted line
    uint8_t editBuffer[kEditBufferBytes] = {};
    RecordLife life = {};
};

extern GridState grid;

// The state itself is never freed. Releases what a grid created after it was destroyed in the
// middle of its own work, when that work ends.
void FreeRecord(GridState* state);

// Sets what is derived from other initial values. Called once, when the process attaches the
// library.
void InitialiseGridState();

}  // namespace kor

// The state of one chart, in its window's user data from WM_CREATE to WM_DESTROY.
//
// Compatibility: field order and sizes are fixed on 32-bit targets, up to the library's own fields
// at the end, since programs find the record in the window's user data
// (GraphRecordLayout.IsTheOneOf32Bits, GraphRecordInWindow.HasItsFieldsInPlaceWith32Bits).
//
// Pixels are those of the off-screen image, whose origin is that of the client area. Ends of data
// ranges are data values.
#pragma once

#include "base/records.h"
#include "numbers/pixel_scale.h"
#include "numbers/shapes.h"
#include "platform/platform.h"
#include "text/number_run.h"

namespace kor {

enum GraphType : int32_t { kLine = 0, kArea = 1, kBar = 2, kColumn = 3, kPie = 4 };

// One series. The graph record owns it; it owns its arrays and its name.
struct GraphSeries {
    int32_t pointCount;
    double* values;  // local heap
    double minValue;
    double maxValue;
    int32_t minIndex;
    int32_t maxIndex;
    double absSum;  // sum of the absolute values; stale after some changes of single values
    wchar_t* name;  // local heap; null for none
    COLORREF colour;
    POINT* liveBuffer;       // local heap, live mode only; at least three points
    int32_t livePointCount;  // points of liveBuffer that were written
};

struct Triangle {
    POINT points[3];
};

// The progress of a print. It runs inside one message, but its dialog dispatches others.
enum class PrintState : int32_t {
    none,
    underWay,  // the record describes the screen; a second print is refused
    onPage     // the record describes the page; only WM_DESTROY may access it
};

struct GraphRecord {
    HWND hwndParent;
    HINSTANCE hInstance;
    HWND hwnd;
    HWND hwndToolTip;  // belongs to the parent window
    HWND hwndLegend;
    HDC hdcMem;      // the off-screen image
    HBITMAP hbmMem;  // selected into hdcMem
    HRGN hrgnClip;   // reused for every change of the clip
    HPEN hpenThick;
    int32_t seriesCount;
    GraphSeries** series;
    wchar_t* title;  // texts: local heap, null for none
    wchar_t* xAxisTitle;
    wchar_t* yAxisTitle;
    int32_t categoryCount;
    wchar_t** categoryLabels;  // may be null whatever the count is
    int32_t labelHalfHeight;
    int32_t xTickHalfSpacing;
    int32_t labelMaxWidth;  // half the width of the widest value label; only grows
    HFONT hfontTitle;       // same as hfontXTitle, hfontLabel, hfontAxis
    HFONT hfontXTitle;
    HFONT hfontYTitle;  // rotated to read upwards
    HFONT hfontLabel;
    HFONT hfontAxis;
    int32_t chartType;
    int32_t dataMode;
    RECT rcPlot;  // the whole image; left and top stay 0 on the screen
    uint32_t options;
    HBRUSH hbrBack;
    COLORREF crBack;
    int32_t liveIndex;
    uint8_t xAutoRange;
    uint8_t yAutoRange;
    alignas(8) double xDataMax;  // doubles are 8-byte aligned on every target

    double yDataMax;
    double xDataMin;
    double yDataMin;
    double xMax;
    double yMax;
    double xMin;
    double yMin;
    double zoom;
    int32_t marginBottom;
    int32_t marginLeft;
    int32_t marginRight;
    int32_t marginTop;
    int32_t xLabelHeight;
    int32_t tipWidth;  // room for one percentage label; 0 without labels
    int32_t tipHeight;
    uint32_t panArrows;  // kPan bits of the arrows on screen
    Triangle arrowLeft;
    Triangle arrowRight;
    Triangle arrowUp;
    Triangle arrowDown;
    HPEN hpenThin;
    int32_t tickHalfLength;
    alignas(8) double xTickStep;
    double yTickStep;
    HPEN hpenGrid;
    alignas(8) double xTickStepCopy;

    double yTickStepCopy;
    double xCentre;  // data value at the plot's centre; panning moves it
    double yCentre;
    double xUnitsPerPixelBase;  // at 100 %
    double yUnitsPerPixelBase;
    double xUnitsPerPixel;
    double yUnitsPerPixel;
    int32_t xCentrePixel;
    int32_t yCentrePixel;
    int32_t barWidth;
    int32_t barHeight;

    // The library's own fields.
    HGDIOBJ blankBitmap;        // hdcMem's original bitmap; reselected before hbmMem is deleted
    NumberWidths numberWidths;  // measured in hfontAxis
    PixelScale xScale;          // the mappings above, for processors without an FPU
    PixelScale yScale;
    PrintState printing;
    bool paintMissed;  // WM_PAINT arrived while the record described a page
    bool sizeMissed;   // WM_SIZE likewise
    bool isMakingLegend;
    RecordLife life;
};

constexpr uint32_t kPanLeft = 1;
constexpr uint32_t kPanRight = 2;
constexpr uint32_t kPanUp = 4;
constexpr uint32_t kPanDown = 8;

static_assert(sizeof(void*) != 4 || offsetof(GraphRecord, xDataMax) % 8 == 0);

// A record with its initial values and pens, or null for lack of memory.
GraphRecord* CreateGraphRecord();

// Frees the record and all that it owns, but destroys no window.
void FreeRecord(GraphRecord* graph);

// Resets ranges and mapping to their initial values, automatic again. The zoom stays.
void ResetGraphRanges(GraphRecord& graph);

// Whether a KORGRAPH_ option bit is set.
bool HasOption(const GraphRecord& graph, uint32_t option);

// The whole image, or page.
Rect SurfaceOf(const GraphRecord& graph);

// The plot area: the image less its margins. As in any RECT, right and bottom are exclusive.
RECT PlotArea(const GraphRecord& graph);

}  // namespace kor

// The state of one chart, in its window's user data from WM_CREATE to WM_DESTROY.
//
// Field order and sizes are binding for 32-bit targets. Pixels are those of the off-screen image,
// whose origin is the client area's; ends of data ranges are data values.
#pragma once

#include "base/records.h"
#include "numbers/pixel_scale.h"
#include "numbers/shapes.h"
#include "platform/platform.h"
#include "text/number_run.h"

namespace kor {

enum GraphType : int32_t { kLine = 0, kArea = 1, kBar = 2, kColumn = 3, kPie = 4 };

// One series. Owned by the graph record, and owning its arrays and name.
struct GraphSeries {
    int32_t pointCount;
    double* values;  // local heap
    double minValue;
    double maxValue;
    int32_t minIndex;
    int32_t maxIndex;
    double absSum;  // of the absolute values; stale after some changes of single values
    wchar_t* name;  // local heap; null for none
    COLORREF colour;
    POINT* liveBuffer;       // local heap, live mode only; at least three points
    int32_t livePointCount;  // points of liveBuffer that were written
};

struct Triangle {
    POINT points[3];
};

// A print under way. It runs inside one message, but its dialog lets others through.
enum class PrintState : int32_t {
    none,
    underWay,  // the record is the screen's; a second print is refused
    onPage     // the record stands for the page; only WM_DESTROY may touch it
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
    wchar_t** categoryLabels;  // may be null whatever the count says
    int32_t labelHalfHeight;
    int32_t xTickHalfSpacing;
    int32_t labelMaxWidth;  // half the width of the widest value label; only grows
    HFONT hfontTitle;       // also hfontXTitle, hfontLabel and hfontAxis
    HFONT hfontXTitle;
    HFONT hfontYTitle;  // turned to read upwards
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
    alignas(8) double xDataMax;  // doubles lie on multiples of 8 on every target

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
    int32_t tipWidth;  // room for one percentage label; 0 without them
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

    // The library's own, behind the fields above.
    HGDIOBJ blankBitmap;        // what hdcMem held at first; back before hbmMem is deleted
    NumberWidths numberWidths;  // in hfontAxis
    PixelScale xScale;          // of the mappings above; for processors without floating point
    PixelScale yScale;
    PrintState printing;
    bool paintMissed;  // WM_PAINT came while the record stood for a page
    bool sizeMissed;   // WM_SIZE likewise
    bool isMakingLegend;
    RecordLife life;
};

constexpr uint32_t kPanLeft = 1;
constexpr uint32_t kPanRight = 2;
constexpr uint32_t kPanUp = 4;
constexpr uint32_t kPanDown = 8;

static_assert(sizeof(void*) != 4 || offsetof(GraphRecord, xDataMax) % 8 == 0);

// A record with its initial values and pens, or null when there is no memory.
GraphRecord* CreateGraphRecord();

// Frees the record and all it holds, but no window.
void FreeRecord(GraphRecord* graph);

// Ranges and mapping as at the start, automatic again; the zoom stays.
void ResetGraphRanges(GraphRecord& graph);

// Whether a KORGRAPH_ option bit is set.
bool HasOption(const GraphRecord& graph, uint32_t option);

// The whole image, or page.
Rect SurfaceOf(const GraphRecord& graph);

// The plot area: the image less its margins, ends exclusive as of a RECT.
RECT PlotArea(const GraphRecord& graph);

}  // namespace kor

#include "cell_styles.h"

#include <algorithm>

namespace workbook {

namespace {

// A default row is 16 pixels high, of which a text may use those below the top one.
constexpr int kTextHeight = 15;
constexpr int kLargestHeight = 13;
constexpr int kSmallestHeight = 8;
constexpr COLORREF kTitleEdgeColour = RGB(112, 136, 168);
constexpr COLORREF kTitleLineColour = RGB(190, 202, 218);

LOGFONTW MessageFont() {
    NONCLIENTMETRICSW metrics = {};
    metrics.cbSize = sizeof metrics;
    if (SystemParametersInfoW(SPI_GETNONCLIENTMETRICS, sizeof metrics, &metrics, 0)) {
        return metrics.lfMessageFont;
    }
    LOGFONTW font = {};
    lstrcpyW(font.lfFaceName, L"Tahoma");
    return font;
}

struct FontSize {
    LONG height = 0;
    LONG digitWidth = 0;
};

FontSize SizeOf(HFONT font) {
    const HDC dc = CreateCompatibleDC(nullptr);
    const HGDIOBJ previous = SelectObject(dc, font);
    TEXTMETRICW metrics = {};
    SIZE digit = {};
    GetTextMetricsW(dc, &metrics);
    GetTextExtentPoint32W(dc, L"0", 1, &digit);
    SelectObject(dc, previous);
    DeleteDC(dc);
    return {metrics.tmHeight, digit.cx};
}

// The system's message font, as large as fits into a row.
HFONT CreateCellFont(LONG weight) {
    LOGFONTW font = MessageFont();
    font.lfWidth = 0;
    font.lfWeight = weight;
    for (int height = kLargestHeight; height > kSmallestHeight; --height) {
        font.lfHeight = -height;
        const HFONT made = CreateFontIndirectW(&font);
        if (!made || SizeOf(made).height <= kTextHeight) return made;
        DeleteObject(made);
    }
    font.lfHeight = -kSmallestHeight;
    return CreateFontIndirectW(&font);
}

}  // namespace

void CreateCellStyles(CellStyles& styles) {
    styles.normal = CreateCellFont(FW_NORMAL);
    styles.bold = CreateCellFont(FW_BOLD);
    styles.digitWidth = std::max(1, static_cast<int>(SizeOf(styles.normal).digitWidth));
    styles.titleBrush = CreateSolidBrush(kTitleColour);
    styles.titleEdgePen = CreatePen(PS_SOLID, 1, kTitleEdgeColour);
    styles.titleLinePen = CreatePen(PS_SOLID, 1, kTitleLineColour);
}

void DeleteCellStyles(CellStyles& styles) {
    DeleteObject(styles.titleLinePen);
    DeleteObject(styles.titleEdgePen);
    DeleteObject(styles.titleBrush);
    DeleteObject(styles.bold);
    DeleteObject(styles.normal);
    styles = {};
}

}  // namespace workbook

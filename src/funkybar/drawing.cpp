#include "funkybar/drawing.h"

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "funkybar/items.h"
#include "funkybar/layout.h"

namespace kor {

namespace {

// Restores a DC's colours and background mode: the menu's DC belongs to the system, and the next
// entry is drawn with it too.
class ColourScope {
public:
    explicit ColourScope(HDC dc) noexcept
        : dc_(dc), text_(SetTextColor(dc, 0)), background_(SetBkColor(dc, 0)),
          mode_(SetBkMode(dc, OPAQUE)) {
        restore();
    }
    ~ColourScope() { restore(); }
    ColourScope(const ColourScope&) = delete;
    ColourScope& operator=(const ColourScope&) = delete;

private:
    void restore() const noexcept {
        SetTextColor(dc_, text_);
        SetBkColor(dc_, background_);
        SetBkMode(dc_, mode_);
    }

    HDC dc_;
    COLORREF text_;
    COLORREF background_;
    int mode_;
};

// Empty for an item without an image, without an image list, and for a bad index into the list.
Size ImageSize(const FunkyBarItem& item) {
    if (!HasField(item, FBIF_IMAGE) || !funkyBar.itemImages) return {};
    IMAGEINFO info = {};
    if (!ImageList_GetImageInfo(funkyBar.itemImages, item.image, &info)) return {};
    return {info.rcImage.right - info.rcImage.left, info.rcImage.bottom - info.rcImage.top};
}

void DrawImage(const FunkyBarItem& item, HDC dc, int left, int top, UINT style) {
    if (!HasField(item, FBIF_IMAGE) || !funkyBar.itemImages) return;
    ImageList_Draw(funkyBar.itemImages, item.image, dc, left, top, style);
}

void SetItemColours(HDC dc, const FunkyBarItem& item) {
    if (!HasField(item, FBIF_COLOURS)) return;
    SetTextColor(dc, item.textColour);
    SetBkColor(dc, item.backgroundColour);
}

// Measured in the selected font.
Size TextSize(HDC dc, const FunkyBarItem& item) {
    SIZE size = {};
    const auto length = static_cast<int>(item.textBytes / sizeof(wchar_t)) - 1;
    GetTextExtentExPointW(dc, item.text, length, 0, nullptr, nullptr, &size);
    return {size.cx, size.cy};
}

void DrawArrow(HDC dc, Point place) {
    if (!funkyBar.arrowImages) return;
    ImageList_Draw(funkyBar.arrowImages, 0, dc, place.x, place.y, ILD_TRANSPARENT);
}

void DrawCurrentItem(HDC dc, const RECT& client, const FunkyBarItem& item) {
    SelectScope font(dc, funkyBar.font);
    const Size image = ImageSize(item);
    DrawImage(item, dc, kBarLeft, BarImageTop(client.bottom, image.height), ILD_TRANSPARENT);
    const int left = BarTextLeft(HasField(item, FBIF_IMAGE), image.width);
    {
        ColourScope colours(dc);
        SetItemColours(dc, item);
        RECT text = {left, client.top, client.right, client.bottom};
        DrawTextW(dc, item.text, -1, &text, DT_VCENTER);
    }
    DrawArrow(dc, ArrowPlace(left, TextSize(dc, item).width, client.bottom));
}

}  // namespace

void PaintBar(HWND hwnd) {
    PaintScope paint(hwnd);
    const RECT client = ClientRectOf(hwnd);
    FillRect(paint.dc(), &client, SystemStockBrush(COLOR_BTNFACE | kSystemColourFlag));
    SetBkColor(paint.dc(), SystemColour(COLOR_BTNFACE | kSystemColourFlag));
    if (funkyBar.current) DrawCurrentItem(paint.dc(), client, *funkyBar.current);
}

Size MeasureEntry(HWND hwnd, const FunkyBarItem& item) {
    WindowDC dc(hwnd);
    return EntrySize(TextSize(dc.get(), item), ImageSize(item));
}

void DrawEntry(HDC dc, const RECT& area, const FunkyBarItem* item, bool selected) {
    const int background = selected ? COLOR_HIGHLIGHT : COLOR_MENU;
    FillRect(dc, &area, SystemStockBrush(background | kSystemColourFlag));
    if (!item) return;
    ColourScope colours(dc);
    if (selected) SetTextColor(dc, SystemColour(COLOR_HIGHLIGHTTEXT | kSystemColourFlag));
    SetBkMode(dc, TRANSPARENT);
    DrawImage(*item, dc, area.left + kEntryImageInset, area.top + kEntryImageInset, ILD_NORMAL);
    SetItemColours(dc, *item);
    RECT text = area;
    text.left = EntryTextLeft(area.left, ImageSize(*item).width);
    DrawTextW(dc, item->text, -1, &text, DT_VCENTER);
}

}  // namespace kor

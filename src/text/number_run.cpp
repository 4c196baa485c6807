#include "text/number_run.h"

#include "platform/gdi_scopes.h"
#include "platform/runtime.h"
#include "text/text_run.h"

namespace kor {

namespace {

constexpr int kLongestNumber = 40;

// Place of a character among those of numbers, or -1.
int PlaceOf(wchar_t character) {
    if (character >= L'0' && character <= L'9') return character - L'0';
    for (int i = 10; i < kNumberCharacterCount; ++i) {
        if (kNumberCharacters[i] == character) return i;
    }
    return -1;
}

// A number's characters from left to right.
struct Advances {
    int count;  // negative when the text is no number, or too long
    int width;
    INT each[kLongestNumber];
};

Advances AdvancesOf(const NumberWidths& widths, const wchar_t* text) {
    Advances found;
    found.width = 0;
    for (found.count = 0; text[found.count]; ++found.count) {
        const int place = PlaceOf(text[found.count]);
        if (place < 0 || found.count == kLongestNumber) {
            found.count = -1;
            return found;
        }
        found.each[found.count] = widths.widths[place];
        found.width += widths.widths[place];
    }
    return found;
}

// The pixels of one text, drawn twice on a bitmap, the second time below the first.
class TwoRows {
public:
    explicit TwoRows(SIZE row) : row_(row), dc_(CreateCompatibleDC(nullptr)), bitmap_(nullptr) {
        BITMAPINFO info = {};
        info.bmiHeader.biSize = sizeof info.bmiHeader;
        info.bmiHeader.biWidth = row.cx;
        info.bmiHeader.biHeight = -2 * row.cy;
        info.bmiHeader.biPlanes = 1;
        info.bmiHeader.biBitCount = 32;
        if (dc_) bitmap_ = CreateDIBSection(dc_, &info, DIB_RGB_COLORS, &pixels_, nullptr, 0);
    }
    ~TwoRows() {
        if (bitmap_) DeleteObject(bitmap_);
        if (dc_) DeleteDC(dc_);
    }
    TwoRows(const TwoRows&) = delete;
    TwoRows& operator=(const TwoRows&) = delete;

    // Whether a text looks the same when it is told how wide its characters are.
    bool AreEqual(HFONT font, const wchar_t* text, int length, const INT* advances) {
        if (!bitmap_) return false;
        {
            SelectScope image(dc_, bitmap_);
            SelectScope selected(dc_, font);
            PatBlt(dc_, 0, 0, row_.cx, 2 * row_.cy, WHITENESS);
            DrawRow(0, text, length, nullptr);
            DrawRow(row_.cy, text, length, advances);
        }
        const auto rowBytes = static_cast<size_t>(row_.cx * row_.cy) * sizeof(uint32_t);
        const auto* first = static_cast<const unsigned char*>(pixels_);
        return memcmp(first, first + rowBytes, rowBytes) == 0;
    }

private:
    void DrawRow(int top, const wchar_t* text, int length, const INT* advances) {
        const RECT row = {0, top, row_.cx, top + row_.cy};
        ExtTextOutW(dc_, 0, top, ETO_CLIPPED, &row, text, static_cast<UINT>(length), advances);
    }

    SIZE row_;
    HDC dc_;
    HBITMAP bitmap_;
    void* pixels_ = nullptr;
};

}  // namespace

NumberWidths MeasureNumberCharacters(HDC dc, HFONT font) {
    SelectScope selected(dc, font);
    NumberWidths found = {};
    INT ends[kNumberCharacterCount] = {};
    SIZE size = {};
    if (!GetTextExtentExPointW(dc, kNumberCharacters, kNumberCharacterCount, 0, nullptr, ends,
                               &size)) {
        return found;
    }
    for (int i = 0; i < kNumberCharacterCount; ++i) {
        found.widths[i] = i == 0 ? ends[0] : ends[i] - ends[i - 1];
    }
    found.known =
        GetDeviceCaps(dc, TECHNOLOGY) == DT_RASDISPLAY &&
        TwoRows(size).AreEqual(font, kNumberCharacters, kNumberCharacterCount, found.widths);
    return found;
}

void DrawNumberText(HDC dc, const NumberWidths& widths, const wchar_t* text, const RECT& area,
                    UINT format) {
    const Advances advances = AdvancesOf(widths, text);
    if (!widths.known || advances.count < 0) {
        TextRun(dc, text).Draw(area, format);
        return;
    }
    int left = area.left;
    if (format == DT_CENTER) {
        left = (area.left + area.right - advances.width) / 2;
    } else if (format == DT_RIGHT) {
        left = area.right - advances.width;
    }
    ExtTextOutW(dc, left, area.top, ETO_CLIPPED, &area, text, static_cast<UINT>(advances.count),
                advances.each);
}

}  // namespace kor

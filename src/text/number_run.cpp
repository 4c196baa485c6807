#include "text/number_run.h"

#include <algorithm>

#include "base/assert.h"
#include "base/runtime.h"
#include "text/scratch_bitmap.h"
#include "text/text_run.h"

namespace kor {

namespace {

constexpr int kLongestNumber = 40;

// Index of a character in kNumberCharacters, or -1.
int PlaceOf(wchar_t character) {
    if (character >= L'0' && character <= L'9') return character - L'0';
    for (int i = 10; i < kNumberCharacterCount; ++i) {
        if (kNumberCharacters[i] == character) return i;
    }
    return -1;
}

// Advance widths of a number's characters, from left to right.
struct Advances {
    int count;  // negative when the text is not a number, or too long
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
        KOR_ASSERT(found.count < kLongestNumber);
        found.each[found.count] = widths.widths[place];
        found.width += widths.widths[place];
    }
    return found;
}

// One text drawn black on white in two rows, the lower one with explicit advance widths.
class TwoRows {
public:
    TwoRows(SIZE row, HFONT font, const wchar_t* text, int length, const INT* advances)
        : row_(row), bitmap_({row.cx, 2 * row.cy}) {
        if (!bitmap_.IsMade()) return;
        SelectScope selected(bitmap_.dc(), font);
        DrawRow(0, text, length, nullptr);
        DrawRow(row.cy, text, length, advances);
    }

    bool IsMade() const { return bitmap_.IsMade(); }

    bool AreEqual() const {
        const uint32_t* first = bitmap_.Pixels();
        const size_t rowPixels = bitmap_.PixelCount() / 2;
        return memcmp(first, first + rowPixels, rowPixels * sizeof(uint32_t)) == 0;
    }

    bool AreBlackAndWhite() const {
        const uint32_t* pixels = bitmap_.Pixels();
        return std::all_of(pixels, pixels + bitmap_.PixelCount(), [](uint32_t pixel) {
            return ColourOfPixel(pixel) == 0 || ColourOfPixel(pixel) == kWhitePixel;
        });
    }

private:
    void DrawRow(int top, const wchar_t* text, int length, const INT* advances) {
        const RECT row = {0, top, row_.cx, top + row_.cy};
        ExtTextOutW(bitmap_.dc(), 0, top, ETO_CLIPPED, &row, text, static_cast<UINT>(length),
                    advances);
    }

    SIZE row_;
    ScratchBitmap bitmap_;
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
    if (GetDeviceCaps(dc, TECHNOLOGY) != DT_RASDISPLAY) return found;
    const TwoRows rows(size, font, kNumberCharacters, kNumberCharacterCount, found.widths);
    if (!rows.IsMade()) return found;
    found.known = rows.AreEqual();
    found.stencil = rows.AreBlackAndWhite();
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

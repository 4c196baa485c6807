#include "text/text_run.h"

#include "text/huge_text.h"

namespace kor {

namespace {

constexpr int kPlainLengthLimit = 255;
// Formats that only align a single line; DT_VCENTER has no effect without DT_SINGLELINE.
constexpr UINT kPlainFormats = DT_LEFT | DT_CENTER | DT_RIGHT | DT_VCENTER | DT_NOPREFIX;

// Latin letters, digits and signs that stand for themselves: nothing that joins, changes the
// writing direction or breaks a line, and no prefix character.
constexpr bool IsPlain(wchar_t character) {
    if (character >= 0x20 && character <= 0x7E) return character != L'&';
    return character >= 0xA1 && character <= 0x17F && character != 0xAD;
}

// Length of a text of at most kPlainLengthLimit characters, all of them plain; else -1.
int PlainLength(const wchar_t* text) {
    int length = 0;
    while (length <= kPlainLengthLimit && IsPlain(text[length])) ++length;
    return length <= kPlainLengthLimit && text[length] == L'\0' ? length : -1;
}

bool IsPlainFormat(UINT format) {
    const bool centredAndRight = (format & DT_CENTER) && (format & DT_RIGHT);
    return (format & ~kPlainFormats) == 0 && !centredAndRight;
}

}  // namespace

SIZE DrawnSize(HDC dc, const wchar_t* text, int length) noexcept {
    RECT measured = {};
    if (!dc || !DrawTextW(dc, text, length, &measured, DT_CALCRECT)) return {};
    return {measured.right - measured.left, measured.bottom - measured.top};
}

TextRun::TextRun(HDC dc, const wchar_t* text) noexcept
    : dc_(dc), text_(text), plainLength_(PlainLength(text)) {}

int TextRun::Width() noexcept {
    if (width_ >= 0) return width_;
    if (plainLength_ >= 0) {
        SIZE size = {};
        GetTextExtentExPointW(dc_, text_, plainLength_, 0, nullptr, nullptr, &size);
        width_ = size.cx;
    } else {
        width_ = DrawnSize(dc_, text_).cx;
    }
    return width_;
}

void TextRun::Draw(const RECT& area, UINT format) noexcept {
    if (plainLength_ >= 0 && IsPlainFormat(format)) {
        DrawPlain(area, format);
        return;
    }
    RECT whole = area;
    DrawTextW(dc_, text_, -1, &whole, format);
}

void TextRun::DrawPlain(const RECT& area, UINT format) noexcept {
    int left = area.left;
    if (format & DT_CENTER) {
        left = (area.left + area.right - Width()) / 2;
    } else if (format & DT_RIGHT) {
        left = area.right - Width();
    }
    if (surface_ && !MayShowInk(dc_, text_, plainLength_, {left, area.top}, *surface_)) {
        DrawTextBackground(dc_, {left, area.top}, Width(), area);
        return;
    }
    ExtTextOutW(dc_, left, area.top, ETO_CLIPPED, &area, text_, static_cast<UINT>(plainLength_),
                nullptr);
}

}  // namespace kor

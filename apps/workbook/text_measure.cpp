#include "text_measure.h"

namespace workbook {

void TextMeasure::close() {
    if (dc_) DeleteDC(dc_);
    dc_ = nullptr;
}

int TextMeasure::width(HFONT font, std::wstring_view text) const {
    const HGDIOBJ previous = SelectObject(dc_, font);
    SIZE size = {};
    GetTextExtentPoint32W(dc_, text.data(), static_cast<int>(text.size()), &size);
    SelectObject(dc_, previous);
    return size.cx;
}

size_t TextMeasure::charactersWithin(HFONT font, std::wstring_view text, int pixels) const {
    const HGDIOBJ previous = SelectObject(dc_, font);
    int count = 0;
    SIZE size = {};
    GetTextExtentExPointW(dc_, text.data(), static_cast<int>(text.size()), pixels, &count, nullptr,
                          &size);
    SelectObject(dc_, previous);
    return static_cast<size_t>(count);
}

}  // namespace workbook

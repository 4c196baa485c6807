// How wide texts are at 100 % zoom, in pixels.
#pragma once

#include <windows.h>

#include <string_view>

namespace workbook {

// Measures on a device context of its own, from Open to Close.
class TextMeasure {
public:
    void open() { dc_ = CreateCompatibleDC(nullptr); }
    void close();

    int width(HFONT font, std::wstring_view text) const;

    // How many characters at the beginning of `text` end within `pixels`.
    size_t charactersWithin(HFONT font, std::wstring_view text, int pixels) const;

private:
    HDC dc_ = nullptr;
};

}  // namespace workbook

// Draws a text with the pixels of DrawTextW, usually in half its time.
//
// DrawTextW looks for line breaks, tabs and prefixes, and measures what it draws even if it has
// just measured it. A short single-line text in a plain script needs none of that: one call
// measures it and one draws it.
#pragma once

#include "platform/platform.h"

namespace kor {

// Size of a text as DrawTextW measures it with DT_CALCRECT alone; empty without a DC, where the
// platform's result is undefined. `length` is in characters; -1 means up to the terminator.
SIZE DrawnSize(HDC dc, const wchar_t* text, int length = -1) noexcept;

class TextRun {
public:
    // `text` is zero-terminated and outlives the run; the DC keeps its font for as long.
    TextRun(HDC dc, const wchar_t* text) noexcept;

    // In pixels, as DrawTextW measures it with DT_CALCRECT alone. Measured once.
    int Width() noexcept;

    // Draws as DrawTextW does with these flags, clipped to the area.
    void Draw(const RECT& area, UINT format) noexcept;

    // Sets the visible rectangle: a huge text is drawn only where it may reach into it. The
    // rectangle outlives the run.
    void LimitTo(const RECT& surface) noexcept { surface_ = &surface; }

private:
    void DrawPlain(const RECT& area, UINT format) noexcept;

    HDC dc_;
    const wchar_t* text_;
    int plainLength_;  // characters; negative when only DrawTextW will do
    int width_ = -1;   // pixels; negative until it is measured
    const RECT* surface_ = nullptr;
};

}  // namespace kor

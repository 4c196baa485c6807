// A text on its way into a DC, drawn with the pixels of DrawTextW and usually in half its time.
//
// DrawTextW looks for line breaks, tabs and prefixes and measures what it draws, also when it has
// just been asked for the measure. A short text of one line in a plain script needs none of that:
// one call measures it and one draws it.
#pragma once

#include "platform/platform.h"

namespace kor {

// Size of a text as DrawTextW measures it with DT_CALCRECT alone; empty without a DC, where the
// platform leaves what it likes. `length` is in characters, -1 for up to the terminator.
SIZE DrawnSize(HDC dc, const wchar_t* text, int length = -1) noexcept;

class TextRun {
public:
    // `text` is zero-terminated and outlives the run; the DC's font stays selected for as long.
    TextRun(HDC dc, const wchar_t* text) noexcept;

    // Pixels, as DrawTextW measures with DT_CALCRECT alone. Measured once.
    int Width() noexcept;

    // As DrawTextW draws with these flags, clipped to the area.
    void Draw(const RECT& area, UINT format) noexcept;

    // All that is to be seen: a huge text is drawn only where it may reach into this rectangle. It
    // outlives the run.
    void LimitTo(const RECT& surface) noexcept { surface_ = &surface; }

private:
    void DrawPlain(const RECT& area, UINT format) noexcept;

    HDC dc_;
    const wchar_t* text_;
    int plainLength_;  // characters; negative when only DrawTextW will do
    int width_ = -1;   // not yet measured
    const RECT* surface_ = nullptr;
};

}  // namespace kor

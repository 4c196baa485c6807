#include "text/huge_text.h"

#include <algorithm>

#include "text/scratch_bitmap.h"

namespace kor {

namespace {

constexpr LONG kHuge = 2048;       // font height in pixels
constexpr LONG kSmall = 256;       // height of the small font that is examined instead
constexpr LONG kMargin = 4;        // in the small font's pixels; hinting moves an edge by one
constexpr LONG kSideLimit = 8192;  // of the area that is examined

// Converts to the small font's pixels, rounding down.
LONG Reduced(int64_t pixels, LONG height) {
    const int64_t scaled = pixels * kSmall;
    return static_cast<LONG>(scaled / height - (scaled % height < 0 ? 1 : 0));
}

// Whether a text marks any pixel of a bitmap of this size. Also true when that cannot be
// determined.
bool LeavesMark(SIZE size, HFONT font, POINT at, const wchar_t* text, int length) {
    const ScratchBitmap paper(size);
    if (!paper.IsMade()) return true;
    SelectScope selected(paper.dc(), font);
    const auto count = static_cast<UINT>(length);
    if (!ExtTextOutW(paper.dc(), at.x, at.y, 0, nullptr, text, count, nullptr)) return true;
    const uint32_t* pixels = paper.Pixels();
    return std::any_of(pixels, pixels + paper.PixelCount(),
                       [](uint32_t pixel) { return ColourOfPixel(pixel) != kWhitePixel; });
}

}  // namespace

bool MayShowInk(HDC dc, const wchar_t* text, int length, POINT at, const RECT& surface) {
    LOGFONTW font = {};
    if (!GetObjectW(GetCurrentObject(dc, OBJ_FONT), sizeof font, &font)) return true;
    const LONG height = font.lfHeight < 0 ? -font.lfHeight : font.lfHeight;
    if (height < kHuge) return true;
    // The surface in the small font's pixels, relative to the text.
    const auto side = [&](LONG position, LONG origin) {
        return Reduced(static_cast<int64_t>(position) - origin, height);
    };
    const POINT first = {side(surface.left, at.x) - kMargin, side(surface.top, at.y) - kMargin};
    const SIZE size = {side(surface.right, at.x) + 1 + kMargin - first.x,
                       side(surface.bottom, at.y) + 1 + kMargin - first.y};
    if (size.cx > kSideLimit || size.cy > kSideLimit) return true;
    font.lfHeight = font.lfHeight < 0 ? -kSmall : kSmall;
    font.lfWidth = 0;
    LocalGdiObject<HFONT> small(CreateFontIndirectW(&font));
    if (!small.get()) return true;
    return LeavesMark(size, small.get(), {-first.x, -first.y}, text, length);
}

void DrawTextBackground(HDC dc, POINT at, int width, const RECT& area) {
    TEXTMETRICW metrics = {};
    const int mode = SetBkMode(dc, OPAQUE);
    SetBkMode(dc, mode);
    if (mode != OPAQUE || !GetTextMetricsW(dc, &metrics)) return;
    const RECT ground = {std::max<LONG>(at.x, area.left), std::max<LONG>(at.y, area.top),
                         std::min<LONG>(at.x + width, area.right),
                         std::min<LONG>(at.y + metrics.tmHeight, area.bottom)};
    if (ground.left >= ground.right || ground.top >= ground.bottom) return;
    ExtTextOutW(dc, 0, 0, ETO_OPAQUE, &ground, nullptr, 0, nullptr);
}

}  // namespace kor

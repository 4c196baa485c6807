#include "text/zoomed_font.h"

#include "zoom/zoom.h"

namespace kor {

HFONT CreateZoomedFont(HFONT font) {
    LOGFONTW description = {};
    if (!font || !GetObjectW(font, sizeof description, &description)) return nullptr;
    description.lfHeight = ZoomedFontHeight(description.lfHeight, zoomLevel);
    description.lfWidth = 0;
    return CreateFontIndirectW(&description);
}

}  // namespace kor

// A strip's picture, drawn by the test from the description of its look.
#pragma once

#include "support/pixels.h"

#include <string>
#include <vector>

namespace kortest {

struct StripItem {
    std::wstring label;
    int size;
    DWORD state;
};

struct Strip {
    int width;
    int height;
    bool isVertical;
    DWORD zoom;  // quarters; 0: labels in the DC's own font, unscaled
    std::vector<StripItem> items;
};

// What the whole client area shows after everything was erased and painted.
Picture ExpectedStrip(const Strip& strip);

}  // namespace kortest

// A dialog resource as a plain description.
#pragma once

#include <windows.h>

#include <iosfwd>
#include <string>
#include <vector>

namespace kortest {

// Sizes in dialog units.
struct DialogItem {
    int id;
    std::wstring className;
    std::wstring text;
    DWORD style;
    int x;
    int y;
    int width;
    int height;

    bool operator==(const DialogItem& other) const = default;
};

struct DialogTemplate {
    DWORD style;
    int width;
    int height;
    std::wstring caption;
    int fontPoints;
    std::wstring font;
    std::vector<DialogItem> items;
};

// Of the form without the "extended" signature; fails the test for another, or for none.
DialogTemplate ReadDialogTemplate(HMODULE module, int id);

void PrintTo(const DialogItem& item, std::ostream* stream);  // for GoogleTest's messages

}  // namespace kortest

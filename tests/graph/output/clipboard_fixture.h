// The clipboard as this program sees it and as another one does.
#pragma once

#include "graph/graph_fixture.h"

#include <string>
#include <vector>

namespace kortest {

using Bytes = std::vector<unsigned char>;

// The CF_DIB on the clipboard; empty when there is none.
Bytes ReadClipboard();

// The same, read by another process.
Bytes ReadClipboardElsewhere();

// Empties the clipboard and puts a text on it.
void PutText(const std::wstring& text);

// The text on the clipboard; empty when there is none.
std::wstring ClipboardText();

// There is one clipboard for all tests that run at the same time, each a process of its own: while
// this lives, the others wait.
class ClipboardTurn {
public:
    ClipboardTurn();
    ~ClipboardTurn();
    ClipboardTurn(const ClipboardTurn&) = delete;
    ClipboardTurn& operator=(const ClipboardTurn&) = delete;

private:
    HANDLE mutex_;
};

// A packed bitmap of 8 bits per pixel and 19 colours.
struct ColourDib {
    BITMAPINFOHEADER header;
    std::vector<COLORREF> colours;
    Picture picture;
};

// Fails the test when the bytes are not exactly one such bitmap.
ColourDib ParseDib(const Bytes& bytes);

// While it lives, another process has the clipboard open.
class ClipboardHeldElsewhere {
public:
    ClipboardHeldElsewhere();
    ~ClipboardHeldElsewhere();
    ClipboardHeldElsewhere(const ClipboardHeldElsewhere&) = delete;
    ClipboardHeldElsewhere& operator=(const ClipboardHeldElsewhere&) = delete;

private:
    HANDLE opened_;
    HANDLE end_;
    HANDLE process_;
};

}  // namespace kortest

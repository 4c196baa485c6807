// What a process holds: figures that must not grow with use.
#pragma once

#include <windows.h>

#include <cstddef>

namespace longrun {

struct Figures {
    std::size_t heapBytes;     // in blocks of all heaps that are in use
    std::size_t privateBytes;  // of the process
    unsigned gdiObjects;
    unsigned windows;  // of this thread, children included
};

Figures Measure();

// Whether GDI objects are counted rightly here: some are made, and must be seen to come and go.
bool CanCountGdiObjects();

}  // namespace longrun

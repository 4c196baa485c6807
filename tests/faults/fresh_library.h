// The library as it was at load, again and again in one process: its variables are put back, and
// its window classes are unregistered. What it has loaded or made meanwhile is not given back.
#pragma once

#include <windows.h>

#include <vector>

namespace kortest {

class FreshLibrary {
public:
    // Remembers the variables as they are now: as at load, when nothing has called the library yet.
    FreshLibrary();

    // No window of the library may exist.
    void restore() const;

    // False when the variables could not be found.
    bool isKnown() const { return !parts_.empty(); }

private:
    struct Part {
        BYTE* begin;
        std::vector<BYTE> bytes;
    };

    void remember(const BYTE* image);

    std::vector<Part> parts_;
};

// Unregisters the library's classes from the program's instance.
void UnregisterLibraryClasses();

}  // namespace kortest

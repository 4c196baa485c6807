// A strip whose messages pass through a test first.
#pragma once

#include <korcontrols/header.h>

#include <functional>

namespace kortest {

// Passes a message on to the library's window procedure.
using PassOn = std::function<LRESULT(HWND window, UINT message, WPARAM wParam, LPARAM lParam)>;

// Sees each message of the strip instead of its procedure.
using Interceptor = std::function<LRESULT(HWND window, UINT message, WPARAM wParam, LPARAM lParam,
                                          const PassOn& passOn)>;

// Creates a strip as a child of `parent` at 0, 0. Its class is one of the test's own that differs
// from the library's in nothing but the procedure, so WM_CREATE is seen as well.
HWND CreateWrappedHeader(HWND parent, DWORD style, int width, int height, Interceptor interceptor);

}  // namespace kortest

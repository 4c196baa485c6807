// The library as a module of the process: its instance, and the events of its life.
#pragma once

#include "platform/platform.h"

namespace kor {

// The library's own instance, set when the process attaches and never cleared. Its resources are
// loaded and its own windows created under it.
extern HINSTANCE moduleInstance;

// What each platform's entry point calls with the system loader's event (DLL_PROCESS_ATTACH and its
// like); defined in src/library. Always TRUE.
BOOL OnLibraryEvent(HINSTANCE instance, DWORD reason);

}  // namespace kor

// The library as a module of the process: its instance and the loader's events.
#pragma once

#include "platform/platform.h"

namespace kor {

// The library's own instance, set when the process attaches and never cleared. The library loads
// its resources from it and creates its own windows with it.
extern HINSTANCE moduleInstance;

// Called by each platform's entry point with the loader's event, such as DLL_PROCESS_ATTACH;
// defined in src/library. Always returns TRUE.
BOOL OnLibraryEvent(HINSTANCE instance, DWORD reason);

}  // namespace kor

// What happens when a process attaches or detaches the library.
#pragma once

#include "platform/platform.h"

namespace kor {

// The library's own instance, set when the process attaches and never cleared.
extern HINSTANCE moduleInstance;

// Answers the system loader's event (DLL_PROCESS_ATTACH and its like); always TRUE.
BOOL OnLibraryEvent(HINSTANCE instance, DWORD reason);

}  // namespace kor

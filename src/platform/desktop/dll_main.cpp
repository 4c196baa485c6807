// The entry point that the desktop's loader calls, through the compiler's start-up code.
#include "base/module.h"

extern "C" BOOL WINAPI DllMain(HINSTANCE instance, DWORD reason, void*) {
    return kor::OnLibraryEvent(instance, reason);
}

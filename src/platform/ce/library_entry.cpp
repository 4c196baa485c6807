// The entry point that Windows CE's loader calls. There is no start-up code in between: nothing
// must run at load except OnLibraryEvent.
#include "base/module.h"

extern "C" BOOL DllEntry(HINSTANCE instance, DWORD reason, void*) {
    return kor::OnLibraryEvent(instance, reason);
}

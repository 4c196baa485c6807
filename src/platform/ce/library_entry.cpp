// What Windows CE's loader calls. There is no start-up code in between: the library has nothing
// that must run at load but what OnLibraryEvent does.
#include "base/module.h"

extern "C" BOOL DllEntry(HINSTANCE instance, DWORD reason, void*) {
    return kor::OnLibraryEvent(instance, reason);
}

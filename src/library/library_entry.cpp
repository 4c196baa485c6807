// Runs when a process attaches the library: derived state gets its initial value, in a fixed order,
// before anything else can run. Nothing needs to be done at detach.
#include "base/module.h"
#include "grid/state.h"

namespace kor {

constinit HINSTANCE moduleInstance = nullptr;

BOOL OnLibraryEvent(HINSTANCE instance, DWORD reason) {
    if (reason == DLL_PROCESS_ATTACH) {
        InitialiseGridState();
        moduleInstance = instance;
    }
    return TRUE;
}

}  // namespace kor

#include "core/library_entry.h"

#include "grid/grid_state.h"

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

// Functions of modules that are loaded at run time.
#pragma once

#include "platform/platform.h"

namespace kor {

// The exported function of a plain Latin name, or null when the module lacks it. The desktop looks
// names up in narrow characters, Windows CE in wide ones.
FARPROC FindProcedure(HMODULE module, const wchar_t* name);

// The same with the function's type, `int(WINAPI*)(HDC)` for example.
template <typename Procedure>
Procedure FindProcedureAs(HMODULE module, const wchar_t* name) {
    return reinterpret_cast<Procedure>(reinterpret_cast<void*>(FindProcedure(module, name)));
}

}  // namespace kor

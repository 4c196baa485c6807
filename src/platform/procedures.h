// Functions of modules that are loaded at run time.
#pragma once

#include "platform/platform.h"

namespace kor {

// Loads a module to look up functions in; null when it is not found. On Windows CE it is one of the
// system's. On a desktop it lies beside the program or beside the library. No other folder is
// searched, since a search would run a file of that name in the current folder.
HMODULE LoadPrintModule(const wchar_t* name);

// An exported function by its ASCII name; null when the module lacks it. The desktop looks names up
// in narrow characters, Windows CE in wide ones.
FARPROC FindProcedure(HMODULE module, const wchar_t* name);

// The same, cast to the function's type, `int(WINAPI*)(HDC)` for example.
template <typename Procedure>
Procedure FindProcedureAs(HMODULE module, const wchar_t* name) {
    return reinterpret_cast<Procedure>(reinterpret_cast<void*>(FindProcedure(module, name)));
}

}  // namespace kor

#include "platform/procedures.h"

namespace kor {

namespace {

// The desktop's headers lack it: function names are narrow there.
extern "C" FARPROC GetProcAddressW(HMODULE module, const wchar_t* name);

}  // namespace

HMODULE LoadPrintModule(const wchar_t* name) { return LoadLibraryW(name); }

FARPROC FindProcedure(HMODULE module, const wchar_t* name) { return GetProcAddressW(module, name); }

}  // namespace kor

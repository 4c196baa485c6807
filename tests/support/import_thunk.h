// Machine code that leads a call with any arguments to one C function, and the way back: a call
// with arguments from an array.
#pragma once

#include "support/import_spy.h"

namespace kortest {

// Receives the number given to MakeThunk and the address of the arguments, which lie one after the
// other as machine words; returns the call's result.
using ThunkTarget = ULONG_PTR(__cdecl*)(int index, ULONG_PTR* arguments);

// A function that can stand in for one of this signature; nullptr when there is no more room. It is
// never freed.
void* MakeThunk(ThunkTarget target, int index, int argumentCount, CallingConvention convention);

constexpr int kMostArguments = 14;

ULONG_PTR CallWithArguments(ULONG_PTR function, const ULONG_PTR* arguments, int argumentCount,
                            CallingConvention convention);

}  // namespace kortest

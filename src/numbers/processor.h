// What the target processor can do in hardware.
#pragma once

namespace kor {

// Without floating-point instructions an addition of doubles costs some 60 instructions, a
// comparison 30 and a division 600. Work that is done for every point of a chart uses integers
// there; src/numbers has what that takes.
#ifdef __SOFTFP__
constexpr bool kHasFloatingPoint = false;
#else
constexpr bool kHasFloatingPoint = true;
#endif

}  // namespace kor

// What the processor that the library is compiled for can do by itself.
#pragma once

namespace kor {

// Without floating-point instructions each addition of doubles costs some 60 instructions, a
// comparison 30 and a division 600. What is done for every point of a chart is done with whole
// numbers there; src/numbers has what that takes.
#ifdef __SOFTFP__
constexpr bool kHasFloatingPoint = false;
#else
constexpr bool kHasFloatingPoint = true;
#endif

}  // namespace kor

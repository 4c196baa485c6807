// Assertions, compiled in only on request.
#pragma once

// KOR_ASSERT(condition) ends the process at the line whose condition is false. It does so only with
// KORCONTROLS_ASSERTIONS; without it the condition is not evaluated.
#ifdef KORCONTROLS_ASSERTIONS
#define KOR_ASSERT(condition) ((condition) ? static_cast<void>(0) : __builtin_trap())
#else
#define KOR_ASSERT(condition) static_cast<void>(sizeof((condition) ? 1 : 0))
#endif

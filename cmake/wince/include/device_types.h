// Included first in every source of the device's build. The types of sizes are the compiler's own;
// the desktop's platform headers assume others of the same width.
#pragma once

typedef __SIZE_TYPE__ size_t;
typedef __PTRDIFF_TYPE__ ptrdiff_t;

#define _SIZE_T_DEFINED
#define _PTRDIFF_T_DEFINED
#define _PTRDIFF_T_

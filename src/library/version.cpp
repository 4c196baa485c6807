// The version export.
#include <korcontrols/korcontrols.h>
#include <korcontrols/version.h>

#include "base/runtime.h"

namespace {

// The digits of a number.
#define KOR_WIDE_DIGITS_(number) L## #number
#define KOR_WIDE_DIGITS(number) KOR_WIDE_DIGITS_(number)

const wchar_t kVersionText[] = L"00" KOR_WIDE_DIGITS(KORCONTROLS_VERSION);

}  // namespace

extern "C" LONG KORCONTROLS_API KORCONTROLS_Version(void) {
    return static_cast<LONG>(kor::DecimalValue(kVersionText));
}

// The version export.
#include <korcontrols/korcontrols.h>

#include "base/runtime.h"

namespace {

const wchar_t kVersionText[] = L"0049";

}  // namespace

extern "C" LONG KORCONTROLS_API KORCONTROLS_Version(void) {
    return static_cast<LONG>(kor::DecimalValue(kVersionText));
}

// Texts on their way into the platform's controls.
#pragma once

#include "base/runtime.h"
#include "platform/platform.h"

#include <commctrl.h>

namespace kor {

// The controls' records have room for texts that are read back, so theirs are not constant; a text
// that is set is only read. A null text is an empty one.
inline LPWSTR WritableText(LPCWSTR text) { return const_cast<LPWSTR>(text ? text : L""); }

// In characters; 0 for the mark that the control shall ask for the text whenever it needs it.
inline int TextLength(LPCWSTR text) {
    return text && text != LPSTR_TEXTCALLBACKW ? static_cast<int>(wcslen(text)) : 0;
}

}  // namespace kor

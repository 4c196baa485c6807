// Texts that are passed to the platform's controls.
#pragma once

#include "base/runtime.h"
#include "platform/platform.h"

#include <commctrl.h>

namespace kor {

// The controls' structures also receive texts, so their pointers are not const; a text that is set
// is only read. A null text becomes an empty one.
inline LPWSTR WritableText(LPCWSTR text) { return const_cast<LPWSTR>(text ? text : L""); }

// In characters; 0 for the marker that makes the control request the text whenever it needs it.
inline int TextLength(LPCWSTR text) {
    return text && text != LPSTR_TEXTCALLBACKW ? static_cast<int>(wcslen(text)) : 0;
}

}  // namespace kor

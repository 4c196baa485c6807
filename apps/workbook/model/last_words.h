// Messages for when memory has run out, so that making them may fail, too.
#ifndef WORKBOOK_MODEL_LAST_WORDS_H
#define WORKBOOK_MODEL_LAST_WORDS_H

#include <new>
#include <string>

namespace workbook {

// The text; an empty one when there is no memory even for that.
inline std::wstring TextOrNothing(const wchar_t* text) noexcept {
    try {
        return text;
    } catch (const std::bad_alloc&) {
        return {};
    }
}

}  // namespace workbook

#endif

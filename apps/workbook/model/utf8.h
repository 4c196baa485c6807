// UTF-8 to UTF-16, and back.
#ifndef WORKBOOK_MODEL_UTF8_H
#define WORKBOOK_MODEL_UTF8_H

#include <optional>
#include <string>
#include <string_view>

namespace workbook {

constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";

// Where the first byte stands that begins no valid sequence (overlong forms, surrogates and code
// points above 10FFFF are not valid); nothing when the whole text is good.
std::optional<size_t> FindInvalidUtf8(std::string_view bytes);

// Appends the text in UTF-16. The bytes must be valid.
void AppendUtf16(std::wstring& text, std::string_view bytes);

// Appends the text in UTF-8. Half a surrogate pair becomes U+FFFD, the replacement character.
void AppendUtf8(std::string& bytes, std::wstring_view text);

}  // namespace workbook

#endif

// What the workbook's fuzzers share: their input as texts, and what happens when a promise is
// broken.
#pragma once

#include "address.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

// Ends the program, which the fuzzer reports together with the input.
#define EXPECT_THAT(condition)                                                                     \
    do {                                                                                           \
        if (!(condition)) {                                                                        \
            std::fprintf(stderr, "%s:%d: broken: %s\n", __FILE__, __LINE__, #condition);           \
            std::abort();                                                                          \
        }                                                                                          \
    } while (false)

namespace workbook {

inline std::string_view BytesOf(const std::uint8_t* data, std::size_t size) {
    return {reinterpret_cast<const char*>(data), size};
}

// A character for each byte: ASCII stays itself, the others have letters beyond it.
inline std::wstring Widen(std::string_view bytes) {
    std::wstring text;
    for (const char byte : bytes) text += static_cast<unsigned char>(byte);
    return text;
}

inline std::vector<std::wstring> LinesOf(std::string_view bytes) {
    std::vector<std::wstring> lines(1);
    for (const wchar_t character : Widen(bytes)) {
        if (character == L'\n') {
            lines.emplace_back();
        } else {
            lines.back() += character;
        }
    }
    return lines;
}

}  // namespace workbook

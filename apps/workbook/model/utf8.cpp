#include "utf8.h"

#include <cstdint>

namespace workbook {

namespace {

// What a first byte tells: the sequence's length, and the range of the second byte, which rules out
// overlong forms, surrogates and code points above 10FFFF.
struct Lead {
    size_t length = 0;  // 0: not a first byte
    unsigned char secondLow = 0x80;
    unsigned char secondHigh = 0xBF;
};

constexpr Lead LeadOf(unsigned char byte) {
    if (byte < 0x80) return {1};
    if (byte >= 0xC2 && byte <= 0xDF) return {2};
    if (byte == 0xE0) return {3, 0xA0, 0xBF};
    if (byte == 0xED) return {3, 0x80, 0x9F};
    if (byte >= 0xE1 && byte <= 0xEF) return {3};
    if (byte == 0xF0) return {4, 0x90, 0xBF};
    if (byte >= 0xF1 && byte <= 0xF3) return {4};
    if (byte == 0xF4) return {4, 0x80, 0x8F};
    return {};
}

bool StartsWithSequence(std::string_view bytes, const Lead& lead) {
    if (lead.length == 0 || lead.length > bytes.size()) return false;
    for (size_t i = 1; i < lead.length; ++i) {
        const auto byte = static_cast<unsigned char>(bytes[i]);
        if (byte < (i == 1 ? lead.secondLow : 0x80)) return false;
        if (byte > (i == 1 ? lead.secondHigh : 0xBF)) return false;
    }
    return true;
}

std::uint32_t Decode(std::string_view sequence) {
    constexpr unsigned char kLeadBits[] = {0, 0x7F, 0x1F, 0x0F, 0x07};
    std::uint32_t code = static_cast<unsigned char>(sequence[0]) & kLeadBits[sequence.size()];
    for (const char byte : sequence.substr(1))
        code = code << 6 | (static_cast<unsigned char>(byte) & 0x3Fu);
    return code;
}

void AppendCode(std::string& bytes, std::uint32_t code) {
    const auto append = [&bytes](std::uint32_t byte) { bytes += static_cast<char>(byte); };
    if (code < 0x80) return append(code);
    if (code < 0x800) {
        append(0xC0 | code >> 6);
    } else if (code < 0x10000) {
        append(0xE0 | code >> 12);
        append(0x80 | (code >> 6 & 0x3F));
    } else {
        append(0xF0 | code >> 18);
        append(0x80 | (code >> 12 & 0x3F));
        append(0x80 | (code >> 6 & 0x3F));
    }
    append(0x80 | (code & 0x3F));
}

constexpr std::uint32_t kReplacement = 0xFFFD;
constexpr bool IsHighSurrogate(std::uint32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
constexpr bool IsLowSurrogate(std::uint32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

}  // namespace

std::optional<size_t> FindInvalidUtf8(std::string_view bytes) {
    for (size_t at = 0; at < bytes.size();) {
        const Lead lead = LeadOf(static_cast<unsigned char>(bytes[at]));
        if (!StartsWithSequence(bytes.substr(at), lead)) return at;
        at += lead.length;
    }
    return std::nullopt;
}

void AppendUtf16(std::wstring& text, std::string_view bytes) {
    for (size_t at = 0; at < bytes.size();) {
        const size_t length = LeadOf(static_cast<unsigned char>(bytes[at])).length;
        const std::uint32_t code = Decode(bytes.substr(at, length));
        at += length;
        if (code < 0x10000) {
            text += static_cast<wchar_t>(code);
        } else {
            text += static_cast<wchar_t>(0xD800 + ((code - 0x10000) >> 10));
            text += static_cast<wchar_t>(0xDC00 + ((code - 0x10000) & 0x3FF));
        }
    }
}

void AppendUtf8(std::string& bytes, std::wstring_view text) {
    for (size_t i = 0; i < text.size(); ++i) {
        const auto unit = static_cast<std::uint32_t>(text[i]);
        const auto next = i + 1 < text.size() ? static_cast<std::uint32_t>(text[i + 1]) : 0u;
        if (IsHighSurrogate(unit) && IsLowSurrogate(next)) {
            AppendCode(bytes, 0x10000 + ((unit - 0xD800) << 10) + (next - 0xDC00));
            ++i;
        } else {
            const bool isHalf = IsHighSurrogate(unit) || IsLowSurrogate(unit);
            AppendCode(bytes, isHalf ? kReplacement : unit);
        }
    }
}

}  // namespace workbook

// Numbers as text and back.
#include "workbook_fuzz.h"

#include "number_text.h"

#include <cmath>
#include <cstring>

namespace workbook {
namespace {

constexpr std::size_t kWidest = 13;  // a sign and "1.23457E-100"

void CheckRead(const std::wstring& text) {
    const std::optional<double> number = ReadNumber(text);
    if (!number) return;
    EXPECT_THAT(std::isfinite(*number));
    EXPECT_THAT(ReadNumber(L" " + text + L" ") == number);
}

void CheckText(double number) {
    const std::wstring shown = DisplayNumber(number);
    EXPECT_THAT(shown.size() <= kWidest);
    const std::optional<double> read = ReadNumber(shown);
    EXPECT_THAT(read.has_value() || std::fabs(number) > 1e308);
    // Six digits at the least, unless it is too near to 0 for a double to have them.
    if (read && std::fabs(number) > 1e-300)
        EXPECT_THAT(std::fabs(*read - number) <= std::fabs(number) * 1e-5);

    const std::optional<double> joined = ReadNumber(JoinNumber(number));
    EXPECT_THAT(joined.has_value() || std::fabs(number) > 1e308);
    if (joined && std::fabs(number) > 1e-300)
        EXPECT_THAT(std::fabs(*joined - number) <= std::fabs(number) * 1e-14);
}

}  // namespace
}  // namespace workbook

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    workbook::CheckRead(workbook::Widen(workbook::BytesOf(data, size)));
    double number = 0;
    if (size < sizeof number) return 0;
    std::memcpy(&number, data, sizeof number);
    if (std::isfinite(number)) workbook::CheckText(number);
    return 0;
}

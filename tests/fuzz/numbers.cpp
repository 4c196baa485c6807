// Numbers to text and back, and doubles by their bits.
#include "fuzz_input.h"

#include "graph/scale/number_format.h"
#include "numbers/truncate.h"

#include <memory>
#include <string>

namespace korfuzz {
namespace {

// The block ends where the text may end at the latest.
void CheckText(double value, int precision) {
    const auto text = std::make_unique<wchar_t[]>(kor::kNumberTextCapacity);
    std::fill_n(text.get(), kor::kNumberTextCapacity, L'?');
    EXPECT_THAT(kor::FormatGraphNumber(value, text.get(), precision) == 1);
    const std::wstring written(text.get(), kor::kNumberTextCapacity);
    EXPECT_THAT(written.find(L'\0') != std::wstring::npos);
    if (!std::isfinite(value)) return;
    const double read = kor::NumberFromText(text.get());
    if (precision >= 17) {
        EXPECT_THAT(read == value);
    } else if (std::isfinite(read) && std::isnormal(value)) {
        const double unit = std::pow(10.0, 1 - std::max(precision, 1));
        EXPECT_THAT(std::fabs(read - value) <= std::fabs(value) * unit);
    }
}

void CheckBits(double a, double b) {
    EXPECT_THAT(kor::IsFiniteByBits(a) == std::isfinite(a));
    EXPECT_THAT(kor::IsNegativeByBits(a) == std::signbit(a));
    if (!std::isnan(a) && !std::isnan(b)) {
        EXPECT_THAT((kor::OrderOf(a) < kor::OrderOf(b)) == (a < b));
        EXPECT_THAT((kor::OrderOf(a) == kor::OrderOf(b)) == (a == b));
    }
    for (const int bits : {20, kor::kPixelLimitBits, 30}) {
        const double limit = std::ldexp(1.0, bits);
        const double cut = std::isnan(a) ? 0.0 : std::clamp(a, -limit, limit);
        EXPECT_THAT(kor::TruncateByBits(a, bits) == static_cast<int>(cut));
    }
    EXPECT_THAT(kor::TruncateToInt(a) == kor::TruncateByBits(a, kor::kPixelLimitBits));
}

// Any characters; none of them is read past the terminator.
void CheckReading(Input& input) {
    const std::string bytes = input.ConsumeRandomLengthString(40);
    const auto text = std::make_unique<wchar_t[]>(bytes.size() + 1);
    for (size_t i = 0; i < bytes.size(); ++i) text[i] = static_cast<unsigned char>(bytes[i]);
    kor::NumberFromText(text.get());
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    const double a = AnyDouble(input);
    const double b = AnyDouble(input);
    CheckText(a, input.ConsumeIntegralInRange(0, 17));
    CheckBits(a, b);
    CheckBits(b, a);
    CheckReading(input);
    return 0;
}

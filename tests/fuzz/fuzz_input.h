// What the fuzzers share: their input as numbers, and what happens when a promise is broken.
#pragma once

#include <fuzzer/FuzzedDataProvider.h>

#include <algorithm>
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <limits>
#include <vector>

// Ends the program, which the fuzzer reports together with the input.
#define EXPECT_THAT(condition)                                                                     \
    do {                                                                                           \
        if (!(condition)) {                                                                        \
            std::fprintf(stderr, "%s:%d: broken: %s\n", __FILE__, __LINE__, #condition);           \
            std::abort();                                                                          \
        }                                                                                          \
    } while (false)

namespace korfuzz {

using Input = FuzzedDataProvider;

// Any double: often one that is special or a small whole number, sometimes any bits.
inline double AnyDouble(Input& input) {
    using Limits = std::numeric_limits<double>;
    switch (input.ConsumeIntegralInRange(0, 9)) {
    case 0: return std::bit_cast<double>(input.ConsumeIntegral<uint64_t>());
    case 1:
        return input.PickValueInArray({Limits::quiet_NaN(), Limits::infinity(), -Limits::infinity(),
                                       0.0, -0.0, Limits::max(), Limits::lowest(), Limits::min(),
                                       Limits::denorm_min(), 1e300, -1e-300});
    case 2: return input.ConsumeIntegralInRange(-1000, 1000) / 7.0;
    case 3: return input.ConsumeIntegral<int32_t>();
    default: return input.ConsumeIntegralInRange(-20, 20);
    }
}

inline double FiniteDouble(Input& input) {
    const double value = AnyDouble(input);
    return std::isfinite(value) ? value : 1.0;
}

// Values as charts have them: runs of a few different ones, repeated one by one or in turn, so that
// few bytes make many points with ties, steps and gaps.
inline std::vector<double> AnyValues(Input& input, size_t most) {
    std::vector<double> alphabet(input.ConsumeIntegralInRange<size_t>(1, 6));
    for (double& value : alphabet) value = AnyDouble(input);
    std::vector<double> values;
    do {
        const size_t first = input.ConsumeIntegralInRange<size_t>(0, alphabet.size() - 1);
        const size_t last = input.ConsumeIntegralInRange<size_t>(first, alphabet.size() - 1);
        const size_t times = input.ConsumeIntegralInRange<size_t>(1, input.ConsumeBool() ? 3 : 200);
        for (size_t i = 0; i < times; ++i) {
            const auto begin = alphabet.begin();
            values.insert(values.end(), begin + static_cast<std::ptrdiff_t>(first),
                          begin + static_cast<std::ptrdiff_t>(last) + 1);
        }
    } while (values.size() < most && input.remaining_bytes() > 0 && input.ConsumeBool());
    values.resize(std::min(values.size(), most));
    return values;
}

}  // namespace korfuzz

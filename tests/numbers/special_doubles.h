// Doubles at which arithmetic by bits could go wrong, and random ones of every size.
#pragma once

#include <bit>
#include <cmath>
#include <cstdint>
#include <limits>
#include <random>
#include <vector>

namespace kortest {

// Each with its neighbours on both sides, in both signs.
inline std::vector<double> SpecialDoubles() {
    using Limits = std::numeric_limits<double>;
    std::vector<double> found;
    for (const double centre :
         {0.0, Limits::denorm_min(), Limits::min(), 0.5, 1.0, 2.0, 3.0, 65536.0, 67108863.0,
          67108864.0, 4294967296.0, 1e300, Limits::max()}) {
        for (const double value : {std::nextafter(centre, -Limits::infinity()), centre,
                                   std::nextafter(centre, Limits::infinity())}) {
            found.push_back(value);
            found.push_back(-value);
        }
    }
    for (const double value : {Limits::infinity(), Limits::quiet_NaN(), Limits::signaling_NaN()}) {
        found.push_back(value);
        found.push_back(-value);
    }
    return found;
}

// Any bits at all, so mostly very large and very small numbers, and some that are none.
class RandomDoubles {
public:
    explicit RandomDoubles(uint64_t seed) : random_(seed) {}

    double next() { return std::bit_cast<double>(random_()); }

    // Of a size that charts have: from 2^-20 to 2^20 and either sign.
    double nextOrdinary() {
        const double fraction = static_cast<double>(random_() >> 11) * 0x1p-53 + 1.0;
        const double magnitude = std::ldexp(fraction, static_cast<int>(random_() % 41) - 20);
        return random_() % 2 ? magnitude : -magnitude;
    }

private:
    std::mt19937_64 random_;
};

}  // namespace kortest

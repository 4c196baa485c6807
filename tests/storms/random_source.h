// Random numbers that are the same everywhere for a seed.
#pragma once

#include <cstdint>
#include <initializer_list>

namespace kortest {

class RandomSource {
public:
    // Mixed, or the numbers of one seed would be those of the one before, one place further on.
    explicit RandomSource(uint64_t seed) : state_(Mixed(seed + 1)) {}

    uint32_t next() { return static_cast<uint32_t>(Mixed(state_ += kStep) >> 32); }
    int below(int end) { return static_cast<int>(next() % static_cast<uint32_t>(end)); }
    bool oneIn(int n) { return below(n) == 0; }
    int from(int first, int last) { return first + below(last - first + 1); }
    int anyOf(std::initializer_list<int> values) {
        return values.begin()[below(static_cast<int>(values.size()))];
    }

private:
    static constexpr uint64_t kStep = 0x9E3779B97F4A7C15u;

    static uint64_t Mixed(uint64_t value) {
        value = (value ^ (value >> 30)) * 0xBF58476D1CE4E5B9u;
        value = (value ^ (value >> 27)) * 0x94D049BB133111EBu;
        return value ^ (value >> 31);
    }

    uint64_t state_;
};

}  // namespace kortest

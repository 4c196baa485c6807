// Random numbers that are the same everywhere for a seed.
#pragma once

#include <cstdint>
#include <initializer_list>

namespace kortest {

class RandomSource {
public:
    explicit RandomSource(uint64_t seed) : state_(seed * 0x9E3779B97F4A7C15u + 1) {}

    uint32_t next() {
        state_ += 0x9E3779B97F4A7C15u;
        uint64_t mixed = state_;
        mixed = (mixed ^ (mixed >> 30)) * 0xBF58476D1CE4E5B9u;
        mixed = (mixed ^ (mixed >> 27)) * 0x94D049BB133111EBu;
        return static_cast<uint32_t>(mixed >> 32);
    }
    int below(int end) { return static_cast<int>(next() % static_cast<uint32_t>(end)); }
    bool oneIn(int n) { return below(n) == 0; }
    int from(int first, int last) { return first + below(last - first + 1); }
    int anyOf(std::initializer_list<int> values) {
        return values.begin()[below(static_cast<int>(values.size()))];
    }

private:
    uint64_t state_;
};

}  // namespace kortest

// Random programs for the comparison of two processors: each begins at its first word and leaves
// through its last.
#pragma once

#include <cstdint>
#include <random>
#include <vector>

namespace compare {

// Both processors have this memory: code first, then data. kMiddle is what r10 holds throughout, so
// that offsets of both signs stay inside.
constexpr uint32_t kCode = 0x20000000;
constexpr uint32_t kCodeSize = 0x2000;
constexpr uint32_t kProgram = kCode + 0x100;  // programs read a few words before their first
constexpr uint32_t kData = kCode + kCodeSize;
constexpr uint32_t kDataSize = 0x4000;
constexpr uint32_t kMiddle = kData + kDataSize / 2;
constexpr unsigned kBaseRegister = 10;

using Random = std::mt19937;

// Everything in it is predictable on each processor of version 4.
std::vector<uint32_t> RandomProgram(Random& random, unsigned groups);

// A value that arithmetic and shifts find interesting.
uint32_t RandomValue(Random& random);

}  // namespace compare

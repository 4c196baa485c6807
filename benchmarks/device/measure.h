// What a step costs the device's library, by the counts of the stand-in that interprets it.
#pragma once

#include "device_counters.h"

#include <cstdint>
#include <functional>

namespace footprint {

// Of this process. Ends it with a message when the library is not the device's.
const device::Counters& Counts();

struct Cost {
    uint64_t instructions;
    uint64_t softFloat;  // of them, in the arithmetic helpers
    uint64_t platformCalls;
    bool operator==(const Cost&) const = default;
};

Cost CostOf(const std::function<void()>& step);

}  // namespace footprint

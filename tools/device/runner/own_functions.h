// Functions that Windows CE has and the desktop has not, or not with the same meaning: by the
// desktop's own means, as the desktop's library does it.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace device {

// `target`: the desktop's function of that name as the import table has it now, or 0.
using OwnFunction = uint64_t (*)(uint32_t target, const uint32_t* words);

// Null for a function that needs none.
OwnFunction FindOwnFunction(const std::string& guestName);

// The desktop's functions that it calls, which get places in the import table for it.
std::vector<std::string> NeededBy(const std::string& guestName);

}  // namespace device

// Functions that Windows CE has and the desktop lacks, or has with another meaning. They are
// implemented by the desktop's own means, as in the desktop's library.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace device {

// `target`: the desktop's function of that name as the import table has it now, or 0.
using OwnFunction = uint64_t (*)(uint32_t target, const uint32_t* words);

// The runner's own function for one of the guest's; null when it needs none.
OwnFunction FindOwnFunction(const std::string& guestName);

// The desktop's functions that it calls; they get slots in the import table for it.
std::vector<std::string> NeededBy(const std::string& guestName);

}  // namespace device

// What the guest holds of the platform's resources: memory blocks and GDI objects, tracked by the
// calls that give and take them. What a host frees for the guest, such as a text that a message
// hands over, counts as held for ever.
#pragma once

#include <cstdint>
#include <string>

namespace device {

// What a function does to the guest's holdings.
enum class Holding : uint8_t {
    None,
    GivesBlock,    // its last argument is the size in bytes
    ResizesBlock,  // its first argument, to its second one
    TakesBlock,
    TakesLocalBlock,      // and returns 0
    TakesClipboardBlock,  // its second argument
    GivesObject,
    TakesObject,
    TakesWindowDC,  // its second argument
};

struct HoldingCall {
    Holding effect = Holding::None;
    int sizeArgument = 0;  // with GivesBlock
};

HoldingCall FindHolding(const std::string& guestName);

// Records a completed call in the counters.
void NoteHolding(const HoldingCall& call, const uint32_t* words, uint32_t result);

}  // namespace device

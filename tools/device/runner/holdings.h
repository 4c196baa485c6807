// What the guest holds of the platform: blocks of memory and GDI objects, by the calls that give
// and take them. What a host frees for the guest, as a text that a message hands over, is held for
// ever.
#pragma once

#include <cstdint>
#include <string>

namespace device {

// What a function does to the guest's holdings.
enum class Holding : uint8_t {
    None,
    GivesBlock,    // of as many bytes as its last argument says
    ResizesBlock,  // its first argument, to its second one
    TakesBlock,
    TakesLocalBlock,      // and answers 0
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

// Notes a call that has been made, in the counters.
void NoteHolding(const HoldingCall& call, const uint32_t* words, uint32_t result);

}  // namespace device

// What must be known about a platform function that the guest calls, beyond its name.
#pragma once

#include "runner/callbacks.h"

#include <cstdint>
#include <string>

namespace device {

// How a function's arguments and result are passed.
enum class Passing : uint8_t {
    Words,         // as they are: all integers, handles and pointers
    DoubleResult,  // the desktop returns it in a register of its own; the arguments are words
    Own,           // by a function of the runner
};

// Where a function takes a procedure: an argument, or a field of a structure that an argument
// points to.
struct ProcedurePlace {
    const char* function;  // as the image names it
    uint8_t argument;
    int16_t offset;  // of the field, or kIsArgument
    Procedure procedure;
};

constexpr int16_t kIsArgument = -1;

// The desktop's name of a function.
std::string DesktopName(const std::string& guestName);

// How a function is called. False for functions of the C runtime that nobody has looked at.
bool FindPassing(const std::string& guestName, const std::string& library, Passing& passing);

// What a function of the C runtime writes to: memory from its first argument on, with the length in
// bytes in argument `lengthArgument`. Window and drawing functions are not in this list; they know
// what they are given.
constexpr int kUnknownLength = -1;
bool FindDestination(const std::string& guestName, int& lengthArgument);

// Announces the procedures among a call's arguments.
void AnnounceProcedures(const std::string& guestName, const uint32_t* words);
bool TakesProcedures(const std::string& guestName);

}  // namespace device

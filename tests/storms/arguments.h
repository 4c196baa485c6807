// How arguments are drawn, and what they stand for.
#pragma once

#include "storms/random_source.h"

#include <windows.h>

#include <string>
#include <vector>

namespace kortest {

// By its letter:
//   b  0 or 1                     s  a place on the stage, 0 to 3
//   p  a parent, 0 to 7           i  an index: mostly small, sometimes odd
//   n  any number, often an extreme one
//   x  a position                 z  a size of a window, 0 to 32767, mostly small
//   c  a column                   r  a row
//   q  a zoom level               k  a key
//   h  a character                t  a text (TextOf)
//   d  a real number (RealOf)     v  a kind of series (SeriesOf)
//   m  how many points            e  an event (EventOf)
//   o  a scroll code              w  a message without pointers (MessageOf)
//   g  a data range or another whole number of moderate size
int DrawArgument(RandomSource& random, char kind);

// Null, empty, short, long and unusual texts.
const wchar_t* TextOf(int number);

// NaN, infinities, both zeros, extremes and ordinary numbers.
double RealOf(int number);

// Ties, constants, sorted, zig-zag, steps, noise, special numbers.
std::vector<double> SeriesOf(int kind, int count);

// Messages whose arguments are numbers to every window of the library and to the system.
UINT MessageOf(int number);

// What a trap waits for: a message in a host's procedure, or in a control's, before or after the
// control itself handles it. `code` is wParam of a WM_NOTIFY, or 0 for any.
struct Event {
    enum Place { kHost, kBefore, kAfter } place;
    UINT message;
    UINT code;
};
Event EventOf(int number);

}  // namespace kortest

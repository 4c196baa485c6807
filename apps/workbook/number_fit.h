// A number in the room that a cell has.
#pragma once

#include <string>

namespace workbook {

// The number as cells show it, rounded to fewer decimals when it is longer than `characters`. Whole
// digits are never dropped: a number that stays too long is for the grid's "####".
std::wstring FitNumber(double number, int characters);

}  // namespace workbook

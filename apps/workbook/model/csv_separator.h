// Finds out which character separates the fields of a file.
#ifndef WORKBOOK_MODEL_CSV_SEPARATOR_H
#define WORKBOOK_MODEL_CSV_SEPARATOR_H

#include <optional>
#include <string_view>

namespace workbook {

constexpr std::string_view kSeparators = ",;\t";

// Looks at the first lines that have any separator outside quotes: the one that most of them have
// the same number of wins. Of two that do equally well, a comma that only stands between digits is
// taken for a decimal comma; otherwise the one that makes more fields wins. Nothing when no line
// has any. `bytes` has no byte-order mark.
std::optional<char> DetectSeparator(std::string_view bytes);

}  // namespace workbook

#endif

// Questions about a sheet's contents: the status line's figures, and whether a heading row is
// there.
#ifndef WORKBOOK_MODEL_SURVEY_H
#define WORKBOOK_MODEL_SURVEY_H

#include "sheet.h"

namespace workbook {

struct BlockStatistics {
    size_t occupied = 0;  // cells with anything in them
    size_t numbers = 0;   // cells with a number; the figures below are about these
    double sum = 0;
    double average = 0;  // 0 without numbers
    double lowest = 0;
    double highest = 0;

    friend bool operator==(const BlockStatistics&, const BlockStatistics&) = default;
};

// Errors and texts in the block are passed over. Walks occupied cells only.
BlockStatistics SurveyBlock(const Sheet& sheet, const Block& block);

// Guesses whether row 1 holds headings (to be shown bold): all its cells are texts, there is at
// least one, and row 2 has a number.
bool FirstRowIsHeader(const Sheet& sheet);

}  // namespace workbook

#endif

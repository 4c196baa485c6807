// What each control is asked to do, beside what happens to any window (window_words.h).
#pragma once

#include "storms/operation.h"

namespace kortest {

// The words of a control by its name: header, grid, chart, legend, tooltip, bar, lists, or all.
// Empty for an unknown name.
bool VocabularyOf(const std::string& control, Vocabulary& vocabulary);

void AddHeaderWords(Vocabulary& vocabulary);
void AddGridWords(Vocabulary& vocabulary);
void AddChartWords(Vocabulary& vocabulary);
void AddLegendWords(Vocabulary& vocabulary);
void AddToolTipWords(Vocabulary& vocabulary);
void AddBarWords(Vocabulary& vocabulary);
void AddListWords(Vocabulary& vocabulary);

}  // namespace kortest

// What is on the stage, drawn a second time with plain calls and compared.
#pragma once

namespace kortest {

class Stage;

// Each chart whose state plain calls can draw: finite values and ranges, no pie, no live mode.
void CompareCharts(Stage& stage);

int ChartsCompared();

// Grids and strips.
int OtherPicturesCompared();

}  // namespace kortest

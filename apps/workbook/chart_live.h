// The demonstration of live data: a second chart below the first, fed by a timer.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// Starts it, in KORGRAPH_SWEEP or KORGRAPH_REPLACE mode, or goes on in the other mode.
void StartLiveData(Workbook& workbook, LONG mode);
void StopLiveData(Workbook& workbook);

// One step.
void OnLiveTimer(Workbook& workbook);

}  // namespace workbook

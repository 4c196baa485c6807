// Finds windows-system objects that the library made and did not give back.
#pragma once

#include "support/import_spy.h"

#include <string>
#include <vector>

namespace kortest {

// Watches every function of the library that makes or gives back a DC or a GDI object, and
// BeginPaint with EndPaint.
void WatchHandles(ImportSpy& spy);

// "CreatePen", "GetDC", ...: who made the handles that are not given back, in order of making. Only
// calls since the spy's last clearCalls count.
std::vector<std::string> UnreturnedHandles(const ImportSpy& spy);

}  // namespace kortest

// The platform's printing functions, which are not linked: two modules are loaded when a chart is
// created, and each function is looked up when it is called. A function that a module lacks is
// skipped.
#pragma once

#include "platform/platform.h"

namespace kor {

// Loads the modules that are not loaded yet. They stay loaded until the process ends.
void LoadPrintModules();

// Whether both modules are loaded.
bool CanPrint();

// Lets the user choose a printer. Null if none was chosen; otherwise the caller deletes the DC. The
// host's messages are dispatched meanwhile.
HDC AskForPrinter(HWND owner);

// Begin and end a print job of one page. Errors are ignored.
void BeginPrintJob(HDC printer);
void EndPrintJob(HDC printer);

}  // namespace kor

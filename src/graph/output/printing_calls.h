// The platform's printing functions, which are not linked: two modules are loaded when a chart is
// created, and each function is looked up when it is called. One that a module lacks is left out.
#pragma once

#include "platform/platform.h"

namespace kor {

// Loads what is not loaded yet. The modules stay until the process ends.
void LoadPrintModules();

// Whether both modules are there.
bool CanPrint();

// Lets the user choose a printer. Null when there is none; else the caller deletes the DC. The
// host's messages are dispatched meanwhile.
HDC AskForPrinter(HWND owner);

// A job of one page. Whether it succeeds is not asked.
void BeginPrintJob(HDC printer);
void EndPrintJob(HDC printer);

}  // namespace kor

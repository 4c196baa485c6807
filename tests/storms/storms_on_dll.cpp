// The storm on the DLL: its records are out of sight but for those in windows' user data.
#include "storms/library.h"
#include "storms/pictures.h"
#include "storms/stage.h"

namespace kortest {

HMODULE StormModule() { return GetModuleHandleW(L"korcontrols.dll"); }

bool HasOwnImports() { return true; }

void CheckRecords(Stage&) {}

void ComparePictures(Stage& stage) { CompareCharts(stage); }

int OtherPicturesCompared() { return 0; }

}  // namespace kortest

// Open, save, close: dialogs, questions and messages around the sheets' files.
#pragma once

#include <windows.h>

#include <string>

namespace workbook {

struct Workbook;

void OpenWithDialog(Workbook& workbook);

// Opens a file as another sheet, or shows the sheet that has it open already. A problem is told,
// and all stays as it was.
void OpenFile(Workbook& workbook, const std::wstring& path);

//   result  whether the current sheet is saved now
bool Save(Workbook& workbook);
bool SaveAs(Workbook& workbook);

// Asks about unsaved changes before the current sheet goes.
void CloseSheet(Workbook& workbook);

// Shows each sheet with unsaved changes, asks about it, and saves it if wanted.
//   result  whether the program may end; "Cancel" keeps everything open
bool MayEnd(Workbook& workbook);

// Files were dropped on the window. Frees the drop.
void OnDropFiles(Workbook& workbook, HDROP drop);

}  // namespace workbook

// New, open, save: dialogs, questions and messages around the document's file.
#pragma once

#include <windows.h>

#include <string>

namespace workbook {

struct Workbook;

void NewDocument(Workbook& workbook);
void OpenWithDialog(Workbook& workbook);

// Opens a file after asking about unsaved changes. With a problem the open document stays.
void OpenFile(Workbook& workbook, const std::wstring& path);

//   result  whether the document is saved now
bool Save(Workbook& workbook);
bool SaveAs(Workbook& workbook);

// Asks about unsaved changes, and saves them if wanted.
//   result  whether the document may go
bool MayDiscard(Workbook& workbook);

// A file was dropped on the window; only the first of several is opened. Frees the drop.
void OnDropFiles(Workbook& workbook, HDROP drop);

}  // namespace workbook

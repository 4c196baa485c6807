// What the equation bar shows, and typing in it.
//
// The grid owns the bar's edit control; its modified flag is the record of something to store.
#pragma once

#include <string>

namespace workbook {

struct Workbook;

// Once the grid exists: the cells' font, and room for the longest text that a cell takes.
void PrepareEquationBar(const Workbook& workbook);

// Shows what was typed into the current cell. Anything typed in the bar is given up.
void ShowCurrentCell(Workbook& workbook);

// Stores what is being typed and leaves the bar, as commands do before they look at the sheet.
void CommitTyping(Workbook& workbook);

bool IsTyping();

// The text of the commit that is being notified: all of it, where the notification carries at most
// 255 characters.
std::wstring CommittedText(const wchar_t* notified);

// Puts the caret behind the bar's text; arrow keys then move the caret.
void EditCurrentCell();

// The same with a text of the host's own, which counts as typed.
void BeginTyping(Workbook& workbook, const std::wstring& text);

// After "OK", "X" or "fx" was clicked the focus is on that button, where keys do nothing.
void TakeFocusFromButtons(const Workbook& workbook);

}  // namespace workbook

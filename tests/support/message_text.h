// Messages and notifications as one line of text.
#pragma once

#include <windows.h>

#include <string>

namespace kortest {

std::string CellName(int column, int row);  // "B4" for 1, 3; works past the sheet's ends as well

// UTF-16 as UTF-8, for transcripts.
std::string Narrow(const wchar_t* text);

// "GRIDN_CURRENTCELL B4" for a WM_NOTIFY of the grid; its pointer is read now.
std::string GridNotificationText(WPARAM code, LPARAM data);

// "GRIDN_EQUATIONENTERED \"5\" B4"
std::string EquationText(UINT message, WPARAM text, LPARAM cell);

// "HCN_ITEMCLICK column 2 3"
std::string HeaderNotificationText(UINT message, const std::string& header, LPARAM words);

// "WM_KEYDOWN 46 1": name (or number), wParam, lParam.
std::string PlainMessageText(UINT message, WPARAM wParam, LPARAM lParam);

// Whether a message to a window that is not the host belongs into the transcript.
bool IsTelling(UINT message);

}  // namespace kortest

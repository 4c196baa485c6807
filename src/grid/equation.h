// The equation bar: an edit with its "X", "OK" and "fx" buttons. The grid hands committed text to
// the parent and never reads it itself.
#pragma once

#include "platform/platform.h"

namespace kor {

// Procedures of the subclassed edit and buttons.
LRESULT CALLBACK EquationEditProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam);
LRESULT CALLBACK OkButtonProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam);
LRESULT CALLBACK FunctionButtonProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam);
LRESULT CALLBACK CancelButtonProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam);

// Hands the typed text to the parent. Returns 0, or 1 when there is nothing to commit.
LRESULT CommitEquation();

// Empties the edit and notifies the parent of the current cell, so that its text is shown again.
LRESULT CancelEquation();

// WM_CHAR of the grid: the character replaces the edit's text, and the edit gets the focus.
void TypeIntoEquation(WPARAM character, LPARAM flags);

// Empties the edit.
void ClearEquationText();

}  // namespace kor

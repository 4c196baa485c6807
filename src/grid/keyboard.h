// The keyboard map of the grid's window.
#pragma once

#include "platform/platform.h"

namespace kor {

// WM_KEYDOWN: what the key means for the grid. Keys beyond those it examines (Tab to Delete) go to
// default processing.
LRESULT OnGridKeyDown(WPARAM key, LPARAM flags);

// Sends the grid a key, as if it had been pressed.
void PressGridKey(int key);

// Whether Shift is down.
bool IsShiftDown();

}  // namespace kor

// The message loop, and what it does with a message before the window it is for sees it.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// Whether the message is dealt with and no window shall get it: an accelerator, the wheel, which
// scrolls the sheet wherever the focus is, or a move over the cells without a button.
bool HandleBeforeDispatch(Workbook& workbook, const MSG& message);

// Whether a key message may be translated into WM_CHAR. The grid starts typing with every character
// but Tab and Enter, and Escape or a control character would replace a cell's contents.
bool MayBecomeCharacter(const MSG& message);

// A step of the loop. Before it waits for a message, the window catches up with what the grid does
// without telling.
//   result  false when the program is to end
bool HandleNextMessage(Workbook& workbook);

}  // namespace workbook

// The two scroll bars: range, page and thumb follow the view and the host's data.
#pragma once

namespace kor {

// Sets a bar after a scroll step, from the new first index and the visible count from before it. A
// hidden bar is left alone.
void SetColumnBarAfterScroll();
void SetRowBarAfterScroll();

// Moves both thumbs to the first visible column and row, hidden bars included.
void SetBarPositions();

}  // namespace kor

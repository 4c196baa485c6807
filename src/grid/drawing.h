// Drawing into the grid's off-screen image: the lines, the highlight and the redraw cycle.
#pragma once

#include "grid/block.h"
#include "platform/platform.h"

namespace kor {

// Repaints a client rectangle: whitens it, draws its lines, lets the parent paint the visible
// cells, draws the highlight and invalidates the rectangle. The highlight must be in the image on
// entry.
void RedrawCells(const RECT& area);
void RedrawClient();

// Whitens a client rectangle of `dc` and draws the grid lines in it. Lines are the left and top
// edges of cells.
void DrawGridLines(HDC dc, HPEN pen, const RECT& area);

enum class Invalidate { no, yes };

// Inverts the visible part of a block in the image, and invalidates it if asked to. Since the
// highlight is an inversion, the same call removes it, and must do so before anything moves.
void InvertBlock(const CellBlock& block, Invalidate invalidate);

// The same for the selection.
void InvertSelection(Invalidate invalidate);

}  // namespace kor

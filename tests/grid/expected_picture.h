// The grid's off-screen image as plain GDI calls draw it, step by step.
#pragma once

#include "grid/expected_grid.h"

#include <functional>
#include <string>

namespace kortest {

constexpr COLORREF kGridLineColour = RGB(176, 176, 176);

// Whitens an area (client coordinates) and draws the grid lines in it.
void DrawExpectedLines(HDC dc, const ExpectedGrid& grid, const RECT& area);

// Inverts the selected block, if it touches the visible cells.
void InvertExpectedSelection(HDC dc, const ExpectedGrid& grid);

// A whole redraw of an area; `paintCells` stands for what the host draws.
void DrawExpectedRedraw(HDC dc, const ExpectedGrid& grid, const RECT& area,
                        const std::function<void()>& paintCells = nullptr);

void DrawExpectedBackground(HDC dc, const ExpectedGrid& grid, CellIndex cell, HBRUSH brush);

void DrawExpectedBorder(HDC dc, const ExpectedGrid& grid, CellIndex cell, HPEN pen, DWORD left,
                        DWORD right, DWORD top, DWORD bottom);

// The arguments of SetCellValue.
struct CellText {
    CellIndex cell = 0;
    std::wstring text;
    HFONT font = nullptr;
    COLORREF textColour = RGB(0, 0, 0);
    COLORREF backColour = RGB(255, 255, 255);
    UINT format = 0;
    LONG spanLeft = 0;
    LONG spanRight = 0;
    DWORD fitCheck = 0;
    DWORD keepSpan = 0;
};

void DrawExpectedText(HDC dc, const ExpectedGrid& grid, const CellText& value);

// The same call to the library.
void SetCellText(const CellText& value);

}  // namespace kortest

// The property sheet "Graph Properties" and what its two pages share. The pages know a chart only
// by its window and control it with its messages, as a host does.
#pragma once

#include "platform/platform.h"

namespace kor {

// Runs the sheet until the user closes it. The chart may be destroyed by then.
void RunGraphProperties(HWND graph);

INT_PTR CALLBACK TitlesPageProc(HWND page, UINT message, WPARAM wParam, LPARAM lParam);
INT_PTR CALLBACK DataPageProc(HWND page, UINT message, WPARAM wParam, LPARAM lParam);

// Capacity of a buffer for an edit control's text, terminator included.
constexpr int kEditTextCapacity = 512 + 1;

bool IsEdited(HWND page, int editId);

// A page keeps its chart in its user data. `parameter` is that of WM_INITDIALOG.
HWND TakeGraphOfPage(HWND page, LPARAM parameter);
HWND GraphOfPage(HWND page);

// What a page does with its two messages.
struct PageActions {
    void (*initialise)(HWND page, LPARAM parameter);
    void (*apply)(HWND page);
};

// The dialog procedure of every page.
INT_PTR AnswerPage(const PageActions& actions, HWND page, UINT message, LPARAM lParam);

// What the chart shows, read with its messages; 0.0 from a window that does not handle them.
double GraphXMin(HWND graph);
double GraphXMax(HWND graph);
double GraphYMin(HWND graph);
double GraphYMax(HWND graph);
double GraphZoom(HWND graph);

}  // namespace kor

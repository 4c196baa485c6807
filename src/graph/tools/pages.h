// The property sheet "Graph Properties" and what its two pages share. The pages know a chart by its
// window alone and talk to it in its messages, as a host does.
#pragma once

#include "platform/platform.h"

namespace kor {

// Runs the sheet until the user closes it. The chart may be gone by then.
void RunGraphProperties(HWND graph);

INT_PTR CALLBACK TitlesPageProc(HWND page, UINT message, WPARAM wParam, LPARAM lParam);
INT_PTR CALLBACK DataPageProc(HWND page, UINT message, WPARAM wParam, LPARAM lParam);

// Room for what is read from an edit control.
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

// What the chart shows, from its messages; 0.0 from a window that does not answer them.
double GraphXMin(HWND graph);
double GraphXMax(HWND graph);
double GraphYMin(HWND graph);
double GraphYMax(HWND graph);
double GraphZoom(HWND graph);

}  // namespace kor

// The property page for the titles of the chart and the axes.
#include <korcontrols/graph.h>

#include "base/gdi_scopes.h"
#include "base/resources.h"
#include "graph/tools/pages.h"

namespace kor {

namespace {

struct TitleEdit {
    int id;
    UINT getter;
    UINT setter;
};

constexpr TitleEdit kTitleEdits[] = {{KOR_EDIT_TITLE, GM_GETTITLE, GM_SETTITLE},
                                     {KOR_EDIT_XTITLE, GM_GETXTITLE, GM_SETXTITLE},
                                     {KOR_EDIT_YTITLE, GM_GETYTITLE, GM_SETYTITLE}};

constexpr WPARAM kTypedCharacters = 20;  // at most; a longer title set by the host is shown whole

// Moves the sheet to the middle of the screen's upper edge, clear of an input panel at the lower
// edge.
void PlaceSheet(HWND page) {
    WindowDC dc(page);
    if (!dc.get()) return;
    HWND sheet = GetParent(page);
    RECT place = {};
    GetWindowRect(sheet, &place);
    const int width = place.right - place.left;
    const int left = (GetDeviceCaps(dc.get(), HORZRES) - width) / 2;
    MoveWindow(sheet, left, 0, width, place.bottom - place.top, TRUE);
}

void FillEdit(HWND page, HWND graph, const TitleEdit& edit) {
    const wchar_t* title = nullptr;
    SendMessageW(graph, edit.getter, 0, reinterpret_cast<LPARAM>(&title));
    SetDlgItemTextW(page, edit.id, title ? title : L"");
    SendDlgItemMessageW(page, edit.id, EM_LIMITTEXT, kTypedCharacters, 0);
}

void InitialisePage(HWND page, LPARAM parameter) {
    HWND graph = TakeGraphOfPage(page, parameter);
    PlaceSheet(page);
    for (const TitleEdit& edit : kTitleEdits) FillEdit(page, graph, edit);
}

bool ApplyEdit(HWND page, HWND graph, const TitleEdit& edit) {
    if (!IsEdited(page, edit.id)) return false;
    wchar_t text[kEditTextCapacity] = {};
    GetDlgItemTextW(page, edit.id, text, kEditTextCapacity);
    SendMessageW(graph, edit.setter, 0, reinterpret_cast<LPARAM>(text));
    return true;
}

void Apply(HWND page) {
    HWND graph = GraphOfPage(page);
    bool isChanged = false;
    for (const TitleEdit& edit : kTitleEdits) {
        if (ApplyEdit(page, graph, edit)) isChanged = true;
    }
    if (isChanged) KorGraph_Redraw(graph);
}

}  // namespace

INT_PTR CALLBACK TitlesPageProc(HWND page, UINT message, WPARAM, LPARAM lParam) {
    return AnswerPage({InitialisePage, Apply}, page, message, lParam);
}

}  // namespace kor

// The property page for the shown ranges, the chart type and the zoom.
#include <korcontrols/graph.h>

#include "graph/data/choices.h"

#include "base/resources.h"
#include "graph/scale/number_format.h"
#include "graph/tools/pages.h"

namespace kor {

namespace {

// The selection that was applied last, of either combo box. Compatibility: there is one value for
// both, so the type and the zoom are sent again on most applies
// (TypeAndZoom.AreSentAgainWheneverTheyDiffer).
constinit int lastSelection = 0;

void FillNumber(HWND page, int editId, double value) {
    wchar_t text[kNumberTextCapacity];
    FormatGraphNumber(value, text, kGraphPrecision);
    SetDlgItemTextW(page, editId, text);
}

template <int count>
void FillCombo(HWND page, int comboId, const wchar_t* const (&texts)[count], int selection) {
    for (const wchar_t* text : texts) {
        SendDlgItemMessageW(page, comboId, CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(text));
    }
    SendDlgItemMessageW(page, comboId, CB_SETCURSEL, static_cast<WPARAM>(selection), 0);
}

void InitialisePage(HWND page, LPARAM parameter) {
    HWND graph = TakeGraphOfPage(page, parameter);
    FillNumber(page, KOR_EDIT_XMIN, GraphXMin(graph));
    FillNumber(page, KOR_EDIT_XMAX, GraphXMax(graph));
    FillNumber(page, KOR_EDIT_YMIN, GraphYMin(graph));
    FillNumber(page, KOR_EDIT_YMAX, GraphYMax(graph));
    FillCombo(page, KOR_COMBO_TYPE, kTypeChoices, KorGraph_GetType(graph));
    FillCombo(page, KOR_COMBO_ZOOM, kZoomChoices, PlaceOfZoom(GraphZoom(graph)));
    SetFocus(GetDlgItem(page, KOR_COMBO_TYPE));
    SetFocus(GetDlgItem(page, KOR_COMBO_ZOOM));
}

double NumberIn(HWND page, int editId) {
    wchar_t text[kEditTextCapacity] = {};
    GetDlgItemTextW(page, editId, text, kEditTextCapacity);
    return NumberFromText(text);
}

// True if one of the two edits was changed, even if the range is then refused. Compatibility: an
// end that was not typed is taken from the x range, whatever the axis, so typing only the upper end
// of y sends the x range's lower end with it (RangeEdits.AYEndThatWasNotTypedIsTheXRanges).
bool ApplyRange(HWND page, HWND graph, LONG axis, int minEdit, int maxEdit) {
    const bool isMinTyped = IsEdited(page, minEdit);
    const bool isMaxTyped = IsEdited(page, maxEdit);
    if (!isMinTyped && !isMaxTyped) return false;
    const double lowEnd = isMinTyped ? NumberIn(page, minEdit) : GraphXMin(graph);
    const double highEnd = isMaxTyped ? NumberIn(page, maxEdit) : GraphXMax(graph);
    if (highEnd < lowEnd) {
        MessageBoxW(graph, L"Incorrect Range Entered.", L"Range Error", MB_OK);
    } else {
        KorGraph_SetRange(graph, axis, lowEnd, highEnd);
    }
    return true;
}

// Sends a combo box's selection if it differs from the one applied last.
bool ApplyChoice(HWND page, HWND graph, int comboId, UINT setter) {
    const auto selection = static_cast<int>(SendDlgItemMessageW(page, comboId, CB_GETCURSEL, 0, 0));
    if (selection == CB_ERR || selection == lastSelection) return false;
    lastSelection = selection;
    SendMessageW(graph, setter, 0, selection);
    return true;
}

void Apply(HWND page) {
    HWND graph = GraphOfPage(page);
    bool isChanged = ApplyRange(page, graph, KORGRAPH_X, KOR_EDIT_XMIN, KOR_EDIT_XMAX);
    isChanged |= ApplyRange(page, graph, KORGRAPH_Y, KOR_EDIT_YMIN, KOR_EDIT_YMAX);
    if (!IsWindow(page)) return;  // destroyed while a message box was open
    isChanged |= ApplyChoice(page, graph, KOR_COMBO_TYPE, GM_SETTYPE);
    isChanged |= ApplyChoice(page, graph, KOR_COMBO_ZOOM, GM_SETZOOM);
    if (isChanged) KorGraph_Redraw(graph);
}

}  // namespace

INT_PTR CALLBACK DataPageProc(HWND page, UINT message, WPARAM, LPARAM lParam) {
    return AnswerPage({InitialisePage, Apply}, page, message, lParam);
}

}  // namespace kor

#include "graph/tools/pages.h"

#include <korcontrols/graph.h>

#include <iterator>

#include <prsht.h>

#include "base/module.h"
#include "base/records.h"
#include "base/resources.h"
#include "graph/data/choices.h"
#include "platform/input_panel.h"

namespace kor {

namespace {

GraphRange RangeOf(HWND graph, LONG axis) {
    GraphRange range = {};
    range.axis = axis;
    SendMessageW(graph, GM_GETRANGE, 0, reinterpret_cast<LPARAM>(&range));
    return range;
}

// Because no flags are set, the tab shows the dialog's caption, not the title.
HPROPSHEETPAGE CreatePage(int dialog, const wchar_t* title, DLGPROC procedure, HWND graph) {
    PROPSHEETPAGEW page = {};
    page.dwSize = PROPSHEETPAGEW_V1_SIZE;
    page.hInstance = moduleInstance;
    page.pszTemplate = MAKEINTRESOURCEW(dialog);
    page.pszTitle = title;
    page.pfnDlgProc = procedure;
    page.lParam = reinterpret_cast<LPARAM>(graph);
    return CreatePropertySheetPageW(&page);
}

void RunSheet(HWND graph, HPROPSHEETPAGE (&pages)[2]) {
    PROPSHEETHEADERW sheet = {};
    sheet.dwSize = PROPSHEETHEADERW_V1_SIZE;
    sheet.dwFlags = PSH_NOAPPLYNOW;
    sheet.hwndParent = graph;
    sheet.hInstance = moduleInstance;
    sheet.pszCaption = L"Graph Properties";
    sheet.nPages = static_cast<UINT>(std::size(pages));
    sheet.nStartPage = 0;
    sheet.phpage = pages;
    ShowInputPanel();
    PropertySheetW(&sheet);
    HideInputPanel();
}

// Whether a WM_NOTIFY tells the page to apply what was typed.
bool IsApply(LPARAM notification) {
    const auto* header = reinterpret_cast<const NMHDR*>(notification);
    return header && header->code == PSN_APPLY;
}

}  // namespace

void RunGraphProperties(HWND graph) {
    HPROPSHEETPAGE pages[] = {CreatePage(KOR_DIALOG_TITLES, L"Titles", TitlesPageProc, graph),
                              CreatePage(KOR_DIALOG_DATA, L"Ranges", DataPageProc, graph)};
    if (pages[0] && pages[1]) {
        RunSheet(graph, pages);  // which frees them
        return;
    }
    for (HPROPSHEETPAGE page : pages) {
        if (page) DestroyPropertySheetPage(page);
    }
}

bool IsEdited(HWND page, int editId) {
    return SendDlgItemMessageW(page, editId, EM_GETMODIFY, 0, 0) != 0;
}

HWND TakeGraphOfPage(HWND page, LPARAM parameter) {
    const auto* description = reinterpret_cast<const PROPSHEETPAGEW*>(parameter);
    const auto graph = reinterpret_cast<HWND>(description->lParam);
    SetUserData(page, graph);
    return graph;
}

HWND GraphOfPage(HWND page) {
    return reinterpret_cast<HWND>(GetWindowLongPtrW(page, GWLP_USERDATA));
}

INT_PTR AnswerPage(const PageActions& actions, HWND page, UINT message, LPARAM lParam) {
    switch (message) {
    case WM_INITDIALOG: actions.initialise(page, lParam); return TRUE;
    case WM_NOTIFY:
        if (IsApply(lParam)) actions.apply(page);
        return 0;
    default: return FALSE;
    }
}

double GraphXMin(HWND graph) { return RangeOf(graph, KORGRAPH_X).min; }

double GraphXMax(HWND graph) { return RangeOf(graph, KORGRAPH_X).max; }

double GraphYMin(HWND graph) { return RangeOf(graph, KORGRAPH_Y).min; }

double GraphYMax(HWND graph) { return RangeOf(graph, KORGRAPH_Y).max; }

double GraphZoom(HWND graph) {
    LONG index = -1;
    SendMessageW(graph, GM_GETZOOM, 0, reinterpret_cast<LPARAM>(&index));
    return index >= 0 && index < kZoomCount ? kZoomFactors[index] : 0.0;
}

}  // namespace kor

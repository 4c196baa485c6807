#include "chart_dialogs.h"

#include <windows.h>

#include <korcontrols/graph.h>

#include <array>
#include <optional>
#include <string>

#include "chart_view.h"
#include "model/number_text.h"
#include "resource.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr int kLongestTitle = 128;
constexpr int kLongestNumber = 32;

std::wstring TextOf(HWND dialog, int id) {
    std::array<wchar_t, kLongestTitle> text = {};
    GetDlgItemTextW(dialog, id, text.data(), static_cast<int>(text.size()));
    return text.data();
}

void Fill(HWND dialog, int id, const std::wstring& text, int longest) {
    SendDlgItemMessageW(dialog, id, EM_LIMITTEXT, static_cast<WPARAM>(longest - 1), 0);
    SetDlgItemTextW(dialog, id, text.c_str());
}

// What a dialog is about; its user data points to it.
template <typename Subject>
Subject& SubjectOf(HWND dialog) {
    return *reinterpret_cast<Subject*>(GetWindowLongPtrW(dialog, DWLP_USER));
}

// ---- Titles: the subject is ChartTitles ----

void FillTitles(HWND dialog, const ChartTitles& titles) {
    Fill(dialog, IDC_TITLE_CHART, titles.chart, kLongestTitle);
    Fill(dialog, IDC_TITLE_CATEGORIES, titles.categories, kLongestTitle);
    Fill(dialog, IDC_TITLE_VALUES, titles.values, kLongestTitle);
}

void OnTitlesAccepted(HWND dialog) {
    SubjectOf<ChartTitles>(dialog) = {TextOf(dialog, IDC_TITLE_CHART),
                                      TextOf(dialog, IDC_TITLE_CATEGORIES),
                                      TextOf(dialog, IDC_TITLE_VALUES)};
    EndDialog(dialog, IDOK);
}

// ---- Range: the subject is ValueRange ----

void FillRange(HWND dialog, const ValueRange& range) {
    Fill(dialog, IDC_RANGE_LOW, DisplayNumber(range.low), kLongestNumber);
    Fill(dialog, IDC_RANGE_HIGH, DisplayNumber(range.high), kLongestNumber);
}

void OnRangeAccepted(HWND dialog) {
    const std::optional<double> low = ReadNumber(TextOf(dialog, IDC_RANGE_LOW));
    const std::optional<double> high = ReadNumber(TextOf(dialog, IDC_RANGE_HIGH));
    if (!low || !high || *low >= *high) {
        MessageBoxW(dialog, L"The range needs two numbers, the second larger than the first.",
                    L"Workbook", MB_OK | MB_ICONINFORMATION);
        return;
    }
    SubjectOf<ValueRange>(dialog) = {*low, *high};
    EndDialog(dialog, IDOK);
}

// ---- Both ----

template <typename Subject, void (*FillIn)(HWND, const Subject&), void (*Accept)(HWND)>
INT_PTR CALLBACK DialogProc(HWND dialog, UINT message, WPARAM wParam, LPARAM lParam) noexcept {
    switch (message) {
    case WM_INITDIALOG:
        SetWindowLongPtrW(dialog, DWLP_USER, lParam);
        FillIn(dialog, SubjectOf<Subject>(dialog));
        return TRUE;
    case WM_COMMAND:
        if (LOWORD(wParam) == IDOK) Accept(dialog);
        if (LOWORD(wParam) == IDCANCEL) EndDialog(dialog, IDCANCEL);
        return TRUE;
    default: return FALSE;
    }
}

bool Ask(const Workbook& workbook, int dialog, DLGPROC procedure, void* subject) {
    return DialogBoxParamW(workbook.instance, MAKEINTRESOURCEW(dialog), workbook.window, procedure,
                           reinterpret_cast<LPARAM>(subject)) == IDOK;
}

}  // namespace

void EditChartTitles(Workbook& workbook) {
    ChartTitles titles = ShownTitles(workbook);
    if (!Ask(workbook, IDD_CHART_TITLES, DialogProc<ChartTitles, FillTitles, OnTitlesAccepted>,
             &titles)) {
        return;
    }
    workbook.sheetView().chart.titles = titles;
    ApplyTitles(workbook);
    DrawChart(workbook);
}

void EditChartRange(Workbook& workbook) {
    ValueRange range = ShownRange(workbook, ValueAxis(workbook));
    if (!Ask(workbook, IDD_CHART_RANGE, DialogProc<ValueRange, FillRange, OnRangeAccepted>,
             &range)) {
        return;
    }
    workbook.sheetView().chart.values = range;
    ApplyRange(workbook);
    DrawChart(workbook);
}

}  // namespace workbook

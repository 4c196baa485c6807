#include "status_line.h"

#include <commctrl.h>

#include <string>

#include "equation_bar.h"
#include "model/number_text.h"
#include "model/survey.h"
#include "resource.h"
#include "selection.h"
#include "workbook.h"

namespace workbook {

namespace {

enum StatusPart { kSelectionPart, kModePart, kZoomPart, kPartCount };

constexpr int kModeWidth = 70;
constexpr int kZoomWidth = 80;
constexpr const wchar_t* kGap = L"      ";

std::wstring Figures(const Sheet& sheet, const Block& block) {
    const BlockStatistics statistics = SurveyBlock(sheet, block);
    std::wstring text;
    if (statistics.numbers > 0) {
        text += kGap + (L"Sum: " + DisplayNumber(statistics.sum));
        text += kGap + (L"Average: " + DisplayNumber(statistics.average));
    }
    if (statistics.occupied > 0) text += kGap + (L"Count: " + std::to_wstring(statistics.occupied));
    return text;
}

std::wstring SelectionText(const Workbook& workbook, const Block& block) {
    const Sheet& sheet = workbook.sheet();
    const CellAddress current = {block.left, block.top};
    const std::wstring address = FormatBlock(block);
    if (!workbook.shown.notice.empty()) return address + kGap + workbook.shown.notice;
    if (block == BlockOf(current)) {
        const std::wstring problem = sheet.formulaProblem(current);
        if (!problem.empty()) return address + kGap + problem;
    }
    return address + Figures(sheet, block);
}

void SetPart(HWND statusBar, StatusPart part, const std::wstring& text) {
    SendMessageW(statusBar, SB_SETTEXTW, static_cast<WPARAM>(part),
                 reinterpret_cast<LPARAM>(text.c_str()));
}

}  // namespace

HWND CreateStatusBar(HWND parent, HINSTANCE instance) {
    return CreateWindowExW(0, STATUSCLASSNAMEW, nullptr, WS_CHILD | WS_VISIBLE | SBARS_SIZEGRIP, 0,
                           0, 0, 0, parent, reinterpret_cast<HMENU>(INT_PTR{IDC_STATUS}), instance,
                           nullptr);
}

int LayoutStatusBar(const Workbook& workbook) {
    SendMessageW(workbook.statusBar, WM_SIZE, 0, 0);
    RECT area = {};
    GetWindowRect(workbook.statusBar, &area);
    const int width = static_cast<int>(area.right - area.left);
    const int rightEdges[kPartCount] = {width - kModeWidth - kZoomWidth, width - kZoomWidth, -1};
    SendMessageW(workbook.statusBar, SB_SETPARTS, kPartCount, reinterpret_cast<LPARAM>(rightEdges));
    return static_cast<int>(area.bottom - area.top);
}

void UpdateStatusBar(Workbook& workbook) {
    const Block block = SelectedBlock();
    workbook.shown.selection = block;
    workbook.shown.statusIsStale = false;
    SetPart(workbook.statusBar, kSelectionPart, SelectionText(workbook, block));
    SetPart(workbook.statusBar, kModePart, IsTyping() ? L"Edit" : L"Ready");
    SetPart(workbook.statusBar, kZoomPart, std::to_wstring(workbook.view.zoom * 25) + L" %");
}

}  // namespace workbook

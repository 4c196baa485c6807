// What a chart offers besides its picture: the clipboard, printing, the property sheet, the command
// bar.
#include "command_bar.h"
#include "faults/chart.h"
#include "faults/printing_stand_in.h"
#include "faults/scenarios.h"
#include "faults/sheet_user.h"
#include "graph/tools/sheet_driver.h"

#include "support/input.h"

#include <commctrl.h>

namespace kortest {

namespace {

constexpr int kTitleEdit = 1002;
constexpr int kYMinEdit = 1005;
constexpr int kYMaxEdit = 1006;
constexpr int kXMinEdit = 1007;
constexpr int kXMaxEdit = 1008;
constexpr int kTypeCombo = 1010;

constexpr int kBarId = 500;

// A chart without anything that takes long to draw.
HWND CreateBareChart(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    KorGraph_ToggleOptions(chart, kAllOptions);
    AddSeries(life, chart, {3, 1}, nullptr);
    life.count(true);
    return chart;
}

std::string ClipboardText() {
    if (!OpenClipboard(nullptr)) return "not to be opened";
    const HANDLE block = GetClipboardData(CF_DIB);
    const std::string text =
        block ? std::to_string(GlobalSize(block)) + " bytes" : std::string("empty");
    CloseClipboard();
    return text;
}

void Enter(HWND page, int editId, const wchar_t* text) {
    SetDlgItemTextW(page, editId, text);
    SendDlgItemMessageW(page, editId, EM_SETMODIFY, TRUE, 0);
}

void UseSheet(Life& life, HWND chart, const std::function<void(HWND sheet)>& use) {
    SheetUser user;
    const auto outcome = user.run([chart] { KorGraph_Notify(chart, GN_PROPERTIES, 0); }, use);
    life.require(!outcome.wasLeftOpen, "the sheet stayed open");
    life.note(outcome.wasUp ? "sheet" : "no sheet");
}

void NoteTitle(Life& life, HWND chart) {
    const wchar_t* title = nullptr;
    SendMessageW(chart, GM_GETTITLE, 0, reinterpret_cast<LPARAM>(&title));
    life.note(title ? Narrow(title) : "no title");
}

}  // namespace

void LiveCopy(Life& life) {
    const HWND chart = CreateBareChart(life);
    life.require(SendMessageW(chart, GM_COPY, 0, 0) == 0, "GM_COPY answers 0");
    life.note("clipboard " + ClipboardText());
    if (chart) DestroyWindow(chart);
}

void LivePrint(Life& life) {
    const HWND chart = CreateBareChart(life);
    life.count(false);
    KorGraph_SetTitle(chart, L"title");
    life.count(true);
    {
        PrintedPage page(life);
        life.note("printing " + std::to_string(IsPrintingAvailableForGraphControl()));
        KorGraph_Print(chart);
    }
    life.count(false);
    if (chart) EnableWindow(chart, TRUE);
    EndChart(life, chart);
}

void LiveSheetOfTitles(Life& life) {
    const HWND chart = CreateBareChart(life);
    UseSheet(life, chart, [](HWND sheet) {
        Enter(PropSheet_IndexToHwnd(sheet, kTitlesPage), kTitleEdit, L"typed");
        PressOk(sheet);
    });
    NoteTitle(life, chart);
    if (chart) DestroyWindow(chart);
}

void LiveSheetOfRanges(Life& life) {
    const HWND chart = CreateBareChart(life);
    life.spy.replace("MessageBoxW", [&life](ULONG_PTR* arguments) -> ULONG_PTR {
        life.note("box " + Narrow(reinterpret_cast<const wchar_t*>(arguments[1])));
        return IDOK;
    });
    // The page remembers, for the whole process, what was chosen last in either combo box, and does
    // not send it again: so the later life chooses what no earlier one can have.
    const int type = life.isLater() ? KORGRAPH_PIE : KORGRAPH_COLUMN;
    UseSheet(life, chart, [type](HWND sheet) {
        PropSheet_SetCurSel(sheet, nullptr, kDataPage);
        const HWND page = PropSheet_IndexToHwnd(sheet, kDataPage);
        Enter(page, kXMinEdit, L"1");
        Enter(page, kXMaxEdit, L"9");
        Enter(page, kYMinEdit, L"9");  // turned round: refused in a box
        Enter(page, kYMaxEdit, L"1");
        SendDlgItemMessageW(page, kTypeCombo, CB_SETCURSEL, static_cast<WPARAM>(type), 0);
        PressOk(sheet);
    });
    life.spy.restore("MessageBoxW");
    GraphRange range = {KORGRAPH_X, 0, 0, 0};
    SendMessageW(chart, GM_GETRANGE, 0, reinterpret_cast<LPARAM>(&range));
    life.note("x " + std::to_string(range.min) + " to " + std::to_string(range.max) + " type " +
              std::to_string(KorGraph_GetType(chart)));
    if (chart) DestroyWindow(chart);
}

void LiveCommandBar(Life& life) {
    life.host->leaveOut(kBarId);
    const HWND bar = command_bar::Create(life.parent(), ProgramInstance(), kBarId);
    TBBUTTON button{};
    button.idCommand = 501;
    button.fsState = TBSTATE_ENABLED;
    HWND zoom = nullptr, type = nullptr;
    const int before = life.fault.happened;
    const DWORD result =
        SetupGraphCommandBar(ProgramInstance(), bar, &button, 1, &zoom, 503, &type, 504);
    life.require(result == 1, "SetupGraphCommandBar answers 1");
    if (life.fault.happened > before && life.fault.function == "CreateWindowExW")
        life.require(!zoom || !type, "a combo box that could not be made is told as null");
    for (const HWND combo : {zoom, type})
        life.note("combo " + std::to_string(SendMessageW(combo, CB_GETCOUNT, 0, 0)) + " at " +
                  std::to_string(SendMessageW(combo, CB_GETCURSEL, 0, 0)));
    life.note("buttons " + std::to_string(SendMessageW(bar, TB_BUTTONCOUNT, 0, 0)));
    DestroyWindow(bar);
}

}  // namespace kortest

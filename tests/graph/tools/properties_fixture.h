// The property sheet of a real chart, used as by hand, and what it sends to the chart.
#pragma once

#include "graph/graph_fixture.h"
#include "graph/tools/sheet_driver.h"

namespace kortest {

constexpr int kTitleEdit = 1002;
constexpr int kXTitleEdit = 1003;
constexpr int kYTitleEdit = 1004;
constexpr int kYMinEdit = 1005;
constexpr int kYMaxEdit = 1006;
constexpr int kXMinEdit = 1007;
constexpr int kXMaxEdit = 1008;
constexpr int kTypeCombo = 1010;
constexpr int kZoomCombo = 1011;

class PropertiesTest : public GraphTest {
protected:
    // A chart whose setters and redraw requests are written down from here on.
    void createRecorded();

    // Opens the sheet; it is cancelled where `use` does not press OK.
    void openSheet(const std::function<void(HWND sheet)>& use);

    // Opens the sheet, types one text into an edit of the data page, presses OK.
    void typeOnDataPage(const std::vector<std::pair<int, std::wstring>>& texts);

    // `GM_SETTITLE "text"`, `GM_SETRANGE x 0 10`, `GM_SETTYPE 2`, `GM_SETZOOM 2`, `GN_REDRAW`.
    Lines sent;
    SheetDriver driver;

private:
    static LRESULT CALLBACK graphProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    void note(UINT message, WPARAM wParam, LPARAM lParam);
    WNDPROC graphOriginal_ = nullptr;
};

}  // namespace kortest

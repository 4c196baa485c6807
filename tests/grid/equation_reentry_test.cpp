// Hosts that call back into the grid, or destroy it, while they are told of something. All of it
// runs on a guarded heap.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// Each of the grid's messages to its host.
constexpr UINT kTold[] = {GRIDN_PAINTCELLS,    GRIDN_CELLCLICKED,     GRIDN_SELECTING,
                          GRIDN_SELECTIONDONE, GRIDN_CURRENTCELL,     GRIDN_COLUMNRESIZED,
                          GRIDN_ROWRESIZED,    GRIDN_EQUATIONENTERED, GRIDN_EQUATIONEMPTY,
                          GRIDN_EDITFOCUS,     GRIDN_EDITKILLFOCUS,   WM_KEYDOWN};

class CallsBack : public GuardedGridUse, public ::testing::WithParamInterface<UINT> {
protected:
    using Action = std::function<void()>;

    // Runs the action inside the first message of the parameter's kind that comes from now on.
    void runInside(const Action& action) {
        hasRun = false;
        host.onMessage = [this, action](UINT message, WPARAM wParam, LPARAM) {
            const UINT code = message == WM_NOTIFY ? static_cast<UINT>(wParam) : message;
            if (code == GetParam() && !hasRun) {
                hasRun = true;
                action();
            }
            return LRESULT{0};
        };
    }

    // Everything that makes the grid tell its host something, once each.
    void useTheGrid() {
        const HWND window = grid;
        const auto isGone = [window] { return !IsWindow(window); };
        const Action steps[] = {
            [&] { press(middleX(2), middleY(2)); },
            [&] { move(middleX(3), middleY(4)); },
            [&] { timer(); },
            [&] { release(); },
            [&] { PressKey(grid, VK_RIGHT); },
            [&] { PressKey(grid, VK_NEXT); },
            [&] { PressKey(grid, VK_PRIOR); },
            [&] { PressKey(grid, VK_TAB); },
            [&] { PressKey(grid, VK_DELETE); },
            [&] { TypeCharacter(grid, L'5'); },
            [&] { PressKey(edit, VK_LEFT); },
            [&] { TypeCharacter(grid, L'6'); },
            [&] { PressKey(edit, VK_RETURN); },
            [&] { TypeCharacter(grid, L'\b'); },
            [&] { PressKey(edit, VK_TAB); },
            [&] { SetFocus(edit); },
            [&] { PressKey(edit, VK_ESCAPE); },
            [&] { TypeCharacter(grid, L'7'); },
            [&] { ClickAt(OkButtonOf(grid), 5, 5); },
            [&] { TypeCharacter(grid, L'8'); },
            [&] { ClickAt(FunctionButtonOf(grid), 5, 5); },
            [&] { TypeCharacter(grid, L'9'); },
            [&] { ClickAt(CancelButtonOf(grid), 5, 5); },
            [&] { TypeCharacter(grid, L'0'); },
            [&] { press(middleX(1), middleY(1)); },
            [&] { release(true); },
            [&] { ClickAt(CornerButtonOf(grid), 3, 3); },
            [&] { SendResized(grid, columnHeader, 1, 50); },
            [&] { SendResized(grid, rowHeader, 1, 20); },
            [&] { scrollColumns(SB_PAGEDOWN); },
            [&] { scrollRows(SB_THUMBPOSITION, 2000); },
            [&] { scrollRows(SB_THUMBPOSITION, 0); },
            [&] { SetFirstVisibleCell(0); },
            [&] { host.pump(); },
        };
        for (const Action& step : steps) {
            if (isGone()) return;
            step();
        }
    }

    // The grid is whole: after a redraw it shows its selection and nothing else.
    void expectWhole() {
        host.onMessage = nullptr;
        ASSERT_TRUE(IsWindow(grid));
        SetGridZoomLevel(4);
        ResetGrid();
        SetFirstVisibleCell(0);
        EXPECT_NE(Select(1, 2, 1, 2), 0u);
        SetFirstVisibleCell(0);
        const Picture picture = (UpdateWindow(grid), ReadWindow(grid));
        const int left = static_cast<int>(ChildRect(columnHeader).left);
        const int top = static_cast<int>(ChildRect(rowHeader).top);
        EXPECT_EQ(picture.pixel(left + 62, top + 18), RGB(0, 0, 0));
        EXPECT_EQ(picture.pixel(left + 178, top + 46), RGB(0, 0, 0));
        EXPECT_EQ(picture.pixel(left + 58, top + 18), RGB(255, 255, 255));
        EXPECT_EQ(picture.pixel(left + 182, top + 46), RGB(255, 255, 255));
        EXPECT_EQ(heap.report(), "");
    }

    bool hasRun = false;
};

TEST_P(CallsBack, ForOtherCells) {
    open(330, 168);
    const Action actions[] = {[] { SetFirstVisibleCell(KORGRID_CELL(3, 3)); },
                              [] { SetFirstVisibleCell(KORGRID_CELL(300, 20000)); },
                              [] { Select(1, 3, 0, 5000); },
                              [this] { scrollRows(SB_THUMBPOSITION, 1000); },
                              [this] { PressKey(grid, VK_RIGHT); },
                              [this] { clickHeader(columnHeader, 0, 1); },
                              [this] { send(WM_COMMAND, 1); },
                              [this] { press(middleX(4), middleY(4)); },
                              [this] { release(); }};
    for (const Action& action : actions) {
        runInside(action);
        useTheGrid();
        EXPECT_TRUE(hasRun);
        expectWhole();
    }
}

TEST_P(CallsBack, ForAnotherLayout) {
    open(330, 168);
    const Action actions[] = {[] { SetGridZoomLevel(2); },
                              [] { ToggleViewStateOfHeaders(); },
                              [] { ToggleViewStateOfHeaders(); },
                              [] { ToggleHorizontalScrollBar(); },
                              [] { ToggleVerticalScrollBar(); },
                              [] {
                                  SetHorizontalDataRange(50);
                                  SetVerticalDataRange(500);
                              },
                              [this] { resize(250, 150); },
                              [this] { resize(500, 400); },
                              [] {
                                  ToggleGridLines();
                                  ToggleGridLines();
                              },
                              [this] { send(GRIDM_REDRAW); }};
    for (const Action& action : actions) {
        runInside(action);
        useTheGrid();
        EXPECT_TRUE(hasRun);
        expectWhole();
    }
}

TEST_P(CallsBack, ForOtherSizes) {
    open(330, 168);
    const Action actions[] = {[] { ResetGrid(); },
                              [] {
                                  for (int i = 0; i < 40; ++i) {
                                      SetColumnWidth(i, 20 + i);
                                      SetRowHeight(i, 10 + i);
                                  }
                              },
                              [this] {
                                  SendResized(grid, columnHeader, 0, 44);
                                  SendResized(grid, rowHeader, 0, 22);
                              }};
    for (const Action& action : actions) {
        runInside(action);
        useTheGrid();
        EXPECT_TRUE(hasRun);
        expectWhole();
    }
}

TEST_P(CallsBack, ForTheEquationBar) {
    open(330, 168);
    const Action actions[] = {[this] { KorGrid_SetEquationText(grid, L"other"); },
                              [] { PressOKButton(); },
                              [this] { SetFocus(edit); },
                              [this] { SetFocus(grid); },
                              [this] { SetFocus(host.window()); },
                              [this] { SetFocus(nullptr); },
                              [this] { send(WM_COMMAND, 8); },
                              [this] { TypeCharacter(grid, L'1'); },
                              [this] {
                                  SetWindowTextW(edit, L"2");
                                  SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
                              }};
    for (const Action& action : actions) {
        runInside(action);
        useTheGrid();
        EXPECT_TRUE(hasRun);
        expectWhole();
    }
}

// The message that destroys the grid may come at any step, so it is tried from every one on.
TEST_P(CallsBack, ToDestroyTheGrid) {
    for (int kept = 0; kept < 30; ++kept) {
        open(330, 168);
        int seen = 0;
        bool isDestroyed = false;
        host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
            const UINT code = message == WM_NOTIFY ? static_cast<UINT>(wParam) : message;
            if (code == GetParam() && !isDestroyed && seen++ == kept) {
                isDestroyed = true;
                DestroyWindow(grid);
            }
            return LRESULT{0};
        };
        useTheGrid();
        host.onMessage = nullptr;
        host.pump();
        EXPECT_EQ(heap.report(), "") << "destroyed by message " << kept;
        if (!isDestroyed) {
            EXPECT_GT(kept, 0) << "never told";
            expectWhole();
            DestroyWindow(grid);
            break;
        }
        EXPECT_FALSE(IsWindow(grid));
        ResetGrid();
        Select(0, 0, 0, 0);
    }
}

TEST_P(CallsBack, ToDestroyItsOwnWindow) {
    open(330, 168);
    runInside([this] { DestroyWindow(host.window()); });
    useTheGrid();
    EXPECT_TRUE(hasRun);
    EXPECT_FALSE(IsWindow(grid));
    EXPECT_EQ(heap.report(), "");
}

std::string NameOf(const ::testing::TestParamInfo<UINT>& info) {
    static const std::map<UINT, std::string> kNames{
        {GRIDN_PAINTCELLS, "PaintCells"},       {GRIDN_CELLCLICKED, "CellClicked"},
        {GRIDN_SELECTING, "Selecting"},         {GRIDN_SELECTIONDONE, "SelectionDone"},
        {GRIDN_CURRENTCELL, "CurrentCell"},     {GRIDN_COLUMNRESIZED, "ColumnResized"},
        {GRIDN_ROWRESIZED, "RowResized"},       {GRIDN_EQUATIONENTERED, "EquationEntered"},
        {GRIDN_EQUATIONEMPTY, "EquationEmpty"}, {GRIDN_EDITFOCUS, "EditFocus"},
        {GRIDN_EDITKILLFOCUS, "EditKillFocus"}, {WM_KEYDOWN, "DeleteKey"}};
    return kNames.at(info.param);
}

INSTANTIATE_TEST_SUITE_P(Inside, CallsBack, ::testing::ValuesIn(kTold), NameOf);

// The first cells are painted before the host knows its grid's window.
class CallsBackAtCreation : public GuardedGridUse {};

TEST_F(CallsBackAtCreation, ToScrollAndSelect) {
    bool hasRun = false;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_PAINTCELLS && !hasRun) {
            hasRun = true;
            SetFirstVisibleCell(KORGRID_CELL(3, 30));
            Select(4, 5, 31, 32);
        }
        return LRESULT{0};
    };
    open(330, 168);
    EXPECT_TRUE(hasRun);
    EXPECT_EQ(VisibleRange(), Range(3, 9, 30, 41));
    EXPECT_EQ(Selection(), Block(4, 5, 31, 32));
}

TEST_F(CallsBackAtCreation, ToDestroyTheGrid) {
    bool hasRun = false;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_PAINTCELLS && !hasRun) {
            hasRun = true;
            DestroyWindow(GetParent(GetHandleToEquationControl()));
        }
        return LRESULT{0};
    };
    RegisterGridControl(GetModuleHandleW(nullptr));
    const HWND made =
        CreateWindowExW(0, KORGRID_CLASS, L"", RecordingHost::kGridStyle, 0, 0, 300, 200,
                        host.window(), nullptr, GetModuleHandleW(nullptr), nullptr);
    EXPECT_TRUE(hasRun);
    EXPECT_FALSE(IsWindow(made));
    EXPECT_EQ(heap.report(), "");
    host.onMessage = nullptr;
    ResetGrid();
    open(330, 168);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
}

}  // namespace
}  // namespace kortest

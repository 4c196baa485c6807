// Which messages the grid's window answers, and how; the rest goes to default processing.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

using GridMessages = GridTest;

// The messages that one call handed to default processing for the grid's window.
std::vector<UINT> DefaultMessages(const ImportSpy& spy, HWND grid) {
    std::vector<UINT> messages;
    for (const auto& call : spy.callsOf("DefWindowProcW"))
        if (call.arguments[0] == reinterpret_cast<ULONG_PTR>(grid))
            messages.push_back(NumberAt(call, 1));
    return messages;
}

bool GoesToDefault(ImportSpy& spy, HWND grid, UINT message, WPARAM wParam = 0, LPARAM lParam = 0) {
    spy.clearCalls();
    SendMessageW(grid, message, wParam, lParam);
    for (const UINT passed : DefaultMessages(spy, grid))
        if (passed == message) return true;
    return false;
}

TEST_F(GridMessages, UnlistedMessagesGoToDefaultProcessing) {
    create(400, 300);
    spy.watch("DefWindowProcW");
    for (const UINT message : {static_cast<UINT>(WM_NULL), static_cast<UINT>(WM_RBUTTONDOWN),
                               static_cast<UINT>(WM_GETTEXTLENGTH), static_cast<UINT>(WM_GETFONT),
                               static_cast<UINT>(WM_KILLFOCUS), static_cast<UINT>(WM_MOVE),
                               static_cast<UINT>(WM_LBUTTONDBLCLK), static_cast<UINT>(WM_ENABLE),
                               static_cast<UINT>(WM_USER), static_cast<UINT>(WM_USER + 586),
                               static_cast<UINT>(WM_USER + 590), 3423u, 3425u, 3428u, 3430u})
        EXPECT_TRUE(GoesToDefault(spy, grid, message)) << "message " << message;
}

TEST_F(GridMessages, HandledMessagesDoNot) {
    create(400, 300);
    spy.watch("DefWindowProcW");
    const LPARAM point = MAKELPARAM(100, 100);
    const auto header = reinterpret_cast<WPARAM>(columnHeader);
    struct {
        UINT message;
        WPARAM wParam;
        LPARAM lParam;
    } const handled[] = {
        {WM_SIZE, 3, 0},
        {WM_KEYUP, VK_LEFT, 1},
        {WM_KEYDOWN, VK_RIGHT, 1},
        {WM_COMMAND, 1, 0},
        {WM_COMMAND, 99, 0},
        {WM_HSCROLL, SB_LINEDOWN, 0},
        {WM_VSCROLL, SB_LINEDOWN, 0},
        {WM_LBUTTONDOWN, MK_LBUTTON, point},
        {WM_MOUSEMOVE, MK_LBUTTON, point},
        {WM_LBUTTONUP, 0, point},
        {HCN_ITEMCLICK, header, MAKELPARAM(1, 1)},
        {HCN_ITEMRESIZED, header, MAKELPARAM(1, 50)},
        {GRIDM_REDRAW, 0, 0},
    };
    for (const auto& each : handled)
        EXPECT_FALSE(GoesToDefault(spy, grid, each.message, each.wParam, each.lParam))
            << "message " << each.message;
}

TEST_F(GridMessages, SomeAreHandledAndPassedOn) {
    create(400, 300);
    spy.watch("DefWindowProcW");
    EXPECT_TRUE(GoesToDefault(spy, grid, WM_SETFOCUS));
    EXPECT_TRUE(GoesToDefault(spy, grid, WM_PAINT));
    EXPECT_TRUE(GoesToDefault(spy, grid, WM_CHAR, L'x', 1));
    EXPECT_TRUE(GoesToDefault(spy, grid, WM_TIMER, 10101));
    EXPECT_TRUE(GoesToDefault(spy, grid, WM_TIMER, 10102));
}

TEST_F(GridMessages, Results) {
    create(400, 300);
    EXPECT_EQ(SendMessageW(grid, WM_KEYUP, VK_DOWN, 1), 0);
    EXPECT_EQ(SendMessageW(grid, GRIDM_REDRAW, 0, 0), 0);
    EXPECT_EQ(SendMessageW(grid, GRIDM_SETEQUATIONTEXT, 0, reinterpret_cast<LPARAM>(L"x")), 0);
    EXPECT_EQ(SendMessageW(grid, WM_SIZE, 0, 0), 0);
}

TEST_F(GridMessages, OtherCommandsReturnOneAndDoNothing) {
    create(400, 300);
    const GridSelection before = Selection();
    for (const WPARAM id : {WPARAM{0}, WPARAM{2}, WPARAM{3}, WPARAM{6}, WPARAM{9}, WPARAM{1000}})
        EXPECT_EQ(SendMessageW(grid, WM_COMMAND, id, 0), 1) << id;
    EXPECT_EQ(Selection(), before);
    EXPECT_EQ(host.transcript(), Lines{});
}

// The high word tells what a child did; the id alone counts.
TEST_F(GridMessages, CommandsAreToldApartByTheirIds) {
    create(400, 300);
    SendMessageW(grid, WM_COMMAND, MAKEWPARAM(1, BN_DOUBLECLICKED), 0);
    EXPECT_EQ(Selection(), (GridSelection{0, 255, 0, 16383}));
    EXPECT_EQ(SendMessageW(grid, WM_COMMAND, MAKEWPARAM(6, EN_CHANGE), 0), 1) << "the edit's";
    EXPECT_EQ(SendMessageW(grid, WM_COMMAND, 7, 0), 1) << "nothing was typed";
    EXPECT_EQ(SendMessageW(grid, WM_COMMAND, 8, 0), 0);
    EXPECT_EQ(host.transcript(), (Lines{"sent GRIDN_CURRENTCELL A1"}));
}

TEST_F(GridMessages, FocusIsRememberedForTheGrid) {
    create(400, 300);
    EXPECT_EQ(GetControlWithFocus(), nullptr);
    SetFocus(grid);
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(GetControlWithFocus(), grid);
    SetFocus(host.window());
    EXPECT_EQ(GetControlWithFocus(), grid) << "the last of grid and edit";
}

TEST_F(GridMessages, OtherTimersDoNotScroll) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(5, 5));
    settle();
    const GridVisibleRange before = VisibleRange();
    for (const WPARAM id : {WPARAM{0}, WPARAM{1}, WPARAM{10100}, WPARAM{10102}})
        SendMessageW(grid, WM_TIMER, id, 0);
    EXPECT_EQ(VisibleRange(), before);
    SendMessageW(grid, WM_TIMER, 10101, 0);
    EXPECT_EQ(VisibleRange().firstColumn, 4);
    EXPECT_EQ(VisibleRange().firstRow, 4);
}

TEST_F(GridMessages, KeyUpIsSwallowed) {
    create(400, 300);
    spy.watch("DefWindowProcW");
    EXPECT_FALSE(GoesToDefault(spy, grid, WM_KEYUP, VK_F10));
    EXPECT_EQ(host.transcript(), Lines{});
}

// What reaches the equation edit.
struct Received {
    UINT message;
    WPARAM wParam;
    std::wstring text;
    bool operator==(const Received&) const = default;
};
std::vector<Received> g_received;
WNDPROC g_editProc;

LRESULT CALLBACK EditProbe(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_SETTEXT || (message >= EM_GETSEL && message < WM_KEYDOWN)) {
        const auto* text = reinterpret_cast<const wchar_t*>(lParam);
        g_received.push_back({message, wParam, message == WM_SETTEXT ? text : L""});
    }
    return CallWindowProcW(g_editProc, window, message, wParam, lParam);
}

void ProbeEdit(HWND edit) {
    g_received.clear();
    g_editProc = reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(edit, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&EditProbe)));
}

std::ostream& operator<<(std::ostream& stream, const Received& received) {
    return stream << received.message << " " << received.wParam;
}

TEST_F(GridMessages, EquationTextIsForwardedWithBothParameters) {
    create(400, 300);
    ProbeEdit(edit);
    EXPECT_EQ(SendMessageW(grid, GRIDM_SETEQUATIONTEXT, 77, reinterpret_cast<LPARAM>(L"=A1+B2")),
              0);
    EXPECT_EQ(g_received, (std::vector<Received>{{WM_SETTEXT, 77, L"=A1+B2"}}));
    EXPECT_EQ(TextOf(edit), L"=A1+B2");
    EXPECT_EQ(host.transcript(), Lines{});
}

TEST_F(GridMessages, NullEquationTextIsHarmless) {
    create(400, 300);
    EXPECT_EQ(SendMessageW(grid, GRIDM_SETEQUATIONTEXT, 0, 0), 0);
    KorGrid_SetEquationText(grid, L"later");
    EXPECT_EQ(TextOf(edit), L"later");
}

TEST_F(GridMessages, ResetSendsTheEditOneEmptyText) {
    create(400, 300);
    KorGrid_SetEquationText(grid, L"text");
    ProbeEdit(edit);
    ResetGrid();
    EXPECT_EQ(g_received, (std::vector<Received>{{WM_SETTEXT, 256, L""}}));
    EXPECT_EQ(TextOf(edit), L"");
}

TEST_F(GridMessages, HeadersAreToldApartByTheirHandles) {
    create(400, 300);
    SendResized(grid, columnHeader, 1, 80);
    SendResized(grid, rowHeader, 1, 30);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 80);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 1), 30);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 60);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 16);
}

TEST_F(GridMessages, FunctionButtonCommitsAndTellsTheHost) {
    create(400, 300);
    SetFunctionButtonMessageID(4321);
    TypeCharacter(grid, L'5');
    host.leaveOut(GRIDN_PAINTCELLS);
    host.clear();
    const HWND button = FunctionButtonOf(grid);
    PressAt(button, 5, 5);
    ReleaseAt(button, 5, 5);
    host.pump();
    Lines commands;
    for (const std::string& line : host.transcript())
        if (line.find("EQUATIONENTERED") != std::string::npos ||
            line.find("WM_COMMAND") != std::string::npos)
            commands.push_back(line);
    EXPECT_EQ(commands, (Lines{"sent GRIDN_EQUATIONENTERED \"5\" A1", "posted WM_COMMAND 4321 0"}));
}

}  // namespace
}  // namespace kortest

// The grid's class and what WM_CREATE makes.
#include "grid/grid_fixture.h"

#include <cstring>

namespace kortest {
namespace {

using GridClass = GridTest;
using GridCreation = GridTest;

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

std::wstring TextAt(ULONG_PTR pointer) {
    const auto* text = reinterpret_cast<const wchar_t*>(pointer);
    return text ? text : L"";
}

TEST_F(GridClass, HasTheStatedAttributes) {
    ASSERT_NE(RegisterGridControl(ProgramInstance()), 0u);
    WNDCLASSW read{};
    ASSERT_TRUE(GetClassInfoW(ProgramInstance(), L"KV Grid Control", &read));
    EXPECT_EQ(read.style, static_cast<UINT>(CS_HREDRAW | CS_VREDRAW | CS_DBLCLKS));
    EXPECT_EQ(read.cbClsExtra, 0);
    EXPECT_EQ(read.cbWndExtra, 0);
    EXPECT_EQ(read.hIcon, nullptr);
    EXPECT_EQ(read.hCursor, nullptr);
    EXPECT_EQ(read.hbrBackground, GetStockObject(WHITE_BRUSH));
    EXPECT_EQ(read.lpszMenuName, nullptr);
}

TEST_F(GridClass, IsRegisteredUnderTheGivenInstance) {
    spy.watch("RegisterClassW");
    WNDCLASSW given{};
    spy.replace("RegisterClassW", [&](ULONG_PTR* arguments) {
        given = *reinterpret_cast<const WNDCLASSW*>(arguments[0]);
        return static_cast<ULONG_PTR>(0xC123);
    });
    EXPECT_NE(RegisterGridControl(reinterpret_cast<HINSTANCE>(0x12340000)), 0u);
    EXPECT_EQ(given.hInstance, reinterpret_cast<HINSTANCE>(0x12340000));
    EXPECT_EQ(given.lpszMenuName, nullptr);
    EXPECT_STREQ(given.lpszClassName, L"KV Grid Control");
}

TEST_F(GridClass, CannotBeRegisteredTwice) {
    EXPECT_NE(RegisterGridControl(ProgramInstance()), 0u);
    EXPECT_EQ(RegisterGridControl(ProgramInstance()), 0u);
}

TEST_F(GridClass, FailedRegistrationGivesZero) {
    spy.watch("RegisterClassW");
    spy.failAlways("RegisterClassW");
    EXPECT_EQ(RegisterGridControl(ProgramInstance()), 0u);
    spy.stopFailing("RegisterClassW");
    EXPECT_NE(RegisterGridControl(ProgramInstance()), 0u) << "a failure is not remembered";
}

TEST_F(GridCreation, RegistersTheHeaderClassUnderTheGridsInstance) {
    spy.watch("RegisterClassW");
    ASSERT_NE(RegisterGridControl(ProgramInstance()), 0u);
    WNDCLASSW read{};
    EXPECT_FALSE(GetClassInfoW(ProgramInstance(), L"korvane Header", &read));
    EXPECT_EQ(spy.count("RegisterClassW"), 1) << "the grid's class alone";

    WNDCLASSW given{};
    spy.replace("RegisterClassW", [&](ULONG_PTR* arguments) {
        given = *reinterpret_cast<const WNDCLASSW*>(arguments[0]);
        return spy.callReal("RegisterClassW", arguments);
    });
    const HWND window =
        CreateWindowExW(0, L"KV Grid Control", L"", RecordingHost::kGridStyle, 0, 0, 300, 200,
                        host.window(), nullptr, ProgramInstance(), nullptr);
    ASSERT_NE(window, nullptr);
    EXPECT_EQ(given.hInstance, ProgramInstance());
    EXPECT_STREQ(given.lpszClassName, L"korvane Header");
    EXPECT_TRUE(GetClassInfoW(ProgramInstance(), L"korvane Header", &read));
}

TEST_F(GridCreation, IgnoresAHeaderClassThatExistsAlready) {
    create(300, 200);
    destroy();
    spy.watch("RegisterClassW");
    create(300, 200);
    ASSERT_NE(columnHeader, nullptr);
    EXPECT_EQ(HeaderLabels(columnHeader).size(), static_cast<size_t>(expected.columnCount));
}

TEST_F(GridCreation, TriesToRegisterTheHeaderClassEachTime) {
    spy.watch("RegisterClassW");
    create(300, 200);
    destroy();
    const HWND second = host.createGrid(300, 200);
    ASSERT_NE(second, nullptr);
    ASSERT_EQ(spy.count("RegisterClassW"), 1);
    EXPECT_EQ(spy.callsOf("RegisterClassW")[0].result, 0u);
}

TEST_F(GridCreation, LivesWithoutHeadersWhenTheirClassCannotBeRegistered) {
    ASSERT_NE(RegisterGridControl(ProgramInstance()), 0u);
    spy.watch("RegisterClassW");
    spy.failAlways("RegisterClassW");
    const HWND window =
        CreateWindowExW(0, L"KV Grid Control", L"", RecordingHost::kGridStyle, 0, 0, 300, 200,
                        host.window(), nullptr, ProgramInstance(), nullptr);
    ASSERT_NE(window, nullptr);
    EXPECT_EQ(ColumnHeaderOf(window), nullptr);
    EXPECT_NE(EquationEditOf(window), nullptr);
}

TEST_F(GridCreation, MakesTheChildrenInOrder) {
    spy.watch("CreateWindowExW");
    const HWND window = host.createGrid(300, 200);
    ASSERT_NE(window, nullptr);
    struct Child {
        std::wstring className, text;
        ULONG_PTR style, id;
    };
    const Child wanted[] = {
        {L"EDIT", L"", 0x50800080, 6},           {L"BUTTON", L"OK", 0x50000001, 7},
        {L"BUTTON", L"fx", 0x50000001, 7},       {L"BUTTON", L"X", 0x50000000, 8},
        {L"BUTTON", L"", 0x50000000, 1},         {L"korvane Header", L"", 0x50000001, 2},
        {L"korvane Header", L"", 0x50000002, 3},
    };
    const auto made = spy.callsOf("CreateWindowExW");
    ASSERT_EQ(made.size(), std::size(wanted));
    const auto instance = static_cast<ULONG_PTR>(GetWindowLongPtrW(window, GWLP_HINSTANCE));
    for (size_t i = 0; i < made.size(); ++i) {
        SCOPED_TRACE(i);
        const auto& arguments = made[i].arguments;
        EXPECT_EQ(TextAt(arguments[1]), wanted[i].className);
        EXPECT_EQ(TextAt(arguments[2]), wanted[i].text);
        EXPECT_EQ(static_cast<DWORD>(arguments[3]), wanted[i].style);
        for (size_t place = 4; place < 8; ++place)
            EXPECT_EQ(static_cast<int>(arguments[place]), 0) << "argument " << place;
        EXPECT_EQ(arguments[8], reinterpret_cast<ULONG_PTR>(window));
        EXPECT_EQ(arguments[9], wanted[i].id);
        EXPECT_EQ(arguments[10], instance);
        EXPECT_NE(made[i].result, 0u);
    }
}

TEST_F(GridCreation, FindsNoChildBesidesTheStatedOnes) {
    create(300, 200);
    int children = 0;
    for (HWND child = GetWindow(grid, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT))
        ++children;
    EXPECT_EQ(children, 7);
    EXPECT_EQ(GetDlgCtrlID(OkButtonOf(grid)), 7);
    EXPECT_EQ(GetDlgCtrlID(FunctionButtonOf(grid)), 7);
    EXPECT_EQ(TextOf(OkButtonOf(grid)), L"OK");
    EXPECT_EQ(TextOf(FunctionButtonOf(grid)), L"fx");
    EXPECT_EQ(TextOf(CancelButtonOf(grid)), L"X");
    EXPECT_EQ(TextOf(CornerButtonOf(grid)), L"");
    EXPECT_EQ(GetWindowLongW(rowHeader, GWL_STYLE) & 3, HCS_VERTICAL);
}

TEST_F(GridCreation, LimitsTheEquationTo260Characters) {
    spy.watch("SendMessageW");
    host.createGrid(300, 200);
    edit = EquationEditOf(host.grid());
    int limits = 0;
    for (const auto& call : spy.callsOf("SendMessageW"))
        if (call.arguments[0] == reinterpret_cast<ULONG_PTR>(edit) &&
            NumberAt(call, 1) == EM_LIMITTEXT) {
            EXPECT_EQ(call.arguments[2], 260u);
            ++limits;
        }
    EXPECT_EQ(limits, 1);
    EXPECT_EQ(SendMessageW(edit, EM_GETLIMITTEXT, 0, 0), 260);
}

// Windows whose procedure the grid replaced, in order, with the procedure each had before.
std::vector<ImportCall> SubclassingCalls(const ImportSpy& spy) {
    std::vector<ImportCall> found;
    for (const auto& call : spy.calls())
        if ((call.name == "SetWindowLongW" || call.name == "SetWindowLongPtrW") &&
            static_cast<int>(call.arguments[1]) == GWLP_WNDPROC)
            found.push_back(call);
    return found;
}

TEST_F(GridCreation, SubclassesTheEditAndThreeButtons) {
    spy.watchAll({"SetWindowLongW", "SetWindowLongPtrW"});
    host.createGrid(300, 200);
    grid = host.grid();
    const HWND wanted[] = {EquationEditOf(grid), OkButtonOf(grid), FunctionButtonOf(grid),
                           CancelButtonOf(grid)};
    const auto calls = SubclassingCalls(spy);
    ASSERT_EQ(calls.size(), std::size(wanted));
    for (size_t i = 0; i < calls.size(); ++i) {
        EXPECT_EQ(calls[i].arguments[0], reinterpret_cast<ULONG_PTR>(wanted[i])) << i;
        EXPECT_EQ(static_cast<ULONG_PTR>(GetWindowLongPtrW(wanted[i], GWLP_WNDPROC)),
                  calls[i].arguments[2])
            << i;
    }
    EXPECT_NE(calls[1].arguments[2], calls[2].arguments[2]);
    EXPECT_NE(calls[2].arguments[2], calls[3].arguments[2]);
}

std::vector<HWND> g_chained;

LRESULT CALLBACK ChainProbe(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    g_chained.push_back(window);
    return DefWindowProcW(window, message, wParam, lParam);
}

TEST_F(GridCreation, AllButtonsChainToTheProcedureSavedLast) {
    const char* const name =
        spy.isImported("SetWindowLongPtrW") ? "SetWindowLongPtrW" : "SetWindowLongW";
    spy.watch(name);
    int seen = 0;
    spy.replace(name, [&](ULONG_PTR* arguments) {
        const ULONG_PTR before = spy.callReal(name, arguments);
        const bool isLast = static_cast<int>(arguments[1]) == GWLP_WNDPROC && ++seen == 4;
        return isLast ? reinterpret_cast<ULONG_PTR>(&ChainProbe) : before;
    });
    host.createGrid(300, 200);
    grid = host.grid();
    const std::vector<HWND> buttons = {OkButtonOf(grid), FunctionButtonOf(grid),
                                       CancelButtonOf(grid)};
    g_chained.clear();
    for (const HWND button : buttons) SendMessageW(button, BM_GETSTATE, 0, 0);
    SendMessageW(CornerButtonOf(grid), BM_GETSTATE, 0, 0);
    EXPECT_EQ(g_chained, buttons);
}

TEST_F(GridCreation, MakesTheGridLinePen) {
    spy.watch("CreatePen");
    host.createGrid(300, 200);
    int gridPens = 0;
    for (const auto& call : spy.callsOf("CreatePen"))
        gridPens += NumberAt(call, 0) == PS_SOLID && NumberAt(call, 1) == 1 &&
                    NumberAt(call, 2) == 0xB0B0B0;
    EXPECT_EQ(gridPens, 1);
}

TEST_F(GridCreation, TakesTheParentsDCAndReleasesItInTheGridsName) {
    spy.watchAll({"GetDC", "CreateCompatibleDC", "GetTextMetricsW", "ReleaseDC"});
    host.createGrid(0, 0);
    const auto parent = reinterpret_cast<ULONG_PTR>(host.window());
    const auto window = reinterpret_cast<ULONG_PTR>(host.grid());
    std::vector<ImportCall> ofParent;
    ULONG_PTR dc = 0;
    for (const auto& call : spy.calls()) {
        if (call.name == "GetDC" && call.arguments[0] == parent) dc = call.result;
        if (dc) ofParent.push_back(call);
    }
    ASSERT_EQ(ofParent.size(), 4u);
    EXPECT_EQ(ofParent[1].name, "CreateCompatibleDC");
    EXPECT_EQ(ofParent[1].arguments[0], dc);
    EXPECT_EQ(ofParent[2].name, "GetTextMetricsW");
    EXPECT_EQ(ofParent[2].arguments[0], dc);
    EXPECT_EQ(ofParent[3].name, "ReleaseDC");
    EXPECT_EQ(ofParent[3].arguments, (std::vector<ULONG_PTR>{window, dc}));
}

// The face name field holds five bytes, not five characters, so that the system takes its default.
TEST_F(GridCreation, DescribesABoldFontWithANarrowFaceName) {
    spy.watch("CreateFontIndirectW");
    std::vector<LOGFONTW> made;
    spy.replace("CreateFontIndirectW", [&](ULONG_PTR* arguments) {
        made.push_back(*reinterpret_cast<const LOGFONTW*>(arguments[0]));
        return spy.callReal("CreateFontIndirectW", arguments);
    });
    host.createGrid(0, 0);
    ASSERT_EQ(made.size(), 1u);
    LOGFONTW wanted{};
    wanted.lfWeight = FW_BOLD;
    wanted.lfCharSet = DEFAULT_CHARSET;
    std::memcpy(wanted.lfFaceName, "Arial", 5);
    EXPECT_EQ(std::memcmp(&made[0], &wanted, sizeof wanted), 0);
}

TEST_F(GridCreation, SendsTheFontToTheRowHeaderFirst) {
    spy.watchAll({"CreateFontIndirectW", "SendMessageW"});
    host.createGrid(0, 0);
    grid = host.grid();
    ASSERT_EQ(spy.count("CreateFontIndirectW"), 1);
    const ULONG_PTR font = spy.callsOf("CreateFontIndirectW")[0].result;
    std::vector<ULONG_PTR> receivers;
    for (const auto& call : spy.callsOf("SendMessageW"))
        if (NumberAt(call, 1) == WM_SETFONT) {
            EXPECT_EQ(call.arguments[2], font);
            receivers.push_back(call.arguments[0]);
        }
    EXPECT_EQ(receivers,
              (std::vector<ULONG_PTR>{reinterpret_cast<ULONG_PTR>(RowHeaderOf(grid)),
                                      reinterpret_cast<ULONG_PTR>(ColumnHeaderOf(grid))}));
}

TEST_F(GridCreation, SendsNoFontWhenNoneCouldBeMade) {
    spy.watchAll({"CreateFontIndirectW", "SendMessageW"});
    spy.failNth("CreateFontIndirectW", 1);
    host.createGrid(300, 200);
    for (const auto& call : spy.callsOf("SendMessageW"))
        EXPECT_NE(NumberAt(call, 1), static_cast<DWORD>(WM_SETFONT));
    EXPECT_NE(GetNumberOfVisibleColumns(), 0u);
}

LRESULT CALLBACK PlainProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    return DefWindowProcW(window, message, wParam, lParam);
}

TEST_F(GridCreation, EquationBarIsAsHighAsTheParentsText) {
    WNDCLASSW parentClass{};
    parentClass.style = CS_OWNDC;
    parentClass.lpfnWndProc = PlainProc;
    parentClass.hInstance = ProgramInstance();
    parentClass.lpszClassName = L"parent with a DC of its own";
    ASSERT_NE(RegisterClassW(&parentClass), 0);
    const HWND parent = CreateWindowExW(0, parentClass.lpszClassName, L"", WS_POPUP | WS_VISIBLE, 0,
                                        0, 400, 300, nullptr, nullptr, ProgramInstance(), nullptr);
    const HFONT font = CreateFontW(-40, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    SelectObject(GetDC(parent), font);  // the DC is the window's, so the font stays in it
    const int wanted = EquationBarHeightFor(parent);
    ASSERT_NE(wanted, EquationBarHeightFor(host.window()));

    ASSERT_NE(RegisterGridControl(ProgramInstance()), 0u);
    const HWND window = CreateWindowExW(0, L"KV Grid Control", L"", RecordingHost::kGridStyle, 0, 0,
                                        300, 200, parent, nullptr, ProgramInstance(), nullptr);
    ASSERT_NE(window, nullptr);
    EXPECT_EQ(ChildRect(EquationEditOf(window)), (RECT{75, 0, 300, wanted}));
    EXPECT_EQ(ChildRect(RowHeaderOf(window)), (RECT{0, wanted + 16, 30, 200}));
    DestroyWindow(parent);
    DeleteObject(font);
}

TEST_F(GridCreation, PositionsNothingBeforeTheFirstSize) {
    create(0, 0);
    for (HWND child = GetWindow(grid, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT))
        EXPECT_EQ(ChildRect(child), (RECT{0, 0, 0, 0})) << GetDlgCtrlID(child);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 0u);
    EXPECT_EQ(GetNumberOfVisibleRows(), 0u);
}

TEST_F(GridCreation, KeepsTheNotificationsForTheParentGivenAtCreation) {
    create(300, 200);
    const HWND other = CreateWindowExW(0, L"STATIC", L"", WS_POPUP, 0, 0, 300, 300, nullptr,
                                       nullptr, ProgramInstance(), nullptr);
    SetParent(grid, other);
    host.clear();
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    EXPECT_EQ(host.transcript().size(), 1u);
    SetParent(grid, host.window());
    DestroyWindow(other);
}

}  // namespace
}  // namespace kortest

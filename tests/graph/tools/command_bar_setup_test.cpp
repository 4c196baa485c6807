// What SetupGraphCommandBar puts into a bar.
#include "graph/tools/command_bar_fixture.h"

#include "graph/tools/sheet_driver.h"

namespace kortest {
namespace {

class CommandBarSetup : public CommandBarTest {
protected:
    CommandBarSetup() { createBar(); }
};

std::vector<LRESULT> ItemDataOf(HWND combo) {
    std::vector<LRESULT> data;
    const auto count = static_cast<int>(SendMessageW(combo, CB_GETCOUNT, 0, 0));
    for (int i = 0; i < count; ++i)
        data.push_back(SendMessageW(combo, CB_GETITEMDATA, static_cast<WPARAM>(i), 0));
    return data;
}

LRESULT SelectionOf(HWND combo) { return SendMessageW(combo, CB_GETCURSEL, 0, 0); }

TEST_F(CommandBarSetup, TellsTheBarInThisOrder) {
    watchMessages();
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(messages, (Lines{"TB_ADDBITMAP 3", "TB_ADDBUTTONS 3", "TB_INSERTBUTTON 3",
                               "TB_INSERTBUTTON 3", "tooltips 5"}));
}

TEST_F(CommandBarSetup, HostsButtonsThenZoomThenTypes) {
    setUp();
    ASSERT_EQ(buttonCount(), 5);
    EXPECT_EQ(buttonAt(0).idCommand, kShowCommand);
    EXPECT_EQ(buttonAt(2).idCommand, kPropertiesCommand);
    EXPECT_EQ(buttonAt(2).iBitmap, 1);
    EXPECT_LT(PlaceIn(bar, zoom).left, PlaceIn(bar, type).left);
}

TEST_F(CommandBarSetup, ChartTypesAreNumberedAsTheChartNumbersThem) {
    setUp();
    EXPECT_EQ(ItemsOf(type),
              (std::vector<std::wstring>{L"Line", L"Area", L"Bar", L"Column", L"Pie"}));
    EXPECT_EQ(ItemDataOf(type), (std::vector<LRESULT>{KORGRAPH_LINE, KORGRAPH_AREA, KORGRAPH_BAR,
                                                      KORGRAPH_COLUMN, KORGRAPH_PIE}));
    EXPECT_EQ(SelectionOf(type), 0);
    EXPECT_EQ(TextOf(type), L"Line");
}

TEST_F(CommandBarSetup, ZoomsStartAtWhole) {
    setUp();
    EXPECT_EQ(ItemsOf(zoom), (std::vector<std::wstring>{L"25%", L"50%", L"100%", L"200%"}));
    EXPECT_EQ(ItemDataOf(zoom), (std::vector<LRESULT>{KORGRAPH_ZOOM25, KORGRAPH_ZOOM50,
                                                      KORGRAPH_ZOOM100, KORGRAPH_ZOOM200}));
    EXPECT_EQ(TextOf(zoom), L"100%");
}

TEST_F(CommandBarSetup, CombosAreDropDownListsOfTheHost) {
    setUp();
    for (const HWND combo : {zoom, type}) {
        const auto style = static_cast<DWORD>(GetWindowLongPtrW(combo, GWL_STYLE));
        EXPECT_EQ(style & (CBS_DROPDOWNLIST | CBS_SIMPLE), static_cast<DWORD>(CBS_DROPDOWNLIST));
        EXPECT_EQ(GetParent(combo), bar);
        EXPECT_TRUE(IsWindowVisible(combo));
        EXPECT_EQ(SendMessageW(combo, CB_GETEXTENDEDUI, 0, 0), TRUE);
        EXPECT_EQ(reinterpret_cast<HINSTANCE>(GetWindowLongPtrW(combo, GWLP_HINSTANCE)),
                  GetModuleHandleW(nullptr));
    }
    EXPECT_EQ(GetDlgCtrlID(zoom), static_cast<int>(kZoomComboId));
    EXPECT_EQ(GetDlgCtrlID(type), static_cast<int>(kTypeComboId));
}

TEST_F(CommandBarSetup, CombosAreCreatedWithTheseStyles) {
    spy.watch("CreateWindowExW");
    setUp();
    const auto calls = spy.callsOf("CreateWindowExW");
    ASSERT_EQ(calls.size(), 2u);
    for (const ImportCall& call : calls)
        EXPECT_EQ(NumberAt(call, 3) & ~static_cast<DWORD>(WS_CHILD | WS_VISIBLE), 0x00200003u);
}

TEST_F(CommandBarSetup, CombosHaveTheirWidths) {
    setUp();
    const RECT zoomPlace = PlaceIn(bar, zoom), typePlace = PlaceIn(bar, type);
    EXPECT_EQ(zoomPlace.right - zoomPlace.left, 60);
    EXPECT_EQ(typePlace.right - typePlace.left, 65);
}

TEST_F(CommandBarSetup, NothingOverlaps) {
    setUp();
    const RECT lastButton = placeOf(2);
    const RECT zoomPlace = PlaceIn(bar, zoom), typePlace = PlaceIn(bar, type);
    EXPECT_GE(zoomPlace.left, lastButton.right);
    EXPECT_GE(typePlace.left, zoomPlace.right);
    EXPECT_GE(zoomPlace.left, placeOf(3).left);
    EXPECT_LE(zoomPlace.right, placeOf(3).right);
    EXPECT_GE(typePlace.left, placeOf(4).left);
    EXPECT_LE(typePlace.right, placeOf(4).right);
}

TEST_F(CommandBarSetup, ImagesComeFromTheLibrary) {
    setUp();
    const auto list = reinterpret_cast<HIMAGELIST>(SendMessageW(bar, TB_GETIMAGELIST, 0, 0));
    EXPECT_EQ(ImageList_GetImageCount(list), 3);
    Canvas canvas(48, 16, RGB(1, 2, 3));
    for (int i = 0; i < 3; ++i) ImageList_Draw(list, i, canvas.dc(), i * 16, 0, ILD_TRANSPARENT);
    const Picture picture = canvas.picture();
    for (LONG i = 0; i < 3; ++i) {
        const RECT image = {i * 16, 0, i * 16 + 16, 16};
        EXPECT_GT(picture.count(RGB(0, 0, 255), image), 5) << "blue, in image " << i;
        EXPECT_GT(picture.count(RGB(1, 2, 3), image), 20) << "see-through, in image " << i;
    }
}

TEST_F(CommandBarSetup, BitmapIsAStripOfSixteenColours) {
    const HRSRC resource =
        FindResourceW(spy.module(), MAKEINTRESOURCEW(105), MAKEINTRESOURCEW(2));  // a bitmap
    ASSERT_NE(resource, nullptr);
    const auto& header =
        *static_cast<const BITMAPINFOHEADER*>(LockResource(LoadResource(spy.module(), resource)));
    EXPECT_EQ(header.biWidth, 48);
    EXPECT_EQ(header.biHeight, 16);
    EXPECT_EQ(header.biBitCount, 4);
}

TEST_F(CommandBarSetup, ChoicesReachTheBarsParent) {
    setUp();
    host.clear();
    // The first key opens the list: that is the extended user interface.
    for (const WPARAM key : {VK_DOWN, VK_DOWN, VK_RETURN}) PressKey(type, key);
    const std::string expected =
        "sent WM_COMMAND " + std::to_string(MAKEWPARAM(kTypeComboId, CBN_SELCHANGE)) + " ";
    bool isTold = false;
    for (const std::string& line : host.transcript()) isTold |= line.rfind(expected, 0) == 0;
    EXPECT_TRUE(isTold) << ::testing::PrintToString(host.transcript());
    EXPECT_EQ(TextOf(type), L"Area");
}

TEST_F(CommandBarSetup, AnotherBarIsIndependent) {
    setUp();
    const HWND firstZoom = zoom;
    createBar();
    setUp();
    EXPECT_NE(zoom, firstZoom);
    EXPECT_EQ(GetParent(zoom), bar);
    EXPECT_EQ(buttonCount(), 5);
}

// ---- Arguments --------------------------------------------------------------------------------

TEST_F(CommandBarSetup, ANullBarIsRefused) {
    createBar();
    zoom = type = host.window();
    const TBBUTTON button = HostButtons()[0];
    EXPECT_EQ(SetupGraphCommandBar(GetModuleHandleW(nullptr), nullptr, &button, 1, &zoom,
                                   kZoomComboId, &type, kTypeComboId),
              0u);
    EXPECT_EQ(zoom, host.window()) << "nothing is stored";
    EXPECT_EQ(type, host.window());
}

TEST_F(CommandBarSetup, NobodyNeedsToHearOfTheCombos) {
    const TBBUTTON button = HostButtons()[0];
    EXPECT_EQ(SetupGraphCommandBar(GetModuleHandleW(nullptr), bar, &button, 1, nullptr,
                                   kZoomComboId, nullptr, kTypeComboId),
              1u);
    EXPECT_EQ(buttonCount(), 3);
    EXPECT_EQ(TextOf(GetDlgItem(bar, kZoomComboId)), L"100%");
    EXPECT_EQ(TextOf(GetDlgItem(bar, kTypeComboId)), L"Line");
}

TEST_F(CommandBarSetup, WithoutButtonsTheCombosStandFirst) {
    const TBBUTTON button = HostButtons()[0];
    const struct {
        const TBBUTTON* buttons;
        LONG count;
    } rows[] = {{nullptr, 0}, {nullptr, 3}, {&button, 0}, {&button, -1}};
    for (const auto& row : rows) {
        createBar();
        EXPECT_EQ(SetupGraphCommandBar(GetModuleHandleW(nullptr), bar, row.buttons, row.count,
                                       &zoom, kZoomComboId, &type, kTypeComboId),
                  1u);
        EXPECT_EQ(buttonCount(), 2) << row.count;
        EXPECT_EQ(TextOf(zoom), L"100%");
        EXPECT_EQ(TextOf(type), L"Line");
    }
}

// Two combo boxes of one id are a host's mistake; they still stand side by side.
TEST_F(CommandBarSetup, EqualIdsDoNotMakeTheCombosOverlap) {
    SetupGraphCommandBar(GetModuleHandleW(nullptr), bar, nullptr, 0, &zoom, 7, &type, 7);
    const RECT gaps[] = {placeOf(0), placeOf(1)};
    const RECT places[] = {PlaceIn(bar, zoom), PlaceIn(bar, type)};
    for (int i = 0; i < 2; ++i)
        EXPECT_EQ(places[i].left + places[i].right, gaps[i].left + gaps[i].right) << i;
}

// A host may keep a window of its own with a separator.
TEST_F(CommandBarSetup, WindowsThatAreNotTheBarsStayWhereTheyAre) {
    const HWND other = CreateWindowExW(0, L"STATIC", L"", WS_CHILD, 3, 4, 20, 20, host.window(),
                                       nullptr, nullptr, nullptr);
    TBBUTTON gap = {};
    gap.iBitmap = 30;
    gap.fsStyle = TBSTYLE_SEP;
    gap.dwData = reinterpret_cast<DWORD_PTR>(other);
    setUp({gap});
    EXPECT_EQ(PlaceIn(host.window(), other), (RECT{3, 4, 23, 24}));
}

// ---- Failures ---------------------------------------------------------------------------------

TEST_F(CommandBarSetup, ABarThatIsGoneGetsNothing) {
    DestroyWindow(bar);
    zoom = type = host.window();
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(zoom, nullptr);
    EXPECT_EQ(type, nullptr);
}

TEST_F(CommandBarSetup, WithoutTheTypesTheRestIsThere) {
    spy.watch("CreateWindowExW");
    spy.failNth("CreateWindowExW", 1);
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(type, nullptr);
    EXPECT_EQ(TextOf(zoom), L"100%");
    EXPECT_EQ(buttonCount(), 4) << "no gap is left where it would have been";
    EXPECT_EQ(toolTipOf(kShowCommand), L"Show Graph");
}

TEST_F(CommandBarSetup, WithoutTheZoomTheRestIsThere) {
    spy.watch("CreateWindowExW");
    spy.failNth("CreateWindowExW", 2);
    EXPECT_EQ(setUp(), 1u);
    EXPECT_EQ(zoom, nullptr);
    EXPECT_EQ(TextOf(type), L"Line");
    EXPECT_EQ(buttonCount(), 4);
}

}  // namespace
}  // namespace kortest

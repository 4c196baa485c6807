// The property sheet as a whole: its resources, its place, its failures.
#include "graph/tools/dialog_template.h"
#include "graph/tools/properties_fixture.h"

#include <commctrl.h>
#include <prsht.h>

namespace kortest {
namespace {

// ---- Resources --------------------------------------------------------------------------------

constexpr DWORD kLabel = WS_CHILD | WS_VISIBLE | WS_GROUP;
constexpr DWORD kEdit = 0x50810080;
constexpr DWORD kCombo = WS_CHILD | WS_VISIBLE | WS_TABSTOP | WS_VSCROLL | CBS_DROPDOWNLIST;

// The widths and heights of the second page's labels are free, so they stay out of the comparison.
std::vector<DialogItem> WithoutLabelSizes(std::vector<DialogItem> items) {
    for (DialogItem& item : items) {
        if (item.className == L"STATIC") item.width = item.height = 0;
    }
    return items;
}

TEST(PropertiesResources, TitlesDialog) {
    const DialogTemplate dialog = ReadDialogTemplate(LibraryModule(), 3000);
    EXPECT_EQ(dialog.style, 0x80C808C0u);
    EXPECT_EQ(dialog.caption, L"Titles");
    EXPECT_EQ(dialog.font, L"Tahoma");
    EXPECT_EQ(dialog.fontPoints, 9);
    EXPECT_EQ(dialog.width, 130);
    EXPECT_EQ(dialog.height, 75);
    const std::vector<DialogItem> expected = {
        {-1, L"STATIC", L"Title:", kLabel, 4, 2, 20, 8},
        {1002, L"EDIT", L"", kEdit, 10, 11, 109, 12},
        {-1, L"STATIC", L"Category (X):", kLabel, 4, 26, 56, 8},
        {1003, L"EDIT", L"", kEdit, 10, 35, 109, 12},
        {-1, L"STATIC", L"Value (Y):", kLabel, 4, 50, 54, 8},
        {1004, L"EDIT", L"", kEdit, 10, 59, 109, 12}};
    EXPECT_EQ(dialog.items, expected);
}

TEST(PropertiesResources, DataDialog) {
    const DialogTemplate dialog = ReadDialogTemplate(LibraryModule(), 3001);
    EXPECT_EQ(dialog.style, 0x80C808C0u);
    EXPECT_EQ(dialog.caption, L"Data");
    EXPECT_EQ(dialog.font, L"Tahoma");
    EXPECT_EQ(dialog.fontPoints, 9);
    EXPECT_EQ(dialog.width, 130);
    EXPECT_EQ(dialog.height, 75);
    const std::vector<DialogItem> expected = {
        {1007, L"EDIT", L"", kEdit, 25, 4, 33, 12},
        {1008, L"EDIT", L"", kEdit, 89, 4, 33, 12},
        {1005, L"EDIT", L"", kEdit, 25, 24, 33, 12},
        {1006, L"EDIT", L"", kEdit, 89, 24, 33, 12},
        {1011, L"COMBOBOX", L"", kCombo, 65, 42, 50, 52},
        {1010, L"COMBOBOX", L"", kCombo, 65, 58, 50, 52},
        {-1, L"STATIC", L"X Min:", kLabel, 3, 4, 0, 0},
        {-1, L"STATIC", L"Zoom Level:", kLabel, 14, 42, 0, 0},
        {-1, L"STATIC", L"X Max:", kLabel, 62, 4, 0, 0},
        {-1, L"STATIC", L"Y Min:", kLabel, 3, 24, 0, 0},
        {-1, L"STATIC", L"Y Max:", kLabel, 62, 24, 0, 0},
        {-1, L"STATIC", L"Graph Type:", kLabel, 14, 58, 0, 0}};
    EXPECT_EQ(WithoutLabelSizes(dialog.items), expected);
}

// ---- The sheet --------------------------------------------------------------------------------

class PropertiesSheet : public PropertiesTest {
protected:
    PropertiesSheet() { createRecorded(); }

    static std::vector<std::wstring> tabs(HWND sheet) {
        std::vector<std::wstring> captions;
        const HWND control = PropSheet_GetTabControl(sheet);
        for (int i = 0; i < TabCtrl_GetItemCount(control); ++i) {
            wchar_t text[40] = {};
            TCITEMW item{};
            item.mask = TCIF_TEXT;
            item.pszText = text;
            item.cchTextMax = 40;
            SendMessageW(control, TCM_GETITEMW, static_cast<WPARAM>(i),
                         reinterpret_cast<LPARAM>(&item));
            captions.emplace_back(text);
        }
        return captions;
    }
};

// The tabs show the dialogs' captions, whatever the pages' own titles say.
TEST_F(PropertiesSheet, HasTwoTabsAndNoApplyButton) {
    openSheet([](HWND sheet) {
        EXPECT_EQ(TextOf(sheet), L"Graph Properties");
        EXPECT_EQ(tabs(sheet), (std::vector<std::wstring>{L"Titles", L"Data"}));
        EXPECT_EQ(PropSheet_GetCurrentPageHwnd(sheet), PropSheet_IndexToHwnd(sheet, 0));
        EXPECT_FALSE(IsWindowVisible(GetDlgItem(sheet, 0x3021))) << "Apply";
        EXPECT_TRUE(IsWindowVisible(GetDlgItem(sheet, IDOK)));
    });
}

TEST_F(PropertiesSheet, StandsInTheMiddleOfTheUpperEdge) {
    openSheet([](HWND sheet) {
        RECT place{};
        GetWindowRect(sheet, &place);
        const HDC screen = GetDC(nullptr);
        const int width = GetDeviceCaps(screen, HORZRES);
        ReleaseDC(nullptr, screen);
        EXPECT_EQ(place.left, (width - (place.right - place.left)) / 2);
        EXPECT_EQ(place.top, 0);
        EXPECT_GT(place.bottom - place.top, 100) << "it kept its size";
    });
}

TEST_F(PropertiesSheet, IsDescribedToThePlatformAsItShould) {
    std::vector<std::wstring> descriptions;
    spy.watch("CreatePropertySheetPageW");
    spy.replace("CreatePropertySheetPageW", [&](ULONG_PTR* arguments) {
        const auto& page = *reinterpret_cast<const PROPSHEETPAGEW*>(arguments[0]);
        descriptions.push_back(page.pszTitle);
        EXPECT_EQ(page.dwFlags, 0u);
        EXPECT_EQ(page.hInstance, spy.module());
        EXPECT_EQ(page.lParam, reinterpret_cast<LPARAM>(graph));
        descriptions.push_back(std::to_wstring(reinterpret_cast<ULONG_PTR>(page.pszTemplate)));
        return spy.callReal("CreatePropertySheetPageW", arguments);
    });
    spy.watch("PropertySheetW");
    spy.replace("PropertySheetW", [&](ULONG_PTR* arguments) {
        const auto& sheet = *reinterpret_cast<const PROPSHEETHEADERW*>(arguments[0]);
        EXPECT_EQ(sheet.dwFlags, static_cast<DWORD>(PSH_NOAPPLYNOW));
        EXPECT_EQ(sheet.hwndParent, graph);
        EXPECT_EQ(sheet.hInstance, spy.module());
        EXPECT_EQ(sheet.nPages, 2u);
        EXPECT_EQ(sheet.nStartPage, 0u);
        return spy.callReal("PropertySheetW", arguments);
    });
    openSheet([](HWND) {});
    EXPECT_EQ(descriptions, (std::vector<std::wstring>{L"Titles", L"3000", L"Ranges", L"3001"}));
}

TEST_F(PropertiesSheet, IsMovedInItsOwnSize) {
    RECT before{};
    int width = 0, height = 0;
    spy.watch("MoveWindow");
    spy.replace("MoveWindow", [&](ULONG_PTR* arguments) {
        GetWindowRect(reinterpret_cast<HWND>(arguments[0]), &before);
        width = static_cast<int>(arguments[3]);
        height = static_cast<int>(arguments[4]);
        return spy.callReal("MoveWindow", arguments);
    });
    openSheet([](HWND) {});
    EXPECT_GT(before.right - before.left, 100);
    EXPECT_EQ(width, before.right - before.left);
    EXPECT_EQ(height, before.bottom - before.top);
}

TEST_F(PropertiesSheet, PagesKeepTheirChart) {
    openSheet([this](HWND sheet) {
        for (const int page : {kTitlesPage, kDataPage}) {
            const LONG_PTR kept = GetWindowLongPtrW(ShowPage(sheet, page), GWLP_USERDATA);
            EXPECT_EQ(reinterpret_cast<HWND>(kept), graph) << page;
        }
    });
}

TEST_F(PropertiesSheet, HandsTheFocusToTheTypeAndThenToTheZoom) {
    std::vector<int> focused;
    spy.watch("SetFocus");
    spy.replace("SetFocus", [&](ULONG_PTR* arguments) {
        focused.push_back(GetDlgCtrlID(reinterpret_cast<HWND>(arguments[0])));
        return spy.callReal("SetFocus", arguments);
    });
    openSheet([](HWND sheet) { ShowPage(sheet, kDataPage); });
    EXPECT_EQ(focused, (std::vector<int>{kTypeCombo, kZoomCombo}));
}

TEST_F(PropertiesSheet, HandsTheFocusToTheZoom) {
    openSheet([](HWND sheet) {
        const HWND page = ShowPage(sheet, kDataPage);
        EXPECT_EQ(GetFocus(), GetDlgItem(page, kZoomCombo));
    });
}

TEST_F(PropertiesSheet, OpensOnlyInsideNotify) {
    spy.watchAll({"PropertySheetW", "DefWindowProcW"});
    EXPECT_EQ(send(GN_PROPERTIES), 0);
    EXPECT_EQ(spy.count("PropertySheetW"), 0);
    EXPECT_EQ(defaultCalls(GN_PROPERTIES), 1);
}

TEST_F(PropertiesSheet, CancelLeavesTheChartAlone) {
    openSheet([](HWND sheet) {
        const HWND page = ShowPage(sheet, kDataPage);
        TypeInto(page, kXMaxEdit, L"99");
        Choose(page, kTypeCombo, KORGRAPH_PIE);
    });
    EXPECT_EQ(sent, Lines{});
}

// The second page is made when it is first shown; one that never was has nothing to apply.
TEST_F(PropertiesSheet, APageThatWasNotShownAppliesNothing) {
    openSheet([](HWND sheet) { PressOk(sheet); });
    EXPECT_EQ(sent, Lines{});
}

TEST_F(PropertiesSheet, OpensAgain) {
    for (int round = 0; round < 3; ++round) {
        openSheet([](HWND sheet) {
            TypeInto(ShowPage(sheet, kTitlesPage), kTitleEdit, L"again");
            PressOk(sheet);
        });
    }
    EXPECT_EQ(sent.size(), 6u);
    EXPECT_TRUE(IsWindowEnabled(graph));
    EXPECT_TRUE(IsWindowEnabled(host.window()));
}

TEST_F(PropertiesSheet, GivesEveryHandleBack) {
    openSheet([](HWND sheet) { ShowPage(sheet, kDataPage); });
    WatchHandles(spy);
    spy.clearCalls();
    openSheet([](HWND sheet) {
        TypeInto(ShowPage(sheet, kDataPage), kXMaxEdit, L"20");
        PressOk(sheet);
    });
    EXPECT_GT(spy.count("GetDC"), 0);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

// ---- Failures ---------------------------------------------------------------------------------

class PropertiesFailures : public PropertiesSheet {};

TEST_F(PropertiesFailures, WithoutAPageThereIsNoSheet) {
    for (const int nth : {1, 2}) {
        spy.watchAll({"CreatePropertySheetPageW", "PropertySheetW", "DestroyPropertySheetPage"});
        spy.clearCalls();
        spy.failNth("CreatePropertySheetPageW", nth);
        EXPECT_EQ(notify(GN_PROPERTIES), 0);
        EXPECT_EQ(spy.sequence(), nth == 1 ? "CreatePropertySheetPageW! CreatePropertySheetPageW "
                                             "DestroyPropertySheetPage"
                                           : "CreatePropertySheetPageW CreatePropertySheetPageW! "
                                             "DestroyPropertySheetPage");
        const auto made = spy.callsOf("CreatePropertySheetPageW").at(nth == 1 ? 1 : 0).result;
        EXPECT_EQ(spy.callsOf("DestroyPropertySheetPage").at(0).arguments.at(0), made);
    }
}

TEST_F(PropertiesFailures, ASheetThatDoesNotOpenChangesNothing) {
    spy.watch("PropertySheetW");
    spy.failNth("PropertySheetW", 1, static_cast<ULONG_PTR>(-1));
    EXPECT_EQ(notify(GN_PROPERTIES), 0);
    EXPECT_EQ(sent, Lines{});
}

TEST_F(PropertiesFailures, WithoutADcTheSheetStaysWhereItIs) {
    spy.watchAll({"GetDC", "MoveWindow"});
    spy.failAlways("GetDC");
    openSheet([](HWND sheet) { EXPECT_EQ(TextOf(sheet), L"Graph Properties"); });
    EXPECT_GT(spy.count("GetDC"), 0);
    EXPECT_EQ(spy.count("MoveWindow"), 0);
}

TEST_F(PropertiesFailures, ANotificationOfNothingAppliesNothing) {
    openSheet([](HWND sheet) {
        for (const int page : {kTitlesPage, kDataPage})
            EXPECT_EQ(SendMessageW(ShowPage(sheet, page), WM_NOTIFY, 0, 0), 0) << page;
    });
    EXPECT_EQ(sent, Lines{});
}

TEST_F(PropertiesFailures, AChartWithoutARecordShowsZerosAndTheFirstType) {
    KorGraph_SetRange(graph, KORGRAPH_X, 3, 4);
    openSheet([this](HWND sheet) {
        const LONG_PTR record = SetWindowLongPtrW(graph, GWLP_USERDATA, 0);
        const HWND page = ShowPage(sheet, kDataPage);
        for (const int edit : {kXMinEdit, kXMaxEdit, kYMinEdit, kYMaxEdit})
            EXPECT_EQ(TextIn(page, edit), L"0") << edit;
        EXPECT_EQ(Chosen(page, kTypeCombo), 0);
        EXPECT_EQ(Chosen(page, kZoomCombo), 3) << "no zoom is any of the first three";
        SetWindowLongPtrW(graph, GWLP_USERDATA, record);
    });
}

class GuardedProperties : public GuardedGraphTest {};

TEST_F(GuardedProperties, SurviveTheChart) {
    create();
    SheetDriver driver;
    driver.run([this] { notify(GN_PROPERTIES); },
               [this](HWND sheet) {
                   TypeInto(ShowPage(sheet, kTitlesPage), kTitleEdit, L"too late");
                   TypeInto(ShowPage(sheet, kDataPage), kXMaxEdit, L"20");
                   DestroyWindow(graph);
                   if (IsWindow(sheet)) PressOk(sheet);
               });
    EXPECT_TRUE(driver.wasUp());
    EXPECT_FALSE(IsWindow(graph));
}

}  // namespace
}  // namespace kortest

// WM_CREATE at a wrong time: a second one for a control that lives, and one without its data.
#include "support/recording_host.h"

#include <korcontrols/graph.h>
#include <korcontrols/header.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include <gtest/gtest.h>

namespace kortest {
namespace {

class CreationAgain : public ::testing::Test {
protected:
    HWND create(const wchar_t* className) {
        return CreateWindowExW(0, className, L"", WS_CHILD, 0, 0, 50, 50, host.window(), nullptr,
                               instance, nullptr);
    }

    LRESULT createAgain(HWND control) {
        CREATESTRUCTW creation = {};
        creation.hInstance = instance;
        creation.hwndParent = host.window();
        return SendMessageW(control, WM_CREATE, 0, reinterpret_cast<LPARAM>(&creation));
    }

    // What the procedure of a control answers for a window that has no record yet.
    LRESULT createWithoutData(HWND control) {
        const HWND window = create(L"STATIC");
        SetWindowLongPtrW(window, GWLP_WNDPROC, GetWindowLongPtrW(control, GWLP_WNDPROC));
        const LRESULT result = SendMessageW(window, WM_CREATE, 0, 0);
        DestroyWindow(window);
        return result;
    }

    HINSTANCE instance = GetModuleHandleW(nullptr);
    RecordingHost host;
};

TEST_F(CreationAgain, LeavesAChartItsRecord) {
    RegisterGraphControl(instance);
    const HWND chart = create(KORGRAPH_CLASS);
    const LONG_PTR record = GetWindowLongPtrW(chart, GWLP_USERDATA);
    ASSERT_NE(record, 0);
    EXPECT_EQ(createAgain(chart), 0);
    EXPECT_EQ(GetWindowLongPtrW(chart, GWLP_USERDATA), record);
    EXPECT_EQ(createWithoutData(chart), 1);
}

TEST_F(CreationAgain, LeavesATooltipAndALegendTheirRecords) {
    RegisterGraphControl(instance);
    const HWND chart = create(KORGRAPH_CLASS);
    const RECT place = {0, 0, 20, 20};
    SendMessageW(chart, GM_SHOWLEGEND, 0, reinterpret_cast<LPARAM>(&place));
    for (const HWND control :
         {GetDlgItem(host.window(), KORTOOLTIP_ID), GetDlgItem(chart, KORLEGEND_ID)}) {
        ASSERT_NE(control, nullptr);
        const LONG_PTR record = GetWindowLongPtrW(control, GWLP_USERDATA);
        ASSERT_NE(record, 0);
        EXPECT_EQ(createAgain(control), 0);
        EXPECT_EQ(GetWindowLongPtrW(control, GWLP_USERDATA), record);
        EXPECT_EQ(createWithoutData(control), 1);
    }
}

TEST_F(CreationAgain, IsRefusedByAStrip) {
    const HWND strip = host.createHeader(0, 100, 20);
    const HeaderItemDesc item = {const_cast<wchar_t*>(L"A"), 30};
    ASSERT_EQ(KorHeader_InsertItem(strip, 0, &item), 0);
    EXPECT_EQ(createAgain(strip), 1);
    EXPECT_EQ(KorHeader_GetItemCount(strip), 1);
    EXPECT_EQ(createWithoutData(strip), 1);
}

TEST_F(CreationAgain, WithoutItsDataMakesNoGrid) {
    const HWND grid = host.createGrid(200, 100);
    const HWND edit = GetHandleToEquationControl();
    EXPECT_EQ(SendMessageW(grid, WM_CREATE, 0, 0), 0);
    EXPECT_EQ(GetHandleToEquationControl(), edit);
}

}  // namespace
}  // namespace kortest

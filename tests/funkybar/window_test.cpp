// The bar's window: creation, destruction, default processing, more than one bar.
#include "funkybar/bar_fixture.h"

namespace kortest {
namespace {

TEST_F(BarTest, ExistsWithoutItems) {
    create();
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(current(), -1);
    EXPECT_EQ(KorFunkyBar_GetImageList(bar), nullptr);
    EXPECT_EQ(send(FBM_DELETEALL), 0);
    EXPECT_EQ(send(WM_CREATE), 0);
}

TEST_F(BarTest, MakesItsFontOfTheSystems) {
    LOGFONTW expected{};
    GetObjectW(GetStockObject(SYSTEM_FONT), sizeof expected, &expected);
    const HDC dc = GetDC(nullptr);
    expected.lfHeight = -10 * GetDeviceCaps(dc, LOGPIXELSY) / 72;
    ReleaseDC(nullptr, dc);
    expected.lfWeight = 700;
    std::vector<LOGFONTW> made;
    spy.watch("CreateFontIndirectW");
    spy.replace("CreateFontIndirectW", [&](ULONG_PTR* arguments) {
        made.push_back(*reinterpret_cast<const LOGFONTW*>(arguments[0]));
        return spy.callReal("CreateFontIndirectW", arguments);
    });
    create();
    ASSERT_EQ(made.size(), 1u);
    EXPECT_EQ(made[0].lfHeight, expected.lfHeight);
    EXPECT_EQ(made[0].lfWidth, expected.lfWidth);
    EXPECT_EQ(made[0].lfWeight, 700);
    EXPECT_EQ(made[0].lfItalic, expected.lfItalic);
    EXPECT_EQ(made[0].lfCharSet, expected.lfCharSet);
    EXPECT_EQ(made[0].lfPitchAndFamily, expected.lfPitchAndFamily);
    EXPECT_STREQ(made[0].lfFaceName, expected.lfFaceName);
}

TEST_F(BarTest, MeasuresInchesOnItsOwnDC) {
    spy.watchAll({"GetDC", "GetDeviceCaps", "CreateFontIndirectW"});
    LONG height = 0;
    spy.replace("GetDeviceCaps", [](ULONG_PTR* arguments) {
        return static_cast<int>(arguments[1]) == LOGPIXELSY ? ULONG_PTR{101} : ULONG_PTR{0};
    });
    spy.replace("CreateFontIndirectW", [&](ULONG_PTR* arguments) {
        height = reinterpret_cast<const LOGFONTW*>(arguments[0])->lfHeight;
        return spy.callReal("CreateFontIndirectW", arguments);
    });
    bar = createBar(host.window(), WS_CHILD, {0, 0, 50, 20});
    EXPECT_EQ(height, -14) << "1010 / 72, cut";
    ASSERT_FALSE(spy.callsOf("GetDC").empty());
    EXPECT_EQ(reinterpret_cast<HWND>(spy.callsOf("GetDC")[0].arguments[0]), bar);
}

TEST_F(BarTest, LoadsItsArrow) {
    spy.watch("ImageList_LoadImageW");
    bar = createBar(host.window(), WS_CHILD, {0, 0, 50, 20});
    const auto loads = spy.callsOf("ImageList_LoadImageW");
    ASSERT_EQ(loads.size(), 1u);
    const auto& arguments = loads[0].arguments;
    EXPECT_EQ(reinterpret_cast<HMODULE>(arguments[0]), LibraryModule());
    EXPECT_EQ(arguments[1], 107u);
    EXPECT_EQ(static_cast<DWORD>(arguments[2]), 13u);
    EXPECT_EQ(static_cast<DWORD>(arguments[3]), 1u);
    EXPECT_EQ(static_cast<DWORD>(arguments[4]), 0x808000u);
    EXPECT_EQ(static_cast<DWORD>(arguments[5]), UINT{IMAGE_BITMAP});
    EXPECT_EQ(static_cast<DWORD>(arguments[6]), 0u);
    const auto arrow = reinterpret_cast<HIMAGELIST>(loads[0].result);
    ASSERT_NE(arrow, nullptr);
    EXPECT_EQ(ImageList_GetImageCount(arrow), 1);
    int width = 0;
    int height = 0;
    EXPECT_TRUE(ImageList_GetIconSize(arrow, &width, &height));
    EXPECT_EQ(width, 13);
    EXPECT_EQ(height, 8);
}

TEST_F(BarTest, GivesBackWhatItMade) {
    WatchHandles(spy);
    spy.watchAll({"ImageList_LoadImageW", "ImageList_Destroy"});
    spy.clearCalls();
    bar = createBar(host.window(), WS_CHILD | WS_VISIBLE, {0, 0, 100, 24});
    insertAll({L"a", L"b"});
    UpdateWindow(bar);
    select(1);
    SIZE size{};
    measure(0, &size);
    DestroyWindow(bar);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
    const auto loads = spy.callsOf("ImageList_LoadImageW");
    const auto destroyed = spy.callsOf("ImageList_Destroy");
    ASSERT_EQ(loads.size(), 1u);
    ASSERT_EQ(destroyed.size(), 1u);
    EXPECT_EQ(destroyed[0].arguments[0], loads[0].result);
}

TEST_F(BarTest, NeverDestroysTheHostsImages) {
    create();
    const HIMAGELIST images = makeImages(8, 8, {RGB(255, 0, 0)});
    KorFunkyBar_SetImageList(bar, images);
    DestroyWindow(bar);
    EXPECT_EQ(ImageList_GetImageCount(images), 1);
    create();
    EXPECT_EQ(KorFunkyBar_GetImageList(bar), images) << "kept for the next bar";
}

TEST_F(BarTest, LeavesTheRestToDefaultProcessing) {
    create();
    spy.watch("DefWindowProcW");
    spy.clearCalls();
    const UINT others[] = {WM_SIZE,       WM_LBUTTONUP, WM_MOUSEMOVE,   WM_RBUTTONDOWN,
                           WM_ERASEBKGND, WM_SETTEXT,   WM_USER + 6049, WM_USER + 6059};
    for (const UINT message : others) send(message);
    ASSERT_EQ(spy.count("DefWindowProcW"), static_cast<int>(std::size(others)));
    const auto calls = spy.callsOf("DefWindowProcW");
    for (size_t i = 0; i < std::size(others); ++i)
        EXPECT_EQ(static_cast<UINT>(calls[i].arguments[1]), others[i]);
}

TEST_F(GuardedBarTest, AnswersAfterItsDestruction) {
    create();
    insert(L"a");
    send(WM_DESTROY);
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(current(), -1);
    EXPECT_EQ(select(0), 0);
    send(WM_DESTROY);
    EXPECT_EQ(insert(L"b"), 0);
    InvalidateRect(bar, nullptr, TRUE);
    UpdateWindow(bar);
    EXPECT_EQ(state(), "[b]");
}

TEST_F(GuardedBarTest, StartsEmptyAfterAnother) {
    create();
    insertAll({L"a", L"b"});
    DestroyWindow(bar);
    create();
    EXPECT_EQ(count(), 0);
    EXPECT_EQ(insert(L"c"), 0);
    EXPECT_EQ(state(), "[c]");
}

TEST_F(GuardedBarTest, SharesItsItemsWithASecondOne) {
    create();
    insertAll({L"a", L"b"});
    const HWND first = bar;
    spy.watchAll({"CreateFontIndirectW", "ImageList_LoadImageW"});
    spy.clearCalls();
    bar = createBar(host.window(), WS_CHILD | WS_VISIBLE, {0, 60, 100, 84}, 6);
    EXPECT_EQ(spy.count("CreateFontIndirectW"), 0) << "the font is there";
    EXPECT_EQ(spy.count("ImageList_LoadImageW"), 0);
    EXPECT_EQ(state(), "[a] b");
    select(1);
    EXPECT_EQ(told(), (Lines{"id 6/6 from bar code 256 index 1"}));
    DestroyWindow(bar);
    bar = first;
    EXPECT_EQ(count(), 0) << "the items went with the other one";
    insert(L"c");
    InvalidateRect(bar, nullptr, TRUE);
    UpdateWindow(bar);
    EXPECT_EQ(state(), "[c]");
}

}  // namespace
}  // namespace kortest

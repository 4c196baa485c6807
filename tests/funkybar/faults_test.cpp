// A whole life of a bar with each call of the platform failing in turn.
#include "funkybar/bar_fixture.h"

namespace kortest {
namespace {

class BarFaults : public GuardedBarTest, public ::testing::WithParamInterface<const char*> {
protected:
    BarFaults() { images = makeImages(10, 10, {RGB(255, 0, 0), RGB(0, 255, 0)}); }

    // A short life of a bar, whatever of it could be made.
    void live() {
        InitFunkyControl(GetModuleHandleW(nullptr));
        bar = createBar(host.window(), WS_CHILD | WS_VISIBLE, {0, 0, 160, 24});
        if (!bar) return;
        KorFunkyBar_SetImageList(bar, images);
        for (LONG i = 0; i < 4; ++i) {
            const FunkyBarItemDesc item = {FBIF_TEXT | FBIF_IMAGE | FBIF_COLOURS,
                                           i % 2 ? kAppend : 1,
                                           const_cast<wchar_t*>(L"item"),
                                           0,
                                           i,
                                           RGB(1, 2, 3),
                                           RGB(4, 5, 6),
                                           7};
            insert(item);
        }
        UpdateWindow(bar);
        for (LONG i = 0; i < 3; ++i) select(i);
        press();
        remove(2);
        remove(0);
        UpdateWindow(bar);
        send(FBM_DELETEALL);
        insert(L"last");
        DestroyWindow(bar);
        host.pump();
    }

    BOOL useMenu() {
        Canvas canvas(80, 20, 0);
        for (const MenuEntry& entry : std::vector<MenuEntry>(entries)) {
            SIZE size{};
            measure(entry.data, &size);
            draw(canvas.dc(), {0, 0, 80, 20}, entry.data, ODS_SELECTED);
        }
        return 2;
    }

    // Whether the call that was to fail was made.
    bool failOnce(const std::string& name, int nth) {
        spy.clearCalls();
        spy.failNth(name, nth);
        live();
        if (IsWindow(bar)) DestroyWindow(bar);
        spy.stopFailing(name);
        for (const auto& call : spy.callsOf(name))
            if (call.failed) return true;
        return false;
    }

    HIMAGELIST images = nullptr;
};

TEST_P(BarFaults, AreSurvivedOneByOne) {
    const std::string name = GetParam();
    replaceMenu([this] { return useMenu(); });
    live();
    EXPECT_LE(heap->live(), 4) << "the texts of single deletions: " << heap->liveReport();
    const int left = heap->live();
    ASSERT_TRUE(spy.watch(name));
    int failures = 0;
    for (int nth = 1; nth <= 500; ++nth) {
        const int before = heap->live();
        if (!failOnce(name, nth)) break;
        ++failures;
        ASSERT_EQ(heap->report(), "") << name << " " << nth;
        EXPECT_LE(heap->live(), before + left) << name << " " << nth << heap->liveReport();
    }
    EXPECT_GT(failures, 0) << name << " was never called";
    create();
    insertAll({L"a", L"b"});
    select(1);
    EXPECT_EQ(state(), "a [b]") << "the next bar is whole";
    EXPECT_EQ(repaints(), "invalidate+erase invalidate+erase update");
}

std::string NameOf(const ::testing::TestParamInfo<const char*>& info) { return info.param; }

INSTANTIATE_TEST_SUITE_P(
    Imports, BarFaults,
    ::testing::Values("AppendMenuW", "BeginPaint", "CreateFontIndirectW", "CreatePopupMenu",
                      "DestroyMenu", "DrawTextW", "FillRect", "GetClientRect", "GetDC",
                      "GetDeviceCaps", "GetObjectW", "GetParent", "GetStockObject",
                      "GetSysColorBrush", "GetTextExtentExPointW", "GetWindowLongW",
                      "GetWindowRect", "ImageList_Draw", "ImageList_GetImageInfo",
                      "ImageList_LoadImageW", "InvalidateRect", "LocalAlloc", "RegisterClassW",
                      "SelectObject", "SendMessageW", "SetBkColor", "SetBkMode", "SetTextColor",
                      "TrackPopupMenuEx", "UpdateWindow"),
    NameOf);

}  // namespace
}  // namespace kortest

// A drag ends when the strip loses the capture, and when it goes itself.
#include "header_fixture.h"

#include "support/message_hook.h"

namespace kortest {
namespace {

// Two strips of items of 60 pixels.
class HeaderCapture : public HeaderTest {
protected:
    HeaderCapture() {
        AppendSizes(header, {60, 60, 60});
        AppendSizes(other, {60, 60, 60});
        posted();
    }
    ~HeaderCapture() override { ReleaseCapture(); }

    const std::vector<int> untouched = {60, 60, 60};
    HWND header = createHorizontal();
    HWND other = createHorizontal();
};

TEST_F(HeaderCapture, LostEndsAPress) {
    PressAt(header, 30, 5);
    SetCapture(host->window());
    posted();
    MoveTo(header, 90, 5);
    MoveTo(other, 90, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderCapture, LostEndsABorderDragWithTheSizeThatItReached) {
    PressAt(header, 60, 5);
    MoveTo(header, 75, 5);
    posted();
    ReleaseCapture();
    EXPECT_EQ(posted(), Lines{}) << "nobody has let the border go";
    MoveTo(header, 100, 5);
    ReleaseAt(header, 100, 5);
    EXPECT_EQ(posted(), Lines{});
    EXPECT_EQ(SizesOf(header), (std::vector<int>{75, 60, 60}));
}

TEST_F(HeaderCapture, LostOrLetGoLeavesNothingForAnotherRelease) {
    PressAt(header, 60, 5);
    MoveTo(header, 75, 5);
    ReleaseAt(header, 75, 5);
    posted();
    SetCapture(host->window());
    ReleaseAt(header, 75, 5);
    EXPECT_EQ(GetCapture(), host->window()) << "it is not the strip's any more";
    PressAt(header, 75, 5);
    SetCapture(host->window());
    posted();
    ReleaseAt(header, 75, 5);
    EXPECT_EQ(GetCapture(), host->window());
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderCapture, IsLostToACancelledMode) {
    PressAt(header, 60, 5);
    SendMessageW(header, WM_CANCELMODE, 0, 0);
    EXPECT_EQ(GetCapture(), nullptr);
    MoveTo(header, 100, 5);
    EXPECT_EQ(SizesOf(header), untouched);
}

TEST_F(HeaderCapture, OfAnotherStripIsItsOwn) {
    PressAt(header, 60, 5);
    PressAt(other, 60, 5);
    MoveTo(other, 80, 5);
    EXPECT_EQ(SizesOf(other), (std::vector<int>{80, 60, 60}));
    EXPECT_EQ(SizesOf(header), untouched);
}

TEST_F(HeaderCapture, TakenAgainByTheSameStripGoesOn) {
    PressAt(header, 60, 5);
    SendMessageW(header, WM_CAPTURECHANGED, 0, reinterpret_cast<LPARAM>(header));
    MoveTo(header, 80, 5);
    EXPECT_EQ(SizesOf(header), (std::vector<int>{80, 60, 60}));
}

TEST_F(HeaderCapture, GoesWithTheStripInTheMiddleOfABorderDrag) {
    PressAt(header, 60, 5);
    DestroyWindow(header);
    MoveTo(other, 120, 5);
    EXPECT_EQ(SizesOf(other), untouched);
}

TEST_F(HeaderCapture, GoesWithTheStripInTheMiddleOfAPress) {
    PressAt(header, 30, 5);
    posted();
    DestroyWindow(header);
    MoveTo(other, 90, 5);
    EXPECT_EQ(posted(), Lines{});
}

// ---- The strip goes inside a message of its own making ---------------------------------------

TEST_F(HeaderCapture, PressEndsWhenWhoHadTheCaptureDestroysTheStrip) {
    const HWND loser = createHorizontal();
    MessageHook hook(loser);
    hook.before(WM_CAPTURECHANGED, [&](WPARAM, LPARAM) { DestroyWindow(header); });
    SetCapture(loser);
    posted();
    PressAt(header, 30, 5);
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(posted(), Lines{});
    MoveTo(other, 90, 5);
    EXPECT_EQ(posted(), Lines{});
    EXPECT_EQ(heap.report(), "");
}

TEST_F(HeaderCapture, ReleaseEndsWhenTheStripIsDestroyedForTheLossOfItsCapture) {
    MessageHook hook(header);
    PressAt(header, 60, 5);
    MoveTo(header, 70, 5);
    posted();
    hook.before(WM_CAPTURECHANGED, [&](WPARAM, LPARAM) { DestroyWindow(header); });
    ReleaseAt(header, 70, 5);
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(posted(), Lines{});
    EXPECT_EQ(heap.report(), "");
}

TEST_F(HeaderCapture, PaintEndsWhenTheStripIsDestroyedForItsErasing) {
    MessageHook hook(header);
    InvalidateRect(header, nullptr, TRUE);
    hook.before(WM_ERASEBKGND, [&](WPARAM, LPARAM) { DestroyWindow(header); });
    UpdateWindow(header);
    EXPECT_TRUE(hook.hasActed());
    EXPECT_EQ(heap.report(), "");
}

}  // namespace
}  // namespace kortest

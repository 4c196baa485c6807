// The size bound before any strip was sized. Every strip is sized when it is created, so these
// strips are kept from hearing of it.
#include "header_fixture.h"
#include "wrapped_header.h"

namespace kortest {
namespace {

LRESULT IgnoreSize(HWND window, UINT message, WPARAM wParam, LPARAM lParam, const PassOn& passOn) {
    if (message == WM_SIZE) return 0;
    return passOn(window, message, wParam, lParam);
}

bool IsHeaderClass(ULONG_PTR className) {
    return className > 0xFFFF &&
           lstrcmpiW(reinterpret_cast<const wchar_t*>(className), KORHEADER_CLASS) == 0;
}

class HeaderBoundAtLoad : public ::testing::Test {
protected:
    // Lets a grid register the strip's class without creating a strip.
    HeaderBoundAtLoad() {
        spy.watch("CreateWindowExW");
        spy.replace("CreateWindowExW", [this](ULONG_PTR* arguments) -> ULONG_PTR {
            if (IsHeaderClass(arguments[1])) return 0;
            return spy.callReal("CreateWindowExW", arguments);
        });
        DestroyWindow(host.createGrid(100, 100));
        host.leaveOut(GRIDN_PAINTCELLS);
        host.clear();
    }

    ImportSpy spy;
    RecordingHost host{1000, 1000};
};

TEST_F(HeaderBoundAtLoad, Is600ForColumns) {
    HWND header = CreateWrappedHeader(host.window(), 0, 900, 16, IgnoreSize);
    AppendSizes(header, {60});
    PressAt(header, 58, 3);
    MoveTo(header, 597, 3);
    EXPECT_EQ(SizesOf(header), std::vector<int>{599});
    MoveTo(header, 800, 3);
    EXPECT_EQ(SizesOf(header), std::vector<int>{600});
    ReleaseAt(header, 800, 3);
}

TEST_F(HeaderBoundAtLoad, Is600ForRows) {
    HWND header = CreateWrappedHeader(host.window(), HCS_VERTICAL, 30, 900, IgnoreSize);
    AppendSizes(header, {60});
    PressAt(header, 3, 58);
    MoveTo(header, 3, 800);
    EXPECT_EQ(SizesOf(header), std::vector<int>{600});
    ReleaseAt(header, 3, 800);
}

}  // namespace
}  // namespace kortest

// Where a window keeps its record.
#include "graph/graph_fixture.h"

#include <algorithm>
#include <cstring>
#include <iterator>

namespace kortest {
namespace {

class GraphRecordInWindow : public GraphTest {
protected:
    // A field of the record, at its offset on systems of 32 bits.
    template <typename Value>
    Value field(size_t offset) const {
        Value value{};
        const auto* record = reinterpret_cast<const char*>(GetWindowLongPtrW(graph, GWLP_USERDATA));
        std::memcpy(&value, record + offset, sizeof value);
        return value;
    }
};

TEST_F(GraphRecordInWindow, IsInTheUserData) {
    create();
    EXPECT_NE(GetWindowLongPtrW(graph, GWLP_USERDATA), 0);
}

TEST_F(GraphRecordInWindow, HasItsFieldsInPlaceWith32Bits) {
    if constexpr (sizeof(void*) != 4) GTEST_SKIP() << "pointers of this build have 64 bits";
    create(101, 90);
    add({1, 2, 3});
    KorGraph_SetType(graph, KORGRAPH_COLUMN);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    const HWND legend = showLegend({5, 5, 60, 60});
    EXPECT_EQ(field<HWND>(0), host.window());
    EXPECT_EQ(field<HINSTANCE>(4), GetModuleHandleW(nullptr));
    EXPECT_EQ(field<HWND>(8), graph);
    EXPECT_EQ(field<HWND>(12), tip);
    EXPECT_EQ(field<HWND>(16), legend);
    EXPECT_EQ(field<HDC>(20), imageDC);
    EXPECT_EQ(field<HBITMAP>(24), GetCurrentObject(imageDC, OBJ_BITMAP));
    EXPECT_EQ(field<int>(36), 1);
    EXPECT_EQ(field<int>(96), KORGRAPH_COLUMN);
    EXPECT_EQ(field<RECT>(104), (RECT{0, 0, 101, 90}));
    EXPECT_EQ(field<DWORD>(120), kAllOptions);
    EXPECT_EQ(field<COLORREF>(128), RGB(255, 255, 255));
    EXPECT_EQ(field<double>(144), 4.0) << "xDataMax";
    EXPECT_EQ(field<double>(176), 4.0) << "xMax";
    EXPECT_EQ(field<double>(208), 2.0) << "zoom";
    EXPECT_EQ(field<int>(224), 15) << "marginRight";
}

TEST_F(GraphRecordInWindow, SharesOneFontButForTheTurnedOne) {
    if constexpr (sizeof(void*) != 4) GTEST_SKIP() << "pointers of this build have 64 bits";
    create();
    const auto upright = field<HFONT>(76);
    EXPECT_NE(upright, nullptr);
    EXPECT_EQ(field<HFONT>(80), upright);
    EXPECT_NE(field<HFONT>(84), upright);
    EXPECT_EQ(field<HFONT>(88), upright);
    EXPECT_EQ(field<HFONT>(92), upright);
    LOGFONTW font{};
    GetObjectW(field<HFONT>(84), sizeof font, &font);
    EXPECT_EQ(font.lfEscapement, 900);
}

// The host destroyed the legend, and what has its handle now is a window of its own.
TEST_F(GraphRecordInWindow, OfALegendThatBecameAnotherWindowChangesNothing) {
    constexpr size_t kPlaceOfLegend = 4 * sizeof(void*);
    create();
    const HWND legend = showLegend({5, 5, 60, 60});
    WNDCLASSW another = {};
    another.lpfnWndProc = DefWindowProcW;
    another.lpszClassName = L"Another window";
    ASSERT_NE(RegisterClassW(&another), 0);
    const HWND reused = CreateWindowExW(0, another.lpszClassName, L"", WS_CHILD, 0, 0, 9, 9,
                                        host.window(), nullptr, nullptr, nullptr);
    ASSERT_NE(reused, nullptr);
    LONG_PTR own[16];
    std::fill(std::begin(own), std::end(own), 1234);
    SetWindowLongPtrW(reused, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(own));
    ASSERT_EQ(field<HWND>(kPlaceOfLegend), legend);
    auto* record = reinterpret_cast<char*>(GetWindowLongPtrW(graph, GWLP_USERDATA));
    std::memcpy(record + kPlaceOfLegend, &reused, sizeof reused);
    destroy();
    for (const LONG_PTR value : own) EXPECT_EQ(value, 1234);
    DestroyWindow(reused);
}

}  // namespace
}  // namespace kortest

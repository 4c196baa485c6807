// What the tooltip shows, compared with the same picture drawn by the test.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class ToolTipPicture : public GraphTest {
protected:
    ToolTipPicture() { create(60, 40); }

    void show(const std::wstring& text) {
        const ToolTipRequest request = {text.c_str(), 0, 290, 30000};
        SendMessageW(tip, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request));
        UpdateWindow(tip);
    }

    // A black frame around white, and the text three pixels inside.
    Picture expected(const std::wstring& text) const {
        const RECT client = ClientOf(tip);
        Canvas canvas(static_cast<int>(client.right), static_cast<int>(client.bottom),
                      RGB(1, 2, 3));
        SelectObject(canvas.dc(), GetStockObject(BLACK_PEN));
        Rectangle(canvas.dc(), 0, 0, client.right, client.bottom);
        RECT inside = {3, 3, client.right - 3, client.bottom - 3};
        DrawTextW(canvas.dc(), text.c_str(), -1, &inside, 0);
        return canvas.picture();
    }

    void expectShown(const std::wstring& text) {
        EXPECT_TRUE(SamePicture(expected(text), ReadWindow(tip)));
    }
};

TEST_F(ToolTipPicture, IsAFramedText) {
    show(L"Value:12.5");
    expectShown(L"Value:12.5");
}

TEST_F(ToolTipPicture, HasTwoLines) {
    show(L"25%\r\nValue:1");
    expectShown(L"25%\r\nValue:1");
}

TEST_F(ToolTipPicture, ShowsNothingOfTheTextOfBefore) {
    show(L"Value:123456789");
    show(L"Value:1");
    expectShown(L"Value:1");
}

// Lines of 19 letters and a break.
std::wstring TextOfLength(size_t length) {
    std::wstring text;
    while (text.size() < length) text += L"abcdefghijklmnopqrs\n";
    text.resize(length);
    return text;
}

TEST_F(ToolTipPicture, Of128CharactersIsWhole) {
    const std::wstring text = TextOfLength(128);
    show(text);
    expectShown(text);
    EXPECT_FALSE(expected(text) == expected(text.substr(0, 127))) << "the last one can be seen";
}

TEST_F(ToolTipPicture, Of129CharactersIsCutTo127) {
    show(TextOfLength(129));
    expectShown(TextOfLength(127));
    EXPECT_FALSE(expected(TextOfLength(127)) == expected(TextOfLength(128)));
}

TEST_F(ToolTipPicture, Of200CharactersIsCutTo127) {
    show(TextOfLength(200));
    expectShown(TextOfLength(127));
}

TEST_F(ToolTipPicture, IsPaintedIntoAGivenDC) {
    show(L"Value:12.5");
    const Picture whole = expected(L"Value:12.5");
    Canvas canvas(whole.width() + 10, whole.height() + 10, RGB(9, 9, 9));
    SendMessageW(tip, WM_PAINT, reinterpret_cast<WPARAM>(canvas.dc()), 0);
    EXPECT_TRUE(SamePicture(whole, canvas.picture().part(whole.area())));
    EXPECT_EQ(canvas.picture().pixel(whole.width(), 5), RGB(9, 9, 9));
}

TEST_F(ToolTipPicture, StaysInTheWindowWhenADCIsGiven) {
    show(L"Value:12.5");
    Canvas canvas(100, 40, RGB(9, 9, 9));
    const HDC own = GetDC(tip);
    for (const HDC given : {canvas.dc(), own}) {
        InvalidateRect(tip, nullptr, TRUE);
        SendMessageW(tip, WM_PAINT, reinterpret_cast<WPARAM>(given), 0);
        EXPECT_FALSE(GetUpdateRect(tip, nullptr, FALSE));
        expectShown(L"Value:12.5");
    }
    ReleaseDC(tip, own);
}

TEST_F(ToolTipPicture, PaintingReachesDefaultProcessingAndValidates) {
    show(L"Value:12.5");
    InvalidateRect(tip, nullptr, FALSE);
    spy.watch("DefWindowProcW");
    UpdateWindow(tip);
    bool found = false;
    for (const auto& call : spy.callsOf("DefWindowProcW")) found |= NumberAt(call, 1) == WM_PAINT;
    EXPECT_TRUE(found);
    EXPECT_FALSE(GetUpdateRect(tip, nullptr, FALSE));
}

class ToolTipText : public GuardedGraphTest {};

TEST_F(ToolTipText, OfAnyLengthStaysInItsBuffer) {
    create();
    for (const size_t length : {0u, 1u, 126u, 127u, 128u, 129u, 130u, 1000u, 100000u}) {
        const std::wstring text(length, L'i');
        const ToolTipRequest request = {text.c_str(), 0, 290, 30000};
        SendMessageW(tip, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request));
        UpdateWindow(tip);
        EXPECT_EQ(heap->report(), "") << length;
    }
}

}  // namespace
}  // namespace kortest

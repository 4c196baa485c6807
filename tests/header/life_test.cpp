// Creation, destruction and the drawing objects that all strips share.
#include "header_fixture.h"
#include "wrapped_header.h"

#include "support/handle_balance.h"
#include "support/pixels.h"

#include <algorithm>

namespace kortest {
namespace {

using Labels = std::vector<std::wstring>;

class HeaderLife : public HeaderTest {
protected:
    int countCalls(const std::string& name, ULONG_PTR firstArgument) {
        const auto calls = spy.callsOf(name);
        return static_cast<int>(
            std::count_if(calls.begin(), calls.end(), [&](const ImportCall& call) {
                return call.arguments[0] == firstArgument;
            }));
    }
};

TEST_F(HeaderLife, GivesBackEverything) {
    WatchHandles(spy);
    spy.clearCalls();
    HWND header = createHorizontal();
    AppendSizes(header, std::vector<int>(40, 20));
    KorHeader_SetItemState(header, 1, HIS_SELECTED | HIS_FRAMED);
    SetItem(header, 2, L"other", 30);
    KorHeader_DeleteItem(header, 3);
    for (int i = 0; i < 3; ++i) Repaint(header);
    ClickAt(header, 30, 5);
    ClickAt(header, 20, 5);
    DestroyWindow(header);
    EXPECT_GE(spy.count("GetDC"), 1);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
}

TEST_F(HeaderLife, FreesItsItemsWithTheWindow) {
    HWND header = createHorizontal();
    const int empty = heap.live();
    EXPECT_EQ(empty, 4);  // the record and its three arrays
    AppendSizes(header, {20, 20, 20});
    EXPECT_EQ(heap.live(), empty + 3);
    KorHeader_DeleteItem(header, 1);
    EXPECT_EQ(heap.live(), empty + 2);
    SetItem(header, 0, L"replaced", 20);
    EXPECT_EQ(heap.live(), empty + 2);
    DestroyWindow(header);
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
}

TEST_F(HeaderLife, FreesTheSpareLabelToo) {
    HWND header = createHorizontal();
    AppendSizes(header, {20, 20});
    SetItem(header, 2, L"spare", 20);
    DestroyWindow(header);
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
}

TEST_F(HeaderLife, FreesLabelsBehindAGap) {
    HWND header = createHorizontal();
    AppendItem(header, L"A", 20);
    InsertItem(header, 6, L"B", 20);
    InsertItem(header, 10, L"C", 20);
    DestroyWindow(header);
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
}

TEST_F(HeaderLife, StartsWithTenPlacesOfEachArray) {
    spy.clearCalls();
    createHorizontal();
    std::vector<ULONG_PTR> sizes;
    for (const ImportCall& call : spy.callsOf("LocalAlloc")) {
        EXPECT_TRUE(call.arguments[0] & LMEM_ZEROINIT);
        sizes.push_back(call.arguments[1]);
    }
    ASSERT_EQ(sizes.size(), 4u);
    // Labels, sizes and states of ten items, perhaps with a spare entry.
    EXPECT_GE(sizes[1], 10 * sizeof(wchar_t*));
    EXPECT_GE(sizes[2], 10 * sizeof(WORD));
    EXPECT_GE(sizes[3], 10u);
}

TEST_F(HeaderLife, SharesOnePenAndBrush) {
    spy.watchAll({"CreatePen", "CreateSolidBrush", "GetSysColor"});
    spy.clearCalls();
    createHorizontal();
    createVertical();
    createHorizontal();
    const auto pens = spy.callsOf("CreatePen");
    ASSERT_EQ(pens.size(), 1u);
    EXPECT_EQ(static_cast<int>(pens[0].arguments[0]), PS_SOLID);
    EXPECT_EQ(static_cast<int>(pens[0].arguments[1]), 1);
    EXPECT_EQ(static_cast<COLORREF>(pens[0].arguments[2]), RGB(128, 128, 128));
    const auto brushes = spy.callsOf("CreateSolidBrush");
    ASSERT_EQ(brushes.size(), 1u);
    EXPECT_EQ(static_cast<COLORREF>(brushes[0].arguments[0]), GetSysColor(COLOR_BTNFACE));
}

TEST_F(HeaderLife, DeletesPenAndBrushWithTheLastStrip) {
    spy.watchAll({"CreatePen", "CreateSolidBrush", "DeleteObject"});
    spy.clearCalls();
    HWND first = createHorizontal();
    HWND second = createVertical();
    const ULONG_PTR pen = spy.callsOf("CreatePen")[0].result;
    const ULONG_PTR brush = spy.callsOf("CreateSolidBrush")[0].result;
    DestroyWindow(first);
    EXPECT_EQ(countCalls("DeleteObject", pen), 0);
    EXPECT_EQ(countCalls("DeleteObject", brush), 0);
    DestroyWindow(second);
    EXPECT_EQ(countCalls("DeleteObject", pen), 1);
    EXPECT_EQ(countCalls("DeleteObject", brush), 1);
    EXPECT_EQ(GetObjectType(reinterpret_cast<HGDIOBJ>(pen)), 0u);

    createHorizontal();
    EXPECT_EQ(spy.count("CreatePen"), 2);
    EXPECT_EQ(spy.count("CreateSolidBrush"), 2);
}

TEST_F(HeaderLife, TakesItsDrawingContextOnce) {
    spy.watchAll({"GetDC", "ReleaseDC"});
    spy.clearCalls();
    HWND header = createHorizontal();
    AppendSizes(header, {60, 60});
    Repaint(header);
    ASSERT_EQ(spy.sequence().find("ReleaseDC"), std::string::npos);
    const auto got = spy.callsOf("GetDC");
    ASSERT_EQ(got.size(), 1u);
    EXPECT_EQ(got[0].arguments[0], reinterpret_cast<ULONG_PTR>(header));
    DestroyWindow(header);
    const auto released = spy.callsOf("ReleaseDC");
    ASSERT_EQ(released.size(), 1u);
    EXPECT_EQ(released[0].arguments[0], reinterpret_cast<ULONG_PTR>(header));
    EXPECT_EQ(released[0].arguments[1], got[0].result);
}

// Each order of destruction unlinks other places of the list of strips.
TEST_F(HeaderLife, LeavesTheOtherStripsAloneInAnyOrder) {
    const int orders[][3] = {{0, 1, 2}, {0, 2, 1}, {1, 0, 2}, {1, 2, 0}, {2, 0, 1}, {2, 1, 0}};
    for (const auto& order : orders) {
        HWND strips[3] = {createHorizontal(), createHorizontal(), createHorizontal()};
        const wchar_t* const labels[3] = {L"first", L"second", L"third"};
        for (int i = 0; i < 3; ++i) AppendItem(strips[i], labels[i], 50);
        for (int step = 0; step < 3; ++step) {
            DestroyWindow(strips[order[step]]);
            for (int left = step + 1; left < 3; ++left) {
                EXPECT_EQ(LabelsOf(strips[order[left]]), Labels{labels[order[left]]});
                Repaint(strips[order[left]]);
            }
        }
        HWND later = createHorizontal();
        AppendItem(later, L"later", 50);
        EXPECT_EQ(LabelsOf(later), Labels{L"later"});
        DestroyWindow(later);
    }
}

TEST_F(HeaderLife, AnswersItsMessages) {
    std::vector<std::pair<UINT, LRESULT>> results;
    HWND header = CreateWrappedHeader(
        host->window(), 0, 400, 16,
        [&](HWND window, UINT message, WPARAM wParam, LPARAM lParam, const PassOn& passOn) {
            const LRESULT result = passOn(window, message, wParam, lParam);
            if (message == WM_CREATE || message == WM_PAINT || message == WM_DESTROY) {
                results.emplace_back(message, result);
            }
            return result;
        });
    UpdateWindow(header);
    EXPECT_FALSE(GetUpdateRect(header, nullptr, FALSE));
    DestroyWindow(header);
    EXPECT_EQ(results, (std::vector<std::pair<UINT, LRESULT>>{
                           {WM_CREATE, 0}, {WM_PAINT, 0}, {WM_DESTROY, 0}}));
}

TEST_F(HeaderLife, LeavesOtherMessagesToTheSystem) {
    HWND header = createHorizontal();
    EXPECT_TRUE(SetWindowTextW(header, L"a text"));
    EXPECT_EQ(TextOf(header), L"a text");
    EXPECT_EQ(SendMessageW(header, WM_USER, 0, 0), 0);
    EXPECT_EQ(SendMessageW(header, WM_USER + 8, 0, 0), 0);
    EXPECT_EQ(KorHeader_GetItemCount(header), 0);
}

// Calls each item message on the window procedure and checks the results of a strip without a
// record.
void ExpectNoRecord(HWND window, const PassOn& passOn) {
    HeaderItemDesc item{const_cast<LPWSTR>(L"untouched"), 7};
    const auto pointer = reinterpret_cast<LPARAM>(&item);
    EXPECT_EQ(passOn(window, HCM_INSERTITEM, 0, pointer), -1);
    EXPECT_EQ(passOn(window, HCM_DELETEITEM, 0, 0), 0);
    EXPECT_EQ(passOn(window, HCM_SETITEM, 0, pointer), 0);
    EXPECT_EQ(passOn(window, HCM_SETITEMSTATE, 0, HIS_SELECTED), 0);
    EXPECT_EQ(passOn(window, HCM_SETITEMSTATE, 0, 0), 0);
    EXPECT_EQ(passOn(window, HCM_GETITEMCOUNT, 0, 0), -1);
    EXPECT_EQ(passOn(window, HCM_GETITEM, 0, pointer), 0);
    EXPECT_EQ(passOn(window, HCM_GETITEMSIZE, 0, 0), -1);
    EXPECT_STREQ(item.text, L"untouched");
    EXPECT_EQ(item.size, 7);
    EXPECT_EQ(passOn(window, WM_PAINT, 0, 0), 1);
    EXPECT_EQ(passOn(window, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(30, 3)), 1);
    EXPECT_EQ(passOn(window, WM_MOUSEMOVE, MK_LBUTTON, MAKELPARAM(31, 3)), 1);
    EXPECT_EQ(passOn(window, WM_LBUTTONUP, 0, MAKELPARAM(31, 3)), 1);
    EXPECT_NE(GetCapture(), window);
}

LRESULT SendToWindow(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    return SendMessageW(window, message, wParam, lParam);
}

TEST_F(HeaderLife, HasNoRecordBeforeCreationAndAfterDestruction) {
    int checks = 0;
    HWND header = CreateWrappedHeader(
        host->window(), 0, 400, 16,
        [&](HWND window, UINT message, WPARAM wParam, LPARAM lParam, const PassOn& passOn) {
            if (message == WM_NCCREATE || message == WM_NCDESTROY) {
                ExpectNoRecord(window, passOn);
                ++checks;
            }
            return passOn(window, message, wParam, lParam);
        });
    ASSERT_NE(header, nullptr);
    EXPECT_EQ(KorHeader_GetItemCount(header), 0);
    DestroyWindow(header);
    EXPECT_EQ(checks, 2);
}

class HeaderWithoutMemory : public HeaderTest {
protected:
    HWND createFailingAt(int allocation) {
        spy.failNth("LocalAlloc", allocation, 0, ERROR_NOT_ENOUGH_MEMORY);
        HWND header = createHorizontal();
        spy.stopFailing("LocalAlloc");
        return header;
    }
};

TEST_F(HeaderWithoutMemory, ExistsAndAnswersWithFailures) {
    for (int allocation = 1; allocation <= 4; ++allocation) {
        HWND header = createFailingAt(allocation);
        ASSERT_TRUE(IsWindow(header)) << allocation;
        ExpectNoRecord(header, SendToWindow);
        EXPECT_EQ(posted(), Lines{});
        EXPECT_EQ(heap.live(), 0) << allocation << "\n" << heap.liveReport();
        DestroyWindow(header);
    }
}

TEST_F(HeaderWithoutMemory, LeavesOtherMessagesToTheSystem) {
    HWND header = createFailingAt(1);
    EXPECT_TRUE(SetWindowTextW(header, L"a text"));
    EXPECT_EQ(TextOf(header), L"a text");
}

TEST_F(HeaderWithoutMemory, ReturnsOneFromCreation) {
    LRESULT result = 0;
    spy.failNth("LocalAlloc", 1);
    HWND header = CreateWrappedHeader(
        host->window(), 0, 400, 16,
        [&](HWND window, UINT message, WPARAM wParam, LPARAM lParam, const PassOn& passOn) {
            const LRESULT got = passOn(window, message, wParam, lParam);
            if (message == WM_CREATE) result = got;
            return got;
        });
    EXPECT_TRUE(IsWindow(header));
    EXPECT_EQ(result, 1);
}

TEST_F(HeaderWithoutMemory, LosesNoHandle) {
    WatchHandles(spy);
    spy.clearCalls();
    for (int allocation = 1; allocation <= 4; ++allocation) {
        HWND failed = createFailingAt(allocation);
        HWND whole = createHorizontal();
        AppendSizes(whole, {60});
        DestroyWindow(failed);
        Repaint(whole);  // pen and brush are still there
        EXPECT_EQ(ReadWindow(whole).pixel(59, 8), RGB(128, 128, 128));
        EXPECT_EQ(ReadWindow(whole).pixel(30, 14), GetSysColor(COLOR_BTNFACE));
        DestroyWindow(whole);
    }
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

TEST_F(HeaderWithoutMemory, DoesNotDisturbTheOthers) {
    HWND whole = createHorizontal();
    AppendItem(whole, L"A", 60);
    HWND failed = createFailingAt(3);
    EXPECT_EQ(LabelsOf(whole), Labels{L"A"});
    HWND later = createHorizontal();
    AppendItem(later, L"B", 60);
    DestroyWindow(whole);
    EXPECT_EQ(LabelsOf(later), Labels{L"B"});
    DestroyWindow(failed);
    EXPECT_EQ(LabelsOf(later), Labels{L"B"});
}

TEST_F(HeaderWithoutMemory, ComesBackAfterMissingPenAndBrush) {
    spy.watchAll({"CreatePen", "CreateSolidBrush"});
    spy.failNth("CreatePen", 1);
    spy.failNth("CreateSolidBrush", 1);
    HWND first = createHorizontal();
    AppendSizes(first, {60});
    Repaint(first);
    EXPECT_EQ(KorHeader_GetItemCount(first), 1);
    createHorizontal();  // makes what is missing
    Repaint(first);
    EXPECT_EQ(ReadWindow(first).pixel(59, 8), RGB(128, 128, 128));
}

}  // namespace
}  // namespace kortest

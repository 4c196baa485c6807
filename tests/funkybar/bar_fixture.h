// What every test of the function bar needs: a host, a bar in it, senders and readers.
//
//   TEST_F(BarTest, AppendsInOrder) {
//       create();
//       insertAll({L"a", L"b"});
//       EXPECT_EQ(texts(), "a b");
//   }
#pragma once

#include <korcontrols/funkybar.h>

#include "support/guard_heap.h"
#include "support/handle_balance.h"
#include "support/import_spy.h"
#include "support/input.h"
#include "support/pixels.h"
#include "support/recording_host.h"

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace kortest {

constexpr int kBarId = 5;
constexpr LONG kAppend = KORFUNKYBAR_APPEND;

// An entry of the menu, as it was handed to AppendMenuW.
struct MenuEntry {
    UINT flags;
    UINT_PTR command;
    ULONG_PTR data;
};

class BarTest : public ::testing::Test {
protected:
    enum class Heap { kOrdinary, kGuarded };

    explicit BarTest(Heap kind = Heap::kOrdinary);
    ~BarTest() override;

    // A visible bar at 10, 20 in the host, painted once.
    void create(int width = 200, int height = 24);
    HWND createBar(HWND parent, DWORD style, const RECT& place, int id = kBarId);

    // Lets everything paint and forgets what was recorded.
    void settle();

    LRESULT send(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const;
    LRESULT select(LONG index) const { return send(FBM_SETCURSEL, static_cast<WPARAM>(index)); }
    void remove(LONG index) const { KorFunkyBar_DeleteItem(bar, index); }
    LONG current() const { return KorFunkyBar_GetCurrent(bar); }
    LONG count() const { return KorFunkyBar_GetCount(bar); }

    // A description with a text and nothing else; the text outlives the call that uses it.
    static FunkyBarItemDesc described(const wchar_t* text, LONG index = kAppend);
    LONG insert(const FunkyBarItemDesc& item) const { return KorFunkyBar_InsertItem(bar, &item); }
    LONG insert(const wchar_t* text, LONG index = kAppend) const {
        return insert(described(text, index));
    }
    void insertAll(const std::vector<const wchar_t*>& all) const;

    std::wstring textOf(LONG index) const;  // L"?" for a bad index
    std::string texts() const;              // of all items, a blank between two
    std::string state() const;              // the same with the current one in brackets

    // A list of as many images as colours, each filled with its colour. Destroyed with the test.
    HIMAGELIST makeImages(int width, int height, const std::vector<COLORREF>& colours);

    // InvalidateRect and UpdateWindow of the bar since the last settle or clearCalls, as in
    // "invalidate+erase update".
    std::string repaints() const;

    // What the host was told since the last settle: "id 5 from bar code 256 index 1".
    Lines told() const { return told_; }
    std::function<void()> whenTold;

    // From now on a press opens no menu: `answer` is called with the appended entries and gives the
    // command.
    void replaceMenu(const std::function<BOOL()>& answer);
    LRESULT press() const { return PressAt(bar, 5, 5); }

    // The entry's size and picture as the menu would ask for them.
    LRESULT measure(ULONG_PTR data, SIZE* size) const;
    LRESULT draw(HDC dc, const RECT& area, ULONG_PTR data, UINT state) const;

    ImportSpy spy;
    std::unique_ptr<GuardHeap> heap;  // outlives the host and with it every window
    RecordingHost host;
    HWND bar = nullptr;
    std::vector<MenuEntry> entries;   // of the menu opened last
    std::vector<ULONG_PTR> tracking;  // TrackPopupMenuEx's arguments

private:
    Lines told_;
    std::vector<HIMAGELIST> imageLists_;
};

// The same with every heap block of the library against a page that nobody may touch.
class GuardedBarTest : public BarTest {
protected:
    GuardedBarTest() : BarTest(Heap::kGuarded) {}
    void TearDown() override { EXPECT_EQ(heap->report(), ""); }
};

// Registers the bar's class, once in the process.
void RegisterBarClass();

RECT ClientOf(HWND window);

}  // namespace kortest

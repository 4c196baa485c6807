// What every test of the grid needs: a host, the grid in it, readers, and the expected grid.
//
//   TEST_F(GridTest, ShowsThirteenColumns) {
//       create(640, 480);
//       EXPECT_EQ(expected.columnCount, visible().endColumn);
//   }
#pragma once

#include "grid/expected_grid.h"
#include "grid/expected_picture.h"
#include "support/guard_heap.h"
#include "support/import_spy.h"
#include "support/input.h"
#include "support/pixels.h"
#include "support/recording_host.h"

#include <gtest/gtest.h>

#include <optional>
#include <sstream>
#include <string>
#include <vector>

namespace kortest {

class GridTest : public ::testing::Test {
protected:
    explicit GridTest(int hostWidth = 640, int hostHeight = 480);

    // Creates the grid, lets it paint, makes `expected` fit it and forgets the transcript.
    void create(int width, int height, DWORD style = RecordingHost::kGridStyle);

    // Ends the grid's window; `create` may follow.
    void destroy();

    // Moves the grid's edges, which lays it out again.
    void resize(int width, int height);

    // Dispatches what is queued and forgets the transcript and the spied calls.
    void settle();

    // Reads the client area's size into `expected` and counts what is visible then.
    void refit();

    // The off-screen image, whole.
    Picture image() const;
    RECT client() const;

    // Sizes a column or row by the message that a header sends when its border is let go.
    void endColumnResize(int item, int units);
    void endRowResize(int item, int units);

    ImportSpy spy;
    RecordingHost host;
    ExpectedGrid expected;
    HWND grid = nullptr;
    HWND columnHeader = nullptr;
    HWND rowHeader = nullptr;
    HWND edit = nullptr;
    HDC imageDC = nullptr;  // the grid's own off-screen DC; the test draws and reads there
};

// The same with every heap block of the library against a page that nobody may touch. Redraws eat
// address space under it: some hundred of them are enough for one test.
class GuardedGridTest : public GridTest {
protected:
    explicit GuardedGridTest(int hostWidth = 640, int hostHeight = 480);
    ~GuardedGridTest() override;
    void TearDown() override;

    GuardHeap heap;
};

// ---- Readers --------------------------------------------------------------------------------

GridVisibleRange VisibleRange();
GridSelection Selection();

// Size and place of a child in its grid's client area.
RECT ChildRect(HWND child);

// Text height of a window's own DC plus 4.
int EquationBarHeightFor(HWND parent);

std::wstring HeaderLabel(HWND header, int item);
std::vector<std::wstring> HeaderLabels(HWND header);
std::vector<int> HeaderSizes(HWND header);

// What of a window is invalid, if anything is; afterwards nothing is.
std::optional<RECT> TakeInvalid(HWND window);

// Pixels of the visible columns and rows, as their headers' items must have them.
std::vector<int> ExpectedColumnSizes(const ExpectedGrid& grid);
std::vector<int> ExpectedRowSizes(const ExpectedGrid& grid);

// An argument that is a number: 32 bits, on 64-bit systems the rest of its place is undefined.
DWORD NumberAt(const ImportCall& call, size_t place);

// The parts written one after another.
template <typename... Parts>
std::string Joined(const Parts&... parts) {
    std::ostringstream text;
    (text << ... << parts);
    return text.str();
}

// A grid's message to itself or from its headers.
LRESULT SendResizing(HWND grid, HWND header, int end);
LRESULT SendResized(HWND grid, HWND header, int item, int units);

}  // namespace kortest

bool operator==(const GridVisibleRange& a, const GridVisibleRange& b);
bool operator==(const GridSelection& a, const GridSelection& b);
void PrintTo(const GridVisibleRange& range, std::ostream* stream);
void PrintTo(const GridSelection& selection, std::ostream* stream);

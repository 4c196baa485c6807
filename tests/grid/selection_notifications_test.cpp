// What the host is told: every message, how it is sent and what it carries.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// The raw values of the next message of a kind.
class Notifications : public GridUse {
protected:
    struct Heard {
        UINT message = 0;
        WPARAM wParam = 0;
        LPARAM lParam = 0;
        std::vector<WORD> words;  // what lParam points to, while it is valid
        bool isPosted = false;
    };

    void SetUp() override {
        open(330, 168);
        told();
    }

    // Listens for WM_NOTIFY with a code, reading `wordCount` words from its pointer.
    void listenTo(UINT code, int wordCount) {
        host.onMessage = [this, code, wordCount](UINT message, WPARAM wParam, LPARAM lParam) {
            if (message != WM_NOTIFY || wParam != code) return LRESULT{0};
            const auto* words = reinterpret_cast<const WORD*>(lParam);
            heard.push_back({message, wParam, lParam, {}, false});
            if (wordCount) heard.back().words.assign(words, words + wordCount);
            return LRESULT{0};
        };
    }

    std::vector<Heard> heard;
};

using Words = std::vector<WORD>;

TEST_F(Notifications, NumbersAreTheDocumentedOnes) {
    EXPECT_EQ(GRIDM_REDRAW, 3424);
    EXPECT_EQ(GRIDN_PAINTCELLS, 3425);
    EXPECT_EQ(GRIDN_CELLCLICKED, 3427);
    EXPECT_EQ(GRIDM_SETEQUATIONTEXT, 3429);
    EXPECT_EQ(GRIDN_COLUMNRESIZED, 3430);
    EXPECT_EQ(GRIDN_ROWRESIZED, 3431);
    EXPECT_EQ(GRIDN_EQUATIONENTERED, 3432);
    EXPECT_EQ(GRIDN_EQUATIONEMPTY, 3433);
    EXPECT_EQ(GRIDN_CURRENTCELL, 3434);
    EXPECT_EQ(GRIDN_SELECTING, 3435);
    EXPECT_EQ(GRIDN_SELECTIONDONE, 3436);
    EXPECT_EQ(GRIDN_EDITFOCUS, 3437);
    EXPECT_EQ(GRIDN_EDITKILLFOCUS, 3438);
}

TEST_F(Notifications, PaintCellsPointsToTheVisibleRange) {
    listenTo(GRIDN_PAINTCELLS, 4);
    SetFirstVisibleCell(KORGRID_CELL(3, 300));
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_EQ(heard[0].words, (Words{3, 9, 300, 311}));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 3-9 rows 300-311"}));
}

TEST_F(Notifications, CellClickedPointsToColumnAndRow) {
    listenTo(GRIDN_CELLCLICKED, 2);
    press(middleX(2), middleY(4));
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_EQ(heard[0].words, (Words{2, 4}));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED C5"}));
}

TEST_F(Notifications, SelectingAndDonePointToTheBlock) {
    listenTo(GRIDN_SELECTING, 4);
    press(middleX(2), middleY(4));
    move(middleX(1), middleY(7));
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_EQ(heard[0].words, (Words{1, 2, 4, 7}));
    listenTo(GRIDN_SELECTIONDONE, 4);
    release();
    ASSERT_EQ(heard.size(), 2u);
    EXPECT_EQ(heard[1].words, (Words{1, 2, 4, 7}));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED C5", "sent GRIDN_SELECTING B5:C8",
                             "sent GRIDN_SELECTIONDONE B5:C8"}));
}

TEST_F(Notifications, CurrentCellPointsToColumnAndRow) {
    Select(2, 4, 3, 6);
    listenTo(GRIDN_CURRENTCELL, 2);
    PressKey(grid, VK_RIGHT);
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_EQ(heard[0].words, (Words{3, 3}));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL D4"}));
}

TEST_F(Notifications, ResizesCarrySizeAndAbsoluteIndexAsAValue) {
    SetFirstVisibleCell(KORGRID_CELL(10, 700));
    listenTo(GRIDN_COLUMNRESIZED, 0);
    SendResized(grid, columnHeader, 2, 75);
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_EQ(static_cast<DWORD>(heard[0].lParam), KORGRID_PAIR(75, 12));
    listenTo(GRIDN_ROWRESIZED, 0);
    SendResized(grid, rowHeader, 3, 21);
    ASSERT_EQ(heard.size(), 2u);
    EXPECT_EQ(static_cast<DWORD>(heard[1].lParam), KORGRID_PAIR(21, 703));
    host.leaveOut(GRIDN_PAINTCELLS);
    told();
    SendResized(grid, columnHeader, 2, 60);
    SendResized(grid, rowHeader, 3, 16);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_COLUMNRESIZED 12 60", "sent GRIDN_ROWRESIZED 703 16"}));
}

TEST_F(Notifications, EquationEnteredCarriesTheRowInTheLowWord) {
    Select(2, 2, 300, 300);
    std::wstring text;
    LPARAM cell = 0;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM lParam) {
        if (message == GRIDN_EQUATIONENTERED) {
            text = reinterpret_cast<const wchar_t*>(wParam);
            cell = lParam;
        }
        return LRESULT{0};
    };
    SetWindowTextW(edit, L"=A1");
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    told();
    EXPECT_EQ(PressOKButton(), 0);
    EXPECT_EQ(text, L"=A1");
    EXPECT_EQ(static_cast<DWORD>(cell), KORGRID_PAIR(300, 2));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EQUATIONENTERED \"=A1\" C301",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 0-11"}));
}

TEST_F(Notifications, EquationEmptyCarriesTheCellAlone) {
    Select(2, 2, 300, 300);
    WPARAM first = 77;
    LPARAM cell = 0;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM lParam) {
        if (message == GRIDN_EQUATIONEMPTY) {
            first = wParam;
            cell = lParam;
        }
        return LRESULT{0};
    };
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    told();
    EXPECT_EQ(PressOKButton(), 0);
    EXPECT_EQ(first, 0u);
    EXPECT_EQ(static_cast<DWORD>(cell), KORGRID_PAIR(300, 2));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EQUATIONEMPTY C301",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 0-11"}));
}

TEST_F(Notifications, EditFocusCarriesZero) {
    SetFocus(grid);
    listenTo(GRIDN_EDITFOCUS, 0);
    told();
    SetFocus(edit);
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_EQ(heard[0].lParam, 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITFOCUS 0"}));
}

TEST_F(Notifications, EditKillFocusTellsAPressInTheGrid) {
    SetFocus(edit);
    told();
    SetFocus(grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
    SetFocus(edit);
    told();
    press(middleX(1), middleY(1));
    release();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 1", "sent GRIDN_CELLCLICKED B2",
                             "sent GRIDN_SELECTIONDONE B2:B2"}));
    SetFocus(edit);
    told();
    SetFocus(host.window());
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
}

TEST_F(Notifications, FunctionButtonsCommandIsPosted) {
    SetFunctionButtonMessageID(4711);
    PressAt(FunctionButtonOf(grid), 5, 5);
    EXPECT_EQ(told(), Lines{});
    host.pump();
    EXPECT_EQ(told(), (Lines{"posted WM_COMMAND 4711 0"}));
}

TEST_F(Notifications, DeleteKeyIsSent) {
    EXPECT_EQ(PressKey(grid, VK_DELETE), 0);
    EXPECT_EQ(told(), (Lines{"sent WM_KEYDOWN 46 1"}));
}

TEST_F(Notifications, PointersAreTheHostsToReadOnly) {
    // Whatever a host writes through them, the grid goes on with its own values.
    host.onMessage = [](UINT message, WPARAM wParam, LPARAM lParam) {
        if (message == WM_NOTIFY && (wParam == GRIDN_CELLCLICKED || wParam == GRIDN_CURRENTCELL)) {
            *reinterpret_cast<GridCellPair*>(lParam) = {9, 9};
        }
        return LRESULT{0};
    };
    press(middleX(2), middleY(4));
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
    release();
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(Selection(), Block(3, 3, 4, 4));
}

TEST_F(Notifications, ResultsAreIgnored) {
    host.onMessage = [](UINT, WPARAM, LPARAM) { return LRESULT{-1}; };
    EXPECT_EQ(press(middleX(2), middleY(4)), 0);
    EXPECT_EQ(move(middleX(3), middleY(5)), 0);
    EXPECT_EQ(release(), 0);
    EXPECT_EQ(PressKey(grid, VK_RIGHT), 0);
    EXPECT_EQ(PressKey(grid, VK_DELETE), 0);
    EXPECT_EQ(SetFirstVisibleCell(0), 1u);
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    EXPECT_EQ(PressOKButton(), 0);
    EXPECT_EQ(Selection(), Block(3, 3, 4, 4));
}

// None of the WM_NOTIFY codes comes with the platform's notification header.
TEST_F(Notifications, SmallValuesAreNoPointers) {
    std::vector<LPARAM> values;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM lParam) {
        if (message == WM_NOTIFY && (wParam == GRIDN_EDITFOCUS || wParam == GRIDN_EDITKILLFOCUS)) {
            values.push_back(lParam);
        }
        return LRESULT{0};
    };
    SetFocus(edit);
    press(middleX(0), middleY(0));
    EXPECT_EQ(values, (std::vector<LPARAM>{0, 1}));
}

}  // namespace
}  // namespace kortest

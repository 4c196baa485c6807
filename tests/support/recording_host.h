// A parent window that writes down, one line each, what the controls promise to tell it.
//
//   posted HCN_ITEMCLICK column 2 3         press began on item 2, pointer on item 3
//   posted HCN_ITEMRESIZING row 16 40       begin, end
//   posted HCN_ITEMRESIZED column 2 65      item, units
//   sent GRIDN_PAINTCELLS columns 0-13 rows 0-20      ends exclusive
//   sent GRIDN_CELLCLICKED B4
//   sent GRIDN_COLUMNRESIZED 3 50           absolute column, units
//   sent GRIDN_ROWRESIZED 3 20
//   sent GRIDN_EQUATIONENTERED "5" B4
//   sent GRIDN_EQUATIONEMPTY B4
//   sent GRIDN_CURRENTCELL B4
//   sent GRIDN_SELECTING B4:C9              a single cell is written B4:B4
//   sent GRIDN_SELECTIONDONE B4:C9
//   sent GRIDN_EDITFOCUS 0
//   sent GRIDN_EDITKILLFOCUS 1
//   sent WM_NOTIFY 3426 0                   a code without a name: wParam, lParam
//   sent WM_COMMAND 77 0                    wParam, lParam
//   sent WM_KEYDOWN 46 1
//
// "posted" means that it came out of the message queue. Everything else is the system's chatter and
// left out.
#pragma once

#include <korcontrols/grid.h>
#include <korcontrols/header.h>

#include "support/message_text.h"

#include <functional>
#include <string>
#include <vector>

namespace kortest {

using Lines = std::vector<std::string>;

class RecordingHost {
public:
    // A visible top-level window without a frame: client area and window are the same.
    explicit RecordingHost(int width = 640, int height = 480);
    ~RecordingHost();
    RecordingHost(const RecordingHost&) = delete;
    RecordingHost& operator=(const RecordingHost&) = delete;

    HWND window() const { return window_; }

    // Registers the grid class (once in the process) and creates a grid at 0, 0.
    static constexpr DWORD kGridStyle = WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN;
    static constexpr DWORD kGridStyleWithBars = kGridStyle | WS_HSCROLL | WS_VSCROLL;
    HWND createGrid(int width, int height, DWORD style = kGridStyle);
    HWND grid() const { return grid_; }

    // Creates a header strip at 0, 0 as a child of the host; `style` is added to WS_CHILD |
    // WS_VISIBLE. In the transcript the strips are named column, column2, ... and row, row2, ...
    // The grid registers the header class, so where that has not happened yet a grid is
    // made and destroyed first.
    HWND createHeader(DWORD style, int width, int height);

    // The written lines, since the beginning or the last clear.
    Lines transcript() const { return transcript_; }
    void clear() { transcript_.clear(); }

    // Does not write a notification code or message any more (GRIDN_PAINTCELLS, for example).
    void leaveOut(UINT codeOrMessage) { leftOut_.push_back(codeOrMessage); }

    // Also writes what another window receives, with a label before the line, as in
    // "grid sent WM_VSCROLL 1 0". Besides the messages above: keys, characters, scrolling, size,
    // timers, edit and text messages, and the grid's and headers' own.
    void alsoRecord(HWND window, const std::string& label);

    // Dispatches what is in the queue until it is empty; mouse moves without a pressed button,
    // which the system makes by itself, are thrown away. A window that does not validate itself in
    // WM_PAINT is given up after some rounds. The second form goes on for a time, for timers.
    void pump();
    void pumpFor(DWORD milliseconds);

    // Called inside GRIDN_PAINTCELLS, as a host would draw.
    std::function<void(const GridVisibleRange& range)> onPaintCells;

    // Called for each message that is written (also one that is left out), before it is answered;
    // its value is the answer.
    std::function<LRESULT(UINT message, WPARAM wParam, LPARAM lParam)> onMessage;

private:
    struct Watched {
        HWND window;
        std::string label;
        WNDPROC original;
    };

    static LRESULT CALLBACK hostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    static LRESULT CALLBACK watchedProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    LRESULT receive(const MSG& message);
    std::string describe(const MSG& message) const;
    std::string headerName(WPARAM header) const;
    bool isPosted(const MSG& message);
    bool isLeftOut(UINT codeOrMessage) const;
    const Watched* findWatched(HWND window) const;

    HWND window_ = nullptr;
    HWND grid_ = nullptr;
    std::vector<HWND> headers_;
    std::vector<Watched> watched_;
    std::vector<UINT> leftOut_;
    Lines transcript_;
    MSG dispatched_{};  // the queue's message on its way to its window; message 0: none
};

// The grid's children.
HWND CornerButtonOf(HWND grid);    // id 1
HWND ColumnHeaderOf(HWND grid);    // id 2
HWND RowHeaderOf(HWND grid);       // id 3
HWND EquationEditOf(HWND grid);    // id 6
HWND OkButtonOf(HWND grid);        // id 7, "OK"
HWND FunctionButtonOf(HWND grid);  // id 7 as well, "fx"
HWND CancelButtonOf(HWND grid);    // id 8

}  // namespace kortest

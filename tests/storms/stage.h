// The windows of a storm: two hosts with two panes each, and places for controls of every kind in
// them. A storm may destroy any of them at any time; what is gone is made anew when it is needed.
#pragma once

#include "storms/arguments.h"
#include "storms/operation.h"

#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/legend.h>
#include <korcontrols/listhelpers.h>
#include <korcontrols/tooltip.h>

#include <unordered_map>

namespace kortest {

enum Kind { kStrip, kGrid, kChart, kLegend, kTip, kBar, kList, kTree, kKinds };

constexpr int kPlaces = 4;

class Stage {
public:
    Stage();

    // ---- Windows -------------------------------------------------------------------------------
    // The window of a place; perhaps one that is gone, perhaps null.
    HWND window(Kind kind, int place) const { return windows_[kind][place & 3]; }
    // Whether something was done to the place since the last call of forgetTouched.
    bool isTouched(Kind kind, int place) const { return touched_ >> (kind * kPlaces + place) & 1; }
    void forgetTouched() { touched_ = 0; }
    void touchAll() { touched_ = ~0u; }

    bool isLive(HWND window) const { return live_.count(window) != 0; }

    // Destroys what is in the place, and creates a window there.
    HWND create(Kind kind, int place, int parent, int width, int height, DWORD style);

    // The place's window, created if there never was one or it is gone.
    HWND ensure(Kind kind, int place);

    // Hosts are 4 and 5, panes 0 to 3, 6 the first grid, 7 no window.
    HWND parent(int number);

    // Sends a message to a window of this stage, or to one that is gone; not to a stranger that
    // has its handle now.
    LRESULT send(HWND window, UINT message, WPARAM wParam, LPARAM lParam);

    // The grid whose messages the process-wide state follows: the one created last.
    HWND currentGrid() const { return currentGrid_; }
    bool stripsInStep = false;   // the current grid has been laid out, and nothing came in between
    bool hadTwoGrids = false;    // at the same time: the first one's objects are lost then
    bool hasMixedGrids = false;  // the last grid was created inside another one's creation
    int gridsCreated = 0;
    int textsLeft = 0;  // texts of single items that were deleted from a function bar
    bool selectionIsAnything = false;  // see noteSelecting
    int paintingManner = 0;            // how a host answers GRIDN_PAINTCELLS

    // A window that was sent WM_DESTROY by hand, and lives without a record.
    void markWithoutRecord(HWND window) { live_[window].isWithoutRecord = true; }
    bool isWithoutRecord(HWND window) const;

    // ---- Running -------------------------------------------------------------------------------
    void run(const Operation& operation);
    void setTrap(const Operation& operation);

    // Traps at WM_ENTERIDLE in a host, which the system sends while a dialog is open.
    void springIdle() { spring(Event::kHost, WM_ENTERIDLE, 0); }

    // Does something with all traps out of the way.
    template <typename Action>
    void runAlone(Action action) {
        const int before = innerLeft_;
        innerLeft_ = 0;
        action();
        innerLeft_ = before;
    }

    // Takes posted messages out of the queue, but no timers, paints or mouse messages: nothing that
    // depends on the clock or the pointer.
    void pump();

    // Destroys everything.
    void clear();

private:
    struct Live {
        Kind kind;
        bool isWithoutRecord;
        bool isDying;
    };
    struct Trap {
        Event event;
        int countdown;
        Sequence inside;
    };

    template <Kind kind>
    static LRESULT CALLBACK controlProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    static LRESULT CALLBACK childProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    static LRESULT CALLBACK hostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);

    void registerClasses();
    template <Kind kind>
    void wrapClass(HWND specimen);
    void wrapChildren(HWND grid);
    LRESULT onControl(Kind kind, HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    LRESULT onHost(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    void noteSelecting(HWND grid, UINT message, WPARAM wParam, LPARAM lParam);
    void noteDisturbed(Kind kind, UINT message);
    bool spring(Event::Place place, UINT message, UINT code);
    HWND host(int number);
    HWND anyParent(int number);

    HWND hosts_[2]{};
    HWND panes_[4]{};
    HWND windows_[kKinds][kPlaces]{};
    WNDPROC original_[kKinds]{};
    std::unordered_map<HWND, Live> live_;
    std::unordered_map<HWND, WNDPROC> children_;
    HWND* awaited_ = nullptr;  // the place whose window is being created
    Kind awaitedKind_ = kStrip;
    HWND currentGrid_ = nullptr;
    uint32_t touched_ = 0;  // a bit for each place of each kind
    std::vector<Trap> traps_;
    int gridsInCreation_ = 0;
    bool isAnchored_ = false;       // a press in the grid has not been let go
    bool isAnchorOutside_ = false;  // pressed while the view lay beyond the sheet
    int depth_ = 0;
    int innerLeft_ = 0;  // operations that traps may still do in this step
};

}  // namespace kortest

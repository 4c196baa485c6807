// A grid with its equation bar at hand.
#pragma once

#include "grid/use_grid.h"

namespace kortest {

class EquationUse : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }

    bool isModified() const { return SendMessageW(edit, EM_GETMODIFY, 0, 0) != 0; }
    void setModified(bool modified) { SendMessageW(edit, EM_SETMODIFY, modified, 0); }

    // A text as if the user had typed it over all, without any focus change.
    void enter(const wchar_t* text) {
        SetWindowTextW(edit, text);
        setModified(true);
    }

    // The edit has the focus, a typed text, and B2 is the current cell.
    void startTyping(const wchar_t* text) {
        Select(1, 1, 1, 1);
        SetFocus(edit);
        enter(text);
        told();
    }

    // How often the library hands a message on to the procedure that it replaced.
    int passedOn(HWND window, UINT message, WPARAM wParam) const {
        int found = 0;
        for (const ImportCall& call : spy.callsOf("CallWindowProcW")) {
            const std::vector<DWORD> arguments = ArgumentsOf(call);
            found += arguments[1] == HandleValue(window) && arguments[2] == message &&
                     arguments[3] == static_cast<DWORD>(wParam);
        }
        return found;
    }

    // How often the library sends a message itself.
    int sentByLibrary(HWND window, UINT message) const {
        int found = 0;
        for (const ImportCall& call : spy.callsOf("SendMessageW")) {
            const std::vector<DWORD> arguments = ArgumentsOf(call);
            found += arguments[0] == HandleValue(window) && arguments[1] == message;
        }
        return found;
    }
};

// The line of a redraw of the fixture's fresh grid.
inline constexpr const char* kPainted = "sent GRIDN_PAINTCELLS columns 0-6 rows 0-11";

}  // namespace kortest

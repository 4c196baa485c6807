// A command bar with the chart's controls, and the messages that reached it.
#pragma once

#include "command_bar.h"
#include "graph/graph_fixture.h"

#include <commctrl.h>

namespace kortest {

constexpr UINT kSetToolTips = WM_USER + 81;

constexpr int kShowCommand = 501;
constexpr int kPropertiesCommand = 502;
constexpr UINT kZoomComboId = 503;
constexpr UINT kTypeComboId = 504;

// Two buttons with a plain separator between them.
std::vector<TBBUTTON> HostButtons();

// A toolbar without any procedure but its own, ready for buttons.
HWND CreatePlainToolbar(HWND parent);

class CommandBarTest : public GraphTest {
protected:
    // A bar that answers the tooltip message.
    void createBar() { bar = command_bar::Create(host.window(), GetModuleHandleW(nullptr), 500); }

    // Fills the bar; the combo boxes go to `zoom` and `type`.
    DWORD setUp(const std::vector<TBBUTTON>& buttons = HostButtons());

    // From now on the library's messages to the bar are written down: "TB_ADDBITMAP 3".
    void watchMessages();

    int buttonCount() const { return static_cast<int>(SendMessageW(bar, TB_BUTTONCOUNT, 0, 0)); }
    TBBUTTON buttonAt(int position) const;
    RECT placeOf(int position) const;  // in the bar

    // What the bar's tooltip would say over a button, or over a combo box.
    std::wstring toolTipOf(int command) const {
        return askToolTip(static_cast<UINT_PTR>(command), 0);
    }
    std::wstring toolTipOf(HWND combo) const {
        return askToolTip(reinterpret_cast<UINT_PTR>(combo), TTF_IDISHWND);
    }

    HWND bar = nullptr;
    HWND zoom = nullptr;
    HWND type = nullptr;
    Lines messages;

private:
    std::wstring askToolTip(UINT_PTR id, UINT flags) const;
};

}  // namespace kortest

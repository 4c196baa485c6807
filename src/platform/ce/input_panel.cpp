// The soft input panel, through the shell library.
#include "platform/input_panel.h"

#include "platform/platform.h"

namespace kor {

namespace {

constexpr UINT kSetPanel = 224;      // SPI_SETSIPINFO
constexpr UINT kGetPanel = 225;      // SPI_GETSIPINFO
constexpr DWORD kPanelShown = 0x01;  // SIPF_ON

// SIPINFO, which the desktop's headers lack.
struct PanelState {
    DWORD size;
    DWORD flags;
    RECT desktopArea;  // what the panel leaves free; screen coordinates
    RECT panelArea;    // screen coordinates, shown or not
    DWORD methodDataSize;
    void* methodData;
};
static_assert(sizeof(PanelState) == 48);

extern "C" BOOL SHSipInfo(UINT action, UINT parameter, void* state, UINT persistence);

void SwitchPanel(DWORD wanted) {
    PanelState panel = {};
    panel.size = sizeof panel;
    if (!SHSipInfo(kGetPanel, 0, &panel, 0)) return;
    if ((panel.flags & kPanelShown) == wanted) return;
    panel.flags ^= kPanelShown;
    SHSipInfo(kSetPanel, 0, &panel, 0);
}

}  // namespace

void ShowInputPanel() { SwitchPanel(kPanelShown); }

void HideInputPanel() { SwitchPanel(0); }

}  // namespace kor

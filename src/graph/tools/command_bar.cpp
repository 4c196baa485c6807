#include "graph/tools/command_bar.h"

#include <korcontrols/graph.h>

#include "base/module.h"
#include "base/resources.h"
#include "graph/data/choices.h"
#include "platform/command_bar.h"

namespace kor {

namespace {

constexpr int kButtonImageCount = 3;

constexpr int kToolTipCount = 5;
constexpr int kToolTipCapacity = 80;

constexpr DWORD kComboStyle = CBS_DROPDOWNLIST | WS_VSCROLL;
constexpr int kTypeComboWidth = 65;
constexpr int kZoomComboWidth = 60;
constexpr int kFirstZoom = KORGRAPH_ZOOM100;

// One set for all command bars; a bar keeps the array and reads it whenever it shows a tooltip.
constinit wchar_t toolTipTexts[kToolTipCount][kToolTipCapacity] = {};
constinit const wchar_t* toolTips[kToolTipCount] = {};

void LoadToolTip(int slot, UINT stringId) {
    LoadStringW(moduleInstance, stringId, toolTipTexts[slot], kToolTipCapacity);
    toolTips[slot] = toolTipTexts[slot];
}

void HandOverToolTips(HWND bar) {
    for (int slot = 0; slot < kToolTipCount; ++slot) {
        LoadToolTip(slot, KOR_STRING_SHOWGRAPH + static_cast<UINT>(slot));
    }
    SetCommandBarToolTips(bar, kToolTipCount, toolTips);
}

// An item's data is its index in the array.
template <int count>
void AddItems(HWND combo, const wchar_t* const (&texts)[count]) {
    for (int i = 0; i < count; ++i) {
        const LRESULT place =
            SendMessageW(combo, CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(texts[i]));
        SendMessageW(combo, CB_SETITEMDATA, static_cast<WPARAM>(place), i);
    }
}

HWND InsertTypeCombo(HWND bar, HINSTANCE instance, UINT id, int position) {
    HWND combo =
        InsertCommandBarComboBox(bar, instance, kTypeComboWidth, kComboStyle, id, position);
    if (!combo) return nullptr;
    SendMessageW(combo, CB_SETEXTENDEDUI, TRUE, 0);
    AddItems(combo, kTypeChoices);
    SendMessageW(combo, CB_SETCURSEL, KORGRAPH_LINE, 0);
    return combo;
}

HWND InsertZoomCombo(HWND bar, HINSTANCE instance, UINT id, int position) {
    HWND combo =
        InsertCommandBarComboBox(bar, instance, kZoomComboWidth, kComboStyle, id, position);
    if (!combo) return nullptr;
    AddItems(combo, kZoomChoices);
    SendMessageW(combo, CB_SETCURSEL, kFirstZoom, 0);
    SendMessageW(combo, CB_SETEXTENDEDUI, TRUE, 0);
    return combo;
}

}  // namespace

void ReloadShowGraphToolTip(bool isGraphShown) {
    LoadToolTip(0, isGraphShown ? KOR_STRING_SHOWGRID : KOR_STRING_SHOWGRAPH);
}

}  // namespace kor

using namespace kor;

extern "C" DWORD KORCONTROLS_API SetupGraphCommandBar(HINSTANCE instance, HWND commandBar,
                                                      const TBBUTTON* buttons, LONG buttonCount,
                                                      HWND* zoomComboOut, UINT zoomComboId,
                                                      HWND* typeComboOut, UINT typeComboId) {
    if (!commandBar) return 0;
    const int added = buttons && buttonCount > 0 ? static_cast<int>(buttonCount) : 0;
    AddCommandBarBitmap(commandBar, moduleInstance, KOR_BITMAP_COMMANDBAR, kButtonImageCount);
    if (added) AddCommandBarButtons(commandBar, buttons, added);
    HWND typeCombo = InsertTypeCombo(commandBar, instance, typeComboId, added);
    if (typeComboOut) *typeComboOut = typeCombo;
    // Inserted at the same position, so that it ends up before the chart types.
    HWND zoomCombo = InsertZoomCombo(commandBar, instance, zoomComboId, added);
    if (zoomComboOut) *zoomComboOut = zoomCombo;
    HandOverToolTips(commandBar);
    return 1;
}

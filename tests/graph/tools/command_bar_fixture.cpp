#include "graph/tools/command_bar_fixture.h"

namespace kortest {
namespace {

const char* NameOf(UINT message) {
    switch (message) {
    case TB_ADDBITMAP: return "TB_ADDBITMAP";
    case TB_ADDBUTTONSW: return "TB_ADDBUTTONS";
    case TB_INSERTBUTTONW: return "TB_INSERTBUTTON";
    case kSetToolTips: return "tooltips";
    default: return nullptr;
    }
}

}  // namespace

std::vector<TBBUTTON> HostButtons() {
    TBBUTTON show{}, space{}, properties{};
    show.idCommand = kShowCommand;
    show.fsState = properties.fsState = TBSTATE_ENABLED;
    show.fsStyle = properties.fsStyle = TBSTYLE_BUTTON;
    space.fsStyle = TBSTYLE_SEP;
    properties.iBitmap = 1;
    properties.idCommand = kPropertiesCommand;
    return {show, space, properties};
}

HWND CreatePlainToolbar(HWND parent) {
    InitCommonControls();
    const HWND toolbar = CreateWindowExW(0, TOOLBARCLASSNAMEW, L"", WS_CHILD | WS_VISIBLE, 0, 0, 0,
                                         0, parent, nullptr, GetModuleHandleW(nullptr), nullptr);
    SendMessageW(toolbar, TB_BUTTONSTRUCTSIZE, sizeof(TBBUTTON), 0);
    return toolbar;
}

DWORD CommandBarTest::setUp(const std::vector<TBBUTTON>& buttons) {
    return SetupGraphCommandBar(GetModuleHandleW(nullptr), bar, buttons.data(),
                                static_cast<LONG>(buttons.size()), &zoom, kZoomComboId, &type,
                                kTypeComboId);
}

void CommandBarTest::watchMessages() {
    spy.watch("SendMessageW");
    spy.replace("SendMessageW", [this](ULONG_PTR* arguments) {
        const char* name = NameOf(static_cast<UINT>(arguments[1]));
        if (name && reinterpret_cast<HWND>(arguments[0]) == bar)
            messages.push_back(name + (" " + std::to_string(static_cast<int>(arguments[2]))));
        return spy.callReal("SendMessageW", arguments);
    });
}

TBBUTTON CommandBarTest::buttonAt(int position) const {
    TBBUTTON button{};
    SendMessageW(bar, TB_GETBUTTON, static_cast<WPARAM>(position),
                 reinterpret_cast<LPARAM>(&button));
    return button;
}

RECT CommandBarTest::placeOf(int position) const {
    RECT place{};
    SendMessageW(bar, TB_GETITEMRECT, static_cast<WPARAM>(position),
                 reinterpret_cast<LPARAM>(&place));
    return place;
}

std::wstring CommandBarTest::askToolTip(UINT_PTR id, UINT flags) const {
    wchar_t noText[] = L"-";
    NMTTDISPINFOW request{};
    request.hdr.hwndFrom = reinterpret_cast<HWND>(SendMessageW(bar, TB_GETTOOLTIPS, 0, 0));
    request.hdr.idFrom = id;
    request.hdr.code = TTN_GETDISPINFOW;
    request.lpszText = noText;
    request.uFlags = flags;
    SendMessageW(bar, WM_NOTIFY, 0, reinterpret_cast<LPARAM>(&request));
    return request.lpszText ? request.lpszText : L"(null)";
}

}  // namespace kortest

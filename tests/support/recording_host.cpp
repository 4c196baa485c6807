#include "support/recording_host.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>

namespace kortest {
namespace {

constexpr wchar_t kHostClass[] = L"recording host";

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

void RegisterHostClass(WNDPROC procedure) {
    static bool isRegistered = false;
    if (isRegistered) return;
    isRegistered = true;
    WNDCLASSW hostClass{};
    hostClass.lpfnWndProc = procedure;
    hostClass.hInstance = ProgramInstance();
    hostClass.hbrBackground = static_cast<HBRUSH>(GetStockObject(WHITE_BRUSH));
    hostClass.lpszClassName = kHostClass;
    RegisterClassW(&hostClass);
}

void RegisterGridClassOnce() {
    WNDCLASSW existing{};
    if (!GetClassInfoW(ProgramInstance(), KORGRID_CLASS, &existing)) {
        RegisterGridControl(ProgramInstance());
    }
}

bool IsHeaderClassRegistered() {
    WNDCLASSW existing{};
    return GetClassInfoW(ProgramInstance(), KORHEADER_CLASS, &existing) != 0;
}

HWND CreateChild(HWND parent, const wchar_t* className, DWORD style, int width, int height) {
    HWND child = CreateWindowExW(0, className, L"", style, 0, 0, width, height, parent, nullptr,
                                 ProgramInstance(), nullptr);
    if (!child) ADD_FAILURE() << "no window of class " << Narrow(className);
    return child;
}

bool IsVertical(HWND header) { return (GetWindowLongW(header, GWL_STYLE) & HCS_VERTICAL) != 0; }

RecordingHost* HostOf(HWND window) {
    return reinterpret_cast<RecordingHost*>(GetWindowLongPtrW(window, GWLP_USERDATA));
}

// The system makes a move when windows change under the resting pointer, at any time; during a
// test's own drag it would count as part of it. A test's moves have the button down.
bool IsTheSystemsMove(const MSG& message) {
    return message.message == WM_MOUSEMOVE && !(message.wParam & MK_LBUTTON);
}

constexpr wchar_t kHostProperty[] = L"recording host";

// Child with a control id and, where two share the id, a text.
HWND FindChild(HWND parent, int id, const wchar_t* text = nullptr) {
    for (HWND child = GetWindow(parent, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT)) {
        if (GetDlgCtrlID(child) != id) continue;
        wchar_t caption[16]{};
        GetWindowTextW(child, caption, static_cast<int>(std::size(caption)));
        if (!text || std::wstring(text) == caption) return child;
    }
    return nullptr;
}

}  // namespace

RecordingHost::RecordingHost(int width, int height) {
    RegisterHostClass(&RecordingHost::hostProc);
    window_ = CreateWindowExW(0, kHostClass, L"host", WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN, 0, 0,
                              width, height, nullptr, nullptr, ProgramInstance(), this);
    if (!window_) ADD_FAILURE() << "no host window";
}

RecordingHost::~RecordingHost() {
    onMessage = nullptr;
    onPaintCells = nullptr;
    DestroyWindow(window_);
    SetWindowLongPtrW(window_, GWLP_USERDATA, 0);
}

HWND RecordingHost::createGrid(int width, int height, DWORD style) {
    RegisterGridClassOnce();
    grid_ = CreateChild(window_, KORGRID_CLASS, style, width, height);
    return grid_;
}

HWND RecordingHost::createHeader(DWORD style, int width, int height) {
    if (!IsHeaderClassRegistered()) {
        RegisterGridClassOnce();
        DestroyWindow(CreateChild(window_, KORGRID_CLASS, WS_CHILD, 0, 0));
    }
    HWND header =
        CreateChild(window_, KORHEADER_CLASS, WS_CHILD | WS_VISIBLE | style, width, height);
    headers_.push_back(header);
    return header;
}

void RecordingHost::alsoRecord(HWND window, const std::string& label) {
    SetPropW(window, kHostProperty, this);
    const LONG_PTR original =
        SetWindowLongPtrW(window, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&watchedProc));
    watched_.push_back({window, label, reinterpret_cast<WNDPROC>(original)});
}

void RecordingHost::pump() {
    // A window that stays invalid would give paint messages for ever.
    constexpr int kMostPaints = 200;
    int paints = 0;
    MSG message{};
    while (paints < kMostPaints && PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
        if (IsTheSystemsMove(message)) continue;
        paints += message.message == WM_PAINT;
        TranslateMessage(&message);
        dispatched_ = message;
        DispatchMessageW(&message);
        dispatched_ = MSG{};
    }
}

void RecordingHost::pumpFor(DWORD milliseconds) {
    const DWORD begin = GetTickCount();
    for (;;) {
        pump();
        const DWORD elapsed = GetTickCount() - begin;
        if (elapsed >= milliseconds) return;
        MsgWaitForMultipleObjects(0, nullptr, FALSE, milliseconds - elapsed, QS_ALLINPUT);
    }
}

LRESULT CALLBACK RecordingHost::hostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_NCCREATE) {
        const auto* creation = reinterpret_cast<const CREATESTRUCTW*>(lParam);
        SetWindowLongPtrW(window, GWLP_USERDATA,
                          reinterpret_cast<LONG_PTR>(creation->lpCreateParams));
    }
    RecordingHost* host = HostOf(window);
    switch (message) {
    case WM_NOTIFY:
    case WM_COMMAND:
    case WM_KEYDOWN:
    case GRIDN_EQUATIONENTERED:
    case GRIDN_EQUATIONEMPTY:
    case HCN_ITEMCLICK:
    case HCN_ITEMRESIZING:
    case HCN_ITEMRESIZED:
        if (host) return host->receive({window, message, wParam, lParam, 0, {}});
        return 0;
    default: return DefWindowProcW(window, message, wParam, lParam);
    }
}

LRESULT RecordingHost::receive(const MSG& message) {
    const UINT code =
        message.message == WM_NOTIFY ? static_cast<UINT>(message.wParam) : message.message;
    const bool posted = isPosted(message);
    if (!isLeftOut(code)) {
        transcript_.push_back((posted ? "posted " : "sent ") + describe(message));
    }
    if (code == GRIDN_PAINTCELLS && message.message == WM_NOTIFY && onPaintCells) {
        onPaintCells(*reinterpret_cast<const GridVisibleRange*>(message.lParam));
    }
    return onMessage ? onMessage(message.message, message.wParam, message.lParam) : 0;
}

std::string RecordingHost::describe(const MSG& message) const {
    switch (message.message) {
    case WM_NOTIFY: return GridNotificationText(message.wParam, message.lParam);
    case GRIDN_EQUATIONENTERED:
    case GRIDN_EQUATIONEMPTY: return EquationText(message.message, message.wParam, message.lParam);
    case HCN_ITEMCLICK:
    case HCN_ITEMRESIZING:
    case HCN_ITEMRESIZED:
        return HeaderNotificationText(message.message, headerName(message.wParam), message.lParam);
    default: return PlainMessageText(message.message, message.wParam, message.lParam);
    }
}

std::string RecordingHost::headerName(WPARAM header) const {
    int columns = 0;
    int rows = 0;
    for (HWND known : headers_) {
        int& number = IsVertical(known) ? rows : columns;
        ++number;
        if (reinterpret_cast<WPARAM>(known) != header) continue;
        return std::string(IsVertical(known) ? "row" : "column") +
               (number > 1 ? std::to_string(number) : "");
    }
    return "unknown";
}

// A message counts as posted once, when it arrives as the pump dispatched it.
bool RecordingHost::isPosted(const MSG& message) {
    if (InSendMessageEx(nullptr) != ISMEX_NOSEND) return false;
    const bool isDispatched =
        dispatched_.hwnd == message.hwnd && dispatched_.message == message.message &&
        dispatched_.wParam == message.wParam && dispatched_.lParam == message.lParam;
    if (isDispatched) dispatched_ = MSG{};
    return isDispatched;
}

bool RecordingHost::isLeftOut(UINT codeOrMessage) const {
    return std::find(leftOut_.begin(), leftOut_.end(), codeOrMessage) != leftOut_.end();
}

const RecordingHost::Watched* RecordingHost::findWatched(HWND window) const {
    const auto found = std::find_if(watched_.begin(), watched_.end(),
                                    [window](const Watched& w) { return w.window == window; });
    return found == watched_.end() ? nullptr : &*found;
}

LRESULT CALLBACK RecordingHost::watchedProc(HWND window, UINT message, WPARAM wParam,
                                            LPARAM lParam) {
    auto* host = static_cast<RecordingHost*>(GetPropW(window, kHostProperty));
    const Watched* watched = host->findWatched(window);
    const WNDPROC original = watched->original;
    if (IsTelling(message) && !host->isLeftOut(message)) {
        const bool posted = host->isPosted({window, message, wParam, lParam, 0, {}});
        host->transcript_.push_back(watched->label + (posted ? " posted " : " sent ") +
                                    PlainMessageText(message, wParam, lParam));
    }
    if (message == WM_NCDESTROY) RemovePropW(window, kHostProperty);
    return CallWindowProcW(original, window, message, wParam, lParam);
}

HWND CornerButtonOf(HWND grid) { return FindChild(grid, 1); }
HWND ColumnHeaderOf(HWND grid) { return FindChild(grid, 2); }
HWND RowHeaderOf(HWND grid) { return FindChild(grid, 3); }
HWND EquationEditOf(HWND grid) { return FindChild(grid, 6); }
HWND OkButtonOf(HWND grid) { return FindChild(grid, 7, L"OK"); }
HWND FunctionButtonOf(HWND grid) { return FindChild(grid, 7, L"fx"); }
HWND CancelButtonOf(HWND grid) { return FindChild(grid, 8); }

}  // namespace kortest

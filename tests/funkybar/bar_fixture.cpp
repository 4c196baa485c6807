#include "funkybar/bar_fixture.h"

namespace kortest {
namespace {

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

std::string Told(HWND bar, WPARAM wParam, LPARAM lParam) {
    const auto& data = *reinterpret_cast<const FunkyBarNotification*>(lParam);
    return "id " + std::to_string(static_cast<int>(wParam)) + "/" +
           std::to_string(static_cast<int>(data.header.idFrom)) +
           (data.header.hwndFrom == bar ? " from bar" : " from another") + " code " +
           std::to_string(data.header.code) + " index " + std::to_string(data.index);
}

}  // namespace

BarTest::BarTest(Heap kind)
    : heap(kind == Heap::kGuarded ? std::make_unique<GuardHeap>(spy) : nullptr), host(400, 300) {
    spy.watch("InvalidateRect");
    spy.watch("UpdateWindow");
    host.onMessage = [this](UINT message, WPARAM wParam, LPARAM lParam) -> LRESULT {
        if (message != WM_NOTIFY) return 0;
        told_.push_back(Told(bar, wParam, lParam));
        if (whenTold) whenTold();
        return 0;
    };
}

BarTest::~BarTest() {
    whenTold = nullptr;
    if (IsWindow(bar)) DestroyWindow(bar);
    for (HIMAGELIST images : imageLists_) ImageList_Destroy(images);
}

void BarTest::create(int width, int height) {
    bar = createBar(host.window(), WS_CHILD | WS_VISIBLE, {10, 20, 10 + width, 20 + height});
    ASSERT_NE(bar, nullptr);
    settle();
}

HWND BarTest::createBar(HWND parent, DWORD style, const RECT& place, int id) {
    RegisterBarClass();
    return CreateWindowExW(0, KORFUNKYBAR_CLASS, L"", style, place.left, place.top,
                           place.right - place.left, place.bottom - place.top, parent,
                           reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), ProgramInstance(),
                           nullptr);
}

void BarTest::settle() {
    host.pump();
    host.clear();
    spy.clearCalls();
    told_.clear();
}

LRESULT BarTest::send(UINT message, WPARAM wParam, LPARAM lParam) const {
    return SendMessageW(bar, message, wParam, lParam);
}

FunkyBarItemDesc BarTest::described(const wchar_t* text, LONG index) {
    return {FBIF_TEXT, index, const_cast<wchar_t*>(text), 0, 0, 0, 0, 0};
}

void BarTest::insertAll(const std::vector<const wchar_t*>& all) const {
    for (const wchar_t* text : all) insert(text);
}

std::wstring BarTest::textOf(LONG index) const {
    wchar_t text[300];
    return KorFunkyBar_GetItemText(bar, index, text, 300) ? text : L"?";
}

std::string BarTest::texts() const {
    std::string all;
    for (LONG i = 0; i < count(); ++i) all += (i ? " " : "") + Narrow(textOf(i).c_str());
    return all;
}

std::string BarTest::state() const {
    std::string all;
    for (LONG i = 0; i < count(); ++i) {
        const std::string text = Narrow(textOf(i).c_str());
        all += (i ? " " : "") + (i == current() ? "[" + text + "]" : text);
    }
    return all;
}

HIMAGELIST BarTest::makeImages(int width, int height, const std::vector<COLORREF>& colours) {
    HIMAGELIST images =
        ImageList_Create(width, height, ILC_COLOR24, static_cast<int>(colours.size()), 1);
    HDC screen = GetDC(nullptr);
    HDC dc = CreateCompatibleDC(screen);
    for (const COLORREF colour : colours) {
        HBITMAP bitmap = CreateCompatibleBitmap(screen, width, height);
        HGDIOBJ previous = SelectObject(dc, bitmap);
        const RECT area = {0, 0, width, height};
        HBRUSH brush = CreateSolidBrush(colour);
        FillRect(dc, &area, brush);
        DeleteObject(brush);
        SelectObject(dc, previous);
        ImageList_Add(images, bitmap, nullptr);
        DeleteObject(bitmap);
    }
    DeleteDC(dc);
    ReleaseDC(nullptr, screen);
    imageLists_.push_back(images);
    return images;
}

std::string BarTest::repaints() const {
    std::string all;
    for (const ImportCall& call : spy.calls()) {
        if (call.arguments.empty() || reinterpret_cast<HWND>(call.arguments[0]) != bar) continue;
        if (call.name == "UpdateWindow") all += "update ";
        if (call.name != "InvalidateRect") continue;
        all += call.arguments[1] ? "part" : "invalidate";
        all += static_cast<BOOL>(call.arguments[2]) ? "+erase " : " ";
    }
    if (!all.empty()) all.pop_back();
    return all;
}

void BarTest::replaceMenu(const std::function<BOOL()>& answer) {
    spy.watchAll({"AppendMenuW", "CreatePopupMenu", "DestroyMenu", "TrackPopupMenuEx"});
    spy.replace("CreatePopupMenu", [this](ULONG_PTR* arguments) {
        entries.clear();
        return spy.callReal("CreatePopupMenu", arguments);
    });
    spy.replace("AppendMenuW", [this](ULONG_PTR* arguments) {
        entries.push_back({static_cast<UINT>(arguments[1]), arguments[2], arguments[3]});
        return spy.callReal("AppendMenuW", arguments);
    });
    spy.replace("TrackPopupMenuEx", [this, answer](ULONG_PTR* arguments) {
        tracking.assign(arguments, arguments + 6);
        return static_cast<ULONG_PTR>(answer());
    });
}

LRESULT BarTest::measure(ULONG_PTR data, SIZE* size) const {
    MEASUREITEMSTRUCT request{};
    request.CtlType = ODT_MENU;
    request.itemData = data;
    const LRESULT result = send(WM_MEASUREITEM, 0, reinterpret_cast<LPARAM>(&request));
    *size = {static_cast<LONG>(request.itemWidth), static_cast<LONG>(request.itemHeight)};
    return result;
}

LRESULT BarTest::draw(HDC dc, const RECT& area, ULONG_PTR data, UINT state) const {
    DRAWITEMSTRUCT request{};
    request.CtlType = ODT_MENU;
    request.itemState = state;
    request.hDC = dc;
    request.rcItem = area;
    request.itemData = data;
    return send(WM_DRAWITEM, 0, reinterpret_cast<LPARAM>(&request));
}

void RegisterBarClass() {
    WNDCLASSW existing{};
    if (!GetClassInfoW(ProgramInstance(), KORFUNKYBAR_CLASS, &existing))
        InitFunkyControl(ProgramInstance());
}

RECT ClientOf(HWND window) {
    RECT area{};
    GetClientRect(window, &area);
    return area;
}

}  // namespace kortest

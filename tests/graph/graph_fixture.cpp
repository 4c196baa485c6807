#include "graph/graph_fixture.h"

namespace kortest {
namespace {

constexpr wchar_t kTestProperty[] = L"chart test";

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

}  // namespace

GraphTest::GraphTest(Heap kind)
    : heap(kind == Heap::kGuarded ? std::make_unique<GuardHeap>(spy) : nullptr), host(400, 300) {
    spy.watch("CreateCompatibleDC");
}

void GraphTest::create(int width, int height, int left, int top) {
    RegisterGraphClass();
    const RECT place = {left, top, left + width, top + height};
    graph = CreateGraphWindow(host.window(), WS_CHILD | WS_VISIBLE, place, ProgramInstance());
    ASSERT_NE(graph, nullptr);
    const auto made = spy.callsOf("CreateCompatibleDC");
    ASSERT_FALSE(made.empty());
    imageDC = reinterpret_cast<HDC>(made.front().result);
    tip = newToolTip();
    ASSERT_NE(tip, nullptr);
    SetPropW(tip, kTestProperty, this);
    tipOriginal_ = reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(tip, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&GraphTest::tipProc)));
    settle();
}

// A further chart has a tooltip of its own in the same host.
HWND GraphTest::newToolTip() const {
    for (HWND child = GetWindow(host.window(), GW_CHILD); child;
         child = GetWindow(child, GW_HWNDNEXT)) {
        if (GetDlgCtrlID(child) == KORTOOLTIP_ID && !GetPropW(child, kTestProperty)) return child;
    }
    return nullptr;
}

void GraphTest::createPlain(int width, int height) {
    create(width, height);
    send(GM_TOGGLEOPTIONS, 0, kAllOptions);
    redraw();
    settle();
}

void GraphTest::createRegular() {
    createPlain();
    add({1, 2, 3, 4, 5, 6, 7, 8, 10});
    redraw();
    settle();
}

void GraphTest::destroy() {
    DestroyWindow(graph);
    DestroyWindow(tip);
}

void GraphTest::resize(int width, int height) {
    SetWindowPos(graph, nullptr, 0, 0, width, height, SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
}

void GraphTest::settle() {
    host.pump();
    host.clear();
    spy.clearCalls();
    shown.clear();
    hidden = 0;
    invalidations.clear();
}

LRESULT GraphTest::send(UINT message, WPARAM wParam, LPARAM lParam) const {
    return SendMessageW(graph, message, wParam, lParam);
}

LRESULT GraphTest::notify(UINT code, LPARAM argument) const {
    return KorGraph_Notify(graph, code, argument);
}

LRESULT GraphTest::add(const std::vector<double>& values, const wchar_t* name) const {
    const GraphSeriesData data = {static_cast<LONG>(values.size()), name, values.data(), -1};
    return send(GM_ADDSERIES, 0, reinterpret_cast<LPARAM>(&data));
}

void GraphTest::setValue(LONG series, LONG point, double value) const {
    KorGraph_SetValue(graph, series, point, value);
}

void GraphTest::replace(LONG series, const std::vector<double>& values) const {
    const GraphSeriesData data = {static_cast<LONG>(values.size()), nullptr, values.data(), series};
    KorGraph_ReplaceSeries(graph, &data);
}

LRESULT GraphTest::categories(const std::vector<const wchar_t*>& labels) const {
    return send(GM_SETCATEGORIES, labels.size(), reinterpret_cast<LPARAM>(labels.data()));
}

std::pair<double, double> GraphTest::range(LONG axis) const {
    GraphRange shownRange = {axis, 0, -1e99, -1e99};
    send(GM_GETRANGE, 0, reinterpret_cast<LPARAM>(&shownRange));
    return {shownRange.min, shownRange.max};
}

const wchar_t* GraphTest::title(UINT getter) const {
    const wchar_t* text = L"(not stored)";
    send(getter, 0, reinterpret_cast<LPARAM>(&text));
    return text;
}

Picture GraphTest::image() const { return ReadDC(imageDC, ClientOf(graph)); }

SIZE GraphTest::bitmapSize() const {
    BITMAP bitmap{};
    GetObjectW(GetCurrentObject(imageDC, OBJ_BITMAP), sizeof bitmap, &bitmap);
    return {bitmap.bmWidth, bitmap.bmHeight};
}

std::wstring GraphTest::tap(int x, int y) {
    shown.clear();
    PressAt(graph, x, y);
    ReleaseAt(graph, x, y);
    if (shown.size() > 1) ADD_FAILURE() << "shown more than once";
    return shown.empty() ? L"-" : shown.back().text;
}

void GraphTest::watchInvalidations() {
    spy.watch("InvalidateRect");
    spy.replace("InvalidateRect", [this](ULONG_PTR* arguments) {
        const auto* area = reinterpret_cast<const RECT*>(arguments[1]);
        invalidations.push_back({reinterpret_cast<HWND>(arguments[0]), !area, area ? *area : RECT{},
                                 static_cast<BOOL>(arguments[2]) != FALSE});
        return spy.callReal("InvalidateRect", arguments);
    });
}

std::vector<Invalidation> GraphTest::invalidationsOf(HWND window) const {
    std::vector<Invalidation> found;
    for (const Invalidation& call : invalidations)
        if (call.window == window) found.push_back(call);
    return found;
}

RECT GraphTest::onlyInvalidation() const {
    const auto calls = invalidationsOf(graph);
    if (calls.size() != 1) {
        ADD_FAILURE() << calls.size() << " invalidations";
        return {};
    }
    EXPECT_FALSE(calls[0].isWhole);
    EXPECT_FALSE(calls[0].erases);
    return calls[0].area;
}

std::vector<std::wstring> GraphTest::textsOf(const std::function<void()>& action) {
    std::vector<std::wstring> texts;
    const auto keep = [&](ULONG_PTR text, ULONG_PTR length) {
        const auto* words = reinterpret_cast<const wchar_t*>(text);
        const int count = static_cast<int>(length);
        texts.push_back(count < 0 ? std::wstring(words)
                                  : std::wstring(words, static_cast<size_t>(count)));
    };
    spy.watchAll({"DrawTextW", "ExtTextOutW"});
    spy.replace("DrawTextW", [&](ULONG_PTR* arguments) {
        if (!(arguments[4] & DT_CALCRECT)) keep(arguments[1], arguments[2]);
        return spy.callReal("DrawTextW", arguments);
    });
    spy.replace("ExtTextOutW", [&](ULONG_PTR* arguments) {
        keep(arguments[5], arguments[6]);
        return spy.callReal("ExtTextOutW", arguments);
    });
    action();
    spy.restore("DrawTextW");
    spy.restore("ExtTextOutW");
    return texts;
}

HWND GraphTest::showLegend(const RECT& place) const {
    send(GM_SHOWLEGEND, 0, reinterpret_cast<LPARAM>(&place));
    return GetDlgItem(graph, KORLEGEND_ID);
}

int GraphTest::defaultCalls(UINT message) const {
    int count = 0;
    for (const auto& call : spy.callsOf("DefWindowProcW"))
        count += NumberAt(call, 1) == message && reinterpret_cast<HWND>(call.arguments[0]) == graph;
    return count;
}

LRESULT CALLBACK GraphTest::tipProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    auto* test = static_cast<GraphTest*>(GetPropW(window, kTestProperty));
    if (message == TIPM_SHOW && lParam) {
        const auto& request = *reinterpret_cast<const ToolTipRequest*>(lParam);
        test->shown.push_back(
            {request.text ? request.text : L"(null)", request.x, request.y, request.limit});
    }
    if (message == TIPM_HIDE) ++test->hidden;
    const WNDPROC original = test->tipOriginal_;
    if (message == WM_NCDESTROY) RemovePropW(window, kTestProperty);
    return CallWindowProcW(original, window, message, wParam, lParam);
}

void RegisterGraphClass() {
    WNDCLASSW existing{};
    if (!GetClassInfoW(ProgramInstance(), KORGRAPH_CLASS, &existing))
        RegisterGraphControl(ProgramInstance());
}

HWND CreateGraphWindow(HWND parent, DWORD style, const RECT& place, HINSTANCE instance) {
    return CreateWindowExW(0, KORGRAPH_CLASS, L"", style, place.left, place.top,
                           place.right - place.left, place.bottom - place.top, parent, nullptr,
                           instance, nullptr);
}

RECT PlaceIn(HWND parent, HWND window) {
    RECT area{};
    GetWindowRect(window, &area);
    MapWindowPoints(nullptr, parent, reinterpret_cast<POINT*>(&area), 2);
    return area;
}

RECT ClientOf(HWND window) {
    RECT area{};
    GetClientRect(window, &area);
    return area;
}

DWORD NumberAt(const ImportCall& call, size_t place) {
    return static_cast<DWORD>(call.arguments.at(place));
}

}  // namespace kortest

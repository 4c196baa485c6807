#include "storms/stage.h"

#include "storms/checks.h"
#include "storms/failure.h"

#include <commctrl.h>

#include <algorithm>
#include <iterator>

namespace kortest {

const Word kTrapWord = {"trap", 0, "ei", nullptr};

namespace {

constexpr int kMostTraps = 6;
constexpr int kMostDepth = 3;
constexpr int kMostInnerOperations = 24;
constexpr int kMostPosted = 200;

Stage* stage = nullptr;

constexpr wchar_t kHostClass[] = L"Host of a storm";

const wchar_t* ClassOf(Kind kind) {
    static const wchar_t* const kClasses[] = {KORHEADER_CLASS, KORGRID_CLASS,    KORGRAPH_CLASS,
                                              KORLEGEND_CLASS, KORTOOLTIP_CLASS, KORFUNKYBAR_CLASS,
                                              WC_LISTVIEWW,    WC_TREEVIEWW};
    return kClasses[kind];
}

DWORD UsualStyle(Kind kind) {
    constexpr DWORD kUsual = WS_CHILD | WS_VISIBLE;
    switch (kind) {
    case kGrid: return kUsual | WS_CLIPCHILDREN | WS_HSCROLL | WS_VSCROLL;
    case kChart: return kUsual | WS_CLIPSIBLINGS | WS_CLIPCHILDREN;
    case kTip: return WS_CHILD;
    case kLegend: return kUsual | WS_VSCROLL;
    case kList: return kUsual | LVS_REPORT;
    default: return kUsual;
    }
}

HINSTANCE Instance() { return GetModuleHandleW(nullptr); }

HWND CreateIn(HWND parent, Kind kind, DWORD style, int width, int height) {
    return CreateWindowExW(0, ClassOf(kind), L"", style, 0, 0, width, height, parent,
                           reinterpret_cast<HMENU>(static_cast<INT_PTR>(100 + kind)), Instance(),
                           nullptr);
}

}  // namespace

Stage::Stage() {
    stage = this;
    registerClasses();
}

// Some classes exist only after the first window of another one: one of each is made, and its
// class's procedure replaced, so that every window is heard from its first message on.
void Stage::registerClasses() {
    WNDCLASSW hostClass = {};
    hostClass.lpfnWndProc = hostProc;
    hostClass.hInstance = Instance();
    hostClass.lpszClassName = kHostClass;
    RegisterClassW(&hostClass);
    RegisterGridControl(Instance());
    RegisterGraphControl(Instance());
    InitFunkyControl(Instance());
    InitCommonControls();
    HWND parentWindow = host(0);
    HWND grid = CreateIn(parentWindow, kGrid, UsualStyle(kGrid), 50, 50);
    HWND chart = CreateIn(parentWindow, kChart, UsualStyle(kChart), 50, 50);
    const RECT place = {0, 0, 20, 20};
    KorGraph_ShowLegend(chart, &place);
    HWND bar = CreateIn(parentWindow, kBar, UsualStyle(kBar), 50, 20);
    wrapClass<kStrip>(GetDlgItem(grid, 2));
    wrapClass<kGrid>(grid);
    wrapClass<kChart>(chart);
    wrapClass<kLegend>(GetDlgItem(chart, KORLEGEND_ID));
    wrapClass<kTip>(GetDlgItem(parentWindow, KORTOOLTIP_ID));
    wrapClass<kBar>(bar);
    wrapClass<kList>(CreateIn(parentWindow, kList, UsualStyle(kList), 50, 50));
    wrapClass<kTree>(CreateIn(parentWindow, kTree, UsualStyle(kTree), 50, 50));
    clear();
}

template <Kind kind>
void Stage::wrapClass(HWND specimen) {
    if (!specimen) FailStorm("no window of %ls to begin with", ClassOf(kind));
    original_[kind] = reinterpret_cast<WNDPROC>(SetClassLongPtrW(
        specimen, GCLP_WNDPROC, reinterpret_cast<LONG_PTR>(&Stage::controlProc<kind>)));
}

void Stage::wrapChildren(HWND grid) {
    for (const int id : {1, 6, 7, 8}) {
        HWND child = GetDlgItem(grid, id);
        if (!child || children_.count(child)) continue;
        children_[child] = reinterpret_cast<WNDPROC>(
            SetWindowLongPtrW(child, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(childProc)));
    }
}

HWND Stage::host(int number) {
    HWND& place = hosts_[number & 1];
    if (!place || !isLive(place)) {
        place = CreateWindowExW(0, kHostClass, L"", WS_POPUP | WS_VISIBLE, 0, 0, 240, 180, nullptr,
                                nullptr, Instance(), nullptr);
        live_[place] = {kKinds, false, false};
    }
    return place;
}

// Null for a window that has been told of its end: what is created in it then may never be.
HWND Stage::parent(int number) {
    HWND window = anyParent(number);
    const auto found = live_.find(window);
    return found == live_.end() || found->second.isDying ? nullptr : window;
}

HWND Stage::anyParent(int number) {
    if (number == 7) return nullptr;
    if (number == 6) return windows_[kGrid][0];
    if (number >= 4) return host(number);
    HWND& place = panes_[number & 3];
    if (!place || !isLive(place)) {
        place = CreateWindowExW(0, kHostClass, L"", WS_CHILD | WS_VISIBLE, 0, 0, 160, 120,
                                parent(4 + (number >> 1)), nullptr, Instance(), nullptr);
        if (place) live_[place] = {kKinds, false, false};
    }
    return place;
}

HWND Stage::create(Kind kind, int place, int parentNumber, int width, int height, DWORD style) {
    touched_ |= 1u << (kind * kPlaces + (place & 3));
    HWND& window = windows_[kind][place & 3];
    if (window && isLive(window)) DestroyWindow(window);
    HWND parentWindow = parent(parentNumber);
    HWND* const awaitedBefore = awaited_;
    awaited_ = &window;
    awaitedKind_ = kind;
    HWND made = CreateIn(parentWindow, kind, style, width, height);
    awaited_ = awaitedBefore;
    return made;
}

HWND Stage::ensure(Kind kind, int place) {
    // A second grid takes everything over from the first: few are made, see create.
    if (kind == kGrid && !isLive(windows_[kGrid][place & 3])) place = 0;
    touched_ |= 1u << (kind * kPlaces + (place & 3));
    HWND window = windows_[kind][place & 3];
    if (window && isLive(window)) return window;
    return create(kind, place, place & 1, 60 + 30 * (place & 3), 70, UsualStyle(kind));
}

bool Stage::isWithoutRecord(HWND window) const {
    const auto found = live_.find(window);
    return found == live_.end() || found->second.isWithoutRecord;
}

LRESULT Stage::send(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (!isLive(window) && !children_.count(window) && IsWindow(window)) return 0;
    return SendMessageW(window, message, wParam, lParam);
}

// ---- What windows receive
// --------------------------------------------------------------------------

template <Kind kind>
LRESULT CALLBACK Stage::controlProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    return stage->onControl(kind, window, message, wParam, lParam);
}

LRESULT Stage::onControl(Kind kind, HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_NCCREATE) {
        live_[window] = {kind, false, false};
        if (awaited_ && awaitedKind_ == kind) {
            *awaited_ = window;
            awaited_ = nullptr;
        }
    }
    if (message == WM_DESTROY) live_[window].isDying = true;
    if (message == WM_CREATE && kind == kGrid && lParam) {
        ++gridsCreated;
        hasMixedGrids = gridsInCreation_++ > 0;
        if (currentGrid_ && isLive(currentGrid_)) hadTwoGrids = true;
        currentGrid_ = window;
        stripsInStep = false;
    }
    if (kind == kGrid && message == WM_LBUTTONUP && !(wParam & MK_SHIFT)) {
        isAnchored_ = isAnchorOutside_ = false;
    }
    if (kind == kGrid) noteSelecting(window, message, wParam, lParam);
    // The system's own views are not to be destroyed inside their messages.
    const bool isSystems = kind == kList || kind == kTree;
    if (!isSystems && spring(Event::kBefore, message, 0)) noteDisturbed(kind, message);
    // A control cannot be created in a window that is gone.
    if (message == WM_CREATE && !isLive(window)) {
        if (kind == kGrid && lParam) --gridsInCreation_;
        return -1;
    }
    const LRESULT result = CallWindowProcW(original_[kind], window, message, wParam, lParam);
    if (kind == kGrid) noteSelecting(window, message, wParam, lParam);  // what came inside is over
    if (message == WM_CREATE && kind == kGrid && lParam) {
        --gridsInCreation_;
        wrapChildren(window);
    }
    if (!isSystems && spring(Event::kAfter, message, 0)) noteDisturbed(kind, message);
    if (message == WM_NCDESTROY) live_.erase(window);
    return result;
}

// Who changes the grid while it fills a strip, item by item, gets the strip that was begun before.
void Stage::noteDisturbed(Kind kind, UINT message) {
    if (kind == kStrip && message >= HCM_INSERTITEM && message <= HCM_GETITEMSIZE) {
        stripsInStep = false;
    }
}

// What leads to a selection outside the sheet, or with its ends turned round, as the headers say: a
// header click on items that the strip has not; keys that extend a block whose anchor lies
// elsewhere, since each arrow has rules of its own; the pointer over a view beyond the sheet.
void Stage::noteSelecting(HWND grid, UINT message, WPARAM wParam, LPARAM lParam) {
    const bool isPress = message == WM_LBUTTONDOWN;
    const bool isPointer = isPress || message == WM_MOUSEMOVE || message == HCN_ITEMCLICK;
    if (isPress) isAnchored_ = true;
    if (message == WM_KEYDOWN && isAnchored_) selectionIsAnything = true;
    GridVisibleRange range = {};
    GetVisibleRange(&range);
    const bool isOutside = range.firstColumn >= KORGRID_COLUMNS || range.firstRow >= KORGRID_ROWS;
    if (isPress && isOutside) isAnchorOutside_ = true;
    if (isPointer && (isOutside || isAnchorOutside_)) selectionIsAnything = true;
    if (message != HCN_ITEMCLICK) return;
    const bool isRow = reinterpret_cast<HWND>(wParam) == GetDlgItem(grid, 3);
    const DWORD count = isRow ? GetNumberOfVisibleRows() : GetNumberOfVisibleColumns();
    const auto items = static_cast<DWORD>(lParam);
    if (LOWORD(items) >= count || HIWORD(items) >= count) selectionIsAnything = true;
}

LRESULT CALLBACK Stage::childProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    const WNDPROC original = stage->children_[window];
    stage->spring(Event::kBefore, message, 0);
    const LRESULT result = CallWindowProcW(original, window, message, wParam, lParam);
    stage->spring(Event::kAfter, message, 0);
    if (message == WM_NCDESTROY) stage->children_.erase(window);
    return result;
}

LRESULT CALLBACK Stage::hostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    return stage->onHost(window, message, wParam, lParam);
}

LRESULT Stage::onHost(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_NOTIFY || message == GRIDN_EQUATIONENTERED ||
        message == GRIDN_EQUATIONEMPTY) {
        CheckNotification(*this, message, wParam, lParam);
    }
    if (message == WM_DESTROY) live_[window].isDying = true;
    const bool isOfList = message == WM_NOTIFY && (wParam == 100 + kList || wParam == 100 + kTree);
    if (!isOfList) {
        spring(Event::kHost, message, message == WM_NOTIFY ? static_cast<UINT>(wParam) : 0);
    }
    if (message == WM_NCDESTROY) live_.erase(window);
    return DefWindowProcW(window, message, wParam, lParam);
}

// ---- Running
// ---------------------------------------------------------------------------------------

void Stage::setTrap(const Operation& operation) {
    if (traps_.size() >= kMostTraps) traps_.erase(traps_.begin());
    traps_.push_back(
        {EventOf(operation.arguments[0]), operation.arguments[1] & 3, operation.inside});
}

bool Stage::spring(Event::Place place, UINT message, UINT code) {
    if (traps_.empty() || depth_ == 0 || depth_ > kMostDepth || innerLeft_ <= 0) return false;
    const auto sprung = std::find_if(traps_.begin(), traps_.end(), [&](const Trap& trap) {
        return trap.event.place == place && trap.event.message == message &&
               (!trap.event.code || trap.event.code == code);
    });
    if (sprung == traps_.end() || sprung->countdown-- > 0) return false;
    const Sequence inside = std::move(sprung->inside);
    traps_.erase(sprung);
    for (const Operation& operation : inside) {
        if (innerLeft_-- > 0) run(operation);
    }
    return true;
}

void Stage::run(const Operation& operation) {
    if (depth_ == 0) innerLeft_ = kMostInnerOperations;
    if (operation.word == &kTrapWord) {
        setTrap(operation);
        return;
    }
    ++depth_;
    operation.word->run(*this, operation.arguments);
    --depth_;
}

void Stage::pump() {
    const auto take = [](UINT first, UINT last, int& left) {
        MSG message;
        while (left > 0 && PeekMessageW(&message, nullptr, first, last, PM_REMOVE)) {
            --left;
            if (message.message == WM_QUIT) continue;
            DispatchMessageW(&message);
        }
    };
    constexpr UINT kSystemTimer = 0x118;
    int left = kMostPosted;
    MSG thrownAway;
    while (PeekMessageW(&thrownAway, nullptr, WM_MOUSEFIRST, WM_MOUSELAST, PM_REMOVE)) {
    }
    take(WM_PAINT + 1, WM_TIMER - 1, left);
    take(WM_TIMER + 1, kSystemTimer - 1, left);
    take(kSystemTimer + 1, WM_MOUSEFIRST - 1, left);
    take(WM_MOUSELAST + 1, 0xFFFF, left);
}

void Stage::clear() {
    traps_.clear();
    for (HWND& place : hosts_) {
        if (place && isLive(place)) DestroyWindow(place);
        place = nullptr;
    }
    // Those that were given another parent, or none.
    while (!live_.empty()) {
        HWND window = live_.begin()->first;
        DestroyWindow(window);
        live_.erase(window);
    }
    pump();
    for (HWND& place : panes_) place = nullptr;
    for (auto& places : windows_) std::fill(std::begin(places), std::end(places), nullptr);
    currentGrid_ = nullptr;
}

}  // namespace kortest

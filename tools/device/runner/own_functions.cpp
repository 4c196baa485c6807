#include "runner/own_functions.h"

#include "platform/command_bar.h"
#include "runner/host_calls.h"
#include "runner/imports.h"

#include <windows.h>

#include <algorithm>
#include <cstring>
#include <iterator>

namespace device {
namespace {

// Marks the index of a system colour on Windows CE; see src/platform/platform.h.
constexpr uint32_t kSystemColourFlag = 0x40000000;

// Messages to a command bar, whose numbers mean something else to a toolbar of the desktop. The
// library sends them to no other window.
constexpr UINT kAddButtons = WM_USER + 20;
constexpr UINT kSetToolTips = WM_USER + 81;

template <typename Value = uint32_t>
Value As(uint32_t word) {
    return reinterpret_cast<Value>(word);
}

uint64_t SystemColour(uint32_t target, const uint32_t* words) {
    uint32_t changed[kHostWords] = {words[0] & ~kSystemColourFlag};
    return CallHost(target, changed);
}

// Stock objects of the desktop, or the brush of a system colour.
uint64_t StockObject(uint32_t target, const uint32_t* words) {
    if (!(words[0] & kSystemColourFlag)) return CallHost(target, words);
    return CallDesktop("GetSysColorBrush", {words[0] & ~kSystemColourFlag});
}

// Function names are wide. The function that is found is called through an address of the runner.
uint64_t ProcAddress(uint32_t target, const uint32_t* words) {
    char name[128] = "";
    WideCharToMultiByte(CP_ACP, 0, As<const wchar_t*>(words[1]), -1, name, sizeof name, nullptr,
                        nullptr);
    uint32_t arguments[kHostWords] = {words[0], reinterpret_cast<uint32_t>(name)};
    return GuestAddressOf(static_cast<uint32_t>(CallHost(target, arguments)));
}

// A movable block of the global heap with the bytes of a local one; 0 for 0, or when there is no
// memory.
uint32_t MovableCopy(uint32_t block) {
    if (!block) return 0;
    const auto size = CallDesktop("LocalSize", {block});
    const auto copy = CallDesktop("GlobalAlloc", {GMEM_MOVEABLE, size});
    if (!copy) return 0;
    const auto bytes = CallDesktop("GlobalLock", {copy});
    if (bytes) std::memcpy(As<void*>(bytes), As<const void*>(block), size);
    CallDesktop("GlobalUnlock", {copy});
    return copy;
}

// The device's clipboard takes blocks of the local heap; the desktop's takes movable ones of the
// global heap. A block that is not taken stays the guest's.
uint64_t SetClipboard(uint32_t target, const uint32_t* words) {
    const uint32_t copy = MovableCopy(words[1]);
    uint32_t arguments[kHostWords] = {words[0], copy};
    const auto taken = static_cast<uint32_t>(CallHost(target, arguments));
    if (taken && copy) {
        CallDesktop("LocalFree", {words[1]});
    } else if (copy) {
        CallDesktop("GlobalFree", {copy});
    }
    return taken;
}

uint64_t SendMessageOrCommand(uint32_t target, const uint32_t* words) {
    const auto bar = As<HWND>(words[0]);
    const auto count = static_cast<int>(words[2]);
    switch (words[1]) {
    case kAddButtons:
        kor::AddCommandBarButtons(bar, As<const TBBUTTON*>(words[3]), count);
        return 0;
    case kSetToolTips:
        kor::SetCommandBarToolTips(bar, count, As<const wchar_t* const*>(words[3]));
        return 0;
    default: return CallHost(target, words);
    }
}

uint64_t CommandBarBitmap(uint32_t, const uint32_t* words) {
    kor::AddCommandBarBitmap(As<HWND>(words[0]), As<HINSTANCE>(words[1]),
                             static_cast<int>(words[2]), static_cast<int>(words[3]));
    return 0;
}

uint64_t CommandBarCombo(uint32_t, const uint32_t* words) {
    const HWND combo = kor::InsertCommandBarComboBox(As<HWND>(words[0]), As<HINSTANCE>(words[1]),
                                                     static_cast<int>(words[2]), words[3], words[4],
                                                     static_cast<int>(words[5]));
    return reinterpret_cast<uint32_t>(combo);
}

// There is no input panel.
uint64_t InputPanel(uint32_t, const uint32_t*) { return 0; }

struct Entry {
    const char* name;
    OwnFunction function;
    std::vector<std::string> needed;
};

const Entry kEntries[] = {
    {"CommandBar_AddBitmap", CommandBarBitmap, {}},
    {"CommandBar_InsertComboBox", CommandBarCombo, {}},
    {"GetProcAddressW", ProcAddress, {}},
    {"GetStockObject", StockObject, {"GetSysColorBrush"}},
    {"GetSysColor", SystemColour, {}},
    {"GetSysColorBrush", SystemColour, {}},
    {"SendMessageW", SendMessageOrCommand, {}},
    {"SetClipboardData",
     SetClipboard,
     {"GlobalAlloc", "GlobalFree", "GlobalLock", "GlobalUnlock", "LocalFree", "LocalSize"}},
    {"SHSipInfo", InputPanel, {}},
};

const Entry* FindEntry(const std::string& guestName) {
    const auto found = std::find_if(std::begin(kEntries), std::end(kEntries),
                                    [&](const Entry& entry) { return guestName == entry.name; });
    return found == std::end(kEntries) ? nullptr : found;
}

}  // namespace

OwnFunction FindOwnFunction(const std::string& guestName) {
    const Entry* entry = FindEntry(guestName);
    return entry ? entry->function : nullptr;
}

std::vector<std::string> NeededBy(const std::string& guestName) {
    const Entry* entry = FindEntry(guestName);
    return entry ? entry->needed : std::vector<std::string>();
}

}  // namespace device

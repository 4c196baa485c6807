#include "listhelpers/view_fixture.h"

#include "support/message_text.h"

namespace kortest {
namespace {

constexpr wchar_t kHostClass[] = L"view host";

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

bool CarriesListItem(UINT message) {
    return message == LVM_SETITEMW || message == LVM_INSERTITEMW || message == LVM_SETITEMTEXTW ||
           message == LVM_GETITEMW || message == LVM_GETITEMTEXTW;
}

}  // namespace

ViewTest::ViewTest() {
    INITCOMMONCONTROLSEX controls = {sizeof controls, ICC_LISTVIEW_CLASSES | ICC_TREEVIEW_CLASSES};
    InitCommonControlsEx(&controls);
    WNDCLASSW hostClass{};
    hostClass.lpfnWndProc = hostProc;
    hostClass.hInstance = ProgramInstance();
    hostClass.lpszClassName = kHostClass;
    RegisterClassW(&hostClass);  // refused from the second test of a process on
    host = CreateWindowExW(0, kHostClass, L"", WS_POPUP | WS_VISIBLE, 0, 0, 400, 300, nullptr,
                           nullptr, ProgramInstance(), nullptr);
    SetWindowLongPtrW(host, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
}

ViewTest::~ViewTest() {
    onNotify = nullptr;
    answer = nullptr;
    DestroyWindow(host);
}

LRESULT CALLBACK ViewTest::hostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    auto* test = reinterpret_cast<ViewTest*>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (message == WM_NOTIFY && test && test->onNotify)
        test->onNotify(*reinterpret_cast<const NMHDR*>(lParam), lParam);
    return DefWindowProcW(window, message, wParam, lParam);
}

HWND ViewTest::createList(int columns, DWORD style) {
    list = CreateWindowExW(0, WC_LISTVIEWW, L"", WS_CHILD | WS_VISIBLE | LVS_REPORT | style, 0, 0,
                           380, 200, host, nullptr, ProgramInstance(), nullptr);
    for (int i = 0; i < columns; ++i) {
        LVCOLUMNW column{};
        column.mask = LVCF_WIDTH | LVCF_SUBITEM;
        column.cx = 80;
        column.iSubItem = i;
        SendMessageW(list, LVM_INSERTCOLUMNW, static_cast<WPARAM>(i),
                     reinterpret_cast<LPARAM>(&column));
    }
    return list;
}

HWND ViewTest::createTree() {
    tree = CreateWindowExW(0, WC_TREEVIEWW, L"", WS_CHILD | WS_VISIBLE | TVS_HASBUTTONS, 0, 200,
                           380, 100, host, nullptr, ProgramInstance(), nullptr);
    return tree;
}

std::string ViewTest::rowText(int index, int column) const {
    wchar_t text[64] = L"(none)";
    LVITEMW item{};
    item.iSubItem = column;
    item.pszText = text;
    item.cchTextMax = 64;
    SendMessageW(list, LVM_GETITEMTEXTW, static_cast<WPARAM>(index),
                 reinterpret_cast<LPARAM>(&item));
    return Narrow(item.pszText);
}

std::string ViewTest::rows() const {
    std::string all;
    for (int i = 0; i < rowCount(list); ++i) all += (i ? "|" : "") + rowText(i);
    return all;
}

LVITEMW ViewTest::row(int index) const {
    LVITEMW item{};
    item.mask = LVIF_PARAM | LVIF_IMAGE | LVIF_STATE;
    item.stateMask = ~0u;
    item.iItem = index;
    EXPECT_TRUE(SendMessageW(list, LVM_GETITEMW, 0, reinterpret_cast<LPARAM>(&item)));
    return item;
}

void ViewTest::fill(const std::vector<const wchar_t*>& texts) const {
    for (size_t i = 0; i < texts.size(); ++i) {
        LVITEMW item{};
        item.mask = LVIF_TEXT | LVIF_PARAM;
        item.iItem = static_cast<int>(i);
        item.pszText = const_cast<wchar_t*>(texts[i]);
        item.lParam = static_cast<LPARAM>(100 + i);
        SendMessageW(list, LVM_INSERTITEMW, 0, reinterpret_cast<LPARAM>(&item));
    }
}

void ViewTest::selectRow(int index) const {
    LVITEMW item{};
    item.state = LVIS_SELECTED;
    item.stateMask = LVIS_SELECTED;
    SendMessageW(list, LVM_SETITEMSTATE, static_cast<WPARAM>(index),
                 reinterpret_cast<LPARAM>(&item));
}

void ViewTest::watchMessages() {
    spy.watch("SendMessageW");
    spy.replace("SendMessageW", [this](ULONG_PTR* arguments) -> ULONG_PTR {
        SentMessage message{reinterpret_cast<HWND>(arguments[0]),
                            static_cast<UINT>(arguments[1]),
                            arguments[2],
                            {},
                            {}};
        const auto* data = reinterpret_cast<const void*>(arguments[3]);
        if (CarriesListItem(message.message)) message.item = *static_cast<const LVITEMW*>(data);
        if (message.message == TVM_INSERTITEMW)
            message.insert = *static_cast<const TVINSERTSTRUCTW*>(data);
        sent.push_back(message);
        LRESULT result = 0;
        if (answer && answer(message, &result)) return static_cast<ULONG_PTR>(result);
        return spy.callReal("SendMessageW", arguments);
    });
}

std::vector<UINT> ViewTest::messages() const {
    std::vector<UINT> numbers;
    for (const SentMessage& message : sent) numbers.push_back(message.message);
    return numbers;
}

}  // namespace kortest

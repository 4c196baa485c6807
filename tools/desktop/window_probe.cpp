// Prints what a person would see of the running programs' windows, as JSON: one line per question.
//
//   window_probe              answers once
//   window_probe --serve      answers each line of standard input, until its end
//   window_probe --clipboard  prints what is on the clipboard: its text, and a picture's size
//   window_probe --put        puts standard input, UTF-8, on the clipboard
//
// An answer is the list of visible top-level windows, each with its visible children. Rectangles
// are [left, top, right, bottom] in screen pixels, right and bottom exclusive.
#include <korcontrols/header.h>

#include <commctrl.h>

#include <fcntl.h>
#include <io.h>

#include <cstring>
#include <iostream>
#include <iterator>
#include <string>
#include <vector>

namespace {

// ---- JSON ---------------------------------------------------------------------------------------

std::string Quoted(const std::wstring& text) {
    std::string utf8(text.size() * 4, '\0');
    const int length =
        WideCharToMultiByte(CP_UTF8, 0, text.data(), static_cast<int>(text.size()), utf8.data(),
                            static_cast<int>(utf8.size()), nullptr, nullptr);
    utf8.resize(static_cast<std::size_t>(length));
    std::string quoted = "\"";
    for (const char letter : utf8) {
        if (letter == '"' || letter == '\\') quoted += '\\';
        if (static_cast<unsigned char>(letter) >= ' ') {
            quoted += letter;
        } else {
            const char digits[] = "0123456789abcdef";
            quoted += "\\u00";
            quoted += digits[letter >> 4];
            quoted += digits[letter & 15];
        }
    }
    return quoted + '"';
}

std::string List(const std::vector<std::string>& values) {
    std::string list = "[";
    for (const std::string& value : values) {
        if (list.size() > 1) list += ", ";
        list += value;
    }
    return list + "]";
}

std::string Rectangle(const RECT& r) {
    return List({std::to_string(r.left), std::to_string(r.top), std::to_string(r.right),
                 std::to_string(r.bottom)});
}

// ---- Another process's memory -------------------------------------------------------------------

// A page in the process that owns a window: messages that the system does not carry across
// processes need their structure in there.
class RemotePage {
public:
    explicit RemotePage(HWND window) {
        DWORD id = 0;
        GetWindowThreadProcessId(window, &id);
        process_ =
            OpenProcess(PROCESS_VM_OPERATION | PROCESS_VM_READ | PROCESS_VM_WRITE, FALSE, id);
        if (process_) page_ = VirtualAllocEx(process_, nullptr, 4096, MEM_COMMIT, PAGE_READWRITE);
    }
    ~RemotePage() {
        if (page_) VirtualFreeEx(process_, page_, 0, MEM_RELEASE);
        if (process_) CloseHandle(process_);
    }
    RemotePage(const RemotePage&) = delete;
    RemotePage& operator=(const RemotePage&) = delete;

    LPARAM address() const { return reinterpret_cast<LPARAM>(page_); }

    template <typename Value>
    Value read(const void* address) const {
        Value value = {};
        ReadProcessMemory(process_, address, &value, sizeof value, nullptr);
        return value;
    }
    template <typename Value>
    Value read() const {
        return read<Value>(page_);
    }

    template <typename Value>
    void write(const Value& value) const {
        WriteProcessMemory(process_, page_, &value, sizeof value, nullptr);
    }

private:
    HANDLE process_ = nullptr;
    void* page_ = nullptr;
};

struct ShortText {
    wchar_t letters[512];
    std::wstring string() const { return std::wstring(letters, wcsnlen(letters, 512)); }
};

// ---- Windows ------------------------------------------------------------------------------------

std::wstring ClassOf(HWND window) {
    wchar_t name[128] = L"";
    GetClassNameW(window, name, 128);
    return name;
}

// WM_GETTEXT, as only it reads another process's edit; a program that hangs gives no text.
std::wstring TextOf(HWND window) {
    wchar_t text[1024] = L"";
    DWORD_PTR length = 0;
    SendMessageTimeoutW(window, WM_GETTEXT, 1024, reinterpret_cast<LPARAM>(text), SMTO_ABORTIFHUNG,
                        2000, &length);
    return text;
}

RECT ClientOnScreen(HWND window) {
    RECT client = {};
    GetClientRect(window, &client);
    MapWindowPoints(window, nullptr, reinterpret_cast<POINT*>(&client), 2);
    return client;
}

bool HasFocus(HWND window) {
    GUITHREADINFO info = {};
    info.cbSize = sizeof info;
    GetGUIThreadInfo(GetWindowThreadProcessId(window, nullptr), &info);
    return info.hwndFocus == window && info.hwndActive == GetForegroundWindow();
}

std::string StatusParts(HWND bar) {
    const RemotePage page(bar);
    std::vector<std::string> parts;
    const LRESULT count = SendMessageW(bar, SB_GETPARTS, 0, 0);
    for (LRESULT part = 0; part < count; ++part) {
        SendMessageW(bar, SB_GETTEXTW, static_cast<WPARAM>(part), page.address());
        parts.push_back(Quoted(page.read<ShortText>().string()));
    }
    return List(parts);
}

// ---- Lists and trees ----

// Room for a text beside the structure that a message fills.
constexpr LPARAM kTextOffset = 1024;

template <typename Item>
Item ItemWithRoom(const RemotePage& page) {
    Item item = {};
    item.pszText = reinterpret_cast<wchar_t*>(page.address() + kTextOffset);
    item.cchTextMax = 512;
    return item;
}

std::string ListText(HWND list, const RemotePage& page, int row, int column) {
    auto item = ItemWithRoom<LVITEMW>(page);
    item.iSubItem = column;
    page.write(item);
    SendMessageW(list, LVM_GETITEMTEXTW, static_cast<WPARAM>(row), page.address());
    return Quoted(page.read<ShortText>(item.pszText).string());
}

RECT RemoteRectangle(HWND window, const RemotePage& page) {
    RECT place = page.read<RECT>();
    MapWindowPoints(window, nullptr, reinterpret_cast<POINT*>(&place), 2);
    return place;
}

// Each row: its texts, its rectangle, whether it is selected.
std::string ListRows(HWND list) {
    const RemotePage page(list);
    const auto header = reinterpret_cast<HWND>(SendMessageW(list, LVM_GETHEADER, 0, 0));
    const int columns = static_cast<int>(SendMessageW(header, HDM_GETITEMCOUNT, 0, 0));
    const int count = static_cast<int>(SendMessageW(list, LVM_GETITEMCOUNT, 0, 0));
    std::vector<std::string> rows;
    for (int row = 0; row < count; ++row) {
        std::vector<std::string> texts;
        for (int column = 0; column < columns; ++column) {
            texts.push_back(ListText(list, page, row, column));
        }
        page.write(RECT{LVIR_LABEL, 0, 0, 0});
        SendMessageW(list, LVM_GETITEMRECT, static_cast<WPARAM>(row), page.address());
        const bool selected =
            SendMessageW(list, LVM_GETITEMSTATE, static_cast<WPARAM>(row), LVIS_SELECTED) != 0;
        rows.push_back("{\"texts\": " + List(texts) +
                       ", \"rect\": " + Rectangle(RemoteRectangle(list, page)) +
                       ", \"selected\": " + (selected ? "true" : "false") + "}");
    }
    return List(rows);
}

// The items that are not folded away, from the top.
std::string TreeItems(HWND tree) {
    const RemotePage page(tree);
    std::vector<std::string> items;
    LRESULT handle = SendMessageW(tree, TVM_GETNEXTITEM, TVGN_ROOT, 0);
    for (; handle; handle = SendMessageW(tree, TVM_GETNEXTITEM, TVGN_NEXTVISIBLE, handle)) {
        auto item = ItemWithRoom<TVITEMW>(page);
        item.mask = TVIF_HANDLE | TVIF_TEXT;
        item.hItem = reinterpret_cast<HTREEITEM>(handle);
        page.write(item);
        SendMessageW(tree, TVM_GETITEMW, 0, page.address());
        const std::string text = Quoted(page.read<ShortText>(item.pszText).string());
        page.write(item.hItem);  // in the rectangle's place, as the message wants it
        const WPARAM ofTextOnly = TRUE;
        const LRESULT shown = SendMessageW(tree, TVM_GETITEMRECT, ofTextOnly, page.address());
        if (!shown) continue;
        items.push_back("{\"text\": " + text +
                        ", \"rect\": " + Rectangle(RemoteRectangle(tree, page)) + "}");
    }
    return List(items);
}

// ---- Headers ----

std::string HeaderSizes(HWND header) {
    std::vector<std::string> sizes;
    const LRESULT count = SendMessageW(header, HCM_GETITEMCOUNT, 0, 0);
    for (LRESULT item = 0; item < count; ++item) {
        sizes.push_back(
            std::to_string(SendMessageW(header, HCM_GETITEMSIZE, static_cast<WPARAM>(item), 0)));
    }
    return List(sizes);
}

// The first item's label. The program's copy of it cannot be freed from here: some bytes stay
// behind in there each time.
std::string FirstLabel(HWND header) {
    const RemotePage page(header);
    if (SendMessageW(header, HCM_GETITEM, 0, page.address()) != TRUE) return "null";
    return Quoted(page.read<ShortText>(page.read<HeaderItemDesc>().text).string());
}

std::string Describe(HWND window);

BOOL CALLBACK AddVisible(HWND window, LPARAM list) {
    if (IsWindowVisible(window)) {
        reinterpret_cast<std::vector<std::string>*>(list)->push_back(Describe(window));
    }
    return TRUE;
}

// EnumChildWindows would give grandchildren as well.
std::string Children(HWND window) {
    std::vector<std::string> children;
    for (HWND child = GetWindow(window, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT)) {
        AddVisible(child, reinterpret_cast<LPARAM>(&children));
    }
    return List(children);
}

std::string Describe(HWND window) {
    RECT outer = {};
    GetWindowRect(window, &outer);
    const std::wstring windowClass = ClassOf(window);
    std::string extra;
    if (windowClass == STATUSCLASSNAMEW) extra = ", \"parts\": " + StatusParts(window);
    if (windowClass == KORHEADER_CLASS) {
        extra = ", \"sizes\": " + HeaderSizes(window) + ", \"firstLabel\": " + FirstLabel(window);
    }
    if (windowClass == WC_LISTVIEWW) extra = ", \"rows\": " + ListRows(window);
    if (windowClass == WC_TREEVIEWW) extra = ", \"items\": " + TreeItems(window);
    return "{\"class\": " + Quoted(windowClass) +
           ", \"id\": " + std::to_string(GetDlgCtrlID(window)) +
           ", \"text\": " + Quoted(TextOf(window)) + ", \"rect\": " + Rectangle(outer) +
           ", \"client\": " + Rectangle(ClientOnScreen(window)) +
           ", \"enabled\": " + (IsWindowEnabled(window) ? "true" : "false") +
           ", \"focus\": " + (HasFocus(window) ? "true" : "false") + extra +
           ", \"children\": " + Children(window) + "}";
}

void Answer() {
    std::vector<std::string> windows;
    EnumWindows(AddVisible, reinterpret_cast<LPARAM>(&windows));
    std::cout << List(windows) << std::endl;
}

// ---- The clipboard ----

std::string ClipboardText() {
    const HANDLE block = GetClipboardData(CF_UNICODETEXT);
    if (!block) return "null";
    const std::string text = Quoted(static_cast<const wchar_t*>(GlobalLock(block)));
    GlobalUnlock(block);
    return text;
}

std::string ClipboardPicture() {
    const HANDLE block = GetClipboardData(CF_DIB);
    if (!block) return "null";
    const auto& header = *static_cast<const BITMAPINFOHEADER*>(GlobalLock(block));
    const std::string size =
        List({std::to_string(header.biWidth), std::to_string(header.biHeight)});
    GlobalUnlock(block);
    return size;
}

void PrintClipboard() {
    if (!OpenClipboard(nullptr)) return;
    std::cout << "{\"text\": " + ClipboardText() + ", \"picture\": " + ClipboardPicture() + "}"
              << std::endl;
    CloseClipboard();
}

void PutOnClipboard(const std::string& utf8) {
    const int length =
        MultiByteToWideChar(CP_UTF8, 0, utf8.data(), static_cast<int>(utf8.size()), nullptr, 0);
    const HGLOBAL block =
        GlobalAlloc(GMEM_MOVEABLE | GMEM_ZEROINIT, (static_cast<size_t>(length) + 1) * 2);
    MultiByteToWideChar(CP_UTF8, 0, utf8.data(), static_cast<int>(utf8.size()),
                        static_cast<wchar_t*>(GlobalLock(block)), length);
    GlobalUnlock(block);
    if (!OpenClipboard(nullptr)) return;
    EmptyClipboard();
    SetClipboardData(CF_UNICODETEXT, block);
    CloseClipboard();
}

std::string ReadInput() {
    _setmode(_fileno(stdin), _O_BINARY);
    return {std::istreambuf_iterator<char>(std::cin), std::istreambuf_iterator<char>()};
}

}  // namespace

int main(int count, char** arguments) {
    if (count == 2 && std::strcmp(arguments[1], "--serve") == 0) {
        for (std::string line; std::getline(std::cin, line);) Answer();
    } else if (count == 2 && std::strcmp(arguments[1], "--clipboard") == 0) {
        PrintClipboard();
    } else if (count == 2 && std::strcmp(arguments[1], "--put") == 0) {
        PutOnClipboard(ReadInput());
    } else {
        Answer();
    }
    return 0;
}

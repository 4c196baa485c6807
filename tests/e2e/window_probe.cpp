// Prints what a person would see of the running programs' windows, as JSON: one line per question.
//
//   window_probe          answers once
//   window_probe --serve  answers each line of standard input, until its end
//
// An answer is the list of visible top-level windows, each with its visible children. Rectangles
// are [left, top, right, bottom] in screen pixels, right and bottom exclusive.
#include <korcontrols/header.h>

#include <commctrl.h>

#include <cstring>
#include <iostream>
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

    template <typename Value> Value read(const void* address) const {
        Value value = {};
        ReadProcessMemory(process_, address, &value, sizeof value, nullptr);
        return value;
    }
    template <typename Value> Value read() const { return read<Value>(page_); }

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

} // namespace

int main(int count, char** arguments) {
    if (count == 2 && std::strcmp(arguments[1], "--serve") == 0) {
        for (std::string line; std::getline(std::cin, line);) Answer();
    } else {
        Answer();
    }
    return 0;
}

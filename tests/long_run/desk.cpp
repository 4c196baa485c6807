#include "desk.h"

#include "message_routing.h"
#include "workbook_window.h"

#include <commctrl.h>
#include <commdlg.h>

#include <stdexcept>
#include <utility>

namespace longrun {

namespace {

constexpr int kMostMessages = 20000;  // after one gesture; more would never end
constexpr UINT kAnswerDialog = WM_APP;

LPARAM Position(POINT place) {
    return MAKELPARAM(static_cast<WORD>(place.x), static_cast<WORD>(place.y));
}

std::wstring TextOf(HWND window) {
    std::wstring text(static_cast<std::size_t>(GetWindowTextLengthW(window)) + 1, L'\0');
    text.resize(static_cast<std::size_t>(
        GetWindowTextW(window, text.data(), static_cast<int>(text.size()))));
    return text;
}

// It may not be shown yet: dialogs are when no message waits.
BOOL CALLBACK FindDialog(HWND window, LPARAM found) {
    wchar_t name[16] = {};
    GetClassNameW(window, name, ARRAYSIZE(name));
    if (lstrcmpW(name, L"#32770") == 0) *reinterpret_cast<HWND*>(found) = window;
    return !*reinterpret_cast<HWND*>(found);
}

// While it lives GetKeyState tells that the keys are down.
class KeysHeld {
public:
    explicit KeysHeld(std::vector<int> keys) : keys_(std::move(keys)) { set(0x80); }
    ~KeysHeld() { set(0); }
    KeysHeld(const KeysHeld&) = delete;
    KeysHeld& operator=(const KeysHeld&) = delete;

private:
    void set(BYTE state) const {
        BYTE all[256] = {};
        GetKeyboardState(all);
        for (const int key : keys_) all[key] = state;
        SetKeyboardState(all);
    }

    std::vector<int> keys_;
};

}  // namespace

std::string Narrow(const std::wstring& text) {
    std::string narrow;
    for (const wchar_t character : text)
        narrow += character < 0x80 ? static_cast<char>(character) : '?';
    return narrow;
}

Desk::Desk() : spy_(GetModuleHandleW(nullptr)) {
    const auto replace = [this](const char* name, int arguments, auto handler) {
        if (!spy_.watch(name, arguments, kortest::CallingConvention::Stdcall))
            throw std::runtime_error(std::string("the workbook does not call ") + name);
        spy_.replace(name, handler);
    };
    replace("MessageBoxW", 4, [this](ULONG_PTR* arguments) {
        return static_cast<ULONG_PTR>(onQuestion(reinterpret_cast<const wchar_t*>(arguments[1])));
    });
    for (const char* name : {"GetOpenFileNameW", "GetSaveFileNameW"}) {
        replace(name, 1, [this](ULONG_PTR* arguments) {
            return static_cast<ULONG_PTR>(onFileDialog(reinterpret_cast<void*>(arguments[0])));
        });
    }
    WNDCLASSW windowClass = {};
    windowClass.lpfnWndProc = helperProc;
    windowClass.lpszClassName = L"Long run";
    RegisterClassW(&windowClass);
    helper_ =
        CreateWindowW(L"Long run", nullptr, 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr, nullptr, nullptr);
    SetWindowLongPtrW(helper_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));

    const INITCOMMONCONTROLSEX controls = {sizeof controls, ICC_BAR_CLASSES};
    InitCommonControlsEx(&controls);
    workbook_.instance = GetModuleHandleW(nullptr);
    if (!helper_ || !workbook::CreateWorkbookWindow(workbook_, {}, SW_SHOW))
        throw std::runtime_error("the workbook's window could not be created");
    SetForegroundWindow(workbook_.window);
    handleMessages();
}

Desk::~Desk() {
    if (workbook_.grid) DestroyWindow(workbook_.window);
    DestroyWindow(helper_);
}

// ---- Gestures ----

void Desk::handleMessages() {
    MSG message = {};
    for (int count = 0; !hasEnded_; ++count) {
        if (!PeekMessageW(&message, nullptr, 0, 0, PM_NOREMOVE)) {
            workbook::OnIdle(workbook_);
            if (!PeekMessageW(&message, nullptr, 0, 0, PM_NOREMOVE)) return;
        }
        if (count == kMostMessages) return complain("messages without an end");
        hasEnded_ = !workbook::HandleNextMessage(workbook_);
    }
}

void Desk::post(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    PostMessageW(window, message, wParam, lParam);
    handleMessages();
}

void Desk::key(WPARAM key) { post(GetFocus(), WM_KEYDOWN, key, 1); }

void Desk::keyWith(std::vector<int> held, WPARAM pressed) {
    const KeysHeld keys(std::move(held));
    key(pressed);
}

void Desk::type(const std::wstring& text) {
    if (text.empty()) return;
    post(GetFocus(), WM_CHAR, text.front(), 1);  // which may lead to the equation bar
    for (const wchar_t character : text.substr(1)) PostMessageW(GetFocus(), WM_CHAR, character, 1);
    handleMessages();
}

void Desk::command(UINT id) { post(workbook_.window, WM_COMMAND, id, 0); }

void Desk::wheel(int notches, WORD keys) {
    const auto distance = static_cast<WORD>(notches * WHEEL_DELTA);
    RECT area = {};
    GetWindowRect(workbook_.grid, &area);
    post(GetFocus(), WM_MOUSEWHEEL, MAKEWPARAM(keys, distance),
         Position({area.left + 50, area.top + 50}));
}

void Desk::press(HWND window, POINT place) { drag(window, place, place); }

void Desk::drag(HWND window, POINT from, POINT to) {
    post(window, WM_LBUTTONDOWN, MK_LBUTTON, Position(from));
    if (from.x != to.x || from.y != to.y) post(window, WM_MOUSEMOVE, MK_LBUTTON, Position(to));
    post(window, WM_LBUTTONUP, 0, Position(to));
}

void Desk::focusGrid() {
    SetFocus(workbook_.grid);
    handleMessages();
}

// ---- Dialogs ----

void Desk::commandWithDialog(UINT id, const std::function<void(HWND)>& answer) {
    dialogAnswer_ = answer;
    PostMessageW(workbook_.window, WM_COMMAND, id, 0);
    PostMessageW(helper_, kAnswerDialog, 0, 0);  // which the dialog's own loop will handle
    handleMessages();
}

LRESULT CALLBACK Desk::helperProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message != kAnswerDialog) return DefWindowProcW(window, message, wParam, lParam);
    reinterpret_cast<Desk*>(GetWindowLongPtrW(window, GWLP_USERDATA))->answerDialog();
    return 0;
}

void Desk::answerDialog() {
    HWND dialog = nullptr;
    EnumThreadWindows(GetCurrentThreadId(), FindDialog, reinterpret_cast<LPARAM>(&dialog));
    if (!dialog) return complain("no dialog opened");
    dialogAnswer_(dialog);
}

int Desk::onQuestion(const wchar_t* text) {
    if (answers_.empty()) {
        complain("unexpected question: " + Narrow(text));
        return IDCANCEL;
    }
    const int answer = answers_.front();
    answers_.pop_front();
    return answer;
}

BOOL Desk::onFileDialog(void* dialog) {
    if (files_.empty()) {
        complain("unexpected file dialog");
        return FALSE;
    }
    auto& record = *static_cast<OPENFILENAMEW*>(dialog);
    lstrcpynW(record.lpstrFile, files_.front().c_str(), static_cast<int>(record.nMaxFile));
    files_.pop_front();
    return TRUE;
}

// ---- What is seen ----

std::wstring Desk::title() const { return TextOf(workbook_.window); }

std::wstring Desk::equation() const { return TextOf(GetHandleToEquationControl()); }

GridSelection Desk::selection() const {
    GridSelection selection = {};
    GetSelectedRanged(&selection);
    return selection;
}

HWND Desk::header(int id) const { return GetDlgItem(workbook_.grid, id); }

std::string Desk::takeComplaint() {
    spy_.clearCalls();  // or the list of them would grow
    if (!answers_.empty()) complain("a question was not asked");
    if (!files_.empty()) complain("a file dialog did not open");
    answers_.clear();
    files_.clear();
    return std::exchange(complaint_, {});
}

}  // namespace longrun

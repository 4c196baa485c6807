// Uses a modal property sheet as somebody in front of it would, from a timer inside its own message
// loop. A sheet or message box that nobody closes is closed after some seconds and fails the test.
#pragma once

#include <windows.h>

#include <functional>
#include <set>
#include <string>
#include <vector>

namespace kortest {

struct BoxSeen {
    HWND owner;
    std::wstring caption;
    std::wstring text;
    std::vector<int> buttons;  // ids
};

class SheetDriver {
public:
    SheetDriver();
    ~SheetDriver();
    SheetDriver(const SheetDriver&) = delete;
    SheetDriver& operator=(const SheetDriver&) = delete;

    // Does `open`, which brings the sheet; `use` runs once while it is up. A sheet that `use`
    // leaves open is cancelled. Message boxes are noted and answered with OK.
    void run(const std::function<void()>& open, const std::function<void(HWND sheet)>& use);

    bool wasUp() const { return wasUp_; }
    const std::vector<BoxSeen>& boxes() const { return boxes_; }

private:
    static void CALLBACK onTimer(HWND window, UINT message, UINT_PTR id, DWORD now);
    void step();
    void answer(HWND box);

    UINT_PTR timer_ = 0;
    std::function<void(HWND)> use_;
    bool wasUp_ = false;
    ULONGLONG deadline_ = 0;
    std::vector<BoxSeen> boxes_;
    std::set<HWND> answered_;
};

// The sheet's pages; the second exists from its first showing on.
constexpr int kTitlesPage = 0;
constexpr int kDataPage = 1;
HWND ShowPage(HWND sheet, int page);

void PressOk(HWND sheet);
void PressCancel(HWND sheet);

// Replaces an edit control's text by typing.
void TypeInto(HWND page, int editId, const std::wstring& text);

std::wstring TextIn(HWND page, int controlId);
void Choose(HWND page, int comboId, int item);
int Chosen(HWND page, int comboId);
std::vector<std::wstring> ItemsOf(HWND combo);

}  // namespace kortest

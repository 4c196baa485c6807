// The workbook's window in this process, and somebody's hands on it: keys and mouse as messages to
// the window that would get them, and answers for dialogs. Nothing waits: after each gesture the
// window handles all of its messages.
#pragma once

#include "support/import_spy.h"
#include "workbook.h"

#include <deque>
#include <functional>
#include <string>
#include <vector>

namespace longrun {

class Desk {
public:
    Desk();
    ~Desk();
    Desk(const Desk&) = delete;
    Desk& operator=(const Desk&) = delete;

    workbook::Workbook& book() { return workbook_; }

    // ---- Gestures

    void key(WPARAM key);
    void keyWith(std::vector<int> held, WPARAM key);  // VK_CONTROL and the like
    void type(const std::wstring& text);
    void command(UINT id);
    void wheel(int notches, WORD keys);
    void press(HWND window, POINT place);
    void drag(HWND window, POINT from, POINT to);
    void post(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    void focusGrid();

    // The same as a command; `answer` is called with the dialog that it opens.
    void commandWithDialog(UINT id, const std::function<void(HWND dialog)>& answer);

    // ---- What dialogs of the system answer. They are not shown.

    void answerNextQuestion(int answer) { answers_.push_back(answer); }
    void chooseNextFile(const std::wstring& path) { files_.push_back(path); }

    // ---- What is seen

    std::wstring title() const;
    std::wstring equation() const;
    bool hasEnded() const { return hasEnded_; }
    GridSelection selection() const;
    HWND columnHeader() const { return header(2); }
    HWND rowHeader() const { return header(3); }

    // What was not expected: a question without an answer, a dialog that did not open, an answer
    // that nobody asked for. Empty when all is well.
    std::string takeComplaint();

private:
    static LRESULT CALLBACK helperProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);

    HWND header(int id) const;
    void handleMessages();
    void answerDialog();
    int onQuestion(const wchar_t* text);
    BOOL onFileDialog(void* dialog);
    void complain(const std::string& what) { complaint_ += what + "; "; }

    workbook::Workbook workbook_;
    kortest::ImportSpy spy_;
    HWND helper_ = nullptr;
    std::function<void(HWND)> dialogAnswer_;
    std::deque<int> answers_;
    std::deque<std::wstring> files_;
    std::string complaint_;
    bool hasEnded_ = false;
};

std::string Narrow(const std::wstring& text);

}  // namespace longrun

#include "file_commands.h"

#include <commdlg.h>
#include <shellapi.h>

#include <array>

#include "equation_bar.h"
#include "view_commands.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

namespace {

constexpr const wchar_t* kFilter = L"CSV files (*.csv)\0*.csv\0"
                                   L"Text files (*.txt;*.tsv)\0*.txt;*.tsv\0"
                                   L"All files (*.*)\0*.*\0";
constexpr size_t kLongestPath = 4096;

// An hourglass for as long as it lives.
class WaitCursor {
public:
    WaitCursor() : previous_(SetCursor(LoadCursorW(nullptr, IDC_WAIT))) {
        // A program that has just started has no cursor yet.
        if (!previous_) previous_ = LoadCursorW(nullptr, IDC_ARROW);
    }
    ~WaitCursor() { SetCursor(previous_); }
    WaitCursor(const WaitCursor&) = delete;
    WaitCursor& operator=(const WaitCursor&) = delete;

private:
    HCURSOR previous_;
};

void ShowProblem(const Workbook& workbook, const FileProblem& problem) {
    MessageBoxW(workbook.window, problem.message.c_str(), L"Workbook", MB_OK | MB_ICONWARNING);
}

// The dialogs' common part. `file` holds the suggested name and receives the chosen path.
OPENFILENAMEW FileDialog(const Workbook& workbook, std::array<wchar_t, kLongestPath>& file) {
    OPENFILENAMEW dialog = {};
    dialog.lStructSize = sizeof dialog;
    dialog.hwndOwner = workbook.window;
    dialog.lpstrFilter = kFilter;
    dialog.lpstrFile = file.data();
    dialog.nMaxFile = static_cast<DWORD>(file.size());
    dialog.lpstrDefExt = L"csv";
    return dialog;
}

bool SaveTo(Workbook& workbook, const std::wstring& path) {
    const WaitCursor wait;
    const std::optional<FileProblem> problem = workbook.document.save(path);
    if (problem) ShowProblem(workbook, *problem);
    ShowTitle(workbook);
    return !problem;
}

void Load(Workbook& workbook, const std::wstring& path) {
    std::optional<FileProblem> problem;
    {
        const WaitCursor wait;
        problem = workbook.document.open(path);
        if (!problem) ShowDocumentFromStart(workbook);
    }
    if (problem) ShowProblem(workbook, *problem);
}

}  // namespace

void NewDocument(Workbook& workbook) {
    if (!MayDiscard(workbook)) return;
    workbook.document.startNew();
    ShowDocumentFromStart(workbook);
}

void OpenWithDialog(Workbook& workbook) {
    if (!MayDiscard(workbook)) return;
    std::array<wchar_t, kLongestPath> file = {};
    OPENFILENAMEW dialog = FileDialog(workbook, file);
    dialog.Flags = OFN_EXPLORER | OFN_FILEMUSTEXIST | OFN_PATHMUSTEXIST | OFN_HIDEREADONLY;
    if (GetOpenFileNameW(&dialog)) Load(workbook, file.data());
}

void OpenFile(Workbook& workbook, const std::wstring& path) {
    if (MayDiscard(workbook)) Load(workbook, path);
}

bool Save(Workbook& workbook) {
    CommitTyping(workbook);
    const std::wstring path = workbook.document.path();
    return path.empty() ? SaveAs(workbook) : SaveTo(workbook, path);
}

bool SaveAs(Workbook& workbook) {
    CommitTyping(workbook);
    std::array<wchar_t, kLongestPath> file = {};
    lstrcpynW(file.data(), workbook.document.name().c_str(), static_cast<int>(file.size()));
    OPENFILENAMEW dialog = FileDialog(workbook, file);
    dialog.Flags = OFN_EXPLORER | OFN_OVERWRITEPROMPT | OFN_PATHMUSTEXIST | OFN_HIDEREADONLY;
    return GetSaveFileNameW(&dialog) && SaveTo(workbook, file.data());
}

bool MayDiscard(Workbook& workbook) {
    CommitTyping(workbook);
    if (!workbook.document.isModified()) return true;
    const std::wstring question = L"Save the changes to " + workbook.document.name() + L"?";
    switch (MessageBoxW(workbook.window, question.c_str(), L"Workbook",
                        MB_YESNOCANCEL | MB_ICONQUESTION)) {
    case IDYES: return Save(workbook);
    case IDNO: return true;
    default: return false;
    }
}

void OnDropFiles(Workbook& workbook, HDROP drop) {
    std::array<wchar_t, kLongestPath> file = {};
    const bool any = DragQueryFileW(drop, 0, file.data(), static_cast<UINT>(file.size())) != 0;
    DragFinish(drop);
    if (!any) return;
    SetForegroundWindow(workbook.window);
    OpenFile(workbook, file.data());
}

}  // namespace workbook

#include "file_commands.h"

#include <commdlg.h>
#include <shellapi.h>

#include <array>
#include <memory>
#include <utility>
#include <vector>

#include "equation_bar.h"
#include "sheet_bar.h"
#include "sheet_switch.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

namespace {

constexpr const wchar_t* kFilter = L"CSV files (*.csv)\0*.csv\0"
                                   L"Text files (*.txt;*.tsv)\0*.txt;*.tsv\0"
                                   L"All files (*.*)\0*.*\0";
constexpr size_t kLongestPath = 4096;
constexpr UINT kCountFiles = 0xFFFFFFFF;  // asks DragQueryFileW how many there are

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

std::wstring FolderOf(const std::wstring& path) {
    const size_t slash = path.find_last_of(L"\\/");
    return slash == std::wstring::npos ? std::wstring() : path.substr(0, slash + 1);
}

// The dialogs' common part: they begin in `folder`, the system's choice when it is empty. `file`
// holds the suggested name and receives the chosen path.
OPENFILENAMEW FileDialog(const Workbook& workbook, const std::wstring& folder,
                         std::array<wchar_t, kLongestPath>& file) {
    OPENFILENAMEW dialog = {};
    dialog.lStructSize = sizeof dialog;
    dialog.hwndOwner = workbook.window;
    dialog.lpstrFilter = kFilter;
    dialog.lpstrFile = file.data();
    dialog.nMaxFile = static_cast<DWORD>(file.size());
    dialog.lpstrDefExt = L"csv";
    if (!folder.empty()) dialog.lpstrInitialDir = folder.c_str();
    return dialog;
}

// Whether to write a file that others have changed or removed. What they wrote goes only by a "Yes"
// that was meant; what they removed is written again by Enter, too.
bool MayReplace(const Workbook& workbook, const FileProblem& problem) {
    const bool isChanged = problem.kind == FileProblemKind::ChangedByOthers;
    const std::wstring question =
        problem.message + (isChanged
                               ? L"\n\nReplace it, and lose those changes? (Save As keeps both.)"
                               : L"\n\nSave it again?");
    const UINT preset = isChanged ? MB_DEFBUTTON2 : MB_DEFBUTTON1;
    return MessageBoxW(workbook.window, question.c_str(), L"Workbook",
                       MB_YESNO | MB_ICONWARNING | preset) == IDYES;
}

using SaveFunction = std::optional<FileProblem> (Document::*)(const std::wstring&) noexcept;

std::optional<FileProblem> SaveBy(SaveFunction save, Workbook& workbook, const std::wstring& path) {
    const WaitCursor wait;
    return (workbook.document().*save)(path);
}

//   result  whether the sheet is saved now
bool SaveTo(Workbook& workbook, const std::wstring& path, SaveFunction save) {
    std::optional<FileProblem> problem = SaveBy(save, workbook, path);
    if (problem && problem->kind != FileProblemKind::Failed) {
        if (!MayReplace(workbook, *problem)) return false;
        problem = SaveBy(&Document::saveOver, workbook, path);
    }
    if (problem) ShowProblem(workbook, *problem);
    ShowTitle(workbook);
    return !problem;
}

// Paths are compared to find a file that is open already.
std::wstring FullPath(const std::wstring& path) {
    std::array<wchar_t, kLongestPath> full = {};
    const DWORD length =
        GetFullPathNameW(path.c_str(), static_cast<DWORD>(full.size()), full.data(), nullptr);
    return length > 0 && length < full.size() ? full.data() : path;
}

std::optional<FileProblem> Load(Workbook& workbook, const std::wstring& path) {
    const WaitCursor wait;
    auto sheet = std::make_unique<OpenSheet>();
    std::optional<FileProblem> problem = sheet->document.open(path);
    if (problem) return problem;
    LeaveSheet(workbook);
    workbook.sheets.add(std::move(sheet));
    ShowSheetFirstTime(workbook);
    return std::nullopt;
}

// Two sheets with one file would each write over what the other one wrote.
bool IsOpenInAnotherSheet(const Workbook& workbook, const std::wstring& path) {
    const std::optional<size_t> index = workbook.sheets.find(path);
    return index && *index != workbook.sheets.currentIndex();
}

// Asks about unsaved changes of the current sheet, and saves them if wanted.
//   result  whether the sheet may go
bool MayDiscard(Workbook& workbook) {
    if (!workbook.document().isModified()) return true;
    const std::wstring question = L"Save the changes to " + workbook.document().name() + L"?";
    switch (MessageBoxW(workbook.window, question.c_str(), L"Workbook",
                        MB_YESNOCANCEL | MB_ICONQUESTION)) {
    case IDYES: return Save(workbook);
    case IDNO: return true;
    default: return false;
    }
}

}  // namespace

void OpenWithDialog(Workbook& workbook) {
    CommitTyping(workbook);
    std::array<wchar_t, kLongestPath> file = {};
    const std::wstring folder = FolderOf(workbook.document().path());
    OPENFILENAMEW dialog = FileDialog(workbook, folder, file);
    dialog.Flags = OFN_EXPLORER | OFN_FILEMUSTEXIST | OFN_PATHMUSTEXIST | OFN_HIDEREADONLY;
    if (GetOpenFileNameW(&dialog)) OpenFile(workbook, file.data());
}

void OpenFile(Workbook& workbook, const std::wstring& path) {
    const std::wstring full = FullPath(path);
    if (const std::optional<size_t> index = workbook.sheets.find(full)) {
        return SelectSheet(workbook, *index);
    }
    if (const std::optional<FileProblem> problem = Load(workbook, full)) {
        ShowProblem(workbook, *problem);
    }
}

bool Save(Workbook& workbook) {
    CommitTyping(workbook);
    const std::wstring path = workbook.document().path();
    return path.empty() ? SaveAs(workbook) : SaveTo(workbook, path, &Document::save);
}

bool SaveAs(Workbook& workbook) {
    CommitTyping(workbook);
    std::array<wchar_t, kLongestPath> file = {};
    lstrcpynW(file.data(), workbook.document().name().c_str(), static_cast<int>(file.size()));
    const std::wstring folder = FolderOf(workbook.document().path());
    OPENFILENAMEW dialog = FileDialog(workbook, folder, file);
    dialog.Flags = OFN_EXPLORER | OFN_OVERWRITEPROMPT | OFN_PATHMUSTEXIST | OFN_HIDEREADONLY;
    if (!GetSaveFileNameW(&dialog)) return false;
    if (IsOpenInAnotherSheet(workbook, file.data())) {
        ShowProblem(workbook, {L"\"" + std::wstring(file.data()) +
                               L"\" is open as another sheet. Choose another name."});
        return false;
    }
    // The dialog has asked whether an existing file is to be replaced.
    return SaveTo(workbook, file.data(), &Document::saveOver);
}

void CloseSheet(Workbook& workbook) {
    CommitTyping(workbook);
    if (!MayDiscard(workbook)) return;
    RemoveFromSheetBar(workbook, workbook.sheets.currentIndex());
    workbook.sheets.closeCurrent();
    ShowSheet(workbook);
}

bool MayEnd(Workbook& workbook) {
    CommitTyping(workbook);
    for (size_t index = 0; index < workbook.sheets.count(); ++index) {
        if (!workbook.sheets.at(index).document.isModified()) continue;
        SelectSheet(workbook, index);
        if (!MayDiscard(workbook)) return false;
    }
    return true;
}

void OnDropFiles(Workbook& workbook, HDROP drop) {
    std::vector<std::wstring> files(DragQueryFileW(drop, kCountFiles, nullptr, 0));
    for (UINT index = 0; index < files.size(); ++index) {
        std::array<wchar_t, kLongestPath> file = {};
        DragQueryFileW(drop, index, file.data(), static_cast<UINT>(file.size()));
        files[index] = file.data();
    }
    DragFinish(drop);
    SetForegroundWindow(workbook.window);
    for (const std::wstring& file : files) OpenFile(workbook, file);
}

}  // namespace workbook

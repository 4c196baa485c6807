#include "user.h"

#include "resource.h"

#include <korcontrols/header.h>

#include <commctrl.h>

#include <algorithm>
#include <cstdio>
#include <utility>

namespace longrun {

namespace {

constexpr std::size_t kMostSheets = 4;
constexpr int kFileNames = 8;
constexpr int kUsualRows = 60;
constexpr int kUsualColumns = 10;
constexpr int kLargestCopy = 60;  // cells
constexpr LONG kSmallestItem = 6;

const wchar_t* const kTexts[] = {L"x",          L"Harbour", L"Mill, old", L"say \"yes\"",
                                 L"Größe",      L"50 €",    L"'007",      L"TRUE",
                                 L"2026-11-22", L"a  b",    L"\"",        L"-",
                                 L"12%",        L"'",       L"1.5e3",     L"no=formula"};

std::wstring Letters(int column) {
    std::wstring letters;
    for (++column; column > 0; column = (column - 1) / 26)
        letters.insert(letters.begin(), static_cast<wchar_t>(L'A' + (column - 1) % 26));
    return letters;
}

std::wstring Name(Place place) { return Letters(place.column) + std::to_wstring(place.row + 1); }

std::wstring Name(const Area& area) { return Name(area.first) + L":" + Name(area.last); }

std::string ReadAll(const std::wstring& path) {
    FILE* const file = _wfopen(path.c_str(), L"rb");
    if (!file) return "(no file)";
    std::string bytes;
    char buffer[4096];
    for (std::size_t count; (count = std::fread(buffer, 1, sizeof buffer, file)) > 0;)
        bytes.append(buffer, count);
    std::fclose(file);
    return bytes;
}

void WriteAll(const std::wstring& path, const std::string& bytes) {
    FILE* const file = _wfopen(path.c_str(), L"wb");
    std::fwrite(bytes.data(), 1, bytes.size(), file);
    std::fclose(file);
}

void Answer(HWND dialog, UINT button) { SendMessageW(dialog, WM_COMMAND, button, 0); }

// The middle of an item of a header, along it, in the coordinates of the header's parent.
//   result  nothing: there is no such item
std::optional<LONG> MiddleOf(HWND header, int item, LONG POINT::*along) {
    if (item < 0 || item >= KorHeader_GetItemCount(header) || !IsWindowVisible(header))
        return std::nullopt;
    POINT start = {};
    MapWindowPoints(header, GetParent(header), &start, 1);
    LONG at = start.*along;
    for (int before = 0; before < item; ++before) at += KorHeader_GetItemSize(header, before);
    const LONG size = KorHeader_GetItemSize(header, item);
    if (size < kSmallestItem) return std::nullopt;
    return at + size / 2;
}

}  // namespace

struct User::Action {
    const char* name;
    int weight;
    void (User::*run)();
};

const std::vector<User::Action>& User::actions() {
    static const std::vector<Action> all = {
        {"type", 250, &User::typeText},
        {"type a formula", 50, &User::typeFormula},
        {"change", 30, &User::changeText},
        {"give up typing", 15, &User::giveUpTyping},
        {"empty by Backspace", 10, &User::emptyByBackspace},
        {"clear", 30, &User::clearCells},
        {"undo", 80, &User::undo},
        {"redo", 50, &User::redo},
        {"go to", 70, &User::goSomewhere},
        {"arrow", 90, &User::step},
        {"page", 20, &User::page},
        {"click", 60, &User::clickCell},
        {"drag", 15, &User::dragCells},
        {"copy and paste", 35, &User::copyAndPaste},
        {"cut and paste", 10, &User::cutAndPaste},
        {"paste beyond the sheet", 1, &User::pasteBeyond},
        {"wheel", 40, &User::turnWheel},
        {"zoom", 8, &User::zoom},
        {"show and hide parts", 6, &User::toggleParts},
        {"resize a column", 8, &User::resizeColumn},
        {"resize the window", 3, &User::resizeWindow},
        {"next sheet", 30, &User::nextSheet},
        {"new sheet", 3, &User::newSheet},
        {"close", 2, &User::closeSheet},
        {"open", 3, &User::reopen},
        {"save", 20, &User::save},
        {"save as", 1, &User::saveAsAnother},
        {"meet others", 1, &User::meetOthers},
        {"show and hide the chart", 10, &User::toggleChart},
        {"chart the selection", 5, &User::chartSelection},
        {"change the chart", 25, &User::changeChart},
        {"chart dialog", 3, &User::chartDialog},
        {"copy the chart", 2, &User::copyChart},
        {"press in the chart", 10, &User::pressChart},
        {"live data", 2, &User::liveChart},
        {"print", 1, &User::print},
        {"side panel", 6, &User::sidePanel},
        {"help", 1, &User::helpDialog},
    };
    return all;
}

User::User(Desk& desk, std::uint32_t seed, std::wstring folder)
    : desk_(desk), random_(seed), folder_(std::move(folder)) {}

void User::act() {
    const Action& action = anyAction();
    ++counts_[action.name];
    desk_.focusGrid();
    (this->*action.run)();
    check();
    if (!problem_.empty()) problem_ = std::string(action.name) + ": " + problem_;
}

// At first each of them once: what is made on first use is there when the first sample is taken.
const User::Action& User::anyAction() {
    if (counts_.size() < actions().size()) return actions()[counts_.size()];
    int total = 0;
    for (const Action& each : actions()) total += each.weight;
    int chosen = below(total);
    for (const Action& each : actions()) {
        chosen -= each.weight;
        if (chosen < 0) return each;
    }
    return actions().back();
}

// ---- What must be ----

void User::complain(const std::string& what) { problem_ += what + "; "; }

void User::check() {
    problem_ += desk_.takeComplaint();
    const std::wstring shown = desk_.equation();
    const std::wstring text = sheet().at(currentPlace());
    if (shown != text) {
        complain(Narrow(Name(currentPlace())) + " holds [" + Narrow(text) + "], shown is [" +
                 Narrow(shown) + "]");
    }
    const std::wstring title = desk_.title();
    if (title.starts_with(L'*') != sheet().isModified())
        complain("the title's mark of changes is wrong: " + Narrow(title));
    const std::size_t slash = sheet().path.rfind(L'\\');
    const std::wstring name =
        slash == std::wstring::npos ? L"Untitled" : sheet().path.substr(slash + 1);
    if (title.find(name) == std::wstring::npos)
        complain("the title should be about " + Narrow(name) + ": " + Narrow(title));
    if (desk_.hasEnded()) complain("the program has ended");
}

void User::expectSaved() {
    sheet().markSaved();
    files_[sheet().path] = sheet().csv();
    if (ReadAll(sheet().path) != files_[sheet().path])
        complain("the file " + Narrow(sheet().path) + " is not what the sheet must hold");
}

// ---- Chance ----

Place User::anyPlace() {
    if (oneIn(20)) return {below(200), below(20)};
    return {below(kUsualRows), below(kUsualColumns)};
}

Area User::anyArea() {
    const Place first = anyPlace();
    return {first, {first.row + below(8), first.column + below(4)}};
}

std::wstring User::anyText() {
    if (oneIn(200)) return std::wstring(static_cast<std::size_t>(below(400)) + 1, L'w');
    if (oneIn(3)) return kTexts[below(static_cast<int>(std::size(kTexts)))];
    std::wstring number = std::to_wstring(below(20000) - 5000);
    if (oneIn(2)) number += L"." + std::to_wstring(below(100));
    return number;
}

std::wstring User::anyFormula() {
    const std::wstring a = Name(anyPlace());
    const std::wstring b = Name(anyPlace());
    switch (below(7)) {
    case 0: return L"=SUM(" + Name(anyArea()) + L")";
    case 1: return L"=" + a + L"+" + b + L"*2";
    case 2: return L"=IF(" + a + L">" + b + L",\"more\",\"less\")";
    case 3: return L"=AVERAGE(" + Name(anyArea()) + L"," + b + L")";
    case 4: return L"=" + a + L"/0&\"x\"";
    case 5: return L"=MAX(" + Name(anyArea()) + L")%";
    default: return L"=" + a + L"+(";  // which cannot be read
    }
}

// ---- Cells ----

Place User::currentPlace() {
    const GridSelection selection = desk_.selection();
    return {selection.top, selection.left};
}

Area User::selectedArea() {
    const GridSelection selection = desk_.selection();
    return {{selection.top, selection.left}, {selection.bottom, selection.right}};
}

void User::beginTyping(const std::wstring& text) { desk_.type(text); }

void User::endTyping() {
    switch (below(5)) {
    case 0: return desk_.key(VK_TAB);
    case 1: return desk_.keyWith({VK_SHIFT}, VK_TAB);
    case 2: return desk_.key(VK_DOWN);
    default: return desk_.key(VK_RETURN);
    }
}

void User::typeText() {
    const Place place = currentPlace();
    const std::wstring text = anyText();
    beginTyping(text);
    endTyping();
    sheet().write({{place, text}});
}

void User::typeFormula() {
    const Place place = currentPlace();
    const std::wstring text = anyFormula();
    beginTyping(text);
    endTyping();
    sheet().write({{place, text}});
}

void User::changeText() {
    const Place place = currentPlace();
    const std::wstring text = sheet().at(place);
    desk_.key(VK_F2);
    desk_.type(L"9");
    desk_.key(VK_RETURN);
    sheet().write({{place, text + L"9"}});
}

void User::giveUpTyping() {
    beginTyping(anyText());
    desk_.key(VK_ESCAPE);
}

void User::emptyByBackspace() {
    const Place place = currentPlace();
    desk_.key(VK_BACK);
    desk_.key(VK_RETURN);
    sheet().write({{place, L""}});
}

void User::clearCells() {
    const Area area = selectedArea();
    desk_.key(VK_DELETE);
    sheet().clear(area);
}

void User::undo() {
    desk_.keyWith({VK_CONTROL}, 'Z');
    sheet().undo();
}

void User::redo() {
    desk_.keyWith({VK_CONTROL}, 'Y');
    sheet().redo();
}

void User::goTo(const Area& area) {
    const bool isCell = area.first == area.last;
    const std::wstring name = isCell ? Name(area.first) : Name(area);
    desk_.commandWithDialog(IDM_EDIT_GOTO, [&](HWND dialog) {
        SetDlgItemTextW(dialog, IDC_GOTO_ADDRESS, name.c_str());
        Answer(dialog, IDOK);
    });
    const Area selected = selectedArea();
    if (selected.first != area.first || selected.last != area.last)
        complain("not " + Narrow(name) + " but " + Narrow(Name(selected)) + " is selected");
}

void User::goSomewhere() {
    if (oneIn(2)) return goTo(anyArea());
    const Place place = anyPlace();
    goTo({place, place});
}

void User::step() {
    constexpr WPARAM kArrows[] = {VK_LEFT, VK_RIGHT, VK_UP, VK_DOWN};
    desk_.key(kArrows[below(4)]);
}

void User::page() {
    if (oneIn(4)) return desk_.keyWith({VK_CONTROL}, oneIn(2) ? VK_HOME : VK_END);
    desk_.key(oneIn(2) ? VK_PRIOR : VK_NEXT);
    if (currentPlace().row > 2000) goSomewhere();
}

std::optional<POINT> User::pointIn(int column, int row) {
    const std::optional<LONG> x = MiddleOf(desk_.columnHeader(), column, &POINT::x);
    const std::optional<LONG> y = MiddleOf(desk_.rowHeader(), row, &POINT::y);
    RECT area = {};
    GetClientRect(desk_.book().grid, &area);
    if (!x || !y || *x >= area.right || *y >= area.bottom) return std::nullopt;
    return POINT{*x, *y};
}

void User::clickCell() {
    const int column = below(4);
    const int row = below(10);
    const std::optional<POINT> place = pointIn(column, row);
    if (!place) return;
    GridVisibleRange range = {};
    GetVisibleRange(&range);
    desk_.press(desk_.book().grid, *place);
    const Place clicked = {range.firstRow + row, range.firstColumn + column};
    if (currentPlace() != clicked)
        complain("a click chose another cell than " + Narrow(Name(clicked)));
}

void User::dragCells() {
    const std::optional<POINT> from = pointIn(below(3), below(5));
    const std::optional<POINT> to = pointIn(below(3), below(5));
    if (from && to) desk_.drag(desk_.book().grid, *from, *to);
}

// ---- Clipboard ----

void User::paste() {
    const Place at = currentPlace();
    desk_.keyWith({VK_CONTROL}, 'V');
    if (!clipboard_) return;
    Texts texts;
    for (std::size_t row = 0; row < clipboard_->size(); ++row) {
        for (std::size_t column = 0; column < (*clipboard_)[row].size(); ++column) {
            texts.push_back({{at.row + static_cast<int>(row), at.column + static_cast<int>(column)},
                             (*clipboard_)[row][column]});
        }
    }
    sheet().write(texts);
}

// What is copied of a formula is its result, which is none of this book's business.
void User::copyAndPaste() {
    const Area area = selectedArea();
    const int cells =
        (area.last.row - area.first.row + 1) * (area.last.column - area.first.column + 1);
    if (cells <= kLargestCopy && !sheet().hasFormulaIn(area)) {
        desk_.keyWith({VK_CONTROL}, 'C');
        clipboard_ = sheet().copy(area);
    }
    goSomewhere();
    paste();
}

void User::cutAndPaste() {
    const Area area = selectedArea();
    const int cells =
        (area.last.row - area.first.row + 1) * (area.last.column - area.first.column + 1);
    if (cells > kLargestCopy || sheet().hasFormulaIn(area)) return;
    desk_.keyWith({VK_CONTROL}, 'X');
    clipboard_ = sheet().copy(area);
    sheet().clear(area);
    goSomewhere();
    paste();
}

void User::pasteBeyond() {
    const Place first = anyPlace();
    const Area area = {first, {first.row + 1, first.column + 1}};
    if (sheet().hasFormulaIn(area)) return;
    goTo(area);
    desk_.keyWith({VK_CONTROL}, 'C');
    clipboard_ = sheet().copy(area);
    const Place last = {SheetModel::kRows - 1, SheetModel::kColumns - 1};
    if (clipboard_->size() * clipboard_->front().size() > 1) {
        goTo({last, last});
        paste();
    }
    goSomewhere();
}

// ---- View ----

void User::turnWheel() {
    const int notches = below(7) - 3;
    desk_.wheel(notches ? notches : 1, oneIn(4) ? MK_SHIFT : 0);
}

void User::zoom() { desk_.command(IDM_VIEW_ZOOM_50 + static_cast<UINT>(below(5))); }

// Twice: with headers hidden nothing could be clicked.
void User::toggleParts() {
    constexpr UINT kParts[] = {IDM_VIEW_HEADERS, IDM_VIEW_GRID_LINES,
                               IDM_VIEW_HORIZONTAL_SCROLL_BAR, IDM_VIEW_VERTICAL_SCROLL_BAR,
                               IDM_VIEW_TITLE_ROW};
    const UINT part = kParts[below(5)];
    desk_.command(part);
    desk_.command(oneIn(3) ? IDM_VIEW_FIT_SIZES : part);
    if (oneIn(3)) return;
    desk_.command(part);
    desk_.command(part);
}

void User::resizeColumn() {
    const HWND header = desk_.columnHeader();
    const int item = below(3);
    if (!IsWindowVisible(header) || item >= KorHeader_GetItemCount(header)) return;
    LONG edge = 0;
    for (int each = 0; each <= item; ++each) edge += KorHeader_GetItemSize(header, each);
    if (KorHeader_GetItemSize(header, item) < kSmallestItem) return;
    desk_.drag(header, {edge - 1, 5}, {edge - 1 + below(60) - 25, 5});
}

void User::resizeWindow() {
    SetWindowPos(desk_.book().window, nullptr, 0, 0, 500 + below(500), 400 + below(300),
                 SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
    desk_.focusGrid();
}

void User::sidePanel() {
    desk_.key(VK_F9);
    if (desk_.book().panel.isShown && oneIn(2)) desk_.key(VK_F6);
}

void User::helpDialog() {
    if (oneIn(2)) {
        desk_.answerNextQuestion(IDOK);
        return desk_.command(IDM_HELP_ABOUT);
    }
    desk_.commandWithDialog(IDM_HELP_KEYS, [](HWND dialog) { Answer(dialog, IDOK); });
}

// ---- Sheets and files ----

bool User::isOpen(const std::wstring& path) const {
    return std::ranges::any_of(sheets_, [&](const SheetModel& each) { return each.path == path; });
}

std::wstring User::freePath() {
    for (;;) {
        const std::wstring path = folder_ + L"sheet" + std::to_wstring(below(kFileNames)) + L".csv";
        if (!isOpen(path)) return path;
    }
}

void User::nextSheet() {
    const bool forward = !oneIn(3);
    desk_.keyWith({VK_CONTROL}, forward ? VK_NEXT : VK_PRIOR);
    current_ = (current_ + (forward ? 1 : sheets_.size() - 1)) % sheets_.size();
}

void User::newSheet() {
    if (sheets_.size() == kMostSheets) return;
    desk_.keyWith({VK_CONTROL}, 'N');
    sheets_.emplace_back();
    current_ = sheets_.size() - 1;
}

void User::removeSheet() {
    if (sheets_.size() == 1) {
        sheets_.front() = {};
        return;
    }
    sheets_.erase(sheets_.begin() + static_cast<std::ptrdiff_t>(current_));
    current_ = std::min(current_, sheets_.size() - 1);
}

void User::closeSheet() {
    const int answer = std::vector<int>{IDYES, IDNO, IDCANCEL}[static_cast<std::size_t>(below(3))];
    const bool asks = sheet().isModified();
    if (asks) {
        desk_.answerNextQuestion(answer);
        if (answer == IDYES && sheet().path.empty()) {
            sheet().path = freePath();
            desk_.chooseNextFile(sheet().path);
        }
    }
    desk_.keyWith({VK_CONTROL}, 'W');
    if (asks && answer == IDCANCEL) return;
    if (asks && answer == IDYES) expectSaved();
    removeSheet();
}

// The dialog's path takes the place of a sheet that nobody has touched.
void User::openFile(const std::wstring& path) {
    desk_.chooseNextFile(path);
    desk_.keyWith({VK_CONTROL}, 'O');
    const bool isUntouched = sheet().path.empty() && !sheet().canUndo() && !sheet().canRedo();
    if (!isUntouched) {
        sheets_.emplace_back();
        current_ = sheets_.size() - 1;
    }
    sheet() = SheetModel::read(path, files_[path]);
}

void User::reopen() {
    if (sheets_.size() == kMostSheets) return;
    for (const auto& [path, bytes] : files_) {
        if (!isOpen(path)) return openFile(path);
    }
}

void User::save() {
    if (sheet().path.empty()) {
        sheet().path = freePath();
        desk_.chooseNextFile(sheet().path);
    }
    desk_.keyWith({VK_CONTROL}, 'S');
    expectSaved();
}

void User::saveAsAnother() {
    sheet().path = freePath();
    desk_.chooseNextFile(sheet().path);
    desk_.keyWith({VK_CONTROL, VK_SHIFT}, 'S');
    expectSaved();
}

// Somebody else writes the file: it is asked about, and their text stays until told otherwise.
void User::meetOthers() {
    if (sheet().path.empty()) return save();
    const std::string theirs = "theirs " + std::to_string(below(1000));
    WriteAll(sheet().path, theirs);
    desk_.answerNextQuestion(IDNO);
    desk_.keyWith({VK_CONTROL}, 'S');
    if (ReadAll(sheet().path) != theirs) complain("what others wrote is gone");
    desk_.answerNextQuestion(IDYES);
    save();
}

// ---- Chart ----

void User::showChart() {
    if (!desk_.book().chart.isShown) desk_.keyWith({VK_CONTROL}, 'H');
    desk_.focusGrid();
}

void User::hideChart() {
    if (desk_.book().chart.isShown) desk_.keyWith({VK_CONTROL}, 'H');
    desk_.focusGrid();
}

void User::toggleChart() { desk_.book().chart.isShown ? hideChart() : showChart(); }

void User::chartSelection() { desk_.command(IDM_CHART_SELECTION); }

void User::changeChart() {
    const auto oneOf = [this](UINT first, UINT last) {
        desk_.command(first + static_cast<UINT>(below(static_cast<int>(last - first) + 1)));
    };
    switch (below(6)) {
    case 0: return oneOf(IDM_CHART_LINE, IDM_CHART_PIE);
    case 1: return oneOf(IDM_CHART_ZOOM_25, IDM_CHART_ZOOM_200);
    case 2: return oneOf(IDM_CHART_OPTION_FIRST, IDM_CHART_OPTION_LAST);
    case 3: return oneOf(IDM_CHART_BACKGROUND_WHITE, IDM_CHART_BACKGROUND_GREY);
    case 4: return oneOf(IDM_CHART_RANGE_AUTOMATIC, IDM_CHART_RANGE_FIX);
    default: return desk_.command(IDM_CHART_LEGEND);
    }
}

void User::chartDialog() {
    showChart();
    const UINT button = oneIn(2) ? IDOK : IDCANCEL;
    switch (below(4)) {
    case 0:
        return desk_.commandWithDialog(IDM_CHART_TITLES, [&](HWND dialog) {
            SetDlgItemTextW(dialog, IDC_TITLE_CHART, anyText().c_str());
            Answer(dialog, button);
        });
    case 1:
        return desk_.commandWithDialog(IDM_CHART_RANGE_EDIT, [&](HWND dialog) {
            SetDlgItemTextW(dialog, IDC_RANGE_LOW, L"-10");
            SetDlgItemTextW(dialog, IDC_RANGE_HIGH, std::to_wstring(below(500)).c_str());
            Answer(dialog, button);
        });
    case 2:
        return desk_.commandWithDialog(IDM_CHART_RANGE_EDIT, [&](HWND dialog) {
            SetDlgItemTextW(dialog, IDC_RANGE_HIGH, L"no number");
            desk_.answerNextQuestion(IDOK);
            Answer(dialog, IDOK);
            Answer(dialog, IDCANCEL);
        });
    default:
        return desk_.commandWithDialog(IDM_CHART_PROPERTIES, [&](HWND dialog) {
            SendMessageW(dialog, PSM_PRESSBUTTON, button == IDOK ? PSBTN_OK : PSBTN_CANCEL, 0);
        });
    }
}

// The picture takes the text's place on the clipboard.
void User::copyChart() {
    showChart();
    desk_.keyWith({VK_CONTROL, VK_SHIFT}, 'C');
    clipboard_.reset();
}

void User::pressChart() {
    if (!desk_.book().chart.isShown) return;
    const HWND graph = desk_.book().chart.graph;
    RECT area = {};
    GetClientRect(graph, &area);
    if (area.right < 2 || area.bottom < 2) return;
    desk_.press(graph, {below(area.right), below(area.bottom)});
}

void User::liveChart() {
    showChart();
    desk_.command(oneIn(2) ? IDM_CHART_LIVE_SWEEP : IDM_CHART_LIVE_REPLACE);
    for (int steps = 0; steps < 5; ++steps) desk_.post(desk_.book().chart.pane, WM_TIMER, 1, 0);
    desk_.command(IDM_CHART_LIVE_OFF);
}

void User::print() {
    showChart();
    desk_.keyWith({VK_CONTROL}, 'P');
    ++pages_;
}

// ---- Beginning and end ----

void User::tidyUp() {
    desk_.focusGrid();
    hideChart();
    if (desk_.book().panel.isShown) desk_.key(VK_F9);
    desk_.command(IDM_VIEW_ZOOM_100);
    closed_.clear();
    for (std::size_t left = sheets_.size(); left > 0; --left) {
        desk_.focusGrid();
        save();
        closed_.push_back(sheet().path);
        desk_.keyWith({VK_CONTROL}, 'W');
        removeSheet();
        check();
    }
    // In place of a large picture of a chart, should that be on the clipboard.
    desk_.focusGrid();
    desk_.keyWith({VK_CONTROL}, 'C');
    clipboard_ = Rows{{L""}};
}

void User::goOn() {
    for (const std::wstring& path : closed_) openFile(path);
    check();
}

}  // namespace longrun

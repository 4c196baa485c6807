// Somebody who does one thing after another with the workbook, chosen at random, and keeps a book
// of what each sheet must hold.
#pragma once

#include "desk.h"
#include "sheet_model.h"

#include <cstdint>
#include <map>
#include <optional>
#include <random>
#include <string>
#include <vector>

namespace longrun {

class User {
public:
    //   folder  for the sheets' files, with a backslash at its end
    User(Desk& desk, std::uint32_t seed, std::wstring folder);

    // Does something. What differs then from what must be is told by problem().
    void act();

    // Saves all sheets, compares their files, closes them, hides chart and side panel: the state
    // that the window began with.
    void tidyUp();

    // Opens again what tidyUp() closed.
    void goOn();

    const std::string& problem() const { return problem_; }  // empty: all is well
    const std::map<std::string, int>& counts() const { return counts_; }
    int pages() const { return pages_; }  // printed so far

private:
    struct Action;
    static const std::vector<Action>& actions();

    const Action& anyAction();

    // ---- Chance
    int below(int limit) { return static_cast<int>(random_() % static_cast<unsigned>(limit)); }
    bool oneIn(int times) { return below(times) == 0; }
    Place anyPlace();
    Area anyArea();
    std::wstring anyText();
    std::wstring anyFormula();

    // ---- What is done
    void typeText();
    void typeFormula();
    void changeText();
    void giveUpTyping();
    void emptyByBackspace();
    void clearCells();
    void undo();
    void redo();
    void goSomewhere();
    void step();
    void page();
    void clickCell();
    void dragCells();
    void copyAndPaste();
    void cutAndPaste();
    void pasteBeyond();
    void turnWheel();
    void zoom();
    void toggleParts();
    void resizeColumn();
    void resizeWindow();
    void nextSheet();
    void newSheet();
    void closeSheet();
    void save();
    void saveAsAnother();
    void meetOthers();
    void toggleChart();
    void chartSelection();
    void changeChart();
    void chartDialog();
    void copyChart();
    void pressChart();
    void liveChart();
    void print();
    void sidePanel();
    void helpDialog();

    // ---- Parts of these
    SheetModel& sheet() { return sheets_[current_]; }
    Place currentPlace();
    Area selectedArea();
    void goTo(const Area& area);
    void beginTyping(const std::wstring& text);
    void endTyping();
    void showChart();
    void hideChart();
    std::optional<POINT> pointIn(int column, int row);
    void expectSaved();
    void paste();
    void removeSheet();
    void openFile(const std::wstring& path);
    void reopen();
    bool isOpen(const std::wstring& path) const;
    std::wstring freePath();
    void check();
    void complain(const std::string& what);

    Desk& desk_;
    std::mt19937 random_;
    std::wstring folder_;
    std::vector<SheetModel> sheets_{1};
    std::size_t current_ = 0;
    std::optional<Rows> clipboard_;              // nothing: no text
    std::map<std::wstring, std::string> files_;  // as they were saved last
    std::vector<std::wstring> closed_;           // by tidyUp()
    int pages_ = 0;
    std::string problem_;
    std::map<std::string, int> counts_;
};

}  // namespace longrun

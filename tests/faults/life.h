// One life of a control, as a scenario lives it: from the registration of its class to the end of
// its window. The same steps every time, with whatever could be made.
#pragma once

#include "faults/fault_ledger.h"
#include "support/import_spy.h"
#include "support/pixels.h"
#include "support/recording_host.h"

#include <functional>
#include <initializer_list>
#include <memory>
#include <ostream>
#include <string>
#include <vector>

namespace kortest {

// The failure that a life has to bear, if any.
struct Fault {
    std::string function;  // empty: none
    int call = 0;          // which one of the life's calls of it, from 1
    ImportSpy::Failing failing = ImportSpy::Failing::kOnce;
    int happened = 0;             // failed calls so far
    ULONG_PTR firstArgument = 0;  // of the first of them
    std::wstring classNames;      // of all that RegisterClassW refused
};

class Life {
public:
    // A later life writes down pictures.
    Life(ImportSpy& lifeSpy, FaultLedger& lifeLedger, const Fault& lifeFault, bool isLater);

    HWND parent() const { return host->window(); }
    bool isLater() const { return isLater_; }

    // Whether the calls from here on are points of this scenario. At first they are; what has led
    // up to its subject, and is another scenario's, is left out.
    void count(bool counted) { isCounted_ = counted; }
    bool isCounted() const { return isCounted_; }

    // What a later life must repeat.
    void note(const std::string& line) { notes_.push_back(line); }
    void look(HWND window, const char* what);
    void look(const Picture& picture, const char* what);

    // A call with a stated failure result. Without a failure so far it must succeed; a failure of a
    // decider inside it must give the failure result, one of another function must not.
    using Names = std::initializer_list<const char*>;
    LRESULT stated(const char* what, LRESULT success, LRESULT failure, Names deciders,
                   const std::function<LRESULT()>& act);

    // The same where any value but `failure` is a success.
    LRESULT statedNot(const char* what, LRESULT failure, Names deciders,
                      const std::function<LRESULT()>& act);

    // A call that a failure may make answer something else that is possible.
    using Possible = std::function<bool(LRESULT result)>;
    void mayFail(const char* what, LRESULT success, const Possible& isPossible,
                 const std::function<LRESULT()>& act);

    // Something that is to hold whatever has failed.
    void require(bool holds, const std::string& what);

    // Ends the host with all windows in it.
    void end();

    // Everything that was noted or told, in two parts.
    std::vector<std::string> transcript() const;
    const std::vector<std::string>& problems() const { return problems_; }

    ImportSpy& spy;
    FaultLedger& ledger;
    const Fault& fault;
    std::unique_ptr<RecordingHost> host;

private:
    LRESULT checked(const char* what, bool isAnySuccess, LRESULT success, LRESULT failure,
                    Names deciders, const std::function<LRESULT()>& act);

    bool isLater_;
    bool isCounted_ = true;
    std::vector<std::string> notes_;
    std::vector<std::string> told_;
    std::vector<std::string> problems_;
};

HINSTANCE ProgramInstance();
bool IsClassRegistered(const wchar_t* name);

// A child of the life's host of one of the library's classes, or null.
HWND CreateControl(const Life& life, const wchar_t* className, DWORD style, int width, int height,
                   int id = 0);

// Paints what is invalid; nothing without a window.
void Paint(HWND window);

struct Scenario {
    const char* control;  // whose points are counted together
    const char* name;
    void (*live)(Life& life);
};

// For GoogleTest's messages.
inline void PrintTo(const Scenario& scenario, std::ostream* stream) { *stream << scenario.name; }

}  // namespace kortest

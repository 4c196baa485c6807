// Records, replaces and fails the calls that a loaded DLL makes through its import table.
//
// Only the given module's table is patched: the test program and the system keep calling the real
// functions. Arguments and results must be integers, handles or pointers.
#pragma once

#include <windows.h>

#include <deque>
#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace kortest {

// The library under test.
HMODULE LibraryModule();

// "dll!function" for every import of a module.
std::vector<std::string> ImportNames(HMODULE module);

struct ImportCall {
    std::string name;
    std::vector<ULONG_PTR> arguments;
    ULONG_PTR result;
    bool failed;  // the spy answered, neither the function nor a replacement was called
};

// A call as an observer sees it, after it was answered.
struct WatchedCall {
    int index;  // of the watch
    const std::string& name;
    const ULONG_PTR* arguments;
    ULONG_PTR result;
    bool failed;
};

enum class CallingConvention { Stdcall, Cdecl };

// One spy at a time. Its end puts every import back.
class ImportSpy {
public:
    using Handler = std::function<ULONG_PTR(ULONG_PTR* arguments)>;
    using Observer = std::function<void(const WatchedCall& call)>;

    explicit ImportSpy(HMODULE module = LibraryModule());
    ~ImportSpy();
    ImportSpy(const ImportSpy&) = delete;
    ImportSpy& operator=(const ImportSpy&) = delete;

    HMODULE module() const { return module_; }
    bool isImported(const std::string& name) const;

    // Begins to record a function. False when the module does not import it. The first form knows
    // the usual functions' argument counts (import_signatures.cpp) and fails the test for others.
    bool watch(const std::string& name);
    bool watch(const std::string& name, int argumentCount, CallingConvention convention);

    // Watches those of the names that are imported.
    void watchAll(const std::vector<std::string>& names);

    // The nth call from now on (1 is the next one) is not made: it gives `result`.
    void failNth(const std::string& name, int nth, ULONG_PTR result = 0, DWORD lastError = 0);
    void failAlways(const std::string& name, ULONG_PTR result = 0, DWORD lastError = 0);
    void stopFailing(const std::string& name);

    // The same with `failure` answering in the function's stead: the nth call alone, or from it on.
    enum class Failing { kOnce, kForEver };
    void failNth(const std::string& name, int nth, Failing failing, Handler failure);

    // Calls `handler` instead of the function; a failure that is due still comes first.
    void replace(const std::string& name, Handler handler);
    void restore(const std::string& name);
    ULONG_PTR callReal(const std::string& name, ULONG_PTR* arguments);

    // Calls in order of entry, since the beginning or the last clearCalls.
    const std::vector<ImportCall>& calls() const { return calls_; }
    std::vector<ImportCall> callsOf(const std::string& name) const;
    int count(const std::string& name) const;

    // "GetDC CreatePen! ReleaseDC": the names in order, failed ones marked.
    std::string sequence() const;

    void clearCalls();  // failures and replacements stay

    // Told of every watched call. Whoever runs millions of calls keeps no list of them besides.
    void observe(Observer observer) { observer_ = std::move(observer); }
    void keepCalls(bool kept) { keepsCalls_ = kept; }
    int indexOf(const std::string& name) const;  // of a watch; -1 when there is none

private:
    struct Watch;

    static ULONG_PTR __cdecl dispatch(int index, ULONG_PTR* arguments);
    ULONG_PTR answer(Watch& watch, ULONG_PTR* arguments, bool& failed);
    ULONG_PTR answerAndRecord(Watch& watch, ULONG_PTR* arguments, bool& failed);
    Watch* find(const std::string& name);
    Watch& require(const std::string& name);

    HMODULE module_;
    std::deque<std::unique_ptr<Watch>> watches_;  // a thunk carries its watch's index
    std::vector<ImportCall> calls_;
    Observer observer_;
    bool keepsCalls_ = true;
    int generation_ = 0;  // counts clearCalls, for calls that are still under way then
};

// How many arguments a platform function takes; false for one that the table lacks.
bool FindImportSignature(const std::string& name, int* argumentCount,
                         CallingConvention* convention);

}  // namespace kortest

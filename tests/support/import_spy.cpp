#include "support/import_spy.h"

#include "support/import_table.h"
#include "support/import_thunk.h"

#include <gtest/gtest.h>

#include <utility>

namespace kortest {
namespace {

ImportSpy* activeSpy = nullptr;

}  // namespace

struct ImportSpy::Watch {
    std::string name;
    int argumentCount;
    CallingConvention convention;
    ULONG_PTR* slot;
    ULONG_PTR realFunction;
    Handler handler = nullptr;
    int callsUntilFailure = 0;  // 1: the next call fails; 0: none does
    bool failsAlways = false;
    bool failsOn = false;  // once a call has failed, all do
    ULONG_PTR failureResult = 0;
    DWORD failureError = 0;
    Handler failure = nullptr;  // instead of the two
};

HMODULE LibraryModule() { return GetModuleHandleW(L"korcontrols.dll"); }

std::vector<std::string> ImportNames(HMODULE module) {
    std::vector<std::string> names;
    VisitImports(module, [&](const char* dll, const char* name, ULONG_PTR*) {
        names.push_back(std::string(dll) + "!" + name);
    });
    return names;
}

ImportSpy::ImportSpy(HMODULE module) : module_(module) {
    if (activeSpy) ADD_FAILURE() << "there can be one import spy at a time";
    activeSpy = this;
}

ImportSpy::~ImportSpy() {
    for (const auto& watch : watches_) WriteImportSlot(watch->slot, watch->realFunction);
    activeSpy = nullptr;
}

bool ImportSpy::isImported(const std::string& name) const {
    return FindImportSlot(module_, name) != nullptr;
}

bool ImportSpy::watch(const std::string& name) {
    int argumentCount = 0;
    auto convention = CallingConvention::Stdcall;
    if (!FindImportSignature(name, &argumentCount, &convention)) {
        ADD_FAILURE() << "the table of signatures lacks " << name;
        return false;
    }
    return watch(name, argumentCount, convention);
}

bool ImportSpy::watch(const std::string& name, int argumentCount, CallingConvention convention) {
    if (find(name)) return true;
    ULONG_PTR* slot = FindImportSlot(module_, name);
    if (!slot) return false;
    const int index = static_cast<int>(watches_.size());
    void* thunk = MakeThunk(&ImportSpy::dispatch, index, argumentCount, convention);
    if (!thunk) {
        ADD_FAILURE() << "no room to watch " << name;
        return false;
    }
    auto entry = std::make_unique<Watch>();
    entry->name = name;
    entry->argumentCount = argumentCount;
    entry->convention = convention;
    entry->slot = slot;
    entry->realFunction = *slot;
    watches_.push_back(std::move(entry));
    WriteImportSlot(slot, reinterpret_cast<ULONG_PTR>(thunk));
    return true;
}

void ImportSpy::watchAll(const std::vector<std::string>& names) {
    for (const std::string& name : names) {
        if (isImported(name)) watch(name);
    }
}

void ImportSpy::failNth(const std::string& name, int nth, ULONG_PTR result, DWORD lastError) {
    Watch& watch = require(name);
    watch.callsUntilFailure = nth;
    watch.failureResult = result;
    watch.failureError = lastError;
    watch.failure = nullptr;
    watch.failsOn = false;
}

void ImportSpy::failNth(const std::string& name, int nth, Failing failing, Handler failure) {
    failNth(name, nth);
    require(name).failsOn = failing == Failing::kForEver;
    require(name).failure = std::move(failure);
}

void ImportSpy::failAlways(const std::string& name, ULONG_PTR result, DWORD lastError) {
    failNth(name, 0, result, lastError);
    require(name).failsAlways = true;
}

void ImportSpy::stopFailing(const std::string& name) {
    Watch& watch = require(name);
    watch.callsUntilFailure = 0;
    watch.failsAlways = false;
    watch.failsOn = false;
    watch.failure = nullptr;
}

void ImportSpy::replace(const std::string& name, Handler handler) {
    require(name).handler = std::move(handler);
}

void ImportSpy::restore(const std::string& name) { require(name).handler = nullptr; }

ULONG_PTR ImportSpy::callReal(const std::string& name, ULONG_PTR* arguments) {
    Watch& watch = require(name);
    return CallWithArguments(watch.realFunction, arguments, watch.argumentCount, watch.convention);
}

std::vector<ImportCall> ImportSpy::callsOf(const std::string& name) const {
    std::vector<ImportCall> found;
    for (const ImportCall& call : calls_) {
        if (call.name == name) found.push_back(call);
    }
    return found;
}

int ImportSpy::count(const std::string& name) const {
    return static_cast<int>(callsOf(name).size());
}

std::string ImportSpy::sequence() const {
    std::string text;
    for (const ImportCall& call : calls_) {
        if (!text.empty()) text += ' ';
        text += call.name;
        if (call.failed) text += '!';
    }
    return text;
}

void ImportSpy::clearCalls() {
    calls_.clear();
    ++generation_;
}

int ImportSpy::indexOf(const std::string& name) const {
    for (size_t i = 0; i < watches_.size(); ++i) {
        if (watches_[i]->name == name) return static_cast<int>(i);
    }
    return -1;
}

ULONG_PTR __cdecl ImportSpy::dispatch(int index, ULONG_PTR* arguments) {
    ImportSpy& spy = *activeSpy;
    Watch& watch = *spy.watches_[static_cast<size_t>(index)];
    bool failed = false;
    const ULONG_PTR result = spy.keepsCalls_ ? spy.answerAndRecord(watch, arguments, failed)
                                             : spy.answer(watch, arguments, failed);
    if (spy.observer_) {
        const DWORD error = GetLastError();  // the library may be about to read it
        spy.observer_({index, watch.name, arguments, result, failed});
        SetLastError(error);
    }
    return result;
}

ULONG_PTR ImportSpy::answerAndRecord(Watch& watch, ULONG_PTR* arguments, bool& failed) {
    const size_t place = calls_.size();
    const int generation = generation_;
    calls_.push_back({watch.name, {arguments, arguments + watch.argumentCount}, 0, false});
    const ULONG_PTR result = answer(watch, arguments, failed);
    if (generation == generation_) {
        calls_[place].result = result;
        calls_[place].failed = failed;
    }
    return result;
}

ULONG_PTR ImportSpy::answer(Watch& watch, ULONG_PTR* arguments, bool& failed) {
    const bool isDue = watch.callsUntilFailure > 0 && --watch.callsUntilFailure == 0;
    if (isDue && watch.failsOn) watch.failsAlways = true;
    if (watch.failsAlways || isDue) {
        failed = true;
        if (watch.failure) return watch.failure(arguments);
        if (watch.failureError) SetLastError(watch.failureError);
        return watch.failureResult;
    }
    if (watch.handler) return watch.handler(arguments);
    return CallWithArguments(watch.realFunction, arguments, watch.argumentCount, watch.convention);
}

ImportSpy::Watch* ImportSpy::find(const std::string& name) {
    for (const auto& watch : watches_) {
        if (watch->name == name) return watch.get();
    }
    return nullptr;
}

// A watch that no call ever reaches stands in for a missing one, so that the test goes on to its
// end.
ImportSpy::Watch& ImportSpy::require(const std::string& name) {
    if (Watch* watch = find(name)) return *watch;
    if (watch(name)) return *find(name);
    ADD_FAILURE() << name << " is not imported";
    static Watch none{name, 0, CallingConvention::Stdcall, nullptr, 0};
    return none;
}

}  // namespace kortest

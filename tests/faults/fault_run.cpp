#include "faults/fault_run.h"

#include "faults/fresh_library.h"

#include <korcontrols/graph.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <sstream>

namespace kortest {
namespace {

constexpr int kMostFailedPoints = 10;

// What is being lived, for the report of a crash.
std::string currentPoint = "no point";

std::string Text(const Fault& fault) {
    if (fault.function.empty()) return "no failure";
    const bool isOnce = fault.failing == ImportSpy::Failing::kOnce;
    return fault.function + ", call " + std::to_string(fault.call) + (isOnce ? "" : " and on");
}

bool IsCrash(DWORD code) {
    return code == EXCEPTION_ACCESS_VIOLATION || code == EXCEPTION_ILLEGAL_INSTRUCTION ||
           code == EXCEPTION_INT_DIVIDE_BY_ZERO || code == EXCEPTION_PRIV_INSTRUCTION ||
           code == EXCEPTION_STACK_OVERFLOW;
}

// The last handler: a guard heap, and what runs the device's code, have had theirs before. A life
// cannot go on from here, and the system would swallow the exception in a window procedure.
LONG CALLBACK ReportCrash(EXCEPTION_POINTERS* exception) {
    const EXCEPTION_RECORD& record = *exception->ExceptionRecord;
    if (!IsCrash(record.ExceptionCode)) return EXCEPTION_CONTINUE_SEARCH;
    const auto base = reinterpret_cast<ULONG_PTR>(LibraryModule());
    const auto place = reinterpret_cast<ULONG_PTR>(record.ExceptionAddress);
    ADD_FAILURE() << "crash " << std::hex << record.ExceptionCode << " at library + 0x"
                  << place - base << " in: " << currentPoint;
    std::fflush(stdout);
    TerminateProcess(GetCurrentProcess(), EXIT_FAILURE);
    return EXCEPTION_CONTINUE_SEARCH;
}

// As at load: nothing has been called when the first run begins.
const FreshLibrary& Fresh() {
    static const FreshLibrary fresh;
    return fresh;
}

bool IsWatched(const ImportFact& fact) {
    return fact.fallible == Fallible::kYes || fact.makes != Resource::kNone ||
           fact.takes != Resource::kNone;
}

bool IsTracing() { return std::getenv("KORCONTROLS_FAULT_TRACE") != nullptr; }

std::string FirstOtherLine(const std::vector<std::string>& expected,
                           const std::vector<std::string>& actual) {
    for (size_t i = 0; i < std::max(expected.size(), actual.size()); ++i) {
        const std::string wanted = i < expected.size() ? expected[i] : "(nothing)";
        const std::string found = i < actual.size() ? actual[i] : "(nothing)";
        if (wanted != found)
            return "line " + std::to_string(i + 1) + " is \"" + found + "\" instead of \"" +
                   wanted + "\"";
    }
    return "";
}

}  // namespace

FaultRun::FaultRun(const Scenario& scenario) : scenario_(scenario), heap_(spy_) {
    static void* const handler = AddVectoredExceptionHandler(0, ReportCrash);
    EXPECT_NE(handler, nullptr);
    EXPECT_TRUE(Fresh().isKnown());
    spy_.keepCalls(false);
    for (const ImportFact& fact : ImportFacts()) {
        if (!IsWatched(fact) || !spy_.isImported(fact.name)) continue;
        spy_.watch(fact.name);
        const auto index = static_cast<size_t>(spy_.indexOf(fact.name));
        if (facts_.size() <= index) facts_.resize(index + 1);
        facts_[index] = &fact;
    }
    spy_.observe([this](const WatchedCall& call) { observe(call); });
}

FaultRun::~FaultRun() {
    startFresh();
    currentPoint = "no point";
}

void FaultRun::observe(const WatchedCall& call) {
    const auto index = static_cast<size_t>(call.index);
    const ImportFact* fact = index < facts_.size() ? facts_[index] : nullptr;
    if (!fact) return;
    if (counted_ && life_) {
        const int number = ++made_[call.name];
        if (life_->isCounted() && CanFail(*fact, call.arguments))
            (*counted_)[call.name].push_back(number);
    }
    if (call.failed && fault_) {
        if (fault_->happened++ == 0) fault_->firstArgument = call.arguments[0];
        if (call.name == "RegisterClassW")
            fault_->classNames +=
                reinterpret_cast<const WNDCLASSW*>(call.arguments[0])->lpszClassName;
    }
    ledger_.note(*fact, call);
}

void FaultRun::startFresh() {
    UnregisterLibraryClasses();
    Fresh().restore();
    ledger_.freeBlocks();
    ledger_.clear();
    heap_.clearFaults();
    heap_.startOver();
}

FaultRun::Lines FaultRun::live(Fault& fault, Lines* transcript, bool isLater) {
    fault_ = &fault;
    if (!fault.function.empty()) fail(fault);
    Life life(spy_, ledger_, fault, isLater);
    life_ = &life;
    scenario_.live(life);
    life.count(false);
    life.require(GetCapture() == nullptr, "the capture is held");
    life.end();
    life_ = nullptr;
    if (!fault.function.empty()) spy_.stopFailing(fault.function);
    if (transcript) *transcript = life.transcript();
    Lines problems = life.problems();
    for (const Lines& lines : {ledger_.leftovers(), ledger_.selections()}) {
        std::copy_if(lines.begin(), lines.end(), std::back_inserter(problems),
                     [&](const std::string& line) { return !isAllowed(fault, line); });
    }
    if (!heap_.report().empty()) problems.push_back(heap_.report());
    heap_.clearFaults();
    ledger_.freeBlocks();
    ledger_.clear();
    heap_.clearFaults();  // of freeing all as one family
    fault_ = nullptr;
    return problems;
}

void FaultRun::fail(Fault& fault) {
    const ImportFact* fact = FindImportFact(fault.function);
    spy_.failNth(fault.function, fault.call, fault.failing,
                 [fact](ULONG_PTR* arguments) { return AnswerFailure(*fact, arguments); });
}

// A failing LocalReAlloc loses the grid's table of sizes, and with it the block.
bool FaultRun::isAllowed(const Fault& fault, const std::string& line) const {
    if (fault.function != "LocalReAlloc" || std::string(scenario_.control) != "grid") return false;
    for (const ULONG_PTR block : ledger_.blocksNotResized()) {
        char text[40];
        std::snprintf(text, sizeof text, "left behind: LocalAlloc %llx",
                      static_cast<unsigned long long>(block));
        if (line == text) return true;
    }
    return false;
}

// The chart, its legend and its tooltip try the registration of their class once in a process.
bool IsGoneForGood(const Fault& fault) {
    for (const wchar_t* name : {KORGRAPH_CLASS, KORLEGEND_CLASS, KORTOOLTIP_CLASS}) {
        if (fault.classNames.find(name) != std::wstring::npos) return true;
    }
    return false;
}

void FaultRun::prepare() {
    Calls again;
    Lines expectedAgain;
    for (int round = 0; round < 2; ++round) {
        startFresh();
        currentPoint = "the first life without failure";
        counted_ = round ? &again : &calls_;
        made_.clear();
        Fault none;
        EXPECT_EQ(live(none, nullptr, false), Lines{}) << currentPoint;
        counted_ = nullptr;
        currentPoint = "the second life without failure";
        EXPECT_EQ(live(none, round ? &expectedAgain : &expected_, true), Lines{}) << currentPoint;
    }
    ASSERT_EQ(calls_, again) << "each life makes the same calls";
    ASSERT_EQ(expected_, expectedAgain) << "each second life is the same";
}

bool FaultRun::tryPoint(const std::string& function, int call, ImportSpy::Failing failing) {
    Fault fault;
    fault.function = function;
    fault.call = call;
    fault.failing = failing;
    currentPoint = Text(fault);
    if (IsTracing()) {
        std::printf("%s\n", currentPoint.c_str());
        std::fflush(stdout);
    }
    startFresh();
    Lines problems = live(fault, nullptr, false);
    if (fault.happened == 0) problems.push_back("the call was not made");
    currentPoint += ", in the life after it";
    Fault none;
    Lines transcript;
    const Lines later = live(none, &transcript, true);
    if (!IsGoneForGood(fault)) {
        for (const std::string& line : later) problems.push_back("then: " + line);
        const std::string other = FirstOtherLine(expected_, transcript);
        if (!other.empty()) problems.push_back("then: " + other);
    }
    if (problems.empty()) return true;
    std::ostringstream text;
    for (const std::string& line : problems) text << "\n  " << line;
    ADD_FAILURE() << Text(fault) << " fails:" << text.str();
    return ++failedPoints_ < kMostFailedPoints;
}

int FaultRun::failEachOnce() {
    int points = 0;
    for (const auto& [function, calls] : calls_) {
        for (const int call : calls) {
            ++points;
            if (!tryPoint(function, call, ImportSpy::Failing::kOnce)) return points;
        }
    }
    return points;
}

int FaultRun::failEachForEver(int mostCalls) {
    int points = 0;
    for (const auto& [function, calls] : calls_) {
        for (const int call : calls) {
            if (call != calls.front() && static_cast<int>(calls.size()) > mostCalls) break;
            ++points;
            if (!tryPoint(function, call, ImportSpy::Failing::kForEver)) return points;
        }
    }
    return points;
}

}  // namespace kortest

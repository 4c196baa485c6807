// Lives a scenario once for each call that can fail, with that call failing, and looks at what is
// left and at how the next life goes.
#pragma once

#include "faults/life.h"
#include "support/guard_heap.h"

#include <map>
#include <string>
#include <vector>

namespace kortest {

class FaultRun {
public:
    explicit FaultRun(const Scenario& scenario);
    ~FaultRun();

    // A life without failure, twice over: counts the calls, and both must be the same.
    void prepare();

    // Each call once; the number of points that were tried.
    int failEachOnce();

    // Each function from each of its calls on for ever, where it is called at most so often; above
    // that from its first call on.
    int failEachForEver(int mostCalls);

    // For each function which of its calls in a life can fail, from 1.
    using Calls = std::map<std::string, std::vector<int>>;
    const Calls& calls() const { return calls_; }

private:
    using Lines = std::vector<std::string>;

    Lines live(Fault& fault, Lines* transcript, bool isLater);
    void startFresh();
    void observe(const WatchedCall& call);
    void fail(Fault& fault);
    bool tryPoint(const std::string& function, int call, ImportSpy::Failing failing);
    Lines problemsAfter(const Fault& fault, bool isFirst);
    bool isAllowed(const Fault& fault, const std::string& line) const;

    const Scenario& scenario_;
    ImportSpy spy_;
    GuardHeap heap_;
    FaultLedger ledger_;
    std::vector<const ImportFact*> facts_;  // by the watch's index
    Fault* fault_ = nullptr;
    const Life* life_ = nullptr;
    std::map<std::string, int> made_;  // calls so far, while they are counted
    Calls* counted_ = nullptr;
    Calls calls_;
    Lines expected_;  // of the second life
    int failedPoints_ = 0;
};

}  // namespace kortest

// Times several ways of doing things in one process, in turns, so that whatever else the machine
// does falls on all of them alike. Only ratios of the results mean something.
#pragma once

#include <windows.h>

#include <algorithm>
#include <functional>
#include <string>
#include <vector>

namespace bench {

struct Way {
    std::string name;
    std::function<void()> run;
    double fastest = 0;  // microseconds
};

inline double Now() {
    LARGE_INTEGER count;
    LARGE_INTEGER frequency;
    QueryPerformanceCounter(&count);
    QueryPerformanceFrequency(&frequency);
    return 1e6 * static_cast<double>(count.QuadPart) / static_cast<double>(frequency.QuadPart);
}

// Runs every way once per round and keeps its fastest run: other work on the machine only ever adds
// to a run.
inline void TimeInTurns(std::vector<Way>& ways, int rounds, int warmUps = 2) {
    for (int round = -warmUps; round < rounds; ++round) {
        for (Way& way : ways) {
            const double start = Now();
            way.run();
            const double taken = Now() - start;
            if (round == 0 || (round > 0 && taken < way.fastest)) way.fastest = taken;
        }
    }
}

// The same in batches until enough() or the last of them; the fastest runs are those of all
// batches. More runs only bring each way nearer to what it takes undisturbed.
inline void TimeInBatches(std::vector<Way>& ways, int rounds, int batches,
                          const std::function<bool()>& enough) {
    std::vector<double> fastest(ways.size());
    for (int batch = 0; batch < batches; ++batch) {
        TimeInTurns(ways, rounds, batch == 0 && rounds > 10 ? 2 : 0);
        for (size_t i = 0; i < ways.size(); ++i) {
            if (batch > 0) ways[i].fastest = std::min(ways[i].fastest, fastest[i]);
            fastest[i] = ways[i].fastest;
        }
        if (enough()) return;
    }
}

}  // namespace bench

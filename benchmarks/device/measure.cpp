#include "measure.h"

#include <cstdio>
#include <cstdlib>

namespace footprint {

const device::Counters& Counts() {
    static const device::Counters* counters = device::FindCounters();
    if (!counters) {
        std::printf("device_footprint: this is not the device's library\n");
        std::exit(1);
    }
    return *counters;
}

Cost CostOf(const std::function<void()>& step) {
    const device::Counters before = Counts();
    step();
    const device::Counters& now = Counts();
    return {now.instructions - before.instructions, now.softFloat - before.softFloat,
            now.importCalls - before.importCalls};
}

}  // namespace footprint

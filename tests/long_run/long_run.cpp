// The workbook in use for a long time: thousands of things done with its window in one process,
// without a pause. Its files must be what an independent book says, and what the process holds must
// not grow.
//
//   long_run [--actions N] [--seed S] [--sample N]
//
// A sample is taken after every so many actions, when all sheets are saved and closed; there must
// be four or more.
#include "figures.h"
#include "user.h"

#include "workbook/temporary_folder.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace longrun {
namespace {

struct Settings {
    int actions = 3000;
    std::uint32_t seed = 1;
    int sample = 1000;
};

// How much more the process may hold in the second half than in the first: the median of the
// samples, as the platform's own caches breathe. Of objects and windows not one. Private bytes are
// what the heaps have taken from the system, not what they use: they go up and down by megabytes.
constexpr std::size_t kHeapBound = std::size_t{256} << 10;
constexpr std::size_t kPrivateBound = std::size_t{4} << 20;

void Print(int action, const Figures& figures) {
    std::printf("%7d actions: heap %7zu KB, private %7zu KB, %3u GDI objects, %3u windows\n",
                action, figures.heapBytes >> 10, figures.privateBytes >> 10, figures.gdiObjects,
                figures.windows);
    std::fflush(stdout);
}

// The first sample is left out: much is made on first use.
template <typename Value>
bool Grew(const std::vector<Figures>& samples, const char* what, Value Figures::*figure,
          std::size_t bound) {
    std::vector<std::size_t> values;
    for (const Figures& each : samples) values.push_back(each.*figure);
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>((values.size() + 1) / 2);
    std::sort(values.begin() + 1, middle);
    std::sort(middle, values.end());
    const std::size_t before = *(values.begin() + (middle - values.begin()) / 2);
    const std::size_t after = *(middle + (values.end() - middle) / 2);
    if (after <= before + bound) return false;
    std::printf("%s grew: from %zu in the first half to %zu in the second\n", what, before, after);
    return true;
}

bool Grew(const std::vector<Figures>& samples) {
    bool grew = Grew(samples, "GDI objects", &Figures::gdiObjects, 0);
    grew |= Grew(samples, "windows", &Figures::windows, 0);
    grew |= Grew(samples, "heap bytes", &Figures::heapBytes, kHeapBound);
    grew |= Grew(samples, "private bytes", &Figures::privateBytes, kPrivateBound);
    return grew;
}

int PrintedPages() {
    const HMODULE job = GetModuleHandleW(L"wingdi.dll");
    const FARPROC count = job ? GetProcAddress(job, "PrintedPages") : nullptr;
    return count ? reinterpret_cast<int(WINAPI*)()>(reinterpret_cast<void*>(count))() : -1;
}

bool IsWell(const User& user, int action, const Settings& settings) {
    if (user.problem().empty()) return true;
    std::printf("seed %u, action %d: %s\n", settings.seed, action, user.problem().c_str());
    return false;
}

bool Run(const Settings& settings) {
    if (!CanCountGdiObjects()) {
        std::puts("GDI objects cannot be counted on this system");
        return false;
    }
    const workbook::TemporaryFolder folder;
    Desk desk;
    User user(desk, settings.seed, folder.at(L""));
    std::vector<Figures> samples;
    for (int action = 1; action <= settings.actions; ++action) {
        user.act();
        if (!IsWell(user, action, settings)) return false;
        if (action % settings.sample != 0) continue;
        user.tidyUp();
        samples.push_back(Measure());
        Print(action, samples.back());
        if (action < settings.actions) user.goOn();
        if (!IsWell(user, action, settings)) return false;
    }
    for (const auto& [name, count] : user.counts()) std::printf("%s: %d\n", name.c_str(), count);
    if (PrintedPages() != user.pages()) {
        std::printf("%d pages should have been printed, but %d were\n", user.pages(),
                    PrintedPages());
        return false;
    }
    return !Grew(samples);
}

bool Read(int count, char** arguments, Settings& settings) {
    for (int index = 1; index + 1 < count; index += 2) {
        const int value = std::atoi(arguments[index + 1]);
        if (std::strcmp(arguments[index], "--actions") == 0) {
            settings.actions = value;
        } else if (std::strcmp(arguments[index], "--seed") == 0) {
            settings.seed = static_cast<std::uint32_t>(value);
        } else if (std::strcmp(arguments[index], "--sample") == 0) {
            settings.sample = value;
        } else {
            return false;
        }
    }
    return count % 2 == 1 && settings.sample > 0 && settings.actions >= 4 * settings.sample;
}

}  // namespace
}  // namespace longrun

int main(int count, char** arguments) {
    longrun::Settings settings;
    if (!longrun::Read(count, arguments, settings)) {
        std::puts("long_run [--actions N] [--seed S] [--sample N]");
        return 2;
    }
    const bool isWell = longrun::Run(settings);
    std::puts(isWell ? "all is well" : "FAILED");
    return isWell ? EXIT_SUCCESS : EXIT_FAILURE;
}

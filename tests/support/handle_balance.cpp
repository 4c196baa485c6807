#include "support/handle_balance.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace kortest {
namespace {

const char* const kMakers[] = {
    "BeginPaint",
    "CreateBitmap",
    "CreateCompatibleBitmap",
    "CreateCompatibleDC",
    "CreateDIBSection",
    "CreateFontIndirectW",
    "CreatePatternBrush",
    "CreatePen",
    "CreatePenIndirect",
    "CreateRectRgn",
    "CreateRectRgnIndirect",
    "CreateSolidBrush",
    "GetDC",
};

// Which argument of a function is the handle it takes back.
struct Returner {
    const char* name;
    size_t argument;
    bool takesDrawingContext;  // else an object; the two kinds may have equal handle values
};

constexpr Returner kReturners[] = {
    {"DeleteDC", 0, true},
    {"DeleteObject", 0, false},
    {"ReleaseDC", 1, true},
};

bool IsMaker(const std::string& name) {
    return std::find(std::begin(kMakers), std::end(kMakers), name) != std::end(kMakers);
}

bool MakesDrawingContext(const std::string& name) {
    return name == "GetDC" || name == "CreateCompatibleDC";
}

struct Made {
    std::string maker;
    ULONG_PTR handle;
};

void TakeBack(std::vector<Made>& made, ULONG_PTR handle, bool isDrawingContext) {
    const auto last = std::find_if(made.rbegin(), made.rend(), [&](const Made& entry) {
        return entry.handle == handle && MakesDrawingContext(entry.maker) == isDrawingContext;
    });
    if (last != made.rend()) made.erase(std::next(last).base());
}

// BeginPaint and EndPaint pair up by themselves: one paint at a time.
void EndPainting(std::vector<Made>& made) {
    const auto last = std::find_if(made.rbegin(), made.rend(),
                                   [](const Made& entry) { return entry.maker == "BeginPaint"; });
    if (last != made.rend()) made.erase(std::next(last).base());
}

}  // namespace

void WatchHandles(ImportSpy& spy) {
    for (const char* name : kMakers) {
        if (spy.isImported(name)) spy.watch(name);
    }
    for (const Returner& returner : kReturners) {
        if (spy.isImported(returner.name)) spy.watch(returner.name);
    }
    if (spy.isImported("EndPaint")) spy.watch("EndPaint");
}

std::vector<std::string> UnreturnedHandles(const ImportSpy& spy) {
    std::vector<Made> made;
    for (const ImportCall& call : spy.calls()) {
        if (IsMaker(call.name) && call.result) made.push_back({call.name, call.result});
        if (call.name == "EndPaint") EndPainting(made);
        for (const Returner& returner : kReturners) {
            if (call.name != returner.name || call.failed) continue;
            TakeBack(made, call.arguments[returner.argument], returner.takesDrawingContext);
        }
    }
    std::vector<std::string> names;
    std::transform(made.begin(), made.end(), std::back_inserter(names),
                   [](const Made& entry) { return entry.maker; });
    return names;
}

}  // namespace kortest

#include "faults/life.h"

#include <algorithm>
#include <cstdint>

namespace kortest {
namespace {

constexpr int kHostWidth = 240;
constexpr int kHostHeight = 160;

std::string PictureText(const Picture& picture) {
    uint32_t sum = 2166136261u;
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) sum = (sum ^ picture.pixel(x, y)) * 16777619u;
    }
    return std::to_string(picture.width()) + " x " + std::to_string(picture.height()) + " sum " +
           std::to_string(sum);
}

}  // namespace

Life::Life(ImportSpy& lifeSpy, FaultLedger& lifeLedger, const Fault& lifeFault, bool isLater)
    : spy(lifeSpy), ledger(lifeLedger), fault(lifeFault),
      host(std::make_unique<RecordingHost>(kHostWidth, kHostHeight)), isLater_(isLater) {}

void Life::look(HWND window, const char* what) {
    Paint(window);
    if (!isLater_) return;
    if (!IsWindow(window)) {
        note(std::string(what) + ": no window");
    } else {
        look(ReadWindow(window), what);
    }
}

void Life::look(const Picture& picture, const char* what) {
    if (isLater_) note(std::string(what) + ": " + PictureText(picture));
}

LRESULT Life::stated(const char* what, LRESULT success, LRESULT failure, Names deciders,
                     const std::function<LRESULT()>& act) {
    return checked(what, false, success, failure, deciders, act);
}

LRESULT Life::statedNot(const char* what, LRESULT failure, Names deciders,
                        const std::function<LRESULT()>& act) {
    return checked(what, true, 0, failure, deciders, act);
}

LRESULT Life::checked(const char* what, bool isAnySuccess, LRESULT success, LRESULT failure,
                      Names deciders, const std::function<LRESULT()>& act) {
    const int before = fault.happened;
    const LRESULT result = act();
    const bool failsHere = fault.happened > before;
    const bool decides = std::any_of(deciders.begin(), deciders.end(),
                                     [this](const char* name) { return fault.function == name; });
    const bool isFailure = result == failure;
    const bool isSuccess = isAnySuccess ? !isFailure : result == success;
    bool fits = isSuccess;
    if (failsHere && decides) fits = isFailure;
    if (before > 0) fits = isSuccess || isFailure;  // what it works on may be damaged
    if (!fits) {
        problems_.push_back(std::string(what) + " answers " + std::to_string(result) +
                            (failsHere ? " with the failure inside" : ""));
    }
    return result;
}

void Life::mayFail(const char* what, LRESULT success, const Possible& isPossible,
                   const std::function<LRESULT()>& act) {
    const LRESULT result = act();
    const bool fits = result == success || (fault.happened > 0 && isPossible(result));
    if (!fits) problems_.push_back(std::string(what) + " answers " + std::to_string(result));
}

void Life::require(bool holds, const std::string& what) {
    if (!holds) problems_.push_back(what);
}

void Life::end() {
    told_ = host->transcript();
    host.reset();
}

std::vector<std::string> Life::transcript() const {
    std::vector<std::string> all = notes_;
    all.insert(all.end(), told_.begin(), told_.end());
    return all;
}

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

bool IsClassRegistered(const wchar_t* name) {
    WNDCLASSW existing{};
    return GetClassInfoW(ProgramInstance(), name, &existing) != 0;
}

HWND CreateControl(const Life& life, const wchar_t* className, DWORD style, int width, int height,
                   int id) {
    return CreateWindowExW(0, className, L"", WS_CHILD | WS_VISIBLE | style, 0, 0, width, height,
                           life.parent(), reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)),
                           ProgramInstance(), nullptr);
}

void Paint(HWND window) {
    if (window) UpdateWindow(window);
}

}  // namespace kortest

// Gives each test program a window station and a desktop of its own before its first test. Focus,
// foreground and clipboard belong to those, so tests that run at the same time cannot take them
// from one another. Programs that a test starts share its station.
#include <windows.h>

#include <cstdio>
#include <cstdlib>
#include <string>

namespace kortest {
namespace {

[[noreturn]] void Fail(const char* what) {
    std::fprintf(stderr, "no %s for this test alone: error %lu\n", what, GetLastError());
    std::exit(EXIT_FAILURE);
}

// The handles stay open until the process ends.
struct OwnWindowStation {
    OwnWindowStation() {
        // Stations without a name would be one and the same.
        const std::wstring name = L"tests-" + std::to_wstring(GetCurrentProcessId());
        const HWINSTA station = CreateWindowStationW(name.c_str(), 0, WINSTA_ALL_ACCESS, nullptr);
        if (!station || !SetProcessWindowStation(station)) Fail("window station");
        const HDESK desktop =
            CreateDesktopW(name.c_str(), nullptr, nullptr, 0, GENERIC_ALL, nullptr);
        if (!desktop || !SetThreadDesktop(desktop)) Fail("desktop");
    }
};

const OwnWindowStation ownWindowStation;

}  // namespace
}  // namespace kortest

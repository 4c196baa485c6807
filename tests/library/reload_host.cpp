// A host that loads the library, uses every control, and unloads it again, three times, each time
// at another address. The status is 0 when all went well, else the line that did not.
#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include <cstdlib>

namespace {

#define REQUIRE(condition)                                                                         \
    if (!(condition)) std::exit(__LINE__)

using Register = DWORD (*)(HINSTANCE);

constexpr const wchar_t* kClasses[] = {KORGRID_CLASS,   KORHEADER_CLASS,  KORGRAPH_CLASS,
                                       KORLEGEND_CLASS, KORTOOLTIP_CLASS, KORFUNKYBAR_CLASS};

const HINSTANCE program = GetModuleHandleW(nullptr);

bool Call(HMODULE library, const char* name) {
    return reinterpret_cast<Register>(reinterpret_cast<void*>(GetProcAddress(library, name)))(
               program) != 0;
}

HWND Create(const wchar_t* windowClass, HWND parent) {
    return CreateWindowExW(0, windowClass, L"", WS_CHILD | WS_VISIBLE, 0, 0, 200, 100, parent,
                           nullptr, program, nullptr);
}

void UseControls(HMODULE library) {
    REQUIRE(Call(library, "RegisterGridControl"));
    REQUIRE(Call(library, "RegisterGraphControl"));
    REQUIRE(Call(library, "InitFunkyControl"));
    const HWND host = CreateWindowExW(0, L"STATIC", L"", WS_POPUP | WS_VISIBLE, 0, 0, 300, 200,
                                      nullptr, nullptr, program, nullptr);
    REQUIRE(Create(KORGRID_CLASS, host));
    const HWND graph = Create(KORGRAPH_CLASS, host);
    REQUIRE(graph);
    const double values[] = {1, 2, 3};
    const GraphSeriesData data = {3, L"one", values, 0};
    REQUIRE(KorGraph_AddSeries(graph, &data));
    const RECT place = {10, 10, 90, 90};
    KorGraph_ShowLegend(graph, &place);
    REQUIRE(Create(KORFUNKYBAR_CLASS, host));
    UpdateWindow(host);
    DestroyWindow(host);  // and the chart's tooltip, which is its child
}

// What a host does before it lets the library go: the classes are its own, since it registered them
// under its instance, but their procedures are the library's.
void Unload(HMODULE library) {
    for (const wchar_t* windowClass : kClasses) REQUIRE(UnregisterClassW(windowClass, program));
    FreeLibrary(library);
    REQUIRE(!GetModuleHandleW(L"korcontrols.dll"));
}

}  // namespace

int main() {
    for (int i = 0; i < 3; ++i) {
        const HMODULE library = LoadLibraryW(L"korcontrols.dll");
        REQUIRE(library);
        UseControls(library);
        Unload(library);
        // The next time something else is there.
        REQUIRE(VirtualAlloc(library, 4096, MEM_RESERVE, PAGE_NOACCESS));
    }
    return 0;
}

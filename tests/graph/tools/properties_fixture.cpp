#include "graph/tools/properties_fixture.h"

#include <cstdio>

namespace kortest {
namespace {

constexpr wchar_t kTestProperty[] = L"properties test";

std::string TitleText(const char* name, LPARAM text) {
    return std::string(name) + " \"" + Narrow(reinterpret_cast<const wchar_t*>(text)) + "\"";
}

std::string RangeText(const GraphRange& range) {
    char text[80];
    std::snprintf(text, sizeof text, "GM_SETRANGE %s %g %g", range.axis == KORGRAPH_X ? "x" : "y",
                  range.min, range.max);
    return text;
}

}  // namespace

void PropertiesTest::createRecorded() {
    create();
    SetPropW(graph, kTestProperty, this);
    graphOriginal_ = reinterpret_cast<WNDPROC>(SetWindowLongPtrW(
        graph, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&PropertiesTest::graphProc)));
}

void PropertiesTest::openSheet(const std::function<void(HWND sheet)>& use) {
    driver.run([this] { EXPECT_EQ(notify(GN_PROPERTIES), 0); },
               [&](HWND sheet) {
                   use(sheet);
                   PressCancel(sheet);  // after an OK there is nothing to cancel any more
               });
    EXPECT_TRUE(driver.wasUp());
}

void PropertiesTest::typeOnDataPage(const std::vector<std::pair<int, std::wstring>>& texts) {
    openSheet([&](HWND sheet) {
        const HWND page = ShowPage(sheet, kDataPage);
        for (const auto& [edit, text] : texts) TypeInto(page, edit, text);
        PressOk(sheet);
    });
}

LRESULT CALLBACK PropertiesTest::graphProc(HWND window, UINT message, WPARAM wParam,
                                           LPARAM lParam) {
    auto* test = static_cast<PropertiesTest*>(GetPropW(window, kTestProperty));
    const WNDPROC original = test->graphOriginal_;
    test->note(message, wParam, lParam);
    if (message == WM_NCDESTROY) RemovePropW(window, kTestProperty);
    return CallWindowProcW(original, window, message, wParam, lParam);
}

void PropertiesTest::note(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case GM_SETTITLE: sent.push_back(TitleText("GM_SETTITLE", lParam)); break;
    case GM_SETXTITLE: sent.push_back(TitleText("GM_SETXTITLE", lParam)); break;
    case GM_SETYTITLE: sent.push_back(TitleText("GM_SETYTITLE", lParam)); break;
    case GM_SETRANGE:
        sent.push_back(RangeText(*reinterpret_cast<const GraphRange*>(lParam)));
        break;
    case GM_SETTYPE: sent.push_back("GM_SETTYPE " + std::to_string(lParam)); break;
    case GM_SETZOOM: sent.push_back("GM_SETZOOM " + std::to_string(lParam)); break;
    case WM_NOTIFY:
        if (wParam == GN_REDRAW) sent.push_back("GN_REDRAW");
        break;
    default: break;
    }
}

}  // namespace kortest

// The window classes and who registers them.
#include <korcontrols/funkybar.h>

#include "support/import_spy.h"
#include "support/recording_host.h"

#include <gtest/gtest.h>

#include <vector>

namespace kortest {
namespace {

HINSTANCE ProgramInstance() { return GetModuleHandleW(nullptr); }

// A class as the library handed it to RegisterClassW, its name copied.
struct RegisteredClass {
    WNDCLASSW attributes;
    std::wstring name;
};

class WindowClasses : public ::testing::Test {
protected:
    WindowClasses() {
        spy.watch("RegisterClassW");
        spy.replace("RegisterClassW", [this](ULONG_PTR* arguments) {
            const auto& attributes = *reinterpret_cast<const WNDCLASSW*>(arguments[0]);
            registered.push_back({attributes, attributes.lpszClassName});
            return spy.callReal("RegisterClassW", arguments);
        });
    }

    // Creates the grid without the host's own help.
    HWND createGrid(HINSTANCE instance) {
        return CreateWindowExW(0, KORGRID_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, 200, 100,
                               host.window(), nullptr, instance, nullptr);
    }

    static bool isRegistered(HINSTANCE instance, const wchar_t* name) {
        WNDCLASSW attributes{};
        return GetClassInfoW(instance, name, &attributes) != 0;
    }

    ImportSpy spy;
    std::vector<RegisteredClass> registered;
    RecordingHost host;
};

void ExpectPlainClass(const WNDCLASSW& attributes, int brush, HINSTANCE instance) {
    EXPECT_EQ(attributes.style, UINT{CS_VREDRAW | CS_HREDRAW | CS_DBLCLKS});
    EXPECT_NE(attributes.lpfnWndProc, nullptr);
    EXPECT_EQ(attributes.cbClsExtra, 0);
    EXPECT_EQ(attributes.cbWndExtra, 0);
    EXPECT_EQ(attributes.hInstance, instance);
    EXPECT_EQ(attributes.hIcon, nullptr);
    EXPECT_EQ(attributes.hCursor, nullptr);
    EXPECT_EQ(attributes.hbrBackground, static_cast<HBRUSH>(GetStockObject(brush)));
    EXPECT_EQ(attributes.lpszMenuName, nullptr);
}

TEST_F(WindowClasses, AreNotThereAtLoad) {
    EXPECT_FALSE(isRegistered(ProgramInstance(), KORGRID_CLASS));
    EXPECT_FALSE(isRegistered(ProgramInstance(), KORHEADER_CLASS));
    EXPECT_FALSE(isRegistered(LibraryModule(), KORGRID_CLASS));
}

TEST_F(WindowClasses, OfTheGridHasItsAttributes) {
    EXPECT_NE(RegisterGridControl(ProgramInstance()), 0u);
    WNDCLASSW attributes{};
    ASSERT_TRUE(GetClassInfoW(ProgramInstance(), KORGRID_CLASS, &attributes));
    ExpectPlainClass(attributes, WHITE_BRUSH, ProgramInstance());
    ASSERT_EQ(registered.size(), 1u);
    EXPECT_EQ(registered[0].name, L"KV Grid Control");
    ExpectPlainClass(registered[0].attributes, WHITE_BRUSH, ProgramInstance());
}

TEST_F(WindowClasses, OfTheGridBelongsToTheCallersInstance) {
    HINSTANCE other = GetModuleHandleW(L"gdi32.dll");
    EXPECT_NE(RegisterGridControl(other), 0u);
    EXPECT_EQ(registered[0].attributes.hInstance, other);
    EXPECT_FALSE(isRegistered(LibraryModule(), KORGRID_CLASS));
    EXPECT_TRUE(isRegistered(other, KORGRID_CLASS));
}

TEST_F(WindowClasses, OfTheGridIsRegisteredOnce) {
    EXPECT_NE(RegisterGridControl(ProgramInstance()), 0u);
    EXPECT_EQ(RegisterGridControl(ProgramInstance()), 0u);
    EXPECT_EQ(registered.size(), 2u);  // asked for again, and refused by the system
    EXPECT_NE(createGrid(ProgramInstance()), nullptr);
}

TEST_F(WindowClasses, OfTheGridReportsFailure) {
    spy.failNth("RegisterClassW", 1, 0, ERROR_NOT_ENOUGH_MEMORY);
    EXPECT_EQ(RegisterGridControl(ProgramInstance()), 0u);
    EXPECT_NE(RegisterGridControl(ProgramInstance()), 0u);
}

TEST_F(WindowClasses, OfTheStripIsRegisteredByTheGrid) {
    RegisterGridControl(ProgramInstance());
    EXPECT_FALSE(isRegistered(ProgramInstance(), KORHEADER_CLASS));
    createGrid(ProgramInstance());
    WNDCLASSW attributes{};
    ASSERT_TRUE(GetClassInfoW(ProgramInstance(), KORHEADER_CLASS, &attributes));
    ExpectPlainClass(attributes, LTGRAY_BRUSH, ProgramInstance());
    ASSERT_EQ(registered.size(), 2u);
    EXPECT_EQ(registered[1].name, L"korvane Header");
    ExpectPlainClass(registered[1].attributes, LTGRAY_BRUSH, ProgramInstance());
}

TEST_F(WindowClasses, OfTheStripBelongsToTheGridsInstance) {
    HINSTANCE other = GetModuleHandleW(L"gdi32.dll");
    RegisterGridControl(other);
    HWND grid = createGrid(other);
    ASSERT_NE(grid, nullptr);
    EXPECT_EQ(registered[1].attributes.hInstance, other);
    EXPECT_NE(ColumnHeaderOf(grid), nullptr);
    EXPECT_NE(RowHeaderOf(grid), nullptr);
}

TEST_F(WindowClasses, OfTheStripIsAskedForByEachGrid) {
    RegisterGridControl(ProgramInstance());
    DestroyWindow(createGrid(ProgramInstance()));
    HWND grid = createGrid(ProgramInstance());
    EXPECT_EQ(registered.size(), 3u);
    EXPECT_NE(ColumnHeaderOf(grid), nullptr);
}

TEST_F(WindowClasses, OfTheStripMayFailWithoutHarmToTheGrid) {
    RegisterGridControl(ProgramInstance());
    spy.failNth("RegisterClassW", 1);
    HWND grid = createGrid(ProgramInstance());
    ASSERT_NE(grid, nullptr);
    EXPECT_EQ(ColumnHeaderOf(grid), nullptr);
    EXPECT_EQ(RowHeaderOf(grid), nullptr);
    SetFirstVisibleCell(KORGRID_CELL(3, 4));
    SetGridZoomLevel(2);
    ToggleViewStateOfHeaders();
    DestroyWindow(grid);
    EXPECT_NE(ColumnHeaderOf(createGrid(ProgramInstance())), nullptr);
}

TEST_F(WindowClasses, OfTheFunctionBarHasItsAttributes) {
    const DWORD atom = InitFunkyControl(ProgramInstance());
    EXPECT_NE(atom, 0u);
    ASSERT_EQ(registered.size(), 1u);
    EXPECT_EQ(registered[0].name, L"FunkyBarControl");
    WNDCLASSW attributes{};
    EXPECT_EQ(GetClassInfoW(ProgramInstance(), L"FunkyBarControl", &attributes),
              static_cast<int>(atom));
    for (const WNDCLASSW& each : {attributes, registered[0].attributes}) {
        EXPECT_EQ(each.style, 0u);
        EXPECT_NE(each.lpfnWndProc, nullptr);
        EXPECT_EQ(each.cbClsExtra, 0);
        EXPECT_EQ(each.cbWndExtra, 0);
        EXPECT_EQ(each.hInstance, ProgramInstance());
        EXPECT_EQ(each.hIcon, nullptr);
        EXPECT_EQ(each.hCursor, nullptr);
        EXPECT_EQ(each.hbrBackground, nullptr);
        EXPECT_EQ(each.lpszMenuName, nullptr);
    }
}

TEST_F(WindowClasses, OfTheFunctionBarNeedsAnInstance) {
    EXPECT_EQ(InitFunkyControl(nullptr), 0u);
    EXPECT_TRUE(registered.empty());
}

TEST_F(WindowClasses, OfTheFunctionBarIsRegisteredOncePerInstance) {
    HINSTANCE other = GetModuleHandleW(L"gdi32.dll");
    EXPECT_NE(InitFunkyControl(ProgramInstance()), 0u);
    EXPECT_EQ(InitFunkyControl(ProgramInstance()), 0u);
    EXPECT_NE(InitFunkyControl(other), 0u);
    EXPECT_EQ(registered.size(), 3u) << "asked for each time";
    EXPECT_TRUE(isRegistered(other, KORFUNKYBAR_CLASS));
}

TEST_F(WindowClasses, OfTheFunctionBarReportsFailure) {
    spy.failNth("RegisterClassW", 1, 0, ERROR_NOT_ENOUGH_MEMORY);
    EXPECT_EQ(InitFunkyControl(ProgramInstance()), 0u);
    EXPECT_NE(InitFunkyControl(ProgramInstance()), 0u);
}

TEST_F(WindowClasses, StayRegisteredAfterTheGridIsGone) {
    RegisterGridControl(ProgramInstance());
    DestroyWindow(createGrid(ProgramInstance()));
    EXPECT_TRUE(isRegistered(ProgramInstance(), KORGRID_CLASS));
    EXPECT_TRUE(isRegistered(ProgramInstance(), KORHEADER_CLASS));
}

}  // namespace
}  // namespace kortest

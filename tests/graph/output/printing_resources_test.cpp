// The dialog that hosts may show while a chart is printed.
#include "graph/tools/dialog_template.h"
#include "support/import_spy.h"

#include <gtest/gtest.h>

namespace kortest {
namespace {

TEST(PrintingResources, ProgressDialog) {
    const DialogTemplate dialog = ReadDialogTemplate(LibraryModule(), 4050);
    EXPECT_EQ(dialog.style,
              static_cast<DWORD>(DS_MODALFRAME | DS_SETFONT | WS_POPUP | WS_CAPTION | WS_SYSMENU));
    EXPECT_EQ(dialog.caption, L"Graph Print");
    EXPECT_EQ(dialog.font, L"MS Sans Serif");
    EXPECT_EQ(dialog.fontPoints, 8);
    EXPECT_EQ(dialog.width, 102);
    EXPECT_EQ(dialog.height, 59);
    const std::vector<DialogItem> expected = {
        {-1, L"STATIC", L"Printing document....", WS_CHILD | WS_VISIBLE | WS_GROUP | SS_CENTER, 7,
         14, 88, 8},
        {4060, L"BUTTON", L"&Cancel", WS_CHILD | WS_VISIBLE | WS_TABSTOP, 26, 38, 50, 14}};
    EXPECT_EQ(dialog.items, expected);
}

}  // namespace
}  // namespace kortest

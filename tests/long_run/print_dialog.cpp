// Stands for the companion that shows the print dialog: a printer is chosen at once, and its page
// is a bitmap.
#include "platform/print_dialog.h"

namespace {

constexpr int kWidth = 300;
constexpr int kHeight = 400;

}  // namespace

extern "C" BOOL WINAPI PrintDlg(kor::PrintDialogRecord* record) {
    record->dc = CreateCompatibleDC(nullptr);
    const HDC screen = GetDC(nullptr);
    SelectObject(record->dc, CreateCompatibleBitmap(screen, kWidth, kHeight));
    ReleaseDC(nullptr, screen);
    return TRUE;
}

// The device's print dialog on the desktop: its record translated to the desktop's and back.
#include "platform/print_dialog.h"

#include <commdlg.h>
#undef PrintDlg

namespace {

// There is only one page to print, and the driver makes the copies.
constexpr DWORD kFlags =
    PD_RETURNDC | PD_NOSELECTION | PD_NOPAGENUMS | PD_USEDEVMODECOPIESANDCOLLATE;

void Free(HGLOBAL block) {
    if (block) GlobalFree(block);
}

}  // namespace

extern "C" BOOL WINAPI PrintDlg(kor::PrintDialogRecord* record) {
    if (!record || record->size != sizeof *record) return FALSE;
    PRINTDLGW dialog = {};
    dialog.lStructSize = sizeof dialog;
    dialog.hwndOwner = record->owner;
    dialog.Flags = kFlags;
    const BOOL isChosen = PrintDlgW(&dialog);
    Free(dialog.hDevMode);
    Free(dialog.hDevNames);
    if (isChosen) record->dc = dialog.hDC;
    return isChosen;
}

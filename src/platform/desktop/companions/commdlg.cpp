// The device's print dialog on the desktop: its record translated to the desktop's and back.
#include "platform/print_dialog.h"

#include <commdlg.h>
#undef PrintDlg

namespace {

// One page is all there is to print, and the driver makes the copies.
constexpr DWORD kAlways =
    PD_RETURNDC | PD_NOSELECTION | PD_NOPAGENUMS | PD_USEDEVMODECOPIESANDCOLLATE;

// What a caller may ask for: the default printer at once, without a dialog.
constexpr DWORD kOnRequest = PD_RETURNDEFAULT;

void Free(HGLOBAL block) {
    if (block) GlobalFree(block);
}

}  // namespace

extern "C" BOOL WINAPI PrintDlg(kor::PrintDialogRecord* record) {
    if (!record || record->size != sizeof *record) return FALSE;
    PRINTDLGW dialog = {};
    dialog.lStructSize = sizeof dialog;
    dialog.hwndOwner = record->owner;
    dialog.Flags = kAlways | (record->flags & kOnRequest);
    const BOOL isChosen = PrintDlgW(&dialog);
    Free(dialog.hDevMode);
    Free(dialog.hDevNames);
    if (isChosen) record->dc = dialog.hDC;
    return isChosen;
}

// The print dialog of "commdlg.dll" as Windows CE has it: the record that its "PrintDlg" takes. On
// the desktop a companion DLL of that name takes the same record (see desktop/companions).
#pragma once

#include "platform/platform.h"

namespace kor {

// 68 bytes on 32-bit systems. Windows CE has no 64-bit form; on 64-bit desktops the companion's
// record is the same with handles and pointers widened and aligned, 104 bytes.
struct PrintDialogRecord {
    DWORD size;  // of this record
    HWND owner;
    HDC dc;             // out: the printer's; the caller deletes it
    DWORD flags;        // the library leaves this and all that follows 0,
    RECT leastMargins;  // and the companion ignores it
    RECT margins;
    HINSTANCE instance;
    LPARAM customData;
    FARPROC hook;
    const wchar_t* templateName;
    HGLOBAL templateResource;
};

static_assert(sizeof(void*) != 4 ||
              (sizeof(PrintDialogRecord) == 68 && offsetof(PrintDialogRecord, dc) == 8 &&
               offsetof(PrintDialogRecord, flags) == 12));
static_assert(sizeof(void*) != 8 ||
              (sizeof(PrintDialogRecord) == 104 && offsetof(PrintDialogRecord, dc) == 16 &&
               offsetof(PrintDialogRecord, flags) == 24));

// TRUE when the user has chosen a printer. All five functions are looked up by these names.
using PrintDialogProcedure = BOOL(WINAPI*)(PrintDialogRecord* record);
constexpr wchar_t kPrintDialogModule[] = L"commdlg.dll";
constexpr wchar_t kPrintDialogName[] = L"PrintDlg";

// A print job: above 0 for success.
using StartDocumentProcedure = int(WINAPI*)(HDC printer, const DOCINFOW* document);
using PageProcedure = int(WINAPI*)(HDC printer);
constexpr wchar_t kPrintJobModule[] = L"wingdi.dll";
constexpr wchar_t kStartDocumentName[] = L"StartDoc";
constexpr wchar_t kStartPageName[] = L"StartPage";
constexpr wchar_t kEndPageName[] = L"EndPage";
constexpr wchar_t kEndDocumentName[] = L"EndDoc";

}  // namespace kor

#include "graph/output/printing_calls.h"

#include <korcontrols/graph.h>

#include "platform/print_dialog.h"
#include "platform/procedures.h"

namespace kor {

namespace {

constexpr wchar_t kDocumentName[] = L"Graph";

// For all charts of the process; null until loaded.
constinit HMODULE dialogModule = nullptr;
constinit HMODULE jobModule = nullptr;

PageProcedure FindPageProcedure(const wchar_t* name) {
    return FindProcedureAs<PageProcedure>(jobModule, name);
}

}  // namespace

void LoadPrintModules() {
    if (!dialogModule) dialogModule = LoadPrintModule(kPrintDialogModule);
    if (!jobModule) jobModule = LoadPrintModule(kPrintJobModule);
}

bool CanPrint() { return dialogModule && jobModule; }

HDC AskForPrinter(HWND owner) {
    const auto ask = FindProcedureAs<PrintDialogProcedure>(dialogModule, kPrintDialogName);
    PrintDialogRecord record = {};
    record.size = sizeof record;
    record.owner = owner;
    return ask && ask(&record) ? record.dc : nullptr;
}

void BeginPrintJob(HDC printer) {
    const auto startDocument =
        FindProcedureAs<StartDocumentProcedure>(jobModule, kStartDocumentName);
    const PageProcedure startPage = FindPageProcedure(kStartPageName);
    DOCINFOW document = {};
    document.cbSize = sizeof document;
    document.lpszDocName = kDocumentName;
    if (startDocument) startDocument(printer, &document);
    if (startPage) startPage(printer);
}

void EndPrintJob(HDC printer) {
    const PageProcedure endDocument = FindPageProcedure(kEndDocumentName);
    const PageProcedure endPage = FindPageProcedure(kEndPageName);
    if (endPage) endPage(printer);
    if (endDocument) endDocument(printer);
}

}  // namespace kor

using namespace kor;

extern "C" DWORD KORCONTROLS_API IsPrintingAvailableForGraphControl(void) { return CanPrint(); }

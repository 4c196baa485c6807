// Print modules of the tests' own: nobody has to answer a dialog, and the page is a bitmap.
#include "faults/printing_stand_in.h"

#include "faults/chart.h"
#include "platform/print_dialog.h"
#include "support/message_text.h"

namespace kortest {
namespace {

constexpr int kPageWidth = 120;
constexpr int kPageHeight = 90;
constexpr int kDotsPerInch = 96;

// Handles that nothing else uses.
const auto kDialogModule = static_cast<ULONG_PTR>(0x11110000);
const auto kJobModule = static_cast<ULONG_PTR>(0x22220000);

PrintedPage* current = nullptr;

ULONG_PTR Load(ULONG_PTR* arguments) {
    const std::string name = Narrow(reinterpret_cast<const wchar_t*>(arguments[0]));
    return name.find("commdlg") != std::string::npos ? kDialogModule : kJobModule;
}

}  // namespace

PrintedPage::PrintedPage(Life& life) : life_(life) {
    current = this;
    life_.spy.replace("GetDeviceCaps", [this](ULONG_PTR* arguments) -> ULONG_PTR {
        if (dc_ && reinterpret_cast<HDC>(arguments[0]) == dc_) {
            switch (static_cast<int>(arguments[1])) {
            case HORZRES: return kPageWidth;
            case VERTRES: return kPageHeight;
            case LOGPIXELSY: return kDotsPerInch;
            default: break;
            }
        }
        return life_.spy.callReal("GetDeviceCaps", arguments);
    });
}

PrintedPage::~PrintedPage() {
    life_.spy.restore("GetDeviceCaps");
    if (bitmap_) DeleteObject(bitmap_);
    current = nullptr;
}

BOOL PrintedPage::ask(HDC& dc) {
    dc_ = CreateCompatibleDC(nullptr);
    const HDC screen = GetDC(nullptr);
    bitmap_ = CreateCompatibleBitmap(screen, kPageWidth, kPageHeight);
    ReleaseDC(nullptr, screen);
    SelectObject(dc_, bitmap_);
    PatBlt(dc_, 0, 0, kPageWidth, kPageHeight, WHITENESS);
    life_.ledger.add(Resource::kMemoryDC, reinterpret_cast<ULONG_PTR>(dc_), "PrintDlg");
    dc = dc_;
    return TRUE;
}

int PrintedPage::tell(const char* function) {
    life_.note(function);
    return 1;
}

int PrintedPage::end() {
    life_.look(ReadDC(dc_, {0, 0, kPageWidth, kPageHeight}), "page");
    return tell("EndPage");
}

namespace {

BOOL WINAPI PrintDialog(kor::PrintDialogRecord* record) { return current->ask(record->dc); }
int WINAPI StartDocument(HDC, const DOCINFOW*) { return current->tell("StartDoc"); }
int WINAPI StartAPage(HDC) { return current->tell("StartPage"); }
int WINAPI EndAPage(HDC) { return current->end(); }
int WINAPI EndDocument(HDC) { return current->tell("EndDoc"); }

ULONG_PTR Find(ULONG_PTR* arguments) {
    const std::string name = reinterpret_cast<const char*>(arguments[1]);
    if (name == "PrintDlg") return reinterpret_cast<ULONG_PTR>(&PrintDialog);
    if (name == "StartDoc") return reinterpret_cast<ULONG_PTR>(&StartDocument);
    if (name == "StartPage") return reinterpret_cast<ULONG_PTR>(&StartAPage);
    if (name == "EndPage") return reinterpret_cast<ULONG_PTR>(&EndAPage);
    return reinterpret_cast<ULONG_PTR>(&EndDocument);
}

}  // namespace

void StandInForPrinting(Life& life) {
    life.spy.replace("LoadLibraryW", Load);
    life.spy.replace("GetProcAddress", Find);
}

}  // namespace kortest

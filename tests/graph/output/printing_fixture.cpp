#include "graph/output/printing_fixture.h"

#include <cstring>

namespace kortest {
namespace {

PrintingTest* current = nullptr;

// Handles that nothing else uses.
const auto kDialogModule = static_cast<ULONG_PTR>(0x11110000);
const auto kJobModule = static_cast<ULONG_PTR>(0x22220000);

template <typename Record>
std::vector<BYTE> BytesOf(const Record& record) {
    std::vector<BYTE> bytes(sizeof record);
    std::memcpy(bytes.data(), &record, sizeof record);
    return bytes;
}

}  // namespace

PrintingTest::PrintingTest(Heap kind) : GraphTest(kind) {
    current = this;
    standInForTheLoader();
    standInForThePrinter();
}

PrintingTest::~PrintingTest() {
    deletePage();
    current = nullptr;
}

const kor::GraphRecord& PrintingTest::record() const {
    return *reinterpret_cast<const kor::GraphRecord*>(GetWindowLongPtrW(graph, GWLP_USERDATA));
}

Lines PrintingTest::linesOf(const std::set<std::string>& words) const {
    Lines found;
    for (const std::string& line : transcript)
        if (words.count(line.substr(0, line.find(' ')))) found.push_back(line);
    return found;
}

void PrintingTest::standInForTheLoader() {
    spy.watchAll({"LoadLibraryW", "GetProcAddress", "EnableWindow"});
    spy.replace("LoadLibraryW", [this](ULONG_PTR* arguments) { return load(arguments); });
    spy.replace("GetProcAddress", [this](ULONG_PTR* arguments) { return find(arguments); });
    spy.replace("EnableWindow", [this](ULONG_PTR* arguments) {
        if (reinterpret_cast<HWND>(arguments[0]) == graph)
            transcript.push_back("EnableWindow " + std::to_string(static_cast<BOOL>(arguments[1])));
        return spy.callReal("EnableWindow", arguments);
    });
}

void PrintingTest::standInForThePrinter() {
    spy.watchAll({"GetDeviceCaps", "DeleteDC", "CreateFontIndirectW"});
    spy.replace("GetDeviceCaps", [this](ULONG_PTR* arguments) -> ULONG_PTR {
        if (page && reinterpret_cast<HDC>(arguments[0]) == page) {
            switch (static_cast<int>(arguments[1])) {
            case HORZRES: return static_cast<ULONG_PTR>(printer.width);
            case VERTRES: return static_cast<ULONG_PTR>(printer.height);
            case LOGPIXELSY: return static_cast<ULONG_PTR>(printer.dotsPerInch);
            }
        }
        return spy.callReal("GetDeviceCaps", arguments);
    });
    spy.replace("DeleteDC", [this](ULONG_PTR* arguments) -> ULONG_PTR {
        if (!page || reinterpret_cast<HDC>(arguments[0]) != page)
            return spy.callReal("DeleteDC", arguments);
        transcript.push_back("DeleteDC");
        ++pagesDeleted;
        deletePage();
        return TRUE;
    });
    spy.replace("CreateFontIndirectW", [this](ULONG_PTR* arguments) {
        fontHeights.push_back(reinterpret_cast<const LOGFONTW*>(arguments[0])->lfHeight);
        return spy.callReal("CreateFontIndirectW", arguments);
    });
}

ULONG_PTR PrintingTest::load(ULONG_PTR* arguments) {
    // On a desktop with the folder in which it is looked for; see printing_search.cpp.
    const std::string path = Narrow(reinterpret_cast<const wchar_t*>(arguments[0]));
    const std::string name = path.substr(path.find_last_of('\\') + 1);
    transcript.push_back("load " + name);
    if (missingModules.count(name)) return 0;
    if (name == "commdlg.dll") return kDialogModule;
    if (name == "wingdi.dll") return kJobModule;
    ADD_FAILURE() << "loads " << name;
    return 0;
}

ULONG_PTR PrintingTest::find(ULONG_PTR* arguments) {
    const std::string name = reinterpret_cast<const char*>(arguments[1]);
    transcript.push_back("find " + name);
    if (missingFunctions.count(name)) return 0;
    if (arguments[0] == kDialogModule && name == "PrintDlg")
        return reinterpret_cast<ULONG_PTR>(&printDialog);
    if (arguments[0] == kJobModule) {
        if (name == "StartDoc") return reinterpret_cast<ULONG_PTR>(&startDocument);
        if (name == "StartPage") return reinterpret_cast<ULONG_PTR>(&startPage);
        if (name == "EndPage") return reinterpret_cast<ULONG_PTR>(&endPage);
        if (name == "EndDoc") return reinterpret_cast<ULONG_PTR>(&endDocument);
    }
    ADD_FAILURE() << "looks for " << name << " in module " << arguments[0];
    return 0;
}

BOOL PrintingTest::printDialog(kor::PrintDialogRecord* dialog) {
    PrintingTest& test = *current;
    test.transcript.push_back("PrintDlg");
    test.dialogRecord = BytesOf(*dialog);
    test.dialogOwner = dialog->owner;
    if (test.inside[kPrintDialog]) test.inside[kPrintDialog]();
    if (!test.givesDC) return test.isChosen;
    if (!test.page) test.makePage();
    dialog->dc = test.page;  // also when it is cancelled: only the answer counts
    return test.isChosen;
}

int PrintingTest::startDocument(HDC dc, const DOCINFOW* info) {
    current->document = BytesOf(*info);
    current->documentName = info->lpszDocName;
    return current->jobCall(kStartDocument, dc);
}

int PrintingTest::startPage(HDC dc) { return current->jobCall(kStartPage, dc); }

int PrintingTest::endPage(HDC dc) {
    current->printed = ReadDC(dc, {0, 0, current->printer.width, current->printer.height});
    return current->jobCall(kEndPage, dc);
}

int PrintingTest::endDocument(HDC dc) { return current->jobCall(kEndDocument, dc); }

int PrintingTest::jobCall(Function function, HDC dc) {
    transcript.push_back(kFunctions[function]);
    EXPECT_EQ(dc, page) << kFunctions[function];
    if (inside[function]) inside[function]();
    return jobResult;
}

void PrintingTest::makePage() {
    page = CreateCompatibleDC(nullptr);
    const HDC screen = GetDC(nullptr);
    pageBitmap_ = CreateCompatibleBitmap(screen, printer.width, printer.height);
    ReleaseDC(nullptr, screen);
    blank_ = SelectObject(page, pageBitmap_);
    const HBRUSH paper = CreateSolidBrush(kPaper);
    const RECT sheet = {0, 0, printer.width, printer.height};
    FillRect(page, &sheet, paper);
    DeleteObject(paper);
}

void PrintingTest::deletePage() {
    if (!page) return;
    SelectObject(page, blank_);
    DeleteObject(pageBitmap_);
    DeleteDC(page);
    page = nullptr;
}

std::string NameOfType(const ::testing::TestParamInfo<LONG>& tested) {
    constexpr const char* kNames[] = {"Line", "Area", "Bar", "Column", "Pie"};
    return kNames[tested.param];
}

}  // namespace kortest

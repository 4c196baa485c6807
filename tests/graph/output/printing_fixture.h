// A chart whose print modules are the test's own: nobody has to answer a dialog, and the page is a
// picture that can be looked at. What the library calls is written down in one transcript:
//
//   load commdlg.dll            find PrintDlg             PrintDlg
//   EnableWindow 0              StartDoc                  StartPage
//   EndPage                     EndDoc                    DeleteDC
#pragma once

#include "graph/data/record.h"
#include "graph/graph_fixture.h"
#include "platform/print_dialog.h"

#include <optional>
#include <set>

namespace kortest {

constexpr COLORREF kPaper = RGB(255, 254, 253);  // what no chart draws

// The printer that the dialog gives. Its page is a bitmap of `width` by `height` pixels.
struct FakePrinter {
    int width = 300;
    int height = 400;
    int dotsPerInch = 96;
};

class PrintingTest : public GraphTest {
protected:
    explicit PrintingTest(Heap kind = Heap::kOrdinary);
    ~PrintingTest() override;

    void print() { printAnswer = notify(GN_PRINT); }

    const kor::GraphRecord& record() const;

    // The lines of the transcript that begin with one of the words.
    Lines linesOf(const std::set<std::string>& words) const;

    // What the test decides.
    FakePrinter printer;
    std::set<std::string> missingModules;    // "wingdi.dll"
    std::set<std::string> missingFunctions;  // "StartDoc"
    std::function<void()> inside[5];  // called inside the function of this place in kFunctions
    BOOL isChosen = TRUE;
    bool givesDC = true;
    int jobResult = 1;  // of the four functions of a job

    // What the library did.
    Lines transcript;
    LRESULT printAnswer = -1;
    std::vector<BYTE> dialogRecord;  // as the dialog got it
    HWND dialogOwner = nullptr;
    std::vector<BYTE> document;  // as StartDoc got it
    std::wstring documentName;
    HDC page = nullptr;  // the printer's DC while it lives
    Picture printed;     // the page at its end
    std::vector<LONG> fontHeights;
    int pagesDeleted = 0;

    enum Function { kPrintDialog, kStartDocument, kStartPage, kEndPage, kEndDocument };

private:
    static constexpr const char* kFunctions[] = {"PrintDlg", "StartDoc", "StartPage", "EndPage",
                                                 "EndDoc"};

    static BOOL WINAPI printDialog(kor::PrintDialogRecord* dialog);
    static int WINAPI startDocument(HDC dc, const DOCINFOW* info);
    static int WINAPI startPage(HDC dc);
    static int WINAPI endPage(HDC dc);
    static int WINAPI endDocument(HDC dc);

    void standInForTheLoader();
    void standInForThePrinter();
    ULONG_PTR load(ULONG_PTR* arguments);
    ULONG_PTR find(ULONG_PTR* arguments);
    int jobCall(Function function, HDC dc);
    void makePage();
    void deletePage();

    HBITMAP pageBitmap_ = nullptr;
    HGDIOBJ blank_ = nullptr;
};

class GuardedPrintingTest : public PrintingTest {
protected:
    GuardedPrintingTest() : PrintingTest(Heap::kGuarded) {}
    void TearDown() override { EXPECT_EQ(heap->report(), ""); }
};

// "Line" to "Pie", for tests of every chart type.
std::string NameOfType(const ::testing::TestParamInfo<LONG>& tested);

}  // namespace kortest

// Saves a large file again and again, in two versions in turn, to be killed while it does.
//
//   saving_loop FILE [TIMES]   says "saving" when it begins; without TIMES it never ends
#include "document.h"

#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

constexpr int kRows = 2000;

const wchar_t* OtherVersion(const workbook::Document& document) {
    return document.sheet().text({0, 0}) == L"one" ? L"another" : L"one";
}

int Fail(const workbook::FileProblem& problem) {
    std::printf("%ls\n", problem.message.c_str());
    return EXIT_FAILURE;
}

// Each row says which version it belongs to.
void Fill(workbook::Document& document, const wchar_t* version) {
    std::vector<workbook::CellText> cells;
    for (int row = 0; row < kRows; ++row) {
        cells.push_back({{0, row}, version});
        cells.push_back({{1, row}, std::to_wstring(row) + std::wstring(400, L'x')});
    }
    document.setCells(std::move(cells), L"filling");
}

}  // namespace

int wmain(int count, wchar_t** arguments) {
    workbook::Document document;
    const std::wstring path = arguments[1];
    if (const auto problem = document.open(path)) return Fail(*problem);
    int left = count > 2 ? static_cast<int>(std::wcstol(arguments[2], nullptr, 10)) : -1;
    Fill(document, OtherVersion(document));
    std::puts("saving");
    std::fflush(stdout);
    for (; left != 0; --left) {
        if (const auto problem = document.save(path)) return Fail(*problem);
        Fill(document, OtherVersion(document));
    }
    return EXIT_SUCCESS;
}

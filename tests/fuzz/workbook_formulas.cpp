// Each line is typed into a cell of the first columns. What the cells come to must not depend on
// the order of typing, nor on what was typed there before.
#include "workbook_fuzz.h"

#include "formula.h"
#include "sheet.h"

namespace workbook {
namespace {

constexpr int kColumns = 3;

CellAddress PlaceOf(std::size_t line) {
    const int number = static_cast<int>(line);
    return {number % kColumns, number / kColumns};
}

void CheckProgram(const std::wstring& text) {
    const Program program = CompileFormula(text);
    for (const Block& block : program.references) {
        EXPECT_THAT(IsInSheet({block.left, block.top}) && IsInSheet({block.right, block.bottom}));
        EXPECT_THAT(block.left <= block.right && block.top <= block.bottom);
    }
    EXPECT_THAT((program.problem == FormulaProblem::None) ==
                ProblemMessage(program.problem).empty());
}

// Everything is asked for, so that all is calculated.
std::wstring Shown(const Sheet& sheet, std::size_t lines) {
    std::wstring shown;
    for (std::size_t line = 0; line < lines; ++line)
        shown += sheet.display(PlaceOf(line)) + sheet.formulaProblem(PlaceOf(line)) + L"\n";
    return shown;
}

void Check(const std::vector<std::wstring>& lines) {
    Sheet forwards;
    Sheet backwards;
    for (std::size_t line = 0; line < lines.size(); ++line) {
        forwards.setText(PlaceOf(line), lines[line]);
        if (lines[line].starts_with(L'=')) CheckProgram(lines[line].substr(1));
    }
    for (std::size_t line = lines.size(); line-- > 0;) {
        backwards.setText(PlaceOf(line), L"=A1+B2");
        backwards.display(PlaceOf(line));
    }
    for (std::size_t line = lines.size(); line-- > 0;) {
        backwards.setText(PlaceOf(line), lines[line]);
        backwards.display(PlaceOf(line));
    }
    EXPECT_THAT(Shown(forwards, lines.size()) == Shown(backwards, lines.size()));
}

}  // namespace
}  // namespace workbook

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    workbook::Check(workbook::LinesOf(workbook::BytesOf(data, size)));
    return 0;
}

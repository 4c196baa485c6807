// Files of any bytes: read, or refused with a sentence; and what was read is the same after
// writing.
#include "workbook_fuzz.h"

#include "csv.h"

namespace workbook {
namespace {

bool HaveSameTexts(const Sheet& one, const Sheet& other) {
    if (one.occupiedCells() != other.occupiedCells()) return false;
    const Block all = {0, 0, kColumnCount - 1, kRowCount - 1};
    for (const CellAddress cell : one.occupiedIn(all)) {
        if (one.text(cell) != other.text(cell)) return false;
    }
    return true;
}

void Check(std::string_view bytes) {
    const CsvResult read = ReadCsv(bytes);
    EXPECT_THAT(read.document.has_value() != read.problem.has_value());
    if (read.problem) {
        EXPECT_THAT(read.problem->message.ends_with(L'.'));
        return;
    }
    const std::string written = WriteCsv(read.document->sheet, read.document->format);
    const CsvResult again = ReadCsv(written);
    EXPECT_THAT(again.document.has_value());
    EXPECT_THAT(HaveSameTexts(read.document->sheet, again.document->sheet));
    EXPECT_THAT(WriteCsv(again.document->sheet, again.document->format) == written);
}

}  // namespace
}  // namespace workbook

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    workbook::Check(workbook::BytesOf(data, size));
    return 0;
}

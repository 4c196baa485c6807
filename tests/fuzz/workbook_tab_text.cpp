// Text from the clipboard: any is read, and what was read is the same after writing.
#include "workbook_fuzz.h"

#include "tab_text.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace workbook;
    const std::vector<TextRow> rows = ReadTabText(Widen(BytesOf(data, size)));
    EXPECT_THAT(size == 0 || !rows.empty());
    for (const TextRow& row : rows) EXPECT_THAT(!row.empty());
    EXPECT_THAT(ReadTabText(WriteTabText(rows)) == rows);
    return 0;
}

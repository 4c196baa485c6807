// Edits, undo and redo in any order, beside a list of all states that there were.
#include "workbook_fuzz.h"

#include "document.h"

#include <map>

namespace workbook {

// The document's only way to the system; here nothing is read or written.
FileContents ReadWholeFile(const std::wstring&, std::size_t) noexcept { return {}; }
std::optional<FileProblem> ReplaceFileBytes(const std::wstring&, std::string_view,
                                            const std::optional<FileMark>&) noexcept {
    return std::nullopt;
}

namespace {

constexpr int kColumns = 4;
constexpr int kRows = 4;

using State = std::map<std::pair<int, int>, std::wstring>;

const wchar_t* const kTexts[] = {L"",     L"1",   L"2",   L"=A1+B2", L"=SUM(A1:D4)",
                                 L"text", L"=C3", L"=1/0"};

class Bytes {
public:
    explicit Bytes(std::string_view bytes) : rest_(bytes) {}
    bool isAtEnd() const { return rest_.empty(); }
    int below(int limit) {
        if (rest_.empty()) return 0;
        const int byte = static_cast<unsigned char>(rest_.front());
        rest_.remove_prefix(1);
        return byte % limit;
    }

private:
    std::string_view rest_;
};

class Checker {
public:
    void step(Bytes& bytes) {
        switch (bytes.below(8)) {
        case 0: return undo();
        case 1: return redo();
        case 2: return save();
        case 3: return clear(bytes);
        case 4: return typeSeveral(bytes);
        default: return typeOne(bytes);
        }
    }

    void check() const {
        for (int column = 0; column < kColumns; ++column) {
            for (int row = 0; row < kRows; ++row) {
                const auto found = states_[now_].find({column, row});
                const std::wstring text = found == states_[now_].end() ? L"" : found->second;
                EXPECT_THAT(document_.sheet().text({column, row}) == text);
                document_.sheet().display({column, row});
            }
        }
        EXPECT_THAT(document_.sheet().occupiedCells() == states_[now_].size());
        EXPECT_THAT(document_.canUndo() == (now_ > 0));
        EXPECT_THAT(document_.canRedo() == (now_ + 1 < states_.size()));
        EXPECT_THAT(document_.isModified() == (saved_ != now_));
    }

private:
    static CellAddress AnyCell(Bytes& bytes) { return {bytes.below(kColumns), bytes.below(kRows)}; }
    static std::wstring AnyText(Bytes& bytes) { return kTexts[bytes.below(std::size(kTexts))]; }

    void expect(EditResult result, State state) {
        EXPECT_THAT(result == (state == states_[now_] ? EditResult::Unchanged : EditResult::Done));
        if (result != EditResult::Done) return;
        if (saved_ && *saved_ > now_) saved_.reset();
        states_.resize(now_ + 1);
        states_.push_back(std::move(state));
        ++now_;
    }
    static void put(State& state, CellAddress cell, const std::wstring& text) {
        if (text.empty()) {
            state.erase({cell.column, cell.row});
        } else {
            state[{cell.column, cell.row}] = text;
        }
    }

    void typeOne(Bytes& bytes) {
        const CellAddress cell = AnyCell(bytes);
        const std::wstring text = AnyText(bytes);
        State state = states_[now_];
        put(state, cell, text);
        expect(document_.setCell(cell, text), std::move(state));
    }
    void typeSeveral(Bytes& bytes) {
        std::vector<CellText> cells;
        State state = states_[now_];
        for (int count = bytes.below(6); count > 0; --count) {
            cells.push_back({AnyCell(bytes), AnyText(bytes)});
            put(state, cells.back().cell, cells.back().text);
        }
        expect(document_.setCells(std::move(cells), L"pasting"), std::move(state));
    }
    void clear(Bytes& bytes) {
        const Block block = BlockBetween(AnyCell(bytes), AnyCell(bytes));
        State state = states_[now_];
        std::erase_if(state, [&](const auto& entry) {
            const auto [column, row] = entry.first;
            return column >= block.left && column <= block.right && row >= block.top &&
                   row <= block.bottom;
        });
        expect(document_.clear(block), std::move(state));
    }
    void undo() {
        EXPECT_THAT(document_.undo().has_value() == (now_ > 0));
        if (now_ > 0) --now_;
    }
    void redo() {
        EXPECT_THAT(document_.redo().has_value() == (now_ + 1 < states_.size()));
        if (now_ + 1 < states_.size()) ++now_;
    }
    void save() {
        EXPECT_THAT(!document_.save(L"a.csv"));
        saved_ = now_;
    }

    Document document_;
    std::vector<State> states_{1};
    std::size_t now_ = 0;
    std::optional<std::size_t> saved_ = 0;
};

}  // namespace
}  // namespace workbook

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace workbook;
    Bytes bytes(BytesOf(data, size));
    Checker checker;
    while (!bytes.isAtEnd()) {
        checker.step(bytes);
        checker.check();
    }
    return 0;
}

#include "sheet_model.h"

#include <algorithm>

namespace longrun {

namespace {

constexpr std::size_t kMostSteps = 1000;

bool IsInSheet(Place place) {
    return place.row >= 0 && place.row < SheetModel::kRows && place.column >= 0 &&
           place.column < SheetModel::kColumns;
}

// Of characters below U+10000, which are all that the long run types.
void AppendUtf8(std::string& bytes, wchar_t character) {
    const auto byte = [&](unsigned value) { bytes += static_cast<char>(value); };
    const unsigned code = character;
    if (code < 0x80) return byte(code);
    if (code < 0x800) {
        byte(0xC0 | code >> 6);
    } else {
        byte(0xE0 | code >> 12);
        byte(0x80 | (code >> 6 & 0x3F));
    }
    byte(0x80 | (code & 0x3F));
}

wchar_t TakeCharacter(const std::string& bytes, std::size_t& at) {
    const auto next = [&] { return static_cast<unsigned char>(bytes[at++]); };
    const unsigned first = next();
    if (first < 0x80) return static_cast<wchar_t>(first);
    unsigned code = first < 0xE0 ? first & 0x1F : first & 0x0F;
    for (int more = first < 0xE0 ? 1 : 2; more > 0; --more) code = code << 6 | (next() & 0x3F);
    return static_cast<wchar_t>(code);
}

std::string Field(const std::wstring& text) {
    const bool quoted = text.find_first_of(L"\",\r\n") != std::wstring::npos;
    std::string bytes;
    for (const wchar_t character : text) {
        if (character == L'"') bytes += '"';
        AppendUtf8(bytes, character);
    }
    return quoted ? '"' + bytes + '"' : bytes;
}

}  // namespace

std::wstring SheetModel::at(Place place) const {
    const auto found = texts_.find(place);
    return found == texts_.end() ? std::wstring() : found->second;
}

int SheetModel::usedRows() const { return texts_.empty() ? 0 : texts_.rbegin()->first.row + 1; }

int SheetModel::usedColumns() const {
    int columns = 0;
    for (const auto& [place, text] : texts_) columns = std::max(columns, place.column + 1);
    return columns;
}

bool SheetModel::hasFormulaIn(const Area& area) const {
    return std::ranges::any_of(texts_, [&](const auto& entry) {
        const Place& place = entry.first;
        return entry.second.front() == L'=' && place.row >= area.first.row &&
               place.row <= area.last.row && place.column >= area.first.column &&
               place.column <= area.last.column;
    });
}

void SheetModel::put(Place place, const std::wstring& text) {
    if (text.empty()) {
        texts_.erase(place);
    } else {
        texts_[place] = text;
    }
}

void SheetModel::write(const Texts& texts) {
    for (const auto& [place, text] : texts) {
        if (!IsInSheet(place)) return;
    }
    Step step;
    for (const auto& [place, text] : texts) {
        if (at(place) == text) continue;
        step.push_back({place, at(place), text});
        put(place, text);
    }
    if (step.empty()) return;
    if (saved_ && *saved_ > now_) saved_.reset();
    undone_.clear();
    done_.push_back(std::move(step));
    if (done_.size() > kMostSteps) done_.pop_front();
    ++now_;
}

void SheetModel::clear(const Area& area) {
    Texts texts;
    for (const auto& [place, text] : texts_) {
        if (place.row >= area.first.row && place.row <= area.last.row &&
            place.column >= area.first.column && place.column <= area.last.column) {
            texts.push_back({place, L""});
        }
    }
    write(texts);
}

void SheetModel::undo() {
    if (done_.empty()) return;
    for (const Change& change : done_.back()) put(change.place, change.before);
    undone_.push_back(std::move(done_.back()));
    done_.pop_back();
    --now_;
}

void SheetModel::redo() {
    if (undone_.empty()) return;
    for (const Change& change : undone_.back()) put(change.place, change.after);
    done_.push_back(std::move(undone_.back()));
    undone_.pop_back();
    ++now_;
}

Rows SheetModel::copy(const Area& area) const {
    const int lastRow = std::min(area.last.row, std::max(usedRows() - 1, area.first.row));
    const int lastColumn =
        std::min(area.last.column, std::max(usedColumns() - 1, area.first.column));
    Rows rows;
    for (int row = area.first.row; row <= lastRow; ++row) {
        rows.emplace_back();
        for (int column = area.first.column; column <= lastColumn; ++column)
            rows.back().push_back(at({row, column}));
    }
    return rows;
}

std::string SheetModel::csv() const {
    const int columns = usedColumns();
    std::string bytes;
    for (int row = 0; row < usedRows(); ++row) {
        for (int column = 0; column < columns; ++column) {
            if (column > 0) bytes += ',';
            bytes += Field(at({row, column}));
        }
        bytes += "\r\n";
    }
    return bytes;
}

SheetModel SheetModel::read(const std::wstring& path, const std::string& csv) {
    SheetModel sheet;
    sheet.path = path;
    Place place = {0, 0};
    bool isQuoted = false;
    for (std::size_t at = 0; at < csv.size();) {
        const wchar_t character = TakeCharacter(csv, at);
        const bool isDoubled = isQuoted && character == L'"' && at < csv.size() && csv[at] == '"';
        if (character == L'"' && !isDoubled) {
            isQuoted = !isQuoted;
        } else if (isQuoted || (character != L',' && character != L'\r' && character != L'\n')) {
            sheet.texts_[place] += character;
            at += isDoubled;
        } else if (character == L',') {
            ++place.column;
        } else if (character == L'\n') {
            place = {place.row + 1, 0};
        }
    }
    return sheet;
}

}  // namespace longrun

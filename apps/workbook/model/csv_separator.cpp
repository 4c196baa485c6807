#include "csv_separator.h"

#include <algorithm>
#include <array>
#include <vector>

namespace workbook {

namespace {

constexpr size_t kCandidates = kSeparators.size();
constexpr size_t kComma = 0;
constexpr size_t kSampleLines = 50;

using Counts = std::array<size_t, kCandidates>;

struct Sample {
    std::vector<Counts> lines;  // of the lines that have any separator
    bool isCommaBetweenDigitsOnly = true;
};

constexpr bool IsDigit(char c) { return c >= '0' && c <= '9'; }

bool IsBetweenDigits(std::string_view bytes, size_t at) {
    return at > 0 && at + 1 < bytes.size() && IsDigit(bytes[at - 1]) && IsDigit(bytes[at + 1]);
}

// A quote opens a quoted field only at a field's beginning, wherever that may be.
Sample TakeSample(std::string_view bytes) {
    Sample sample;
    Counts counts{};
    bool isQuoted = false;
    bool isFieldStart = true;
    const auto endLine = [&] {
        if (counts != Counts{}) sample.lines.push_back(counts);
        counts = {};
    };

    for (size_t at = 0; at < bytes.size() && sample.lines.size() < kSampleLines; ++at) {
        const char c = bytes[at];
        if (isQuoted) {
            isQuoted = c != '"';  // a doubled quote ends the field, and begins it again
            isFieldStart = !isQuoted;
            continue;
        }
        const size_t candidate = kSeparators.find(c);
        isQuoted = c == '"' && isFieldStart;
        isFieldStart = candidate != std::string_view::npos || c == '\n' || c == '\r';
        if (c == '\n' || c == '\r') endLine();
        if (candidate == std::string_view::npos) continue;
        ++counts[candidate];
        if (candidate == kComma && !IsBetweenDigits(bytes, at))
            sample.isCommaBetweenDigitsOnly = false;
    }
    endLine();
    return sample;
}

struct Score {
    size_t lines = 0;  // how many lines have the most usual number of this separator
    size_t count = 0;  // that number
};

Score ScoreOf(size_t candidate, const std::vector<Counts>& lines) {
    std::vector<size_t> counts;
    for (const Counts& line : lines)
        if (line[candidate] > 0) counts.push_back(line[candidate]);
    std::ranges::sort(counts);

    Score best;
    for (auto first = counts.begin(); first != counts.end();) {
        const auto end = std::upper_bound(first, counts.end(), *first);
        const auto length = static_cast<size_t>(end - first);
        if (length >= best.lines) best = {length, *first};
        first = end;
    }
    return best;
}

}  // namespace

std::optional<char> DetectSeparator(std::string_view bytes) {
    const Sample sample = TakeSample(bytes);
    if (sample.lines.empty()) return std::nullopt;

    size_t winner = kCandidates;
    Score best;
    for (size_t candidate = 0; candidate < kCandidates; ++candidate) {
        const Score score = ScoreOf(candidate, sample.lines);
        if (score.lines == 0) continue;
        const bool beatsDecimalComma = winner == kComma && sample.isCommaBetweenDigitsOnly;
        const bool isBetter =
            score.lines > best.lines ||
            (score.lines == best.lines && (beatsDecimalComma || score.count > best.count));
        if (!isBetter) continue;
        winner = candidate;
        best = score;
    }
    return kSeparators[winner];
}

}  // namespace workbook

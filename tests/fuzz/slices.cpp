// The slices of a pie: each pixel of the disc in exactly one, and rows that follow one another as
// each row for itself.
#include "fuzz_input.h"

#include "graph/shapes/slice_walk.h"

#include <map>

namespace korfuzz {
namespace {

// Edges from 0 to 360 degrees, some on the quarters and some so close that nothing is between them.
std::vector<double> Boundaries(Input& input) {
    std::vector<double> degrees = {0.0, 360.0};
    while (input.remaining_bytes() > 0 && degrees.size() < 20) {
        const double base = input.ConsumeBool() ? 45.0 * input.ConsumeIntegralInRange(0, 8)
                                                : 360.0 * input.ConsumeProbability<double>();
        const double off = input.ConsumeBool() ? 0.0 : 1e-9 * input.ConsumeIntegral<int8_t>();
        degrees.push_back(std::clamp(base + off, 0.0, 360.0));
    }
    std::sort(degrees.begin(), degrees.end());
    return degrees;
}

using Row = std::map<int, int>;  // columns by their run's begin, with the end

Row OnRow(const kor::SliceEdge& start, const kor::SliceEdge& end, int dy, int halfWidth) {
    Row row;
    for (const kor::DiscRun& run : kor::SliceOnRow(start, end, dy, halfWidth).runs) {
        if (run.from < run.to) row[run.from] = run.to;
    }
    return row;
}

void CheckWalk(const kor::SliceEdge& start, const kor::SliceEdge& end, kor::RowRange rows,
               const std::vector<int32_t>& halfWidths) {
    std::map<int, Row> walked;
    kor::WalkSlice(start, end, rows, halfWidths.data(), [&](int dy, kor::DiscRun run) {
        EXPECT_THAT(dy >= rows.first && dy <= rows.last);
        EXPECT_THAT(walked[dy].emplace(run.from, run.to).second);
    });
    for (int dy = rows.first; dy <= rows.last; ++dy) {
        EXPECT_THAT(walked[dy] ==
                    OnRow(start, end, dy, halfWidths[static_cast<size_t>(std::abs(dy))]));
    }
}

void CheckCover(const std::vector<kor::SliceEdge>& edges, int dy, int halfWidth) {
    std::vector<int> times(static_cast<size_t>(2 * halfWidth));
    for (size_t i = 0; i + 1 < edges.size(); ++i) {
        for (const auto& [from, to] : OnRow(edges[i], edges[i + 1], dy, halfWidth)) {
            EXPECT_THAT(from >= -halfWidth && to <= halfWidth);
            for (int x = from; x < to; ++x) ++times[static_cast<size_t>(x + halfWidth)];
        }
    }
    EXPECT_THAT(std::all_of(times.begin(), times.end(), [](int n) { return n == 1; }));
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    const int radius = input.ConsumeIntegralInRange(1, input.ConsumeBool() ? 150 : 20);
    std::vector<int32_t> halfWidths(static_cast<size_t>(radius) + 1);
    kor::WalkCircle(radius, halfWidths.data());
    const int first = input.ConsumeIntegralInRange(-radius, radius);
    const int last = input.ConsumeIntegralInRange(-radius, radius);
    std::vector<kor::SliceEdge> edges;
    for (const double degrees : Boundaries(input)) edges.push_back(kor::MakeSliceEdge(degrees));
    for (size_t i = 0; i + 1 < edges.size(); ++i) {
        if (edges[i].degrees < edges[i + 1].degrees) {
            CheckWalk(edges[i], edges[i + 1], {first, last}, halfWidths);
        }
    }
    for (int dy = -radius; dy <= radius; ++dy) {
        CheckCover(edges, dy, halfWidths[static_cast<size_t>(std::abs(dy))]);
    }
    return 0;
}

// Sizes and positions of the grid's columns and rows against the definitions, one by one.
#include "fuzz_input.h"

#include "grid/geometry.h"
#include "grid/state.h"
#include "zoom/zoom.h"

namespace korfuzz {
namespace {

std::vector<kor::SizeOverride> AnyOverrides(Input& input, int limit, int defaultSize) {
    std::vector<kor::SizeOverride> table;
    for (int index = input.ConsumeIntegralInRange(0, 5);
         index < limit && table.size() < 40 && input.remaining_bytes() > 0;
         index += input.ConsumeIntegralInRange(1, input.ConsumeBool() ? 3 : limit)) {
        const auto size = input.ConsumeBool() ? input.ConsumeIntegralInRange<uint16_t>(0, 100)
                                              : input.ConsumeIntegral<uint16_t>();
        table.push_back({static_cast<uint16_t>(index), size, size - defaultSize});
    }
    return table;
}

int LiteralSize(const std::vector<kor::SizeOverride>& table, int defaultSize, int index,
                uint32_t zoom) {
    for (const kor::SizeOverride& entry : table) {
        if (entry.index == index) return kor::PixelsFromUnits(entry.size, zoom);
    }
    return kor::PixelsFromUnits(static_cast<uint32_t>(defaultSize), zoom);
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    const bool isColumns = input.ConsumeBool();
    const int limit = isColumns ? kor::kColumnLimit : kor::kRowLimit;
    const int defaultSize = isColumns ? 60 : 16;
    const uint32_t zoom = input.ConsumeBool() ? input.ConsumeIntegralInRange(1u, 16u)
                                              : std::max(input.ConsumeIntegral<uint32_t>(), 1u);
    const int first = input.ConsumeIntegralInRange(0, limit - 1);
    const int extent = input.ConsumeIntegralInRange(-10, 40000);
    const int position = input.ConsumeIntegralInRange(-100, 40000);
    const int origin = input.ConsumeIntegralInRange(0, 100);
    const int a = input.ConsumeIntegralInRange(0, limit - 1);
    const int b = input.ConsumeIntegralInRange(0, limit - 1);
    const auto pixels = input.ConsumeIntegral<uint16_t>();
    // A copy of exactly the table's size, so that a look behind it is seen.
    const std::vector<kor::SizeOverride> table = AnyOverrides(input, limit, defaultSize);
    const std::vector<kor::SizeOverride> exact(table);
    const kor::GridAxis axis = {exact.empty() ? nullptr : exact.data(),
                                static_cast<uint32_t>(exact.size()), defaultSize};
    const auto literal = [&](int index) { return LiteralSize(table, defaultSize, index, zoom); };

    for (int i = first; i < std::min(first + 20, limit); ++i) {
        EXPECT_THAT(kor::SizeOf(axis, i, zoom) == literal(i));
    }
    int64_t sum = 0;
    for (int i = a; i < b; ++i) sum += literal(i);
    EXPECT_THAT(kor::SizeOfRange(axis, a, b, zoom) == sum);
    kor::RoughDistance(axis, std::min(a, b), std::max(a, b), zoom);

    const int count = kor::CountVisible(axis, first, limit, extent, zoom);
    EXPECT_THAT(count >= 0 && count <= 255 && first + count <= limit);
    if (count > 0) EXPECT_THAT(kor::SizeOfRange(axis, first, first + count - 1, zoom) < extent);
    if (count < 255 && first + count < limit) {
        EXPECT_THAT(kor::SizeOfRange(axis, first, first + count, zoom) >= extent);
    }

    const int found = kor::IndexAt(axis, first, count, origin, position, zoom);
    EXPECT_THAT(found == 0 || (found >= first && found <= first + count));
    if (found > first) {
        const int begin = origin + kor::SizeOfRange(axis, first, found, zoom);
        EXPECT_THAT(begin < position && position <= begin + literal(found));
    }

    const kor::VisibleSpan span =
        kor::SelectedSpan(axis, std::min(a, b), std::max(a, b), first, count, zoom);
    EXPECT_THAT(span.touches == (std::min(a, b) <= first + count && std::max(a, b) >= first));
    EXPECT_THAT(span.offset >= 0 && span.length >= 0);

    const int area = input.ConsumeIntegralInRange(-20, 40000);
    EXPECT_THAT(kor::UnitsWithinArea(pixels, zoom, area) <= std::max(area, 0));
    return 0;
}

// Items and borders under a position of a header strip, against the definition, border by border.
#include "fuzz_input.h"

#include "header/hit_test.h"

namespace korfuzz {
namespace {

constexpr int kBefore = 5;
constexpr int kFromIt = 6;

kor::HeaderHit Literal(const std::vector<uint16_t>& sizes, int position) {
    kor::HeaderHit hit = {-1, false, -1};
    if (position < 0) return hit;
    std::vector<int> starts = {0};
    for (const uint16_t size : sizes) starts.push_back(starts.back() + size);
    const int count = static_cast<int>(sizes.size());
    for (int i = count - 1; i >= 0; --i) {
        if (starts[static_cast<size_t>(i) + 1] > position) hit.item = i;
    }
    // Where the items' beginnings hold the position, down to the item under it; the item's own end.
    const int walked = hit.item < 0 ? count : hit.item + 1;
    for (int i = 0; i < walked; ++i) {
        if (position - starts[static_cast<size_t>(i)] < kFromIt) hit = {hit.item, true, i - 1};
    }
    if (hit.item >= 0 && starts[static_cast<size_t>(hit.item) + 1] - position <= kBefore) {
        hit = {hit.item, true, hit.item};
    }
    return hit;
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    const int base = input.ConsumeIntegralInRange(-10, input.ConsumeBool() ? 300 : 70000);
    std::vector<uint16_t> sizes;
    while (input.remaining_bytes() > 0 && sizes.size() < 100) {
        sizes.push_back(input.ConsumeBool() ? input.ConsumeIntegralInRange<uint16_t>(0, 12)
                                            : input.ConsumeIntegral<uint16_t>());
    }
    const std::vector<uint16_t> exact(sizes);
    for (int position = base; position < base + 20; ++position) {
        const kor::HeaderHit hit =
            kor::HitTestHeader(exact.data(), static_cast<uint32_t>(exact.size()), position);
        const kor::HeaderHit literal = Literal(sizes, position);
        EXPECT_THAT(hit.item == literal.item && hit.onBorder == literal.onBorder);
        EXPECT_THAT(!hit.onBorder || hit.borderItem == literal.borderItem);
    }
    return 0;
}

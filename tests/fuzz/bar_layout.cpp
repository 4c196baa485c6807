// The function bar's layout: parts that stand beside one another, and a menu entry with room for
// all of them.
#include "fuzz_input.h"

#include "funkybar/layout.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    const auto pixels = [&] { return input.ConsumeIntegralInRange(0, 32767); };
    const int clientHeight = pixels(), imageWidth = pixels(), imageHeight = pixels();
    const kor::Size text = {pixels(), pixels()};

    const int above = kor::BarImageTop(clientHeight, imageHeight);
    const int below = clientHeight - imageHeight - above;
    EXPECT_THAT(std::abs(above - below) <= 1);
    EXPECT_THAT(kor::BarTextLeft(true, imageWidth) >= kor::kBarLeft + imageWidth);
    EXPECT_THAT(kor::BarTextLeft(false, imageWidth) == kor::kBarLeft);
    const kor::Point arrow = kor::ArrowPlace(kor::kBarLeft, text.width, clientHeight);
    EXPECT_THAT(arrow.x >= kor::kBarLeft + text.width && arrow.y < clientHeight);

    const kor::Size image = {imageWidth, imageHeight};
    const kor::Size entry = kor::EntrySize(text, image);
    EXPECT_THAT(kor::EntryTextLeft(0, imageWidth) + text.width <= entry.width);
    EXPECT_THAT(entry.height >= text.height && entry.height >= imageHeight);
    EXPECT_THAT(kor::FontHeight(input.ConsumeIntegralInRange(1, 1000),
                                input.ConsumeIntegralInRange(72, 2400)) < 0);
    return 0;
}

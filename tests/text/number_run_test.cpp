// Numbers that are drawn character by character have the pixels that DrawTextW gives.
#include "text/number_run.h"

#include "text_canvas.h"

#include <gtest/gtest.h>

#include <cmath>
#include <string>

namespace {

using namespace kortest;

std::wstring RandomNumber(std::mt19937& random) {
    const double value = (random() / 4294967296.0 - 0.5) * std::pow(10.0, random() % 14);
    wchar_t text[64];
    _snwprintf(text, std::size(text), random() % 4 ? L"%.5G" : L"%.3E", value);
    std::wstring number = text;
    if (random() % 3 == 0) number += L'%';
    if (random() % 8 == 0) number.insert(random() % number.size(), random() % 2 ? L"a" : L"&b");
    return number;
}

UINT RandomAlignment(std::mt19937& random) {
    static const UINT kAlignments[] = {DT_LEFT, DT_CENTER, DT_RIGHT};
    return kAlignments[random() % std::size(kAlignments)];
}

// Draws one number both ways on a fresh ground; whether anything was drawn goes to `drawn`.
class BothWays {
public:
    void Draw(HFONT font, const kor::NumberWidths& widths, const std::wstring& text, RECT area,
              UINT format) {
        for (Canvas* canvas : {&literal_, &run_}) {
            canvas->clear();
            SetTextColor(canvas->dc(), RGB(10, 60, 200));
            SetBkColor(canvas->dc(), RGB(250, 240, 200));
            SelectObject(canvas->dc(), font);
        }
        kor::DrawNumberText(run_.dc(), widths, text.c_str(), area, format);
        DrawTextW(literal_.dc(), text.c_str(), -1, &area, format);
        expected = literal_.pixels();
        actual = run_.pixels();
        for (Canvas* canvas : {&literal_, &run_}) {
            SelectObject(canvas->dc(), GetStockObject(SYSTEM_FONT));
        }
    }
    HDC dc() const { return run_.dc(); }
    bool Drew() const { return expected != std::vector<uint32_t>(expected.size(), expected[0]); }

    std::vector<uint32_t> expected;
    std::vector<uint32_t> actual;

private:
    Canvas literal_;
    Canvas run_;
};

TEST(NumberRun, DrawsThePixelsOfDrawText) {
    std::mt19937 random(30);
    BothWays ways;
    int drawn = 0;
    int known = 0;
    for (int i = 0; i < 4000; ++i) {
        HFONT font = RandomFont(random);
        const kor::NumberWidths widths = kor::MeasureNumberCharacters(ways.dc(), font);
        known += widths.known;
        const std::wstring text = RandomNumber(random);
        ways.Draw(font, widths, text, RandomArea(random), RandomAlignment(random));
        ASSERT_EQ(ways.actual, ways.expected) << "picture " << i;
        drawn += ways.Drew();
        DeleteObject(font);
    }
    EXPECT_GT(drawn, 2000);  // or the comparison said little
    EXPECT_GT(known, 2000);
}

TEST(NumberRun, LeavesNumbersToDrawTextWhileNoWidthIsKnown) {
    std::mt19937 random(31);
    BothWays ways;
    HFONT font = RandomFont(random);
    ways.Draw(font, {}, L"-12.5", {10, 5, 120, 30}, DT_CENTER);
    EXPECT_EQ(ways.actual, ways.expected);
    EXPECT_TRUE(ways.Drew());
    DeleteObject(font);
}

TEST(NumberRun, LeavesLongTextsToDrawText) {
    std::mt19937 random(32);
    BothWays ways;
    HFONT font = RandomFont(random);
    const kor::NumberWidths widths = kor::MeasureNumberCharacters(ways.dc(), font);
    for (const size_t length : {39U, 40U, 41U, 1000U}) {
        ways.Draw(font, widths, std::wstring(length, L'1'), {0, 5, 160, 30}, DT_LEFT);
        EXPECT_EQ(ways.actual, ways.expected) << length;
    }
    DeleteObject(font);
}

TEST(NumberRun, KnowsNoWidthsWithoutADevice) {
    EXPECT_EQ(kor::MeasureNumberCharacters(nullptr, nullptr).known, 0);
}

}  // namespace

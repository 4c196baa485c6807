// The short way of drawing a text gives the pixels that DrawTextW gives, whatever the text, the
// format and the font.
#include "text/text_run.h"

#include "text_canvas.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using namespace kortest;

// Mostly plain texts, some with what only DrawTextW understands.
std::wstring RandomText(std::mt19937& random) {
    static const std::wstring kOdd = L"\t\n\r&\u00AD\u05D0\u0301\u4E2D";
    std::wstring text;
    const auto length = random() % 24;
    const bool odd = random() % 4 == 0;
    for (unsigned i = 0; i < length; ++i) {
        if (odd && random() % 6 == 0) {
            text += kOdd[random() % kOdd.size()];
        } else if (random() % 8 == 0) {
            text += static_cast<wchar_t>(0xA1 + random() % 0xDF);
        } else {
            text += static_cast<wchar_t>(0x20 + random() % 0x5F);
        }
    }
    return text;
}

UINT RandomFormat(std::mt19937& random) {
    static const UINT kFormats[] = {0,
                                    DT_CENTER,
                                    DT_RIGHT,
                                    DT_VCENTER,
                                    DT_NOPREFIX,
                                    DT_NOPREFIX | DT_VCENTER | DT_CENTER,
                                    DT_NOCLIP,
                                    DT_CENTER | DT_RIGHT,
                                    DT_SINGLELINE | DT_VCENTER,
                                    DT_RIGHT | DT_NOPREFIX,
                                    DT_WORDBREAK,
                                    DT_EXPANDTABS};
    return kFormats[random() % std::size(kFormats)];
}

TEST(TextRun, DrawsThePixelsOfDrawText) {
    std::mt19937 random(20);
    Canvas literal;
    Canvas run;
    int drawn = 0;
    for (int i = 0; i < 6000; ++i) {
        const std::wstring text = RandomText(random);
        const UINT format = RandomFormat(random);
        const RECT area = RandomArea(random);
        HFONT font = RandomFont(random);
        for (Canvas* canvas : {&literal, &run}) {
            canvas->clear();
            SelectObject(canvas->dc(), font);
            SetTextColor(canvas->dc(), RGB(10, 60, 200));
            SetBkColor(canvas->dc(), RGB(250, 240, 200));
        }
        RECT copy = area;
        DrawTextW(literal.dc(), text.c_str(), -1, &copy, format);
        kor::TextRun(run.dc(), text.c_str()).Draw(area, format);
        const auto expected = literal.pixels();
        ASSERT_EQ(run.pixels(), expected) << "picture " << i << ", format " << format;
        drawn += expected != std::vector<uint32_t>(kWidth * kHeight, expected[0]);
        for (Canvas* canvas : {&literal, &run}) {
            SelectObject(canvas->dc(), GetStockObject(SYSTEM_FONT));
        }
        DeleteObject(font);
    }
    EXPECT_GT(drawn, 3000);  // or the comparison said little
}

TEST(TextRun, MeasuresAsDrawTextDoes) {
    std::mt19937 random(21);
    Canvas canvas;
    for (int i = 0; i < 4000; ++i) {
        const std::wstring text = RandomText(random);
        HFONT font = RandomFont(random);
        SelectObject(canvas.dc(), font);
        RECT measured = {};
        DrawTextW(canvas.dc(), text.c_str(), -1, &measured, DT_CALCRECT);
        ASSERT_EQ(kor::TextRun(canvas.dc(), text.c_str()).Width(), measured.right) << "text " << i;
        SelectObject(canvas.dc(), GetStockObject(SYSTEM_FONT));
        DeleteObject(font);
    }
}

TEST(TextRun, LeavesLongTextsToDrawText) {
    Canvas canvas;
    for (const size_t length : {254U, 255U, 256U, 100000U}) {
        const std::wstring text(length, L'i');
        RECT measured = {};
        DrawTextW(canvas.dc(), text.c_str(), -1, &measured, DT_CALCRECT);
        EXPECT_EQ(kor::TextRun(canvas.dc(), text.c_str()).Width(), measured.right) << length;
    }
}

}  // namespace

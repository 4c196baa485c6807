// SetCellValue with thousands of random arguments, pixel for pixel against plain GDI calls.
#include "grid/grid_fixture.h"

#include <random>

namespace kortest {
namespace {

class GridTextPictures : public GridTest {
protected:
    GridTextPictures() : GridTest(260, 140) {}

    ~GridTextPictures() override {
        for (const HFONT font : fonts) DeleteObject(font);
    }

    void start(unsigned seed) {
        create(260, 140);
        random.seed(seed);
        for (int i = 0; i < 10; ++i) {
            LOGFONTW font{};
            font.lfHeight = upTo(40) - 20;
            font.lfWidth = upTo(3) == 0 ? upTo(12) : 0;
            font.lfWeight = upTo(1) ? FW_BOLD : FW_NORMAL;
            font.lfItalic = static_cast<BYTE>(upTo(1));
            font.lfUnderline = static_cast<BYTE>(upTo(4) == 0);
            font.lfStrikeOut = static_cast<BYTE>(upTo(6) == 0);
            font.lfEscapement = upTo(12) == 0 ? 150 : 0;
            font.lfCharSet = DEFAULT_CHARSET;
            fonts.push_back(CreateFontIndirectW(&font));
        }
    }

    int upTo(int last) { return static_cast<int>(random() % (static_cast<unsigned>(last) + 1)); }

    std::wstring randomText() {
        static const wchar_t* const kPieces[] = {L"0",
                                                 L"12.5",
                                                 L"Total",
                                                 L"word ",
                                                 L" ",
                                                 L"WWW",
                                                 L"iii",
                                                 L"#",
                                                 L"\t",
                                                 L"\r\n",
                                                 L"\n",
                                                 L"&x",
                                                 L"&&",
                                                 L"\u00e4\u00f6",
                                                 L"\u4e2d",
                                                 L"e\u0301",
                                                 L"\u05d0\u05d1",
                                                 L"\u0627\u0644",
                                                 L"fi",
                                                 L"AV",
                                                 L"-",
                                                 L"\u2014",
                                                 L"1,234,567",
                                                 L"\u00a0",
                                                 L"\u200b",
                                                 L"long text of words",
                                                 L"\r",
                                                 L"\v",
                                                 L"\u0001"};
        std::wstring text;
        const int pieces = upTo(6);
        const int kind = upTo(3);
        for (int i = 0; i < pieces; ++i) {
            if (kind == 0)
                text += static_cast<wchar_t>(0x20 + upTo(0x180));  // Latin and what borders on it
            else if (kind == 1)
                text += kPieces[upTo(static_cast<int>(std::size(kPieces)) - 1)];
            else
                text += kPieces[upTo(7)];
        }
        if (upTo(40) == 0) text.resize(static_cast<size_t>(253 + upTo(4)), L'i');
        return text;
    }

    UINT randomFormat() {
        static const UINT kBits[] = {DT_CENTER,       DT_RIGHT,       DT_VCENTER,
                                     DT_BOTTOM,       DT_WORDBREAK,   DT_SINGLELINE,
                                     DT_NOPREFIX,     DT_EXPANDTABS,  DT_NOCLIP,
                                     DT_END_ELLIPSIS, DT_EDITCONTROL, DT_EXTERNALLEADING};
        if (upTo(3) == 0) return 0;
        UINT format = 0;
        for (const UINT bit : kBits)
            if (upTo(4) == 0) format |= bit;
        return format;
    }

    CellText randomValue() {
        CellText value;
        value.cell = KORGRID_CELL(expected.firstColumn + upTo(expected.columnCount),
                                  expected.firstRow + upTo(expected.rowCount));
        value.text = randomText();
        value.font = upTo(3) ? fonts[static_cast<size_t>(upTo(9))] : nullptr;
        value.textColour = random() & 0xFFFFFF;
        value.backColour = random() & 0xFFFFFF;
        value.format = randomFormat();
        value.spanLeft = upTo(2) ? 0 : upTo(5) - 1;
        value.spanRight = upTo(2) ? 0 : upTo(7) - 2;
        value.fitCheck = static_cast<DWORD>(upTo(1));
        value.keepSpan = static_cast<DWORD>(upTo(1));
        return value;
    }

    void changeView() {
        if (upTo(4) == 0) {
            ToggleViewStateOfHeaders();
            expected.headersHidden = !expected.headersHidden;
        }
        static const unsigned kZooms[] = {4, 4, 4, 1, 2, 3, 5, 6, 8, 11};
        expected.zoom = kZooms[upTo(9)];
        SetGridZoomLevel(expected.zoom);
        expected.firstColumn = upTo(6) ? upTo(200) : 250 + upTo(5);
        expected.firstRow = upTo(500);
        SetFirstVisibleCell(KORGRID_CELL(expected.firstColumn, expected.firstRow));
        refit();
        expected.fitColumns(expected.clientWidth);
        for (int i = 0; i < 4; ++i) {
            const int last =
                std::max(std::min(expected.columnCount, 255 - expected.firstColumn), 0);
            endColumnResize(upTo(last), upTo(110));
            expected.fitColumns(expected.clientWidth);
            endRowResize(upTo(6), upTo(30));
        }
        SetFirstVisibleCell(KORGRID_CELL(expected.firstColumn, expected.firstRow));
        refit();
        expected.fitColumns(expected.clientWidth);
        ASSERT_EQ(VisibleRange(), expected.visibleRange());
    }

    std::string describe(const CellText& value) const {
        std::string text =
            Joined("zoom ", expected.zoom, " cell ",
                   CellName(KORGRID_CELLCOLUMN(value.cell), KORGRID_CELLROW(value.cell)), " first ",
                   CellName(expected.firstColumn, expected.firstRow), " format ", value.format,
                   " spans ", value.spanLeft, " ", value.spanRight, " fit ", value.fitCheck,
                   " keep ", value.keepSpan, " text");
        for (const wchar_t character : value.text)
            text = Joined(text, " ", static_cast<int>(character));
        return text;
    }

    // Both pictures start white; many texts lie over one another before a comparison.
    void compareTexts(int rounds) {
        Canvas canvas(260, 140, RGB(255, 255, 255));
        for (int round = 0; round < rounds; ++round) {
            if (round % 50 == 0) {
                ASSERT_NO_FATAL_FAILURE(changeView());
            }
            const int mode = upTo(1) ? OPAQUE : TRANSPARENT;
            SetBkMode(imageDC, mode);
            SetBkMode(canvas.dc(), mode);
            PatBlt(imageDC, 0, 0, 260, 140, WHITENESS);
            PatBlt(canvas.dc(), 0, 0, 260, 140, WHITENESS);
            const CellText value = randomValue();
            DrawExpectedText(canvas.dc(), expected, value);
            SetCellText(value);
            ASSERT_TRUE(SamePicture(canvas.picture(), image())) << describe(value);
            spy.clearCalls();
        }
    }

    std::vector<HFONT> fonts;
    std::mt19937 random;
};

TEST_F(GridTextPictures, FirstThousands) {
    start(1);
    compareTexts(4000);
}

TEST_F(GridTextPictures, SecondThousands) {
    start(2);
    compareTexts(4000);
}

TEST_F(GridTextPictures, ThirdThousands) {
    start(3);
    compareTexts(4000);
}

// Short plain texts in ordinary cells: what a host draws most.
TEST_F(GridTextPictures, PlainNumbersAndWords) {
    start(4);
    Canvas canvas(260, 140, RGB(255, 255, 255));
    for (int round = 0; round < 4000; ++round) {
        if (round % 400 == 0) {
            ASSERT_NO_FATAL_FAILURE(changeView());
        }
        CellText value = randomValue();
        value.text = std::to_wstring(upTo(1000000) * (upTo(1) ? 1 : -1));
        if (upTo(2) == 0) value.text = L"Word " + value.text;
        value.format =
            upTo(2) == 0 ? 0 : (upTo(1) ? UINT{DT_RIGHT | DT_NOPREFIX} : UINT{DT_NOPREFIX});
        PatBlt(imageDC, 0, 0, 260, 140, WHITENESS);
        PatBlt(canvas.dc(), 0, 0, 260, 140, WHITENESS);
        DrawExpectedText(canvas.dc(), expected, value);
        SetCellText(value);
        ASSERT_TRUE(SamePicture(canvas.picture(), image())) << describe(value);
        spy.clearCalls();
    }
}

}  // namespace
}  // namespace kortest

// GM_COPY: the bytes on the clipboard.
#include "graph/output/clipboard_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kColours[] = {0x000000, 0xFFFFFF, 0x0000FF, 0x00FF00, 0xFF0000,
                                 0x00FFFF, 0xFF00FF, 0xFFFF00, 0x000080, 0x008000,
                                 0x800000, 0x008080, 0x800080, 0x808000, 0x8080FF,
                                 0x80FF80, 0xFF8080, 0x808080, 0xC0C0C0};

class ClipboardCopy : public GraphTest {
protected:
    // Black, white and the series' colours only.
    void createInPaletteColours(int width = 230, int height = 130) {
        createPlain(width, height);
        for (int i = 0; i < 4; ++i) add({double(i + 1), 5, 2, -4, double(6 - i)});
        KorGraph_SetType(graph, KORGRAPH_COLUMN);
        settle();
    }

    ClipboardTurn turn;
};

TEST_F(ClipboardCopy, SizesAreMultiplesOfFour) {
    create(101, 50);
    EXPECT_EQ(send(GM_COPY), 0);
    const Bytes bytes = ReadClipboard();
    const ColourDib dib = ParseDib(bytes);
    EXPECT_EQ(dib.header.biWidth, 104);
    EXPECT_EQ(dib.header.biHeight, 52);
    EXPECT_EQ(bytes.size(), 116u + 104u * 52u);
}

TEST_F(ClipboardCopy, SizesThatAreMultiplesStay) {
    create(100, 48);
    send(GM_COPY);
    const ColourDib dib = ParseDib(ReadClipboard());
    EXPECT_EQ(dib.header.biWidth, 100);
    EXPECT_EQ(dib.header.biHeight, 48);
}

TEST_F(ClipboardCopy, HeaderFieldByField) {
    create(101, 50);
    send(GM_COPY);
    const BITMAPINFOHEADER header = ParseDib(ReadClipboard()).header;
    EXPECT_EQ(header.biSize, 40u);
    EXPECT_EQ(header.biPlanes, 1);
    EXPECT_EQ(header.biBitCount, 8);
    EXPECT_EQ(header.biCompression, static_cast<DWORD>(BI_RGB));
    EXPECT_EQ(header.biSizeImage, 0u);
    EXPECT_EQ(header.biXPelsPerMeter, 0);
    EXPECT_EQ(header.biYPelsPerMeter, 0);
    EXPECT_EQ(header.biClrUsed, 19u);
    EXPECT_EQ(header.biClrImportant, 19u);
}

TEST_F(ClipboardCopy, ColourTableIsThePalettes) {
    create();
    send(GM_COPY);
    EXPECT_EQ(ParseDib(ReadClipboard()).colours,
              std::vector<COLORREF>(std::begin(kColours), std::end(kColours)));
}

TEST_F(ClipboardCopy, AGreyChartHasAGreyTable) {
    spy.watch("GetDeviceCaps");
    spy.replace("GetDeviceCaps", [this](ULONG_PTR* arguments) -> ULONG_PTR {
        return static_cast<int>(arguments[1]) == BITSPIXEL
                   ? 4
                   : spy.callReal("GetDeviceCaps", arguments);
    });
    create();
    send(GM_COPY);
    const std::vector<COLORREF> colours = ParseDib(ReadClipboard()).colours;
    ASSERT_EQ(colours.size(), 19u);
    EXPECT_EQ(colours[0], 0u);
    EXPECT_EQ(colours[1], 0xFFFFFFu);
    for (size_t i = 2; i < 19; ++i) {
        const COLORREF greys[] = {0x808080, 0xC0C0C0, 0x000000};
        EXPECT_EQ(colours[i], greys[(i - 2) % 3]) << i;
    }
}

TEST_F(ClipboardCopy, ShowsTheImagePixelForPixel) {
    createInPaletteColours();
    send(GM_COPY);
    const Picture copied = ParseDib(ReadClipboard()).picture;
    EXPECT_GT(copied.count(RGB(0, 255, 0)), 50) << "the first series";
    EXPECT_TRUE(SamePicture(image(), copied.part({0, 0, 230, 130})));
}

TEST_F(ClipboardCopy, ShowsTheImageAsItStands) {
    createInPaletteColours();
    PatBlt(imageDC, 0, 0, 10, 10, BLACKNESS);
    send(GM_COPY);
    const Picture copied = ParseDib(ReadClipboard()).picture;
    EXPECT_EQ(copied.count(RGB(0, 0, 0), {0, 0, 10, 10}), 100);
    EXPECT_EQ(copied.pixel(10, 10), RGB(255, 255, 255));
}

TEST_F(ClipboardCopy, OtherColoursBecomeTheNearestOnes) {
    createPlain();
    send(GM_SETBKCOLOR, 0, RGB(250, 4, 6));
    redraw();
    send(GM_COPY);
    EXPECT_EQ(ParseDib(ReadClipboard()).picture.pixel(2, 2), RGB(255, 0, 0));
}

TEST_F(ClipboardCopy, ReplacesAllThatWasThere) {
    PutText(L"before");
    create();
    send(GM_COPY);
    EXPECT_EQ(ClipboardText(), L"");
    EXPECT_FALSE(ReadClipboard().empty());
}

TEST_F(ClipboardCopy, AnotherProgramReadsTheSame) {
    createInPaletteColours(101, 50);
    send(GM_COPY);
    const Bytes bytes = ReadClipboardElsewhere();
    EXPECT_EQ(bytes, ReadClipboard());
    EXPECT_TRUE(SamePicture(image(), ParseDib(bytes).picture.part({0, 0, 101, 50})));
}

TEST_F(ClipboardCopy, OutlivesTheChart) {
    createInPaletteColours();
    const Picture before = image();
    send(GM_COPY);
    destroy();
    EXPECT_TRUE(SamePicture(before, ParseDib(ReadClipboard()).picture.part({0, 0, 230, 130})));
}

TEST_F(ClipboardCopy, OfAnEmptyWindowIsAHeadAlone) {
    create(0, 0);
    EXPECT_EQ(send(GM_COPY), 0);
    const Bytes bytes = ReadClipboard();
    EXPECT_EQ(bytes.size(), 116u);
    EXPECT_EQ(ParseDib(bytes).header.biWidth, 0);
}

TEST_F(ClipboardCopy, CallsInThisOrder) {
    create();
    spy.watchAll({"LocalAlloc", "CreateDIBSection", "DeleteDC", "OpenClipboard", "EmptyClipboard",
                  "SetClipboardData", "CloseClipboard"});
    spy.clearCalls();
    send(GM_COPY);
    EXPECT_EQ(spy.sequence(),
              "LocalAlloc CreateDIBSection CreateCompatibleDC DeleteDC OpenClipboard "
              "EmptyClipboard SetClipboardData CloseClipboard");
    const ImportCall allocation = spy.callsOf("LocalAlloc").at(0);
    EXPECT_EQ(NumberAt(allocation, 0), static_cast<DWORD>(LMEM_ZEROINIT));
    EXPECT_EQ(NumberAt(allocation, 1), 116u + 232u * 132u);
    EXPECT_EQ(spy.callsOf("OpenClipboard").at(0).arguments.at(0), 0u) << "no owner";
    EXPECT_EQ(NumberAt(spy.callsOf("SetClipboardData").at(0), 0), static_cast<DWORD>(CF_DIB));
}

TEST_F(ClipboardCopy, WithoutARecordNothingIsCopied) {
    PutText(L"before");
    create();
    const LONG_PTR record = SetWindowLongPtrW(graph, GWLP_USERDATA, 0);
    EXPECT_EQ(send(GM_COPY), 0);
    SetWindowLongPtrW(graph, GWLP_USERDATA, record);
    EXPECT_EQ(ClipboardText(), L"before");
}

}  // namespace
}  // namespace kortest

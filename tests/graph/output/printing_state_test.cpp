// After a print the chart is as it was: its record field by field, its image, its redraws.
#include "graph/output/printing_fixture.h"

#include <cstring>

namespace kortest {
namespace {

class PrintState : public PrintingTest {
protected:
    // A chart of which every margin, title and label takes part.
    void createFull(LONG type = KORGRAPH_LINE) {
        create();
        KorGraph_SetTitle(graph, L"Harvest");
        KorGraph_SetXTitle(graph, L"field");
        KorGraph_SetYTitle(graph, L"tons");
        add({3, 5, 2, 800, 2, 7}, L"wheat");
        add({1, 4, -6, 30}, L"rye");
        KorGraph_SetType(graph, type);
        printer = {900, 1200, 300};
        settle();
    }

    // Both directions of both axes have something to pan to, and the view is off its centre.
    void pan() {
        KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
        for (const auto& arrow : {record().arrowRight, record().arrowUp}) {
            const POINT target = arrow.points[0];
            PressAt(graph, target.x, target.y);
            ReleaseAt(graph, target.x, target.y);
        }
        ASSERT_NE(record().panArrows, 0u);
        settle();
    }

    Picture redrawn() {
        redraw();
        return image();
    }

    // All of the record but the fonts, which are made anew.
    void expectSame(const kor::GraphRecord& before) const {
        kor::GraphRecord expected = before;
        expected.hfontTitle = record().hfontTitle;
        expected.hfontXTitle = record().hfontXTitle;
        expected.hfontYTitle = record().hfontYTitle;
        expected.hfontLabel = record().hfontLabel;
        expected.hfontAxis = record().hfontAxis;
        const auto* expectedBytes = reinterpret_cast<const BYTE*>(&expected);
        const auto* actualBytes = reinterpret_cast<const BYTE*>(&record());
        size_t offset = 0;
        while (offset < sizeof expected && expectedBytes[offset] == actualBytes[offset]) ++offset;
        EXPECT_EQ(offset, sizeof expected) << "the field at this offset has changed";
    }

    void expectSameSurface(HDC dc, const RECT& surface) const {
        EXPECT_EQ(record().hdcMem, dc);
        EXPECT_EQ(record().rcPlot, surface);
    }

    static LOGFONTW descriptionOf(HFONT font) {
        LOGFONTW description{};
        GetObjectW(font, sizeof description, &description);
        return description;
    }
};

class PrintStateOfType : public PrintState, public ::testing::WithParamInterface<LONG> {};

TEST_P(PrintStateOfType, IsWholeAgain) {
    createFull(GetParam());
    const Picture image = redrawn();
    const kor::GraphRecord before = record();
    print();
    ASSERT_EQ(pagesDeleted, 1);
    expectSame(before);
    EXPECT_TRUE(SamePicture(image, redrawn()));
}

TEST_P(PrintStateOfType, KeepsZoomAndPan) {
    createFull(GetParam());
    if (GetParam() != KORGRAPH_PIE) pan();
    const Picture image = redrawn();
    const kor::GraphRecord before = record();
    print();
    expectSame(before);
    EXPECT_TRUE(SamePicture(image, redrawn()));
}

INSTANTIATE_TEST_SUITE_P(Types, PrintStateOfType, ::testing::Range<LONG>(0, 5), NameOfType);

TEST_F(PrintState, KeepsMarginsThatAreOlderThanTheData) {
    createFull();
    setValue(0, 0, 123456);  // scales, but lays no labels out
    const Picture image = redrawn();
    const kor::GraphRecord before = record();
    print();
    expectSame(before);
    EXPECT_TRUE(SamePicture(image, redrawn()));
}

TEST_F(PrintState, DoesNotRedrawTheImage) {
    createFull();
    const Picture before = image();
    setValue(0, 0, 700);
    print();
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_NE(before, redrawn());
}

TEST_F(PrintState, InvalidatesTheWindowOnce) {
    createFull();
    watchInvalidations();
    print();
    ASSERT_EQ(invalidationsOf(graph).size(), 1u);
    EXPECT_TRUE(invalidations[0].isWhole);
    EXPECT_FALSE(invalidations[0].erases);
}

TEST_F(PrintState, WindowShowsTheImageAgain) {
    createFull();
    const Picture before = ReadWindow(graph);
    print();
    host.pump();
    EXPECT_TRUE(SamePicture(before, ReadWindow(graph)));
}

TEST_F(PrintState, FontsAreMadeForThePrinterAndThenForTheScreen) {
    createFull();
    fontHeights.clear();
    const LOGFONTW upright = descriptionOf(record().hfontTitle);
    const LOGFONTW turned = descriptionOf(record().hfontYTitle);
    print();
    EXPECT_EQ(fontHeights, (std::vector<LONG>{41, 41, upright.lfHeight, upright.lfHeight}));
    for (const HFONT font : {record().hfontXTitle, record().hfontLabel, record().hfontAxis})
        EXPECT_EQ(font, record().hfontTitle);
    const LOGFONTW uprightAfter = descriptionOf(record().hfontTitle);
    const LOGFONTW turnedAfter = descriptionOf(record().hfontYTitle);
    EXPECT_EQ(std::memcmp(&upright, &uprightAfter, sizeof upright), 0);
    EXPECT_EQ(std::memcmp(&turned, &turnedAfter, sizeof turned), 0);
}

TEST_F(PrintState, ClipRegionIsTheScreensAgain) {
    createFull();
    print();
    RECT box{};
    GetRgnBox(record().hrgnClip, &box);
    EXPECT_EQ(box, (RECT{0, 0, 231, 131}));
    EXPECT_EQ(GetClipBox(imageDC, &box), SIMPLEREGION);
    EXPECT_EQ(box, (RECT{0, 0, 231, 131})) << "cut to the bitmap, which is a little larger";
}

TEST_F(PrintState, ClipRegionIsThePagesMeanwhile) {
    createFull();
    KorGraph_SetType(graph, 9);  // draws nothing, so nothing else sets the clip
    inside[kStartPage] = [this] {
        const HRGN corner = CreateRectRgn(10, 10, 20, 20);
        SelectClipRgn(page, corner);
        DeleteObject(corner);
    };
    RECT region{}, clip{};
    inside[kEndPage] = [&] {
        GetRgnBox(record().hrgnClip, &region);
        GetClipBox(page, &clip);
    };
    print();
    EXPECT_EQ(region, (RECT{0, 0, 901, 1201}));
    EXPECT_EQ(clip, (RECT{0, 0, 900, 1200})) << "cut to the paper";
}

TEST_F(PrintState, PanArrowsAreHitWhereTheyAre) {
    createFull();
    pan();
    print();
    EnableWindow(graph, TRUE);
    const double centre = record().xCentre;
    const POINT target = record().arrowLeft.points[0];
    PressAt(graph, target.x, target.y);
    EXPECT_EQ(record().xCentre, centre - record().xTickStep);
}

TEST_F(PrintState, ValuesAreFoundWhereTheyAre) {
    createRegular();
    print();
    EnableWindow(graph, TRUE);
    EXPECT_EQ(tap(95, 75), L"Value:4");
}

TEST_F(PrintState, RecordStandsForThePageUntilItsEnd) {
    createFull();
    const kor::GraphRecord before = record();
    inside[kStartPage] = [&] { expectSameSurface(before.hdcMem, before.rcPlot); };
    inside[kEndPage] = [&] { expectSameSurface(page, {0, 0, 900, 1200}); };
    inside[kEndDocument] = inside[kEndPage];
    print();
    expectSameSurface(before.hdcMem, before.rcPlot);
}

}  // namespace
}  // namespace kortest

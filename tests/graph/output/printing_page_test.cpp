// What is on the page.
#include "graph/output/printing_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kWhite = RGB(255, 255, 255);

int ScreenDotsPerInch() {
    const HDC screen = GetDC(nullptr);
    const int dots = GetDeviceCaps(screen, LOGPIXELSY);
    ReleaseDC(nullptr, screen);
    return dots;
}

class PrintedPage : public PrintingTest {
protected:
    void addData() {
        KorGraph_SetTitle(graph, L"Harvest");
        KorGraph_SetXTitle(graph, L"field");
        KorGraph_SetYTitle(graph, L"tons");
        add({3, 5, 2, 8, -2, 7}, L"wheat");
        add({1, 4, -6, 3}, L"rye");
    }

    // A page of the chart window's size and the screen's resolution.
    void takeScreensPaper() {
        const RECT client = ClientOf(graph);
        printer = {client.right, client.bottom, ScreenDotsPerInch()};
    }
};

class PrintedPageOfType : public PrintedPage, public ::testing::WithParamInterface<LONG> {};

TEST_P(PrintedPageOfType, IsTheScreensPictureAtTheScreensSize) {
    create(240, 180);
    addData();
    KorGraph_SetType(graph, GetParam());
    takeScreensPaper();
    print();
    EXPECT_TRUE(SamePicture(image(), printed));
    EXPECT_GT(printed.count(GetParam() == KORGRAPH_PIE ? colour(3) : colour(0)), 20);
}

TEST_P(PrintedPageOfType, IsThePictureOfAWindowOfItsSize) {
    create(120, 90);
    addData();
    KorGraph_SetType(graph, GetParam());
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    printer = {310, 205, ScreenDotsPerInch()};
    print();
    resize(310, 205);
    EXPECT_TRUE(SamePicture(image(), printed));
}

INSTANTIATE_TEST_SUITE_P(Types, PrintedPageOfType, ::testing::Range<LONG>(0, 5), NameOfType);

TEST_F(PrintedPage, FontsFollowThePrintersResolution) {
    create();
    addData();
    printer = {900, 1200, 300};
    fontHeights.clear();
    kor::GraphRecord onPage{};
    inside[kEndPage] = [&] { onPage = record(); };
    print();
    ASSERT_GE(fontHeights.size(), 2u);
    EXPECT_EQ(fontHeights[0], 41) << "300 dots of 10/72 inch";
    EXPECT_EQ(fontHeights[1], 41) << "turned upwards";
    EXPECT_GE(onPage.marginTop, 41 + 4);
    EXPECT_GE(onPage.marginBottom, 2 * (41 + 4));
    // The title's ink: the black of the top margin, right of the topmost number.
    const RECT title = printed.boundsOfOthers(kWhite, {200, 0, 900, onPage.marginTop});
    EXPECT_GT(title.bottom - title.top, 20);
    EXPECT_NEAR((title.left + title.right) / 2, 450, 6) << "centred on the page";
}

TEST_F(PrintedPage, AllElseKeepsItsPixels) {
    createPlain();
    add({5});
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    printer = {400, 300, 600};
    kor::GraphRecord onPage{};
    inside[kEndPage] = [&] { onPage = record(); };
    print();
    EXPECT_EQ(onPage.marginLeft, 15);
    EXPECT_EQ(onPage.marginTop, 15);
    EXPECT_EQ(onPage.marginRight, 15);
    EXPECT_EQ(onPage.marginBottom, 15);
    EXPECT_EQ(onPage.tickHalfLength, 3);
    // The one point stands in the middle of the plot area, a circle of radius 4.
    Picture plot = printed.part({40, 40, 360, 260});
    EXPECT_EQ(plot.boundsOfOthers(kWhite), (RECT{156, 106, 164, 114}));
    EXPECT_GT(plot.count(colour(0)), 40);
}

// The fill reaches one row below the outline's square, as on the screen.
TEST_F(PrintedPage, PieIsCentredAndFillsTheShorterSide) {
    createPlain();
    add({1, 3});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    printer = {300, 400, 300};
    print();
    EXPECT_EQ(printed.boundsOfOthers(kWhite), (RECT{4, 54, 296, 347}));
    printer = {500, 200, 300};
    print();
    EXPECT_EQ(printed.boundsOfOthers(kWhite), (RECT{154, 4, 346, 197}));
}

TEST_F(PrintedPage, PieLeavesRoomForItsLabels) {
    createPlain();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_PERCENTAGES);
    add({1, 3});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    printer = {600, 800, 300};
    kor::GraphRecord onPage{};
    inside[kEndPage] = [&] { onPage = record(); };
    print();
    EXPECT_GT(onPage.tipWidth, 60) << "the text 99% at 300 dots per inch";
    // The lower right quarter has no label: there the pie's edge is the outermost ink.
    const RECT edge = printed.boundsOfOthers(kWhite, {300, 402, 600, 440});
    EXPECT_EQ(edge.right, 600 - onPage.tipWidth - 4);
}

TEST_F(PrintedPage, BackgroundFillsThePageAndTextsLeaveNoBoxes) {
    create();
    addData();
    KorGraph_SetBackgroundColour(graph, RGB(250, 240, 120));
    KorGraph_SetType(graph, KORGRAPH_PIE);
    printer = {300, 400, 200};
    print();
    EXPECT_EQ(printed.pixel(0, 0), RGB(250, 240, 120));
    EXPECT_EQ(printed.pixel(299, 399), RGB(250, 240, 120));
    EXPECT_EQ(printed.count(kWhite), 0);
}

TEST_F(PrintedPage, ShowsTheMiddleOfTheRangeOfAPannedChart) {
    create(240, 180);
    addData();
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    const Picture centred = image();
    const POINT target = record().arrowRight.points[0];
    PressAt(graph, target.x, target.y);
    ASSERT_NE(image(), centred);
    takeScreensPaper();
    print();
    EXPECT_TRUE(SamePicture(centred, printed));
}

TEST_F(PrintedPage, HasManyMarkersWhereTheyBelong) {
    create(240, 180);
    std::vector<double> values;
    for (int i = 0; i < 900; ++i) values.push_back(i % 37);
    add(values);
    redraw();
    takeScreensPaper();
    print();
    EXPECT_TRUE(SamePicture(image(), printed));
}

}  // namespace
}  // namespace kortest

// The look of the items.
#include "expected_strip.h"
#include "header_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kWhite = RGB(255, 255, 255);
constexpr COLORREF kBlack = RGB(0, 0, 0);
constexpr COLORREF kFrame = RGB(128, 128, 128);
constexpr COLORREF kLightGrey = RGB(192, 192, 192);
constexpr COLORREF kDarkGrey = RGB(64, 64, 64);

class HeaderPainting : public HeaderTest {
protected:
    ~HeaderPainting() override { SetGridZoomLevel(4); }

    HWND createStrip(const Strip& strip) {
        SetGridZoomLevel(strip.zoom);
        HWND header =
            host->createHeader(strip.isVertical ? HCS_VERTICAL : 0, strip.width, strip.height);
        for (const StripItem& item : strip.items) {
            const int index = AppendItem(header, item.label.c_str(), item.size);
            KorHeader_SetItemState(header, index, item.state);
        }
        return header;
    }

    Picture paint(const Strip& strip) {
        HWND header = createStrip(strip);
        Repaint(header);
        return ReadWindow(header);
    }

    const COLORREF face = GetSysColor(COLOR_BTNFACE);
};

const std::vector<StripItem> kOneOfEach{
    {L"A", 60, 0},
    {L"B", 60, HIS_SELECTED},
    {L"C", 60, HIS_FRAMED},
    {L"D", 60, HIS_SELECTED | HIS_FRAMED},
    {L"", 40, 0},
    {L"", 40, HIS_SELECTED},
    {L"a label that is too long & odd", 50, 0},
};

// A point of the strip as (along, across), so that one list serves both directions.
struct Probe {
    int along;
    int across;
    COLORREF colour;
};

TEST_F(HeaderPainting, OutlinesARaisedColumnItem) {
    const Picture p = paint({100, 20, false, 4, {{L"", 30, 0}, {L"", 30, 0}}});
    for (const Probe& probe : {Probe{0, 0, kFrame},
                               {29, 0, kFrame},
                               {0, 19, kFrame},
                               {29, 19, kFrame},
                               {29, 10, kFrame},
                               {15, 0, kFrame},
                               {1, 1, kWhite},
                               {1, 10, kWhite},
                               {1, 18, kWhite},
                               {2, 10, face},
                               {28, 10, face},
                               {15, 1, face},
                               {15, 18, face},
                               {30, 10, kFrame},
                               {31, 10, kWhite},
                               {59, 10, kFrame},
                               {60, 10, kLightGrey},
                               {99, 19, kLightGrey}}) {
        EXPECT_EQ(p.pixel(probe.along, probe.across), probe.colour)
            << probe.along << "," << probe.across;
    }
}

TEST_F(HeaderPainting, OutlinesARaisedRowItem) {
    const Picture p = paint({40, 100, true, 4, {{L"", 20, 0}, {L"", 20, 0}}});
    for (const Probe& probe : {Probe{0, 0, kFrame},
                               {0, 39, kFrame},
                               {19, 0, kFrame},
                               {19, 39, kFrame},
                               {1, 1, kWhite},
                               {1, 20, kWhite},
                               {1, 37, kWhite},
                               {1, 38, kWhite},
                               {2, 20, face},
                               {18, 20, face},
                               {10, 1, face},
                               {10, 38, face},
                               {20, 10, kFrame},
                               {21, 10, kWhite},
                               {39, 10, kFrame},
                               {40, 10, kLightGrey},
                               {99, 39, kLightGrey}}) {
        EXPECT_EQ(p.pixel(probe.across, probe.along), probe.colour)
            << probe.across << "," << probe.along;
    }
}

TEST_F(HeaderPainting, FillsASelectedItemDarkWithAWhiteOutline) {
    const Picture column = paint({100, 20, false, 4, {{L"", 30, HIS_SELECTED}}});
    const Picture row = paint({20, 100, true, 4, {{L"", 30, HIS_SELECTED}}});
    for (const Probe& probe : {Probe{0, 0, kWhite},
                               {29, 19, kWhite},
                               {15, 0, kWhite},
                               {15, 19, kWhite},
                               {0, 10, kWhite},
                               {29, 10, kWhite},
                               {1, 1, kDarkGrey},
                               {28, 18, kDarkGrey},
                               {15, 10, kDarkGrey},
                               {30, 10, kLightGrey}}) {
        EXPECT_EQ(column.pixel(probe.along, probe.across), probe.colour);
        EXPECT_EQ(row.pixel(probe.across, probe.along), probe.colour);
    }
}

TEST_F(HeaderPainting, FramesAColumnItem) {
    const Picture p = paint({100, 20, false, 4, {{L"", 30, HIS_FRAMED}}});
    EXPECT_EQ(p.count(kWhite, {1, 1, 28, 2}), 27);    // along the top, cut by the black line
    EXPECT_EQ(p.count(kBlack, {1, 18, 29, 19}), 28);  // along the bottom
    EXPECT_EQ(p.count(kBlack, {28, 1, 29, 19}), 18);  // along the right
    EXPECT_EQ(p.count(kBlack), 28 + 18 - 1);
    EXPECT_EQ(p.count(kWhite, {1, 1, 2, 18}), 17);  // the highlight
    EXPECT_EQ(p.pixel(0, 10), kFrame);
    EXPECT_EQ(p.pixel(15, 10), face);
}

TEST_F(HeaderPainting, FramesARowItem) {
    const Picture p = paint({40, 100, true, 4, {{L"", 20, HIS_FRAMED}}});
    EXPECT_EQ(p.count(kWhite, {1, 1, 2, 18}), 17);    // along the left, cut by the black line
    EXPECT_EQ(p.count(kBlack, {38, 1, 39, 19}), 18);  // along the right
    EXPECT_EQ(p.count(kBlack, {1, 18, 39, 19}), 38);  // along the bottom
    EXPECT_EQ(p.count(kBlack), 18 + 38 - 1);
    EXPECT_EQ(p.count(kWhite, {1, 1, 38, 2}), 37);  // the highlight
    EXPECT_EQ(p.pixel(0, 10), kFrame);
}

TEST_F(HeaderPainting, WritesASelectedLabelInWhite) {
    const Picture plain = paint({100, 20, false, 4, {{L"M", 60, 0}}});
    const Picture selected = paint({100, 20, false, 4, {{L"M", 60, HIS_SELECTED}}});
    const RECT inside{3, 2, 57, 18};
    EXPECT_GT(plain.count(kBlack, inside), 5);
    EXPECT_EQ(plain.count(kWhite, inside), 0);
    EXPECT_GT(selected.count(kWhite, inside), 5);
    EXPECT_EQ(selected.count(kBlack, inside), 0);
}

TEST_F(HeaderPainting, EndsRowLabelsThreePixelsBeforeTheRight) {
    const Picture p = paint({60, 40, true, 4, {{L"12", 20, 0}}});
    const RECT ink = p.boundsOfOthers(face, {1, 2, 59, 19});
    EXPECT_LE(ink.right, 57);
    EXPECT_GE(ink.right, 54);
    EXPECT_GT(ink.left, 30);
}

TEST_F(HeaderPainting, CentresColumnLabels) {
    const Picture p = paint({100, 20, false, 4, {{L"M", 61, 0}}});
    const RECT ink = p.boundsOfOthers(face, {3, 2, 58, 18});
    EXPECT_NEAR(ink.left + ink.right, 61, 3);
}

class HeaderPicture : public HeaderPainting,
                      public ::testing::WithParamInterface<std::tuple<bool, DWORD>> {};

TEST_P(HeaderPicture, IsWhatTheDescriptionDraws) {
    const auto [isVertical, zoom] = GetParam();
    const Strip strip = isVertical ? Strip{36, 400, true, zoom, kOneOfEach}
                                   : Strip{400, 20, false, zoom, kOneOfEach};
    EXPECT_TRUE(SamePicture(ExpectedStrip(strip), paint(strip)));
}

// Texts that are more than one plain line.
TEST_P(HeaderPicture, TreatsLabelsAsDrawTextDoes) {
    const auto [isVertical, zoom] = GetParam();
    const int size = isVertical ? 36 : 50;
    const std::vector<StripItem> items{
        {L"two\nlines", size, 0},     {L"a & b", size, HIS_SELECTED},
        {L"&x&&y", size, 0},          {L"tab\tstop", size, HIS_FRAMED},
        {L" spaces ", size, 0},       {L"\u00e9\u00df\u20ac", size, 0},
        {L"\u05d0\u05d1 1", size, 0}, {L"e\u0301", size, 0},
        {L"\xD83D\xDE00", size, 0},   {L"cr\r\nlf", size, 0},
        {L"\x01\x7f", size, 0},       {L"WWWWWWWWWWWWWWWW", size, 3}};
    const Strip strip =
        isVertical ? Strip{40, 432, true, zoom, items} : Strip{600, 40, false, zoom, items};
    EXPECT_TRUE(SamePicture(ExpectedStrip(strip), paint(strip)));
}

INSTANTIATE_TEST_SUITE_P(Zooms, HeaderPicture,
                         ::testing::Combine(::testing::Bool(),
                                            ::testing::Values(1u, 2u, 3u, 4u, 5u, 8u)),
                         [](const auto& test) {
                             return std::string(std::get<0>(test.param) ? "Rows" : "Columns") +
                                    std::to_string(std::get<1>(test.param));
                         });

TEST_F(HeaderPainting, DrawsNarrowItemsByTheSameCalls) {
    std::vector<StripItem> items;
    for (int size = 0; size <= 12; ++size) {
        for (DWORD state = 0; state <= 3; ++state) items.push_back({L"7", size, state});
    }
    const Strip columns{330, 16, false, 4, items};
    EXPECT_TRUE(SamePicture(ExpectedStrip(columns), paint(columns)));
    const Strip rows{30, 330, true, 4, items};
    EXPECT_TRUE(SamePicture(ExpectedStrip(rows), paint(rows)));
}

TEST_F(HeaderPainting, DrawsInAStripOfAnyThickness) {
    for (int thickness = 1; thickness <= 6; ++thickness) {
        const Strip columns{400, thickness, false, 4, kOneOfEach};
        EXPECT_TRUE(SamePicture(ExpectedStrip(columns), paint(columns))) << thickness;
        const Strip rows{thickness, 400, true, 4, kOneOfEach};
        EXPECT_TRUE(SamePicture(ExpectedStrip(rows), paint(rows))) << thickness;
    }
}

TEST_F(HeaderPainting, CutsItemsOffAtTheStripsEnd) {
    const Strip strip{100, 16, false, 4, {{L"A", 60, 0}, {L"B", 60, 0}, {L"C", 60, 0}}};
    EXPECT_TRUE(SamePicture(ExpectedStrip(strip), paint(strip)));
}

TEST_F(HeaderPainting, LeavesAnEmptyStripLightGrey) {
    const Picture p = paint({100, 16, false, 4, {}});
    EXPECT_EQ(p.count(kLightGrey), 1600);
}

TEST_F(HeaderPainting, DoesNotShowTheSparePlace) {
    const Strip strip{200, 16, false, 4, {{L"A", 60, 0}}};
    HWND header = createStrip(strip);
    SetItem(header, 1, L"spare", 60);
    Repaint(header);
    EXPECT_TRUE(SamePicture(ExpectedStrip(strip), ReadWindow(header)));
}

TEST_F(HeaderPainting, ShowsStatesAsTheyAdd) {
    HWND header = createStrip({200, 16, false, 4, {{L"A", 60, 0}}});
    const auto shown = [&](DWORD state) {
        Repaint(header);
        return SamePicture(ExpectedStrip({200, 16, false, 4, {{L"A", 60, state}}}),
                           ReadWindow(header));
    };
    EXPECT_EQ(KorHeader_SetItemState(header, 0, HIS_FRAMED), 1);
    EXPECT_TRUE(shown(HIS_FRAMED));
    EXPECT_EQ(KorHeader_SetItemState(header, 0, HIS_SELECTED), 1);
    EXPECT_TRUE(shown(HIS_FRAMED | HIS_SELECTED));
    EXPECT_EQ(KorHeader_SetItemState(header, 0, 0x04), 1);  // no known bit: nothing changes
    EXPECT_TRUE(shown(HIS_FRAMED | HIS_SELECTED));
    EXPECT_EQ(KorHeader_SetItemState(header, 0, 0), 1);
    EXPECT_TRUE(shown(0));
    EXPECT_EQ(KorHeader_SetItemState(header, 0, 0xFFFFFFFD), 1);
    EXPECT_TRUE(shown(HIS_SELECTED));
    EXPECT_EQ(KorHeader_SetItemState(header, 0, HIS_FRAMED | HIS_SELECTED), 1);
    EXPECT_TRUE(shown(HIS_FRAMED | HIS_SELECTED));
}

TEST_F(HeaderPainting, MovesStatesWithTheirItems) {
    HWND header = createStrip({300, 16, false, 4, {{L"A", 60, 0}, {L"B", 60, HIS_SELECTED}}});
    InsertItem(header, 1, L"C", 50);
    SetItem(header, 2, L"D", 40);
    Repaint(header);
    EXPECT_TRUE(SamePicture(
        ExpectedStrip(
            {300, 16, false, 4, {{L"A", 60, 0}, {L"C", 50, 0}, {L"D", 40, HIS_SELECTED}}}),
        ReadWindow(header)));
    KorHeader_DeleteItem(header, 0);
    Repaint(header);
    EXPECT_TRUE(
        SamePicture(ExpectedStrip({300, 16, false, 4, {{L"C", 50, 0}, {L"D", 40, HIS_SELECTED}}}),
                    ReadWindow(header)));
}

TEST_F(HeaderPainting, GivesAnInsertedItemNoState) {
    HWND header = createStrip({300, 16, false, 4, {{L"A", 60, HIS_SELECTED}}});
    KorHeader_DeleteItem(header, 0);
    AppendItem(header, L"B", 60);
    Repaint(header);
    EXPECT_TRUE(
        SamePicture(ExpectedStrip({300, 16, false, 4, {{L"B", 60, 0}}}), ReadWindow(header)));
}

TEST_F(HeaderPainting, ShowsMoreItemsThanTheFirstArraysHold) {
    std::vector<StripItem> items;
    for (int i = 0; i < 40; ++i) {
        items.push_back({std::to_wstring(i), 15, static_cast<DWORD>(i % 4)});
    }
    const Strip strip{620, 16, false, 4, items};
    EXPECT_TRUE(SamePicture(ExpectedStrip(strip), paint(strip)));
}

TEST_F(HeaderPainting, FollowsADraggedBorder) {
    HWND header = createStrip({300, 16, false, 4, {{L"A", 60, 0}, {L"B", 60, 0}}});
    Repaint(header);
    PressAt(header, 58, 3);
    MoveTo(header, 88, 3);
    host->pump();
    EXPECT_TRUE(SamePicture(ExpectedStrip({300, 16, false, 4, {{L"A", 90, 0}, {L"B", 60, 0}}}),
                            ReadWindow(header)));
    MoveTo(header, 48, 3);
    host->pump();
    EXPECT_TRUE(SamePicture(ExpectedStrip({300, 16, false, 4, {{L"A", 50, 0}, {L"B", 60, 0}}}),
                            ReadWindow(header)));
    ReleaseAt(header, 48, 3);
}

// Painting is not cut off at the update region, and goes on to the first item that begins behind
// it.
TEST_F(HeaderPainting, ReachesTheItemBehindTheUpdateRegion) {
    HWND header = createStrip({300, 16, false, 4, {{L"A", 60, 0}, {L"B", 60, 0}, {L"C", 60, 0}}});
    Repaint(header);
    for (int i = 0; i < 3; ++i) KorHeader_SetItemState(header, i, HIS_SELECTED);
    const RECT invalid{10, 0, 20, 16};
    InvalidateRect(header, &invalid, TRUE);
    UpdateWindow(header);
    EXPECT_TRUE(SamePicture(
        ExpectedStrip({300,
                       16,
                       false,
                       4,
                       {{L"A", 60, HIS_SELECTED}, {L"B", 60, HIS_SELECTED}, {L"C", 60, 0}}}),
        ReadWindow(header)));
}

TEST_F(HeaderPainting, DrawsAgainWhenTheWindowGrows) {
    HWND header = createStrip({100, 16, false, 4, {{L"A", 60, 0}, {L"B", 60, 0}}});
    Repaint(header);
    MoveWindow(header, 0, 0, 200, 24, TRUE);
    host->pump();
    EXPECT_TRUE(SamePicture(ExpectedStrip({200, 24, false, 4, {{L"A", 60, 0}, {L"B", 60, 0}}}),
                            ReadWindow(header)));
}

}  // namespace
}  // namespace kortest

// Reading items back.
#include "funkybar/bar_fixture.h"

#include <climits>

namespace kortest {
namespace {

constexpr DWORD kAll = FBIF_TEXT | FBIF_IMAGE | FBIF_COLOURS | FBIF_USERDATA;

class BarReading : public GuardedBarTest {
protected:
    BarReading() {
        create();
        insert({kAll, kAppend, const_cast<wchar_t*>(L"Hello"), 0, 3, RGB(1, 2, 3), RGB(4, 5, 6),
                0xFFFFFFFF});
        insert(L"second");
    }

    // What the description holds of an item after FBM_GETITEM, its text in `buffer`.
    FunkyBarItemDesc get(DWORD mask, LONG index, LONG capacity, LRESULT expected = 1) {
        std::fill(std::begin(buffer), std::end(buffer), L'#');
        FunkyBarItemDesc item = {mask, index, buffer, capacity, -7, 7, 8, 9};
        EXPECT_EQ(send(FBM_GETITEM, 0, reinterpret_cast<LPARAM>(&item)), expected);
        return item;
    }

    std::wstring raw(size_t characters) const { return {buffer, characters}; }

    wchar_t buffer[12];
};

TEST_F(BarReading, FillsInWhatTheMaskNames) {
    const FunkyBarItemDesc item = get(kAll, 0, 12);
    EXPECT_EQ(item.mask, kAll);
    EXPECT_EQ(item.index, 0);
    EXPECT_EQ(item.text, buffer);
    EXPECT_EQ(item.textCapacity, 12);
    EXPECT_EQ(std::wstring(buffer), L"Hello");
    EXPECT_EQ(item.image, 3);
    EXPECT_EQ(item.textColour, RGB(1, 2, 3));
    EXPECT_EQ(item.backgroundColour, RGB(4, 5, 6));
    EXPECT_EQ(item.userData, 0xFFFFFFFFu);
}

TEST_F(BarReading, LeavesTheRestAsItWas) {
    const FunkyBarItemDesc none = get(0, 0, 12);
    EXPECT_EQ(none.image, -7);
    EXPECT_EQ(none.textColour, 7u);
    EXPECT_EQ(none.backgroundColour, 8u);
    EXPECT_EQ(none.userData, 9u);
    EXPECT_EQ(raw(6), L"######");
    EXPECT_EQ(get(FBIF_IMAGE, 0, 12).image, 3);
    EXPECT_EQ(get(FBIF_COLOURS, 0, 12).image, -7);
    EXPECT_EQ(get(FBIF_USERDATA, 0, 12).userData, 0xFFFFFFFFu);
    EXPECT_EQ(get(FBIF_USERDATA, 0, 12).textColour, 7u);
}

TEST_F(BarReading, FillsTheBufferWithZeros) {
    get(FBIF_TEXT, 0, 8);
    EXPECT_EQ(raw(9), std::wstring(L"Hello\0\0\0#", 9));
}

TEST_F(BarReading, OfATextThatFillsTheBufferLeavesNoTerminator) {
    get(FBIF_TEXT, 0, 5);
    EXPECT_EQ(raw(6), L"Hello#");
    get(FBIF_TEXT, 0, 3);
    EXPECT_EQ(raw(4), L"Hel#");
    get(FBIF_TEXT, 0, 1);
    EXPECT_EQ(raw(2), L"H#");
}

TEST_F(BarReading, WithoutCapacityCopiesNothing) {
    get(FBIF_TEXT, 0, 0);
    EXPECT_EQ(raw(2), L"##");
    get(FBIF_TEXT, 0, -1);
    get(FBIF_TEXT, 0, INT_MIN);
    EXPECT_EQ(raw(2), L"##");
}

TEST_F(BarReading, OfBadIndexesIsRefused) {
    for (const LONG index : {2L, 3L, -1L, static_cast<LONG>(INT_MIN), static_cast<LONG>(INT_MAX)}) {
        EXPECT_EQ(get(kAll, index, 12, 0).image, -7) << index;
        EXPECT_EQ(raw(2), L"##");
    }
    EXPECT_EQ(send(FBM_GETITEM), 0);
}

TEST_F(BarReading, WithoutABufferIsRefused) {
    FunkyBarItemDesc item = {kAll, 0, nullptr, 12, -7, 7, 8, 9};
    EXPECT_FALSE(KorFunkyBar_GetItem(bar, &item));
    EXPECT_EQ(item.image, -7);
    item.mask = kAll & ~FBIF_TEXT;
    EXPECT_TRUE(KorFunkyBar_GetItem(bar, &item));
    EXPECT_EQ(item.image, 3);
}

TEST_F(BarReading, WithTheHeadersFunctionAlwaysTerminates) {
    wchar_t text[6] = L"#####";
    EXPECT_TRUE(KorFunkyBar_GetItemText(bar, 0, text, 6));
    EXPECT_EQ(std::wstring(text), L"Hello");
    EXPECT_TRUE(KorFunkyBar_GetItemText(bar, 0, text, 5));
    EXPECT_EQ(std::wstring(text), L"Hell");
    EXPECT_TRUE(KorFunkyBar_GetItemText(bar, 0, text, 1));
    EXPECT_EQ(std::wstring(text), L"");
    EXPECT_FALSE(KorFunkyBar_GetItemText(bar, 0, text, 0));
    EXPECT_FALSE(KorFunkyBar_GetItemText(bar, 0, nullptr, 6));
    EXPECT_FALSE(KorFunkyBar_GetItemText(bar, 2, text, 6));
}

TEST_F(BarReading, OfTheImageList) {
    EXPECT_EQ(KorFunkyBar_GetImageList(bar), nullptr);
    const HIMAGELIST one = makeImages(8, 8, {RGB(255, 0, 0)});
    const HIMAGELIST two = makeImages(8, 8, {RGB(0, 255, 0)});
    EXPECT_EQ(KorFunkyBar_SetImageList(bar, one), nullptr);
    EXPECT_EQ(KorFunkyBar_GetImageList(bar), one);
    EXPECT_EQ(KorFunkyBar_SetImageList(bar, two), one);
    EXPECT_EQ(KorFunkyBar_SetImageList(bar, nullptr), nullptr);
    EXPECT_EQ(KorFunkyBar_GetImageList(bar), two);
    EXPECT_EQ(repaints(), "invalidate+erase") << "the first insertion's alone";
}

}  // namespace
}  // namespace kortest

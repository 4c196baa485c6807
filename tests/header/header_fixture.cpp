#include "header_fixture.h"

namespace kortest {
namespace {

HeaderItemDesc Describe(const wchar_t* text, int size) {
    return {const_cast<LPWSTR>(text), static_cast<WORD>(size)};
}

}  // namespace

int InsertItem(HWND header, int index, const wchar_t* text, int size) {
    const HeaderItemDesc item = Describe(text, size);
    return KorHeader_InsertItem(header, index, &item);
}

int AppendItem(HWND header, const wchar_t* text, int size) {
    return InsertItem(header, -1, text, size);
}

int SetItem(HWND header, int index, const wchar_t* text, int size) {
    const HeaderItemDesc item = Describe(text, size);
    return KorHeader_SetItem(header, index, &item);
}

HeaderItem GetItem(HWND header, int index) {
    HeaderItemDesc item{};
    const LRESULT result = SendMessageW(header, HCM_GETITEM, static_cast<WPARAM>(index),
                                        reinterpret_cast<LPARAM>(&item));
    HeaderItem got{result, item.text ? item.text : L"", item.size};
    if (item.text) ReleaseLocal(item.text);
    return got;
}

std::vector<std::wstring> LabelsOf(HWND header) {
    std::vector<std::wstring> labels;
    const int count = KorHeader_GetItemCount(header);
    for (int i = 0; i < count; ++i) labels.push_back(GetItem(header, i).text);
    return labels;
}

std::vector<int> SizesOf(HWND header) {
    std::vector<int> sizes;
    const int count = KorHeader_GetItemCount(header);
    for (int i = 0; i < count; ++i) sizes.push_back(KorHeader_GetItemSize(header, i));
    return sizes;
}

void AppendSizes(HWND header, const std::vector<int>& sizes) {
    for (int size : sizes) {
        AppendItem(header, std::to_wstring(KorHeader_GetItemCount(header)).c_str(), size);
    }
}

void Repaint(HWND header) {
    InvalidateRect(header, nullptr, TRUE);
    UpdateWindow(header);
}

HeaderTest::HeaderTest() {
    // Registers the strip's class, so that a test's own blocks and handles are its strips' alone.
    RecordingHost other;
    other.createHeader(0, 400, 16);
}

HeaderTest::~HeaderTest() {
    destroyWindows();
    EXPECT_EQ(heap.report(), "");
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
}

Lines HeaderTest::posted() {
    host->pump();
    const Lines lines = host->transcript();
    host->clear();
    return lines;
}

}  // namespace kortest

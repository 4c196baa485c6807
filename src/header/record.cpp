#include "header/record.h"

#include <korcontrols/header.h>

#include "base/local_heap.h"

namespace kor {

constinit HeaderDrag headerDrag;
constinit HeaderPaintObjects headerPaint = {};

namespace {

constexpr COLORREF kFrameColour = RGB(128, 128, 128);

constinit HeaderRecord* firstRecord = nullptr;

void CreatePaintObjects() {
    if (!headerPaint.framePen) headerPaint.framePen = CreatePen(PS_SOLID, 1, kFrameColour);
    if (!headerPaint.faceBrush) {
        headerPaint.faceBrush = CreateSolidBrush(SystemColour(COLOR_BTNFACE | kSystemColourFlag));
    }
}

void DeletePaintObjects() {
    if (headerPaint.framePen) DeleteObject(headerPaint.framePen);
    if (headerPaint.faceBrush) DeleteObject(headerPaint.faceBrush);
    headerPaint = {};
}

void ReleaseRecordDC(HeaderRecord& record) {
    if (record.dc) ReleaseDC(record.window, record.dc);
    record.dc = nullptr;
}

// A record that is not in the list yet; null when there is no memory.
HeaderRecord* NewHeaderRecord(const CREATESTRUCTW& creation, HWND window) {
    auto* record = AllocateLocal<HeaderRecord>(1);
    if (!record) return nullptr;
    record->window = window;
    record->parent = creation.hwndParent;
    record->style = static_cast<uint32_t>(creation.style);
    record->capacity = kHeaderInitialCapacity;
    record->dc = GetDC(window);
    record->texts = AllocateLocal<wchar_t*>(kHeaderInitialCapacity + 1);
    record->sizes = AllocateLocal<uint16_t>(kHeaderInitialCapacity + 1);
    record->states = AllocateLocal<uint8_t>(kHeaderInitialCapacity + 1);
    if (!record->texts || !record->sizes || !record->states) {
        ReleaseRecordDC(*record);
        FreeRecord(record);
        return nullptr;
    }
    return record;
}

void Append(HeaderRecord* record) {
    HeaderRecord** link = &firstRecord;
    while (*link) link = &(*link)->next;
    *link = record;
}

void Unlink(const HeaderRecord* record) {
    HeaderRecord** link = &firstRecord;
    while (*link && *link != record) link = &(*link)->next;
    if (*link) *link = record->next;
}

}  // namespace

HeaderRecord* FindHeaderRecord(HWND window) {
    HeaderRecord* record = firstRecord;
    while (record && record->window != window) record = record->next;
    return record;
}

HeaderRecord* CreateHeaderRecord(const CREATESTRUCTW& creation, HWND window) {
    CreatePaintObjects();
    HeaderRecord* record = NewHeaderRecord(creation, window);
    if (record) {
        Append(record);
    } else if (!firstRecord) {
        DeletePaintObjects();
    }
    return record;
}

// The DC is released at once: the system hands it to another window next.
void RetireHeaderRecord(HeaderRecord& record) {
    Unlink(&record);
    ReleaseRecordDC(record);
    if (!firstRecord) DeletePaintObjects();
    RetireRecord(record);
}

// Any element may hold a label, also past the count.
void FreeRecord(HeaderRecord* record) {
    if (record->texts) {
        for (uint32_t i = 0; i <= record->capacity; ++i) {
            if (record->texts[i]) LocalFree(record->texts[i]);
        }
        LocalFree(record->texts);
    }
    if (record->sizes) LocalFree(record->sizes);
    if (record->states) LocalFree(record->states);
    LocalFree(record);
}

bool IsVertical(const HeaderRecord& record) { return (record.style & HCS_VERTICAL) != 0; }

// The sum wraps round when very many items have the largest size.
int ItemStart(const HeaderRecord& record, uint32_t index) {
    uint32_t start = 0;
    for (uint32_t i = 0; i < index; ++i) start += record.sizes[i];
    return static_cast<int>(start);
}

}  // namespace kor

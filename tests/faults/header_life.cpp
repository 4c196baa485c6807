// The header strip alone.
#include "faults/scenarios.h"

#include "support/guard_heap.h"
#include "support/input.h"

namespace kortest {

namespace {

// The horizontal strip has more than a fresh one has room for.
constexpr int kItems[] = {12, 3};

const std::initializer_list<const char*> kMemory = {"LocalAlloc", "LocalReAlloc"};

LRESULT Insert(HWND strip, int index, const wchar_t* text) {
    const HeaderItemDesc item = {const_cast<wchar_t*>(text), 20};
    return KorHeader_InsertItem(strip, index, &item);
}

// What a strip tells: sizes and labels of all items.
void NoteItems(Life& life, HWND strip) {
    const int count = KorHeader_GetItemCount(strip);
    life.note("items " + std::to_string(count));
    for (int i = 0; i < count; ++i) {
        HeaderItemDesc item{};
        life.stated("HCM_GETITEM", 1, 0, kMemory,
                    [&] { return LRESULT{KorHeader_GetItem(strip, i, &item)}; });
        if (!item.text) continue;
        life.note(Narrow(item.text) + " " + std::to_string(item.size));
        life.ledger.forget(Resource::kLocalBlock, reinterpret_cast<ULONG_PTR>(item.text));
        ReleaseLocal(item.text);
    }
}

void UseStrip(Life& life, HWND strip, bool isVertical) {
    const auto press = [&](int along) {
        isVertical ? PressAt(strip, 4, along) : PressAt(strip, along, 4);
    };
    const auto move = [&](int along) {
        isVertical ? MoveTo(strip, 4, along) : MoveTo(strip, along, 4);
    };
    // Without a record every answer is the failure result.
    const bool hasRecord = KorHeader_GetItemCount(strip) >= 0;
    life.require(hasRecord || life.fault.happened > 0, "a strip without a record");
    for (int i = 0; i < kItems[isVertical]; ++i) {
        const auto insert = [&] { return Insert(strip, -1, L"item"); };
        if (hasRecord) {
            life.statedNot("HCM_INSERTITEM", -1, kMemory, insert);
        } else {
            life.require(insert() == -1, "HCM_INSERTITEM without a record");
        }
    }
    Paint(strip);
    const HeaderItemDesc other = {const_cast<wchar_t*>(L"other"), 30};
    if (hasRecord) {
        life.stated("HCM_SETITEM", 1, 0, kMemory,
                    [&] { return LRESULT{KorHeader_SetItem(strip, 1, &other)}; });
        life.stated("HCM_SETITEMSTATE", 1, 0, {}, [&] {
            return LRESULT{KorHeader_SetItemState(strip, 2, HIS_SELECTED | HIS_FRAMED)};
        });
        life.stated("HCM_DELETEITEM", 1, 0, {},
                    [&] { return LRESULT{KorHeader_DeleteItem(strip, 0)}; });
    }
    InvalidateRect(strip, nullptr, TRUE);
    Paint(strip);
    // The item that was reported last is one for the process: from here on it is this strip's.
    press(10);
    move(40);
    move(10);
    ReleaseAt(strip, 4, 4);
    life.host->pump();
    life.host->clear();
    press(10);
    move(40);
    ReleaseAt(strip, 4, 4);
    press(31);
    move(36);
    ReleaseAt(strip, 4, 4);
    life.host->pump();
    for (const std::string& line : life.host->transcript()) life.note(line);
    life.host->clear();
    NoteItems(life, strip);
    SetWindowPos(strip, nullptr, 0, 0, isVertical ? 30 : 90, isVertical ? 90 : 16, SWP_NOMOVE);
    life.look(strip, isVertical ? "column of items" : "row of items");
    SendMessageW(strip, WM_SETFONT, 0, 0);
}

}  // namespace

// The grid registers the strip's class.
void RegisterStripClass(Life& life) {
    RegisterGridClass(life);
    if (IsClassRegistered(KORHEADER_CLASS)) return;
    const HWND grid = CreateControl(life, KORGRID_CLASS, 0, 0, 0);
    life.ledger.forgetOldest("CreateFontIndirectW");
    if (grid) DestroyWindow(grid);
}

void LiveHeader(Life& life) {
    RegisterStripClass(life);
    for (const bool isVertical : {false, true}) {
        const HWND strip = CreateControl(life, KORHEADER_CLASS, isVertical ? HCS_VERTICAL : 0,
                                         isVertical ? 30 : 60, isVertical ? 60 : 16);
        if (!strip) continue;
        UseStrip(life, strip, isVertical);
        DestroyWindow(strip);
    }
}

}  // namespace kortest

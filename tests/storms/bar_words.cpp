#include "storms/library.h"
#include "storms/window_words.h"
#include "storms/words.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr int kMostItems = 40;

HWND Bar(Stage& stage, int place) { return stage.ensure(kBar, place); }

void Insert(Stage& stage, const Arguments& a) {
    HWND bar = Bar(stage, a[0]);
    FunkyBarItemDesc item = {};
    item.mask = static_cast<DWORD>(a[1]) & 15;
    if (a[1] & 0x30) item.mask |= FBIF_TEXT;
    item.index = a[2];
    item.text = const_cast<LPWSTR>(TextOf(a[3]));
    item.image = a[4];
    item.textColour = static_cast<COLORREF>(a[1]);
    item.userData = static_cast<DWORD>(a[2]);
    if (KorFunkyBar_GetCount(bar) >= kMostItems) return;
    stage.send(bar, FBM_INSERTITEM, 0, reinterpret_cast<LPARAM>(&item));
}

void Append(Stage& stage, const Arguments& a) {
    Insert(stage, {a[0], FBIF_TEXT | FBIF_IMAGE, KORFUNKYBAR_APPEND, a[1], a[2]});
}

void Get(Stage& stage, const Arguments& a) {
    wchar_t buffer[40];
    FunkyBarItemDesc item = {};
    item.mask = static_cast<DWORD>(a[1]);
    item.index = a[2];
    item.text = a[3] & 1 ? buffer : nullptr;
    item.textCapacity = std::min(a[3], 40);
    stage.send(Bar(stage, a[0]), FBM_GETITEM, 0, reinterpret_cast<LPARAM>(&item));
}

void Delete(Stage& stage, const Arguments& a) {
    HWND bar = Bar(stage, a[0]);
    const LRESULT before = stage.send(bar, FBM_GETCOUNT, 0, 0);
    if (a[1] >= 0 && a[1] < before) ++stage.textsLeft;
    stage.send(bar, FBM_DELETEITEM, WideWord(a[1]), 0);
}

void DeleteAll(Stage& stage, const Arguments& a) {
    stage.send(Bar(stage, a[0]), FBM_DELETEALL, 0, 0);
}

void Current(Stage& stage, const Arguments& a) {
    stage.send(Bar(stage, a[0]), FBM_SETCURSEL, WideWord(a[1]), 0);
}

HIMAGELIST Images() {
    static const HIMAGELIST images = ImageList_Create(8, 8, ILC_COLOR, 4, 4);
    return images;
}

void SetImages(Stage& stage, const Arguments& a) {
    stage.send(Bar(stage, a[0]), FBM_SETIMAGELIST, 0,
               a[1] ? reinterpret_cast<LPARAM>(Images()) : 0);
}

void Nulls(Stage& stage, const Arguments& a) {
    HWND bar = Bar(stage, a[0]);
    for (const UINT message : {FBM_INSERTITEM, FBM_GETITEM}) stage.send(bar, message, 0, 0);
    for (const UINT message : {WM_MEASUREITEM, WM_DRAWITEM}) stage.send(bar, message, 0, 0);
}

// As a menu asks, also for an entry whose item is gone.
void Entry(Stage& stage, const Arguments& a) {
    HWND bar = Bar(stage, a[0]);
    MEASUREITEMSTRUCT measure = {};
    measure.CtlType = ODT_MENU;
    measure.itemData = static_cast<ULONG_PTR>(static_cast<intptr_t>(a[1]));
    stage.send(bar, WM_MEASUREITEM, 0, reinterpret_cast<LPARAM>(&measure));
    DRAWITEMSTRUCT draw = {};
    draw.CtlType = ODT_MENU;
    draw.itemState = static_cast<UINT>(a[2]);
    draw.hDC = GetDC(bar);
    draw.rcItem = {0, 0, 60, 20};
    draw.itemData = measure.itemData;
    stage.send(bar, WM_DRAWITEM, 0, reinterpret_cast<LPARAM>(&draw));
    ReleaseDC(bar, draw.hDC);
}

constexpr Word kWords[] = {
    KORTEST_WINDOW_WORDS(kBar, "bar."), {"bar.insert", 90, "sniti", Insert},
    {"bar.append", 60, "sti", Append},  {"bar.get", 60, "snii", Get},
    {"bar.delete", 50, "si", Delete},   {"bar.delete_all", 12, "s", DeleteAll},
    {"bar.current", 70, "si", Current}, {"bar.images", 6, "sb", SetImages},
    {"bar.nulls", 6, "s", Nulls},       {"bar.entry", 20, "snn", Entry},
};

}  // namespace

void AddBarWords(Vocabulary& vocabulary) { vocabulary.add(kWords); }

}  // namespace kortest

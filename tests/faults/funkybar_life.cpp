// The function bar with its menu.
#include "faults/scenarios.h"

#include <korcontrols/funkybar.h>

#include "support/input.h"
#include "support/pixels.h"

#include <vector>

namespace kortest {

namespace {

constexpr int kBarId = 5;
constexpr int kImageSide = 8;

// A list of two images, the host's own.
class Images {
public:
    Images() : list_(ImageList_Create(kImageSide, kImageSide, ILC_COLOR24, 2, 1)) {
        Canvas canvas(2 * kImageSide, kImageSide, RGB(255, 0, 0));
        const auto bitmap = CreateCompatibleBitmap(canvas.dc(), 2 * kImageSide, kImageSide);
        ImageList_Add(list_, bitmap, nullptr);
        DeleteObject(bitmap);
    }
    ~Images() { ImageList_Destroy(list_); }
    Images(const Images&) = delete;
    Images& operator=(const Images&) = delete;

    HIMAGELIST get() const { return list_; }

private:
    HIMAGELIST list_;
};

// The menu, used as the system would: each entry is measured and drawn, the second one chosen.
class Menu {
public:
    Menu(Life& life, HWND bar) : life_(life) {
        life_.spy.replace("AppendMenuW", [this](ULONG_PTR* arguments) {
            entries_.push_back(arguments[3]);
            return life_.spy.callReal("AppendMenuW", arguments);
        });
        life_.spy.replace("TrackPopupMenuEx", [this, bar](ULONG_PTR*) -> ULONG_PTR {
            for (const ULONG_PTR entry : entries_) show(bar, entry);
            return 2;
        });
    }
    ~Menu() {
        life_.spy.restore("AppendMenuW");
        life_.spy.restore("TrackPopupMenuEx");
    }
    Menu(const Menu&) = delete;
    Menu& operator=(const Menu&) = delete;

private:
    void show(HWND bar, ULONG_PTR data) {
        MEASUREITEMSTRUCT measured{};
        measured.CtlType = ODT_MENU;
        measured.itemData = data;
        SendMessageW(bar, WM_MEASUREITEM, 0, reinterpret_cast<LPARAM>(&measured));
        DRAWITEMSTRUCT drawn{};
        drawn.CtlType = ODT_MENU;
        drawn.itemState = ODS_SELECTED;
        drawn.hDC = canvas_.dc();
        drawn.rcItem = {0, 0, 60, 16};
        drawn.itemData = data;
        SendMessageW(bar, WM_DRAWITEM, 0, reinterpret_cast<LPARAM>(&drawn));
    }

    Life& life_;
    Canvas canvas_{60, 16, 0};
    std::vector<ULONG_PTR> entries_;
};

void Insert(Life& life, HWND bar, const wchar_t* text, LONG index) {
    const FunkyBarItemDesc item = {FBIF_TEXT | FBIF_IMAGE | FBIF_COLOURS,
                                   index,
                                   const_cast<wchar_t*>(text),
                                   0,
                                   index % 2,
                                   RGB(1, 2, 3),
                                   RGB(4, 5, 6),
                                   7};
    const LONG count = KorFunkyBar_GetCount(bar);
    life.stated("FBM_INSERTITEM", count, -1, {"LocalAlloc"},
                [&] { return LRESULT{KorFunkyBar_InsertItem(bar, &item)}; });
}

void NoteItems(Life& life, HWND bar) {
    life.note("count " + std::to_string(KorFunkyBar_GetCount(bar)) + " current " +
              std::to_string(KorFunkyBar_GetCurrent(bar)));
}

// The documented leak: the text of an item that is deleted by itself. What it is must be found.
void DeleteSingly(Life& life, HWND bar) {
    wchar_t text[20] = {};
    const bool isThere = KorFunkyBar_GetItemText(bar, 0, text, 20);
    KorFunkyBar_DeleteItem(bar, 0);
    if (isThere) life.require(life.ledger.freeText(text), "the deleted item's text stays");
}

}  // namespace

void LiveFunctionBar(Life& life) {
    const Images images;
    life.host->leaveOut(kBarId);
    life.host->onMessage = [&life](UINT message, WPARAM, LPARAM data) -> LRESULT {
        if (message == WM_NOTIFY)
            life.note("selected " +
                      std::to_string(reinterpret_cast<const FunkyBarNotification*>(data)->index));
        return 0;
    };
    if (!IsClassRegistered(KORFUNKYBAR_CLASS)) {
        life.statedNot("InitFunkyControl", 0, {"RegisterClassW"},
                       [] { return static_cast<LRESULT>(InitFunkyControl(ProgramInstance())); });
    }
    const HWND bar = CreateControl(life, KORFUNKYBAR_CLASS, 0, 120, 20, kBarId);
    if (!bar) return;
    KorFunkyBar_SetImageList(bar, images.get());
    Insert(life, bar, L"one", 0);
    Insert(life, bar, L"two", KORFUNKYBAR_APPEND);
    Insert(life, bar, L"deleted", 0);
    Paint(bar);
    KorFunkyBar_SetCurrent(bar, 1);
    {
        const Menu menu(life, bar);
        PressAt(bar, 5, 5);
    }
    NoteItems(life, bar);
    DeleteSingly(life, bar);
    life.look(bar, "bar");
    KorFunkyBar_DeleteAll(bar);
    Insert(life, bar, L"last", 0);
    SetWindowPos(bar, nullptr, 0, 0, 90, 22, SWP_NOMOVE);
    life.look(bar, "bar");
    NoteItems(life, bar);
    DestroyWindow(bar);
}

}  // namespace kortest

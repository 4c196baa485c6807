#include "sheet_bar.h"

#include <array>
#include <string>
#include <vector>

#include "resource.h"
#include "sheet_images.h"
#include "sheet_switch.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr DWORD kItemParts = FBIF_TEXT | FBIF_IMAGE | FBIF_COLOURS;
constexpr size_t kLongestName = 64;

// What the bar shows of one sheet.
struct BarItem {
    std::wstring text;
    LONG image = 0;
    COLORREF colour = 0;

    friend bool operator==(const BarItem&, const BarItem&) = default;
};

BarItem ItemOf(const OpenSheet& sheet) {
    const bool isModified = sheet.document.isModified();
    const std::wstring name = (isModified ? L"*" : L"") + sheet.document.name();
    return {
        name.substr(0, kLongestName), SheetImage(sheet.colour, isModified),
        ReadableSheetColour(sheet.colour, GetSysColor(COLOR_MENU), GetSysColor(COLOR_HIGHLIGHT))};
}

std::vector<BarItem> WantedItems(const OpenSheets& sheets) {
    std::vector<BarItem> items;
    for (size_t index = 0; index < sheets.count(); ++index) {
        items.push_back(ItemOf(sheets.at(index)));
    }
    return items;
}

std::vector<BarItem> ShownItems(HWND bar) {
    std::vector<BarItem> items(static_cast<size_t>(KorFunkyBar_GetCount(bar)));
    LONG index = 0;
    for (BarItem& item : items) {
        std::array<wchar_t, kLongestName + 1> text = {};
        FunkyBarItemDesc shown = {};
        shown.mask = FBIF_IMAGE | FBIF_COLOURS;
        shown.index = index;
        KorFunkyBar_GetItem(bar, &shown);
        KorFunkyBar_GetItemText(bar, index, text.data(), static_cast<LONG>(text.size()));
        item = {text.data(), shown.image, shown.textColour};
        ++index;
    }
    return items;
}

void Append(HWND bar, BarItem item) {
    FunkyBarItemDesc appended = {};
    appended.mask = kItemParts;
    appended.index = KORFUNKYBAR_APPEND;
    appended.text = item.text.data();
    appended.image = item.image;
    appended.textColour = item.colour;
    appended.backgroundColour = GetSysColor(COLOR_BTNFACE);
    KorFunkyBar_InsertItem(bar, &appended);
}

// The bar opens its menu at the screen's left edge, as is right on a small screen. In a window
// anywhere on a large one it belongs below the bar.
void MoveMenuBelow(HWND bar, HWND menu) {
    RECT place = {};
    RECT shown = {};
    GetWindowRect(bar, &place);
    GetWindowRect(menu, &shown);
    if (shown.left == place.left) return;
    SetWindowPos(menu, nullptr, place.left, shown.top, 0, 0,
                 SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

LRESULT CALLBACK BarProc(HWND bar, UINT message, WPARAM wParam, LPARAM lParam) {
    const auto original = reinterpret_cast<WNDPROC>(GetWindowLongPtrW(bar, GWLP_USERDATA));
    if (message == WM_ENTERIDLE && wParam == MSGF_MENU) {
        MoveMenuBelow(bar, reinterpret_cast<HWND>(lParam));
    }
    return CallWindowProcW(original, bar, message, wParam, lParam);
}

}  // namespace

bool CreateSheetBar(Workbook& workbook) {
    if (!InitFunkyControl(workbook.instance)) return false;
    const HWND bar = CreateWindowExW(
        0, KORFUNKYBAR_CLASS, nullptr, WS_CHILD | WS_VISIBLE, 0, 0, 0, 0, workbook.window,
        reinterpret_cast<HMENU>(INT_PTR{IDC_SHEET_BAR}), workbook.instance, nullptr);
    if (!bar) return false;
    workbook.sheetBar = bar;
    workbook.sheetImages = CreateSheetImages();
    KorFunkyBar_SetImageList(bar, workbook.sheetImages);
    const auto original = SetWindowLongPtrW(bar, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(BarProc));
    SetWindowLongPtrW(bar, GWLP_USERDATA, original);
    return true;
}

void DestroySheetBar(Workbook& workbook) {
    const HIMAGELIST images = KorFunkyBar_GetImageList(workbook.sheetBar);
    DestroyWindow(workbook.sheetBar);
    ImageList_Destroy(images);
    workbook.sheetImages = nullptr;
}

void OnSheetChosen(Workbook& workbook, const FunkyBarNotification& chosen) {
    SelectSheet(workbook, static_cast<size_t>(chosen.index));
}

void RemoveFromSheetBar(const Workbook& workbook, size_t index) {
    KorFunkyBar_DeleteItem(workbook.sheetBar, static_cast<LONG>(index));
}

void RefreshSheetBar(const Workbook& workbook) {
    const HWND bar = workbook.sheetBar;
    const std::vector<BarItem> items = WantedItems(workbook.sheets);
    if (items != ShownItems(bar)) {
        KorFunkyBar_DeleteAll(bar);
        for (const BarItem& item : items) Append(bar, item);
        InvalidateRect(bar, nullptr, TRUE);
    }
    const auto current = static_cast<LONG>(workbook.sheets.currentIndex());
    if (KorFunkyBar_GetCurrent(bar) != current) KorFunkyBar_SetCurrent(bar, current);
}

}  // namespace workbook

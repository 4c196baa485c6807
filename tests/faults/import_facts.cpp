#include "faults/import_facts.h"

#include <korcontrols/graph.h>
#include <korcontrols/header.h>

#include <commctrl.h>

#include <algorithm>
#include <prsht.h>

namespace kortest {
namespace {

constexpr ULONG_PTR kMinusOne = ~ULONG_PTR{0};
constexpr DWORD kNoMemory = ERROR_NOT_ENOUGH_MEMORY;
constexpr DWORD kNoHandles = ERROR_NO_MORE_USER_HANDLES;
constexpr DWORD kNoWindow = ERROR_INVALID_WINDOW_HANDLE;
constexpr DWORD kBadHandle = ERROR_INVALID_HANDLE;

constexpr ImportFact Fails(const char* name, DWORD error = 0, ULONG_PTR result = 0) {
    return {name, Fallible::kYes, result, error};
}

constexpr ImportFact Makes(const char* name, Resource made, DWORD error) {
    return {name, Fallible::kYes, 0, error, made};
}

constexpr ImportFact Cannot(const char* name, const char* why) {
    return {name, Fallible::kNo, 0, 0, Resource::kNone, Resource::kNone, 0, why};
}

// The answer of a function that gives back can only be ignored, and what it did not take back would
// be left behind by the platform.
constexpr ImportFact GivesBack(const char* name, Resource taken, int argument = 0) {
    return {name, Fallible::kNo, 0, 0, Resource::kNone, taken, argument, "gives back"};
}

constexpr ImportFact AtLoad(const char* name) {
    return {name, Fallible::kAtLoad, 0, 0, Resource::kNone, Resource::kNone, 0, "start-up code"};
}

const ImportFact kFacts[] = {
    // ---- Memory -------------------------------------------------------------------------------
    Makes("LocalAlloc", Resource::kLocalBlock, kNoMemory),
    {"LocalReAlloc", Fallible::kYes, 0, kNoMemory, Resource::kLocalBlock, Resource::kLocalBlock, 0,
     "", Step::kTakesIfItCan},
    GivesBack("LocalFree", Resource::kLocalBlock),
    Makes("malloc", Resource::kRuntimeBlock, 0),
    GivesBack("free", Resource::kRuntimeBlock),
    Makes("GlobalAlloc", Resource::kGlobalBlock, kNoMemory),
    Fails("GlobalLock", kNoMemory),
    Cannot("GlobalUnlock", "0 means that no lock is left"),
    GivesBack("GlobalFree", Resource::kGlobalBlock),
    Cannot("LocalSize", "of a block that the caller has"),
    // ---- Windows ------------------------------------------------------------------------------
    Fails("RegisterClassW", kNoMemory),
    Makes("CreateWindowExW", Resource::kWindow, kNoHandles),
    Cannot("DefWindowProcW", "what a message answers"),
    Cannot("CallWindowProcW", "what a message answers"),
    Cannot("IsWindow", "an answer, not an outcome"),
    Cannot("EnableWindow", "tells the state before"),
    Cannot("ShowWindow", "tells the state before"),
    Cannot("GetUpdateRect", "0 means that nothing is invalid"),
    Cannot("GetWindowLongW", "a window's own procedure asks for its own data"),
    Cannot("GetWindowLongPtrW", "a window's own procedure asks for its own data"),
    // Of another window; see CanFail.
    Fails("SetWindowLongW", kNoWindow),
    Fails("SetWindowLongPtrW", kNoWindow),
    Fails("GetClassNameW", kNoWindow),
    Fails("GetClientRect", kNoWindow),
    Fails("GetWindowRect", kNoWindow),
    Fails("GetParent", kNoWindow),
    Cannot("GetPropW", "null means that there is no such property"),
    Fails("MapWindowPoints", kNoWindow),
    Fails("MoveWindow", kNoWindow),
    Fails("SetWindowPos", kNoWindow),
    Fails("UpdateWindow", kNoWindow),
    Fails("InvalidateRect", kNoWindow),
    Fails("ValidateRect", kNoWindow),
    Fails("SetFocus", kNoWindow),
    Cannot("SetCapture", "tells who had the capture"),
    Fails("ReleaseCapture", kNoWindow),
    {"SetTimer", Fallible::kYes, 0, kNoHandles, Resource::kTimer},
    {"KillTimer", Fallible::kYes, 0, ERROR_INVALID_PARAMETER, Resource::kNone, Resource::kTimer, 1},
    Fails("SendMessageW", kNoWindow),
    Fails("PostMessageW", ERROR_NOT_ENOUGH_QUOTA),
    Cannot("GetMessagePos", "the position of the last message"),
    Cannot("GetKeyState", "the state of a key"),
    Fails("SetScrollInfo", kNoWindow),
    Fails("SetScrollPos", kNoWindow),
    Fails("SetScrollRange", kNoWindow),
    // ---- Dialogs, menus, the clipboard
    // ------------------------------------------------------------
    Makes("CreatePropertySheetPageW", Resource::kPage, kNoMemory),
    GivesBack("DestroyPropertySheetPage", Resource::kPage),
    {"PropertySheetW", Fallible::kYes, kMinusOne, kNoMemory, Resource::kNone, Resource::kNone, 0,
     "", Step::kTakesPages},
    Fails("MessageBoxW", kNoMemory),
    Fails("GetDlgItem", ERROR_CONTROL_ID_NOT_FOUND),
    Fails("GetDlgItemTextW", ERROR_CONTROL_ID_NOT_FOUND),
    Fails("SetDlgItemTextW", ERROR_CONTROL_ID_NOT_FOUND),
    Fails("SendDlgItemMessageW", ERROR_CONTROL_ID_NOT_FOUND),
    Makes("CreatePopupMenu", Resource::kMenu, kNoHandles),
    GivesBack("DestroyMenu", Resource::kMenu),
    Fails("AppendMenuW", kNoMemory),
    Fails("TrackPopupMenuEx", kNoMemory),
    Makes("OpenClipboard", Resource::kClipboard, ERROR_ACCESS_DENIED),
    GivesBack("CloseClipboard", Resource::kClipboard),
    Fails("EmptyClipboard", ERROR_CLIPBOARD_NOT_OPEN),
    {"SetClipboardData", Fallible::kYes, 0, ERROR_CLIPBOARD_NOT_OPEN, Resource::kNone,
     Resource::kGlobalBlock, 1, "", Step::kTakesIfItCan},
    // ---- Drawing ------------------------------------------------------------------------------
    Makes("BeginPaint", Resource::kPaint, kNoWindow),
    GivesBack("EndPaint", Resource::kPaint),
    Makes("GetDC", Resource::kWindowDC, kNoHandles),
    GivesBack("ReleaseDC", Resource::kWindowDC, 1),
    Makes("CreateCompatibleDC", Resource::kMemoryDC, kNoMemory),
    GivesBack("DeleteDC", Resource::kMemoryDC),
    Makes("CreateCompatibleBitmap", Resource::kObject, kNoMemory),
    Makes("CreateDIBSection", Resource::kObject, kNoMemory),
    Makes("CreateFontIndirectW", Resource::kObject, kNoMemory),
    Makes("CreatePen", Resource::kObject, kNoMemory),
    Makes("CreateRectRgn", Resource::kObject, kNoMemory),
    Makes("CreateSolidBrush", Resource::kObject, kNoMemory),
    GivesBack("DeleteObject", Resource::kObject),
    {"SelectObject", Fallible::kYes, 0, kBadHandle, Resource::kNone, Resource::kNone, 0, "",
     Step::kSelects},
    Fails("GetCurrentObject", kBadHandle),
    Fails("GetObjectW", kBadHandle),
    Fails("GetStockObject", kBadHandle),
    Fails("GetDeviceCaps", kBadHandle),
    Fails("SetRectRgn", kBadHandle),
    Fails("SetBkColor", kBadHandle, CLR_INVALID),
    Fails("SetBkMode", kBadHandle),
    Fails("SetTextColor", kBadHandle, CLR_INVALID),
    Fails("BitBlt", kBadHandle),
    Fails("PatBlt", kBadHandle),
    Fails("FillRect", kBadHandle),
    Fails("Ellipse", kBadHandle),
    Fails("Polygon", kBadHandle),
    Fails("Polyline", kBadHandle),
    Fails("Rectangle", kBadHandle),
    Fails("DrawTextW", kBadHandle),
    Fails("ExtTextOutW", kBadHandle),
    Fails("GetPixel", kBadHandle, CLR_INVALID),
    Fails("GetTextExtentExPointW", kBadHandle),
    Fails("GetTextMetricsW", kBadHandle),
    Fails("GdiFlush"),
    Cannot("GetSysColor", "0 is black"),
    Fails("GetSysColorBrush", kBadHandle),
    Makes("ImageList_LoadImageW", Resource::kImageList, kNoMemory),
    GivesBack("ImageList_Destroy", Resource::kImageList),
    Fails("ImageList_Draw", kBadHandle),
    Fails("ImageList_GetImageInfo", kBadHandle),
    // ---- Modules and resources ------------------------------------------------------------------
    Fails("GetModuleFileNameW", ERROR_INVALID_HANDLE),
    Fails("LoadLibraryW", ERROR_MOD_NOT_FOUND),  // modules stay for the life of the process
    Fails("GetProcAddress", ERROR_PROC_NOT_FOUND),
    Fails("LoadStringW", ERROR_RESOURCE_NAME_NOT_FOUND),
    Cannot("SetLastError", "a store"),
    // ---- Texts and numbers ----------------------------------------------------------------------
    Cannot("lstrcmpiW", "a comparison of two texts"),
    Cannot("_itow", "the buffer holds any number"),
    Cannot("_snwprintf", "the buffer holds any number"),
    Cannot("swprintf", "the buffer holds any number"),
    Cannot("_wtof", "0 is a number"),
    Cannot("_wtol", "0 is a number"),
    Cannot("wcstod", "0 is a number"),
    Cannot("acos", "arithmetic"),
    Cannot("ceil", "arithmetic"),
    Cannot("cos", "arithmetic"),
    Cannot("floor", "arithmetic"),
    Cannot("log10", "arithmetic"),
    Cannot("pow", "arithmetic"),
    Cannot("sin", "arithmetic"),
    Cannot("sqrt", "arithmetic"),
    Cannot("tan", "arithmetic"),
    Cannot("memcmp", "bytes in memory"),
    Cannot("memcpy", "bytes in memory"),
    Cannot("memmove", "bytes in memory"),
    Cannot("memset", "bytes in memory"),
    Cannot("wcscat", "characters in memory"),
    Cannot("wcschr", "characters in memory"),
    Cannot("wcslen", "characters in memory"),
    Cannot("wcsncpy", "characters in memory"),
    // ---- What the compiler's start-up code calls
    // --------------------------------------------------
    AtLoad("DeleteCriticalSection"),
    AtLoad("EnterCriticalSection"),
    AtLoad("FreeLibrary"),
    AtLoad("GetLastError"),
    AtLoad("GetModuleHandleA"),
    AtLoad("InitializeCriticalSection"),
    AtLoad("LeaveCriticalSection"),
    AtLoad("LoadLibraryA"),
    AtLoad("Sleep"),
    AtLoad("TlsGetValue"),
    AtLoad("VirtualProtect"),
    AtLoad("VirtualQuery"),
    AtLoad("__iob_func"),
    AtLoad("__setusermatherr"),
    AtLoad("_amsg_exit"),
    AtLoad("_errno"),
    AtLoad("_initterm"),
    AtLoad("_iob"),
    AtLoad("_lock"),
    AtLoad("_unlock"),
    AtLoad("abort"),
    AtLoad("calloc"),
    AtLoad("fwrite"),
    AtLoad("realloc"),
    AtLoad("strlen"),
    AtLoad("strncmp"),
    AtLoad("vfprintf"),
};

// What a window answers to a message that it cannot carry out; 0 for all others.
ULONG_PTR RefusalOf(UINT message) {
    switch (message) {
    case CB_ADDSTRING: return static_cast<ULONG_PTR>(CB_ERRSPACE);
    case CB_GETCURSEL:
    case LVM_INSERTITEMW:
    case LVM_HITTEST:
    case HCM_INSERTITEM:
    case HCM_GETITEMCOUNT:
    case HCM_GETITEMSIZE: return kMinusOne;
    case GM_ADDSERIES:
    case GM_SETCATEGORIES: return 1;
    default: return 0;
    }
}

// A sheet that cannot be shown takes its pages with it.
void TakePages(const PROPSHEETHEADERW& sheet) {
    for (UINT i = 0; i < sheet.nPages; ++i) DestroyPropertySheetPage(sheet.phpage[i]);
}

}  // namespace

const std::vector<ImportFact>& ImportFacts() {
    static const std::vector<ImportFact> facts(std::begin(kFacts), std::end(kFacts));
    return facts;
}

const ImportFact* FindImportFact(const std::string& name) {
    const auto& facts = ImportFacts();
    const auto found = std::find_if(facts.begin(), facts.end(),
                                    [&](const ImportFact& fact) { return name == fact.name; });
    return found == facts.end() ? nullptr : &*found;
}

// The user data of a window is its own procedure's, and always there.
bool CanFail(const ImportFact& fact, const ULONG_PTR* arguments) {
    if (fact.fallible != Fallible::kYes) return false;
    const std::string name = fact.name;
    if (name != "SetWindowLongW" && name != "SetWindowLongPtrW") return true;
    return static_cast<int>(arguments[1]) != GWLP_USERDATA;
}

ULONG_PTR AnswerFailure(const ImportFact& fact, ULONG_PTR* arguments) {
    const std::string name = fact.name;
    ULONG_PTR result = fact.failure;
    if (name == "SendMessageW") result = RefusalOf(static_cast<UINT>(arguments[1]));
    if (name == "SendDlgItemMessageW") result = RefusalOf(static_cast<UINT>(arguments[2]));
    if (name == "PropertySheetW")
        TakePages(*reinterpret_cast<const PROPSHEETHEADERW*>(arguments[0]));
    if (fact.error) SetLastError(fact.error);
    return result;
}

}  // namespace kortest

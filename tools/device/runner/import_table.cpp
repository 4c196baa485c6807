#include "runner/import_table.h"

#include "runner/own_functions.h"

#include <windows.h>

#include <prsht.h>

#include <algorithm>
#include <iterator>

namespace device {
namespace {

struct OtherName {
    const char* guest;
    const char* desktop;
};

constexpr OtherName kOtherNames[] = {
    {"??2@YAPAXI@Z", "malloc"},
    {"??3@YAXPAX@Z", "free"},
    {"GetProcAddressW", "GetProcAddress"},
    {"ImageList_LoadImage", "ImageList_LoadImageW"},
};

const char* const kDoubleResults[] = {"acos", "asin", "atan",  "atan2", "ceil",  "cos",
                                      "exp",  "fabs", "floor", "fmod",  "log",   "log10",
                                      "pow",  "sin",  "sqrt",  "tan",   "wcstod"};

// Functions of the C runtime whose arguments are words. swprintf is one of them since both sides
// lay out its arguments alike: a double is the next two words.
const char* const kRuntimeOfWords[] = {
    "??2@YAPAXI@Z", "??3@YAXPAX@Z", "_itow",   "_wtol",  "free",    "malloc",
    "memcmp",       "memcpy",       "memmove", "memset", "realloc", "swprintf",
    "wcscat",       "wcschr",       "wcscmp",  "wcscpy", "wcslen",  "wcsncpy"};

struct Destination {
    const char* function;
    int lengthArgument;
};

constexpr Destination kDestinations[] = {
    {"_itow", kUnknownLength},
    {"memcpy", 2},
    {"memmove", 2},
    {"memset", 2},
    {"swprintf", kUnknownLength},
    {"wcscat", kUnknownLength},
    {"wcscpy", kUnknownLength},
    {"wcsncpy", kUnknownLength},
};

constexpr ProcedurePlace kProcedures[] = {
    {"RegisterClassW", 0, offsetof(WNDCLASSW, lpfnWndProc), Procedure::Words4},
    {"SetWindowLongW", 2, kIsArgument, Procedure::Words4},
    {"CallWindowProcW", 0, kIsArgument, Procedure::Words4},
    {"SetTimer", 3, kIsArgument, Procedure::Words4},
    {"CreateDialogIndirectParamW", 3, kIsArgument, Procedure::Words4},
    {"CreateDialogParamW", 3, kIsArgument, Procedure::Words4},
    {"DialogBoxIndirectParamW", 3, kIsArgument, Procedure::Words4},
    {"DialogBoxParamW", 3, kIsArgument, Procedure::Words4},
    {"EnumFontFamiliesW", 2, kIsArgument, Procedure::Words4},
    {"EnumWindows", 0, kIsArgument, Procedure::Words2},
    {"SetAbortProc", 1, kIsArgument, Procedure::Words2},
    {"SetWindowsHookExW", 1, kIsArgument, Procedure::Words3},
    {"CreatePropertySheetPageW", 0, offsetof(PROPSHEETPAGEW, pfnDlgProc), Procedure::Words4},
    {"CreatePropertySheetPageW", 0, offsetof(PROPSHEETPAGEW, pfnCallback), Procedure::Words3},
    {"PropertySheetW", 0, offsetof(PROPSHEETHEADERW, pfnCallback), Procedure::Words3},
    {"qsort", 3, kIsArgument, Procedure::Cdecl},
};

template <size_t count>
bool Contains(const char* const (&names)[count], const std::string& name) {
    return std::find(std::begin(names), std::end(names), name) != std::end(names);
}

template <typename Value>
Value FieldAt(uint32_t address, size_t offset) {
    return *reinterpret_cast<const Value*>(address + offset);
}

// A property sheet may contain its pages as an array of structures, each of which holds its size.
void AnnouncePages(uint32_t header) {
    const auto& sheet = *reinterpret_cast<const PROPSHEETHEADERW*>(header);
    if (!(sheet.dwFlags & PSH_PROPSHEETPAGE)) return;
    auto page = reinterpret_cast<uint32_t>(sheet.ppsp);
    for (UINT i = 0; i < sheet.nPages; ++i) {
        Announce(FieldAt<uint32_t>(page, offsetof(PROPSHEETPAGEW, pfnDlgProc)), Procedure::Words4);
        Announce(FieldAt<uint32_t>(page, offsetof(PROPSHEETPAGEW, pfnCallback)), Procedure::Words3);
        page += FieldAt<DWORD>(page, offsetof(PROPSHEETPAGEW, dwSize));
    }
}

}  // namespace

std::string DesktopName(const std::string& guestName) {
    for (const OtherName& entry : kOtherNames) {
        if (guestName == entry.guest) return entry.desktop;
    }
    return guestName;
}

bool FindPassing(const std::string& guestName, const std::string& library, Passing& passing) {
    passing = Passing::Words;
    if (FindOwnFunction(guestName)) {
        passing = Passing::Own;
        return true;
    }
    if (library != "msvcrt.dll") return true;
    if (Contains(kDoubleResults, guestName)) {
        passing = Passing::DoubleResult;
        return true;
    }
    return Contains(kRuntimeOfWords, guestName);
}

bool FindDestination(const std::string& guestName, int& lengthArgument) {
    for (const Destination& entry : kDestinations) {
        if (guestName != entry.function) continue;
        lengthArgument = entry.lengthArgument;
        return true;
    }
    return false;
}

bool TakesProcedures(const std::string& guestName) {
    return std::any_of(std::begin(kProcedures), std::end(kProcedures),
                       [&](const ProcedurePlace& place) { return guestName == place.function; });
}

void AnnounceProcedures(const std::string& guestName, const uint32_t* words) {
    for (const ProcedurePlace& place : kProcedures) {
        if (guestName != place.function) continue;
        uint32_t address = words[place.argument];
        if (place.offset != kIsArgument && address) {
            address = FieldAt<uint32_t>(address, static_cast<size_t>(place.offset));
        }
        Announce(address, place.procedure);
    }
    if (guestName == "PropertySheetW" && words[0]) AnnouncePages(words[0]);
}

}  // namespace device

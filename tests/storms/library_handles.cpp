// Follows the drawing objects of the library from their making to their end.
#include "storms/library.h"

#include <unordered_map>

namespace kortest {
namespace {

enum class Made { object, font, context, painting, menu };

// Kinds of handles never meet in one map: their values may be equal.
std::unordered_map<const void*, Made> objects;
std::unordered_map<const void*, int> contexts;
std::unordered_map<const void*, int> menus;
int paintings = 0;
bool isFollowing = false;

template <Made kind, int place, typename Result, typename... Parameters>
struct Maker {
    static inline Result(WINAPI* real)(Parameters...) = nullptr;
    static Result WINAPI call(Parameters... parameters) {
        const Result result = real(parameters...);
        if (!result) return result;
        const auto* handle = reinterpret_cast<const void*>(result);
        if constexpr (kind == Made::context) {
            ++contexts[handle];
        } else if constexpr (kind == Made::painting) {
            ++paintings;
        } else if constexpr (kind == Made::menu) {
            ++menus[handle];
        } else {
            objects[handle] = kind;
        }
        return result;
    }
};

void TakeOne(std::unordered_map<const void*, int>& from, const void* handle) {
    const auto found = from.find(handle);
    if (found != from.end() && --found->second == 0) from.erase(found);
}

decltype(&DeleteObject) realDeleteObject;
decltype(&DeleteDC) realDeleteDC;
decltype(&ReleaseDC) realReleaseDC;
decltype(&EndPaint) realEndPaint;
decltype(&DestroyMenu) realDestroyMenu;

BOOL WINAPI FollowedDeleteObject(HGDIOBJ object) {
    objects.erase(object);
    return realDeleteObject(object);
}

BOOL WINAPI FollowedDeleteDC(HDC dc) {
    TakeOne(contexts, dc);
    return realDeleteDC(dc);
}

int WINAPI FollowedReleaseDC(HWND window, HDC dc) {
    TakeOne(contexts, dc);
    return realReleaseDC(window, dc);
}

BOOL WINAPI FollowedEndPaint(HWND window, const PAINTSTRUCT* paint) {
    --paintings;
    return realEndPaint(window, paint);
}

BOOL WINAPI FollowedDestroyMenu(HMENU menu) {
    TakeOne(menus, menu);
    return realDestroyMenu(menu);
}

// `place` only tells apart functions of equal signatures.
template <Made kind, int place, typename Result, typename... Parameters>
void Follow(const char* name, Result(WINAPI*)(Parameters...)) {
    using Wrapped = Maker<kind, place, Result, Parameters...>;
    Wrapped::real = reinterpret_cast<Result(WINAPI*)(Parameters...)>(
        ReplaceImport(name, reinterpret_cast<void*>(&Wrapped::call)));
}

template <typename Function>
Function Replace(const char* name, Function function) {
    return reinterpret_cast<Function>(ReplaceImport(name, reinterpret_cast<void*>(function)));
}

}  // namespace

void FollowHandles() {
    isFollowing = true;
    Follow<Made::object, 1>("CreateCompatibleBitmap", &CreateCompatibleBitmap);
    Follow<Made::object, 2>("CreateDIBSection", &CreateDIBSection);
    Follow<Made::object, 3>("CreatePen", &CreatePen);
    Follow<Made::object, 4>("CreateSolidBrush", &CreateSolidBrush);
    Follow<Made::object, 5>("CreateRectRgn", &CreateRectRgn);
    Follow<Made::font, 6>("CreateFontIndirectW", &CreateFontIndirectW);
    Follow<Made::context, 7>("CreateCompatibleDC", &CreateCompatibleDC);
    Follow<Made::context, 8>("GetDC", &GetDC);
    Follow<Made::painting, 9>("BeginPaint", &BeginPaint);
    Follow<Made::menu, 10>("CreatePopupMenu", &CreatePopupMenu);
    realDeleteObject = Replace("DeleteObject", &FollowedDeleteObject);
    realDeleteDC = Replace("DeleteDC", &FollowedDeleteDC);
    realReleaseDC = Replace("ReleaseDC", &FollowedReleaseDC);
    realEndPaint = Replace("EndPaint", &FollowedEndPaint);
    realDestroyMenu = Replace("DestroyMenu", &FollowedDestroyMenu);
}

HandleCounts LiveHandles() {
    HandleCounts counts{};
    if (!isFollowing) return counts;
    for (const auto& [handle, kind] : objects)
        ++(kind == Made::font ? counts.fonts : counts.objects);
    for (const auto& [handle, times] : contexts) counts.contexts += times;
    counts.menus = static_cast<int>(menus.size());
    counts.paintings = paintings;
    return counts;
}

}  // namespace kortest

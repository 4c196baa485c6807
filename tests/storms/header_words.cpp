#include "storms/library.h"
#include "storms/window_words.h"
#include "storms/words.h"

namespace kortest {
namespace {

constexpr int kMostItems = 90;

// Texts are const in the storm; the library copies them.
HeaderItemDesc ItemOf(int text, int size) {
    return {const_cast<LPWSTR>(TextOf(text)), static_cast<WORD>(size)};
}

void Insert(Stage& stage, const Arguments& a) {
    HWND strip = stage.ensure(kStrip, a[0]);
    const HeaderItemDesc item = ItemOf(a[2], a[3]);
    if (KorHeader_GetItemCount(strip) >= kMostItems) return;
    stage.send(strip, HCM_INSERTITEM, WideWord(a[1]), reinterpret_cast<LPARAM>(&item));
}

void Append(Stage& stage, const Arguments& a) { Insert(stage, {a[0], -1, a[1], a[2]}); }

void Delete(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kStrip, a[0]), HCM_DELETEITEM, WideWord(a[1]), 0);
}

void Set(Stage& stage, const Arguments& a) {
    const HeaderItemDesc item = ItemOf(a[2], a[3]);
    stage.send(stage.ensure(kStrip, a[0]), HCM_SETITEM, WideWord(a[1]),
               reinterpret_cast<LPARAM>(&item));
}

void SetState(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kStrip, a[0]), HCM_SETITEMSTATE, WideWord(a[1]), a[2]);
}

void Get(Stage& stage, const Arguments& a) {
    HeaderItemDesc item = {};
    HWND strip = stage.ensure(kStrip, a[0]);
    if (!stage.send(strip, HCM_GETITEM, WideWord(a[1]), reinterpret_cast<LPARAM>(&item))) return;
    ReleaseLibraryBlock(item.text);
}

void Null(Stage& stage, const Arguments& a) {
    const UINT messages[] = {HCM_INSERTITEM, HCM_SETITEM, HCM_GETITEM};
    stage.send(stage.ensure(kStrip, a[0]), messages[static_cast<unsigned>(a[1]) % 3],
               WideWord(a[2]), 0);
}

void Clear(Stage& stage, const Arguments& a) {
    HWND strip = stage.ensure(kStrip, a[0]);
    for (int i = KorHeader_GetItemCount(strip); i > 0; --i) KorHeader_DeleteItem(strip, 0);
}

// A press on a border and moves of it, which random positions seldom hit.
void DragBorder(Stage& stage, const Arguments& a) {
    HWND strip = stage.ensure(kStrip, a[0]);
    int border = 0;
    for (int i = 0; i <= (a[1] & 7); ++i) border += std::max(KorHeader_GetItemSize(strip, i), 0);
    stage.send(strip, WM_LBUTTONDOWN, MK_LBUTTON, PairOf(border, border));
    stage.send(strip, WM_MOUSEMOVE, MK_LBUTTON, PairOf(border + a[2], border + a[2]));
    if (a[3]) stage.send(strip, WM_LBUTTONUP, 0, PairOf(a[2], a[2]));
}

constexpr Word kWords[] = {
    KORTEST_WINDOW_WORDS(kStrip, "strip."), {"strip.insert", 80, "sitz", Insert},
    {"strip.append", 80, "stz", Append},    {"strip.delete", 90, "si", Delete},
    {"strip.set", 80, "sitz", Set},         {"strip.state", 60, "sin", SetState},
    {"strip.get", 50, "si", Get},           {"strip.null", 10, "sii", Null},
    {"strip.clear", 4, "s", Clear},         {"strip.drag_border", 60, "sixb", DragBorder},
};

}  // namespace

void AddHeaderWords(Vocabulary& vocabulary) { vocabulary.add(kWords); }

}  // namespace kortest

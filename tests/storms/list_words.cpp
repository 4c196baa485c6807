#include "storms/window_words.h"
#include "storms/words.h"

#include <iterator>

namespace kortest {
namespace {

constexpr int kMostRows = 60;

HWND List(Stage& stage, int place) { return stage.ensure(kList, place); }

// A view that the helpers may get: a list, a tree, a stranger, nothing, or one that is gone.
HWND AnyView(Stage& stage, int number) {
    switch (number & 7) {
    case 5: return nullptr;
    case 6: return stage.window(kStrip, 0);
    case 7: return stage.window(kList, 1);
    default: return List(stage, 0);
    }
}

void AddColumns(HWND list, int count) {
    for (int i = 0; i < count; ++i) {
        LVCOLUMNW column = {};
        column.mask = LVCF_WIDTH;
        column.cx = 30;
        SendMessageW(list, LVM_INSERTCOLUMNW, static_cast<WPARAM>(i),
                     reinterpret_cast<LPARAM>(&column));
    }
}

// As many texts as 8 bits of a count can ask for.
void Update(Stage& stage, const Arguments& a) {
    LPCWSTR texts[256];
    for (int i = 0; i < static_cast<int>(std::size(texts)); ++i) texts[i] = TextOf(a[2] + i);
    HWND list = AnyView(stage, a[0]);
    if (SendMessageW(list, LVM_GETITEMCOUNT, 0, 0) > kMostRows) {
        KorListView_DeleteAll(list, FALSE, FALSE);
    }
    KorListView_UpdateItem(list, a[1], texts, static_cast<DWORD>(a[3]) & 0xFF03, 0, a[2], 0, 0);
}

void UpdateState(Stage& stage, const Arguments& a) {
    const LPCWSTR text = TextOf(a[2]);
    KorListView_UpdateItem(AnyView(stage, a[0]), a[1], &text, 1, 0, a[3],
                           static_cast<DWORD>(a[3]) & 0xFF, 0xFF);
}

void UpdateNull(Stage& stage, const Arguments& a) {
    KorListView_UpdateItem(AnyView(stage, a[0]), a[1], nullptr, 3, 0, 0, 0, 0);
}

void Columns(Stage& stage, const Arguments& a) { AddColumns(List(stage, 0), a[0] & 3); }

void DeleteAll(Stage& stage, const Arguments& a) {
    KorListView_DeleteAll(AnyView(stage, a[0]), a[1], FALSE);
}

// Rows with objects of the host's, which the library releases.
void DeleteObjects(Stage& stage, const Arguments& a) {
    HWND list = List(stage, 0);
    KorListView_DeleteAll(list, FALSE, FALSE);
    const LPCWSTR text = L"row";
    for (int i = 0; i < (a[0] & 7); ++i) {
        auto* object = static_cast<char*>(::operator new(16));
        if (KorListView_UpdateItem(list, -1, &text, 1, reinterpret_cast<LPARAM>(object), 0, 0, 0) <
            0) {
            ::operator delete(object);
        }
    }
    KorListView_DeleteAll(list, FALSE, TRUE);
}

void Questions(Stage& stage, const Arguments& a) {
    KorListView_GetSelection(AnyView(stage, a[0]));
    KorListView_GetIndexFromCurrentPosition(AnyView(stage, a[0]));
}

void AddItem(Stage& stage, const Arguments& a) {
    HWND tree = a[0] ? stage.ensure(kTree, 0) : AnyView(stage, a[1]);
    const HTREEITEM after[] = {TVI_FIRST, TVI_LAST, TVI_SORT, nullptr};
    auto* root = reinterpret_cast<HTREEITEM>(SendMessageW(tree, TVM_GETNEXTITEM, TVGN_ROOT, 0));
    if (SendMessageW(tree, TVM_GETCOUNT, 0, 0) > kMostRows) {
        SendMessageW(tree, TVM_DELETEITEM, 0, reinterpret_cast<LPARAM>(TVI_ROOT));
        root = nullptr;
    }
    KorTreeView_AddItem(tree, a[2] ? root : TVI_ROOT, TextOf(a[3]), a[1], a[4], after[a[1] & 3],
                        a[2]);
}

constexpr Word kWords[] = {
    KORTEST_WINDOW_WORDS(kList, "list."),
    {"list.update", 120, "iitn", Update},
    {"list.update_state", 90, "iitn", UpdateState},
    {"list.update_null", 10, "ii", UpdateNull},
    {"list.columns", 6, "i", Columns},
    {"list.delete_all", 30, "ib", DeleteAll},
    {"list.delete_objects", 20, "i", DeleteObjects},
    {"list.questions", 60, "i", Questions},
    {"tree.add", 80, "bibtn", AddItem},
};

}  // namespace

void AddListWords(Vocabulary& vocabulary) { vocabulary.add(kWords); }

bool VocabularyOf(const std::string& control, Vocabulary& vocabulary) {
    static constexpr struct {
        const char* name;
        void (*add)(Vocabulary& vocabulary);
    } kControls[] = {{"header", AddHeaderWords},   {"grid", AddGridWords},
                     {"chart", AddChartWords},     {"legend", AddLegendWords},
                     {"tooltip", AddToolTipWords}, {"bar", AddBarWords},
                     {"lists", AddListWords}};
    bool isKnown = false;
    for (const auto& each : kControls) {
        const bool isInAll = control == "all" && each.add != AddLegendWords;
        if (control != each.name && !isInAll) continue;
        each.add(vocabulary);
        isKnown = true;
    }
    vocabulary.add(kHostWords, kHostWordCount);
    return isKnown;
}

}  // namespace kortest

// Random use of the list helpers, with fixed seeds, against a plain array of rows; and a use in
// which one message after the other is lost.
#include "listhelpers/view_fixture.h"

#include "support/message_text.h"

#include <random>

namespace kortest {
namespace {

struct ModelRow {
    std::wstring texts[3];
    int* object;  // from new; the row's lParam
    bool selected;
};

class ListRandom : public ViewTest, public ::testing::WithParamInterface<unsigned> {
protected:
    ~ListRandom() override {
        for (const ModelRow& each : model) delete each.object;
    }

    int below(int limit) { return static_cast<int>(random() % static_cast<unsigned>(limit)); }
    int size() const { return static_cast<int>(model.size()); }

    ModelRow someRow() {
        ModelRow made{};
        for (std::wstring& text : made.texts) text = std::to_wstring(below(1000));
        made.object = new int(below(1000));
        made.selected = below(3) == 0;
        return made;
    }

    // Replaces a row (whose object the host releases itself), appends one, or tries the impossible.
    void update() {
        const int index = below(size() + 2) - 1;
        const int columns = below(4);
        ModelRow made = someRow();
        const LPCWSTR texts[] = {made.texts[0].c_str(), made.texts[1].c_str(),
                                 made.texts[2].c_str()};
        const LONG row =
            KorListView_UpdateItem(list, index, texts, static_cast<DWORD>(columns | below(4) << 8),
                                   reinterpret_cast<LPARAM>(made.object), 0,
                                   made.selected ? LVIS_SELECTED : 0u, LVIS_SELECTED);
        if (index >= size()) {
            EXPECT_EQ(row, -1);
            delete made.object;
        } else if (index < 0) {
            EXPECT_EQ(row, size());
            for (int i = columns < 1 ? 1 : columns; i < 3; ++i) made.texts[i].clear();
            model.push_back(made);
        } else {
            EXPECT_EQ(row, index);
            ModelRow& old = model[static_cast<size_t>(index)];
            for (int i = columns < 1 ? 1 : columns; i < 3; ++i) made.texts[i] = old.texts[i];
            delete old.object;
            old = made;
        }
    }

    void removeSome() {
        const bool selectedOnly = below(10) != 0;
        const bool freeObjects = below(2) != 0;
        const LONG expected = size() > 0 && (!selectedOnly || model[0].selected) ? TRUE : 0;
        std::vector<ModelRow> left;
        for (const ModelRow& each : model) {
            if (selectedOnly && !each.selected) {
                left.push_back(each);
            } else if (freeObjects) {
                expectedFreed.push_back(each.object);
            } else {
                delete each.object;
            }
        }
        freed.clear();
        EXPECT_EQ(KorListView_DeleteAll(list, selectedOnly, freeObjects), expected);
        EXPECT_EQ(freed, std::vector<void*>(expectedFreed.rbegin(), expectedFreed.rend()));
        expectedFreed.clear();
        model = left;
    }

    void watchFree() {
        spy.watch("free");
        spy.replace("free", [this](ULONG_PTR* arguments) {
            freed.push_back(reinterpret_cast<void*>(arguments[0]));
            return spy.callReal("free", arguments);
        });
    }

    void expectAsModelled() const {
        ASSERT_EQ(rowCount(list), size());
        LONG firstSelected = -1;
        for (int i = 0; i < size(); ++i) {
            const ModelRow& each = model[static_cast<size_t>(i)];
            for (int column = 0; column < 3; ++column)
                ASSERT_EQ(rowText(i, column), Narrow(each.texts[column].c_str())) << i;
            ASSERT_EQ(row(i).lParam, reinterpret_cast<LPARAM>(each.object));
            if (each.selected && firstSelected < 0) firstSelected = i;
        }
        ASSERT_EQ(KorListView_GetSelection(list), firstSelected);
    }

    std::mt19937 random;
    std::vector<ModelRow> model;
    std::vector<void*> expectedFreed;
    std::vector<void*> freed;
};

TEST_P(ListRandom, UseLeavesWhatTheModelHolds) {
    random.seed(GetParam() * 7919);
    createList();
    watchFree();
    for (int i = 0; i < 600; ++i) {
        if (below(8)) {
            update();
        } else {
            removeSome();
        }
        expectAsModelled();
        if (HasFailure()) FAIL() << "at step " << i;
    }
}

INSTANTIATE_TEST_SUITE_P(Seeds, ListRandom, ::testing::Range(1u, 4u));

class ViewFaults : public ViewTest {};

TEST_F(ViewFaults, AreSurvivedOneByOne) {
    createList();
    createTree();
    const LPCWSTR texts[] = {L"a", L"b", L"c"};
    spy.watch("SendMessageW");
    int failures = 0;
    for (int nth = 1; nth < 100; ++nth) {
        for (const ULONG_PTR lost : {ULONG_PTR{0}, ~ULONG_PTR{0}}) {
            spy.clearCalls();
            spy.failNth("SendMessageW", nth, lost);
            for (LONG index = -2; index < 1; ++index)
                KorListView_UpdateItem(list, index, texts, 3, 0, 0, LVIS_SELECTED, LVIS_SELECTED);
            KorTreeView_AddItem(tree, TVI_ROOT, L"a", 0, 0, TVI_LAST, TRUE);
            KorListView_GetSelection(list);
            KorListView_GetIndexFromCurrentPosition(list);
            KorListView_DeleteAll(list, TRUE, TRUE);
            KorListView_DeleteAll(list, FALSE, FALSE);
            spy.stopFailing("SendMessageW");
            SendMessageW(list, LVM_DELETEALLITEMS, 0, 0);
            for (const ImportCall& call : spy.calls()) failures += call.failed;
        }
        if (failures < 2 * nth) break;
    }
    EXPECT_GT(failures, 20);
    EXPECT_EQ(KorListView_UpdateItem(list, -1, texts, 3, 0, 0, 0, 0), 0);
    EXPECT_EQ(rowText(0, 2), "c") << "the next use is whole";
}

}  // namespace
}  // namespace kortest

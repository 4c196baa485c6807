// Adding items to a tree.
#include "listhelpers/view_fixture.h"

#include "support/message_text.h"

namespace kortest {
namespace {

class TreeItems : public ViewTest {
protected:
    TreeItems() { createTree(); }

    HTREEITEM add(HTREEITEM parent, LPCWSTR text, HTREEITEM after = TVI_LAST,
                  BOOL hasChildren = FALSE) const {
        return KorTreeView_AddItem(tree, parent, text, 3, 42, after, hasChildren);
    }

    std::string textOf(HTREEITEM item) const {
        wchar_t text[64] = L"(none)";
        TVITEMW request{};
        request.mask = TVIF_TEXT;
        request.hItem = item;
        request.pszText = text;
        request.cchTextMax = 64;
        SendMessageW(tree, TVM_GETITEMW, 0, reinterpret_cast<LPARAM>(&request));
        return Narrow(text);
    }

    HTREEITEM next(UINT relation, HTREEITEM item) const {
        return reinterpret_cast<HTREEITEM>(
            SendMessageW(tree, TVM_GETNEXTITEM, relation, reinterpret_cast<LPARAM>(item)));
    }

    // Texts of an item's children.
    std::string children(HTREEITEM item) const {
        std::string all;
        for (HTREEITEM child = next(TVGN_CHILD, item); child; child = next(TVGN_NEXT, child))
            all += (all.empty() ? "" : "|") + textOf(child);
        return all;
    }

    TVITEMW item(HTREEITEM handle) const {
        TVITEMW request{};
        request.mask = TVIF_IMAGE | TVIF_SELECTEDIMAGE | TVIF_PARAM | TVIF_CHILDREN;
        request.hItem = handle;
        EXPECT_TRUE(SendMessageW(tree, TVM_GETITEMW, 0, reinterpret_cast<LPARAM>(&request)));
        return request;
    }
};

TEST_F(TreeItems, HaveTextImageAndParam) {
    const HTREEITEM added = add(TVI_ROOT, L"root");
    ASSERT_NE(added, nullptr);
    EXPECT_EQ(textOf(added), "root");
    EXPECT_EQ(item(added).iImage, 3);
    EXPECT_EQ(item(added).iSelectedImage, 3);
    EXPECT_EQ(item(added).lParam, 42);
    EXPECT_EQ(item(added).cChildren, 0);
}

TEST_F(TreeItems, AreInsertedWhereTheyShall) {
    const HTREEITEM root = add(nullptr, L"root");
    const HTREEITEM b = add(root, L"b");
    add(root, L"d");
    add(root, L"c", b);
    add(root, L"a", TVI_FIRST);
    EXPECT_EQ(children(root), "a|b|c|d");
    add(TVI_ROOT, L"other");
    EXPECT_EQ(children(TVI_ROOT), "root|other");
}

TEST_F(TreeItems, MayAnnounceAChild) {
    const HTREEITEM added = add(TVI_ROOT, L"root", TVI_LAST, 2);
    EXPECT_EQ(item(added).cChildren, 1);
    EXPECT_EQ(children(added), "");
}

TEST_F(TreeItems, AreHandedOverWhole) {
    watchMessages();
    const LPCWSTR text = L"text";
    const HTREEITEM root = add(TVI_ROOT, text, TVI_FIRST);
    add(root, text, TVI_SORT, TRUE);
    ASSERT_EQ(sent.size(), 2u);
    for (size_t i = 0; i < 2; ++i) {
        EXPECT_EQ(sent[i].window, tree);
        EXPECT_EQ(sent[i].message, UINT{TVM_INSERTITEMW});
        EXPECT_EQ(sent[i].insert.hParent, i ? root : TVI_ROOT);
        EXPECT_EQ(sent[i].insert.hInsertAfter, i ? TVI_SORT : TVI_FIRST);
        EXPECT_EQ(sent[i].insert.item.mask, i ? 103u : 39u);
        EXPECT_EQ(sent[i].insert.item.pszText, text);
        EXPECT_EQ(sent[i].insert.item.cchTextMax, 4);
        EXPECT_EQ(sent[i].insert.item.cChildren, i ? 1 : 0);
    }
}

TEST_F(TreeItems, MayBeAskedForTheirText) {
    onNotify = [](const NMHDR& header, LPARAM data) {
        if (header.code != TVN_GETDISPINFOW) return;
        auto& request = *reinterpret_cast<NMTVDISPINFOW*>(data);
        if (request.item.mask & TVIF_TEXT)
            lstrcpynW(request.item.pszText, L"asked", request.item.cchTextMax);
    };
    EXPECT_EQ(textOf(add(TVI_ROOT, LPSTR_TEXTCALLBACKW)), "asked");
}

TEST_F(TreeItems, ThatCannotBeInsertedAreNull) {
    watchMessages();
    answer = [](const SentMessage&, LRESULT*) { return true; };
    EXPECT_EQ(add(TVI_ROOT, L"text"), nullptr);
}

TEST_F(TreeItems, NeedATextAndAWindow) {
    watchMessages();
    EXPECT_EQ(add(TVI_ROOT, nullptr), nullptr);
    EXPECT_EQ(KorTreeView_AddItem(nullptr, TVI_ROOT, L"text", 0, 0, TVI_LAST, FALSE), nullptr);
    DestroyWindow(tree);
    EXPECT_EQ(add(TVI_ROOT, L"text"), nullptr);
    EXPECT_TRUE(sent.empty());
}

}  // namespace
}  // namespace kortest

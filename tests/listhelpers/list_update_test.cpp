// Filling a row with one call.
#include "listhelpers/view_fixture.h"

namespace kortest {
namespace {

using Numbers = std::vector<UINT>;

class ListUpdate : public ViewTest {
protected:
    ListUpdate() { createList(); }

    LONG update(LONG index, DWORD columns, const std::vector<LPCWSTR>& texts) const {
        return KorListView_UpdateItem(list, index, texts.data(), columns, 77, 2, LVIS_SELECTED,
                                      LVIS_SELECTED | LVIS_FOCUSED);
    }
};

TEST_F(ListUpdate, AppendsARowToAnEmptyList) {
    EXPECT_EQ(update(-1, 3, {L"a", L"b", L"c"}), 0);
    ASSERT_EQ(rowCount(list), 1);
    EXPECT_EQ(rowText(0, 0), "a");
    EXPECT_EQ(rowText(0, 1), "b");
    EXPECT_EQ(rowText(0, 2), "c");
    EXPECT_EQ(row(0).lParam, 77);
    EXPECT_EQ(row(0).iImage, 2);
    EXPECT_EQ(row(0).state, UINT{LVIS_SELECTED});
}

TEST_F(ListUpdate, AppendsBehindTheLastRow) {
    fill({L"x", L"y"});
    EXPECT_EQ(update(-1, 1, {L"a"}), 2);
    EXPECT_EQ(update(-5, 1, {L"b"}), 3);
    EXPECT_EQ(rows(), "x|y|a|b");
}

TEST_F(ListUpdate, ReplacesARow) {
    fill({L"x", L"y", L"z"});
    EXPECT_EQ(update(1, 2, {L"a", L"b"}), 1);
    EXPECT_EQ(rows(), "x|a|z");
    EXPECT_EQ(rowText(1, 1), "b");
    EXPECT_EQ(row(1).lParam, 77);
    EXPECT_EQ(row(1).iImage, 2);
    EXPECT_EQ(row(0).lParam, 100);
}

TEST_F(ListUpdate, OfARowThatIsNotThereFails) {
    fill({L"x"});
    EXPECT_EQ(update(1, 2, {L"a", L"b"}), -1);
    EXPECT_EQ(update(0x7FFFFFFF, 2, {L"a", L"b"}), -1);
    EXPECT_EQ(rows(), "x");
}

TEST_F(ListUpdate, WithNoneOrOneColumnSetsNoOtherText) {
    watchMessages();
    EXPECT_EQ(update(-1, 0, {L"a"}), 0);
    EXPECT_EQ(update(-1, 1, {L"b"}), 1);
    EXPECT_EQ(messages(),
              (Numbers{LVM_GETITEMCOUNT, LVM_INSERTITEMW, LVM_GETITEMCOUNT, LVM_INSERTITEMW}));
}

TEST_F(ListUpdate, TakesTheLowEightBitsOfTheColumns) {
    watchMessages();
    update(-1, 0xFFFFFF02, {L"a", L"b"});
    EXPECT_EQ(messages(), (Numbers{LVM_GETITEMCOUNT, LVM_INSERTITEMW, LVM_SETITEMTEXTW}));
    sent.clear();
    update(0, 0x100, {L"a"});
    EXPECT_EQ(messages(), (Numbers{LVM_SETITEMW}));
}

TEST_F(ListUpdate, HandsOverTheWholeRow) {
    watchMessages();
    const std::vector<LPCWSTR> texts = {L"first", L"b", L"c"};
    update(-1, 3, texts);
    ASSERT_EQ(sent.size(), 4u);
    const LVITEMW& item = sent[1].item;
    EXPECT_EQ(sent[1].window, list);
    EXPECT_EQ(item.mask, 15u);
    EXPECT_EQ(item.iItem, 0);
    EXPECT_EQ(item.iSubItem, 0);
    EXPECT_EQ(item.state, UINT{LVIS_SELECTED});
    EXPECT_EQ(item.stateMask, UINT{LVIS_SELECTED | LVIS_FOCUSED});
    EXPECT_EQ(item.pszText, texts[0]);
    EXPECT_EQ(item.cchTextMax, 5);
    EXPECT_EQ(item.iImage, 2);
    EXPECT_EQ(item.lParam, 77);
    for (size_t i = 1; i < 3; ++i) {
        EXPECT_EQ(sent[i + 1].message, UINT{LVM_SETITEMTEXTW});
        EXPECT_EQ(sent[i + 1].wParam, 0u);
        EXPECT_EQ(sent[i + 1].item.iSubItem, static_cast<int>(i));
        EXPECT_EQ(sent[i + 1].item.pszText, texts[i]);
    }
}

TEST_F(ListUpdate, AnswersWhereTheListPutTheRow) {
    DestroyWindow(list);
    createList(2, LVS_SORTASCENDING);
    update(-1, 2, {L"m", L"1"});
    EXPECT_EQ(update(-1, 2, {L"a", L"2"}), 0);
    EXPECT_EQ(rows(), "a|m");
    EXPECT_EQ(rowText(0, 1), "2") << "the other columns go to the same row";
    EXPECT_EQ(rowText(1, 1), "1");
}

TEST_F(ListUpdate, ThatCannotInsertFails) {
    watchMessages();
    answer = [](const SentMessage& message, LRESULT* result) {
        *result = -1;
        return message.message == LVM_INSERTITEMW;
    };
    EXPECT_EQ(update(-1, 3, {L"a", L"b", L"c"}), -1);
    EXPECT_EQ(messages(), (Numbers{LVM_GETITEMCOUNT, LVM_INSERTITEMW}));
}

TEST_F(ListUpdate, DoesNotMindAColumnThatCannotBeSet) {
    watchMessages();
    answer = [](const SentMessage& message, LRESULT*) {
        return message.message == LVM_SETITEMTEXTW;
    };
    EXPECT_EQ(update(-1, 3, {L"a", L"b", L"c"}), 0);
    EXPECT_EQ(sent.size(), 4u);
}

TEST_F(ListUpdate, TakesNullTextsAsEmpty) {
    EXPECT_EQ(update(-1, 3, {nullptr, nullptr, L"c"}), 0);
    EXPECT_EQ(rowText(0, 0), "");
    EXPECT_EQ(rowText(0, 1), "");
    EXPECT_EQ(rowText(0, 2), "c");
}

TEST_F(ListUpdate, PassesTheCallbackMarkOn) {
    onNotify = [](const NMHDR& header, LPARAM data) {
        if (header.code != LVN_GETDISPINFOW) return;
        auto& request = *reinterpret_cast<NMLVDISPINFOW*>(data);
        if (request.item.mask & LVIF_TEXT)
            lstrcpynW(request.item.pszText, request.item.iSubItem ? L"asked 1" : L"asked 0",
                      request.item.cchTextMax);
    };
    EXPECT_EQ(update(-1, 2, {LPSTR_TEXTCALLBACKW, LPSTR_TEXTCALLBACKW}), 0);
    EXPECT_EQ(rowText(0, 0), "asked 0");
    EXPECT_EQ(rowText(0, 1), "asked 1");
}

TEST_F(ListUpdate, WithoutTextsOrWindowFails) {
    watchMessages();
    const LPCWSTR texts[] = {L"a"};
    EXPECT_EQ(KorListView_UpdateItem(list, -1, nullptr, 1, 0, 0, 0, 0), -1);
    EXPECT_EQ(KorListView_UpdateItem(nullptr, -1, texts, 1, 0, 0, 0, 0), -1);
    DestroyWindow(list);
    EXPECT_EQ(KorListView_UpdateItem(list, -1, texts, 1, 0, 0, 0, 0), -1);
    EXPECT_EQ(KorListView_UpdateItem(list, 0, texts, 1, 0, 0, 0, 0), -1);
    EXPECT_EQ(messages(), Numbers{});
}

TEST_F(ListUpdate, SurvivesAListThatGoesMeanwhile) {
    watchMessages();
    answer = [this](const SentMessage& message, LRESULT*) {
        if (message.message == LVM_SETITEMTEXTW) DestroyWindow(list);
        return false;
    };
    EXPECT_EQ(update(-1, 3, {L"a", L"b", L"c"}), 0) << "as the list answered";
    EXPECT_EQ(sent.size(), 4u);
}

}  // namespace
}  // namespace kortest

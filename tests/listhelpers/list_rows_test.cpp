// Deleting rows, the selection, and the row under the pointer.
#include "listhelpers/view_fixture.h"

namespace kortest {
namespace {

using Numbers = std::vector<UINT>;

class ListRows : public ViewTest {
protected:
    ListRows() { createList(); }

    // From now on what the library frees is written down, and freed.
    void watchFree() {
        spy.watch("free");
        spy.replace("free", [this](ULONG_PTR* arguments) {
            freed.push_back(arguments[0]);
            return spy.callReal("free", arguments);
        });
    }

    void setParam(int index, const void* object) const {
        LVITEMW item{};
        item.mask = LVIF_PARAM;
        item.iItem = index;
        item.lParam = reinterpret_cast<LPARAM>(object);
        SendMessageW(list, LVM_SETITEMW, 0, reinterpret_cast<LPARAM>(&item));
    }

    std::vector<ULONG_PTR> freed;
};

TEST_F(ListRows, AreAllDeleted) {
    fill({L"a", L"b", L"c"});
    watchFree();
    EXPECT_EQ(KorListView_DeleteAll(list, FALSE, FALSE), TRUE);
    EXPECT_EQ(rowCount(list), 0);
    EXPECT_TRUE(freed.empty());
}

TEST_F(ListRows, AreDeletedFromTheLastToTheFirst) {
    fill({L"a", L"b", L"c"});
    watchMessages();
    KorListView_DeleteAll(list, FALSE, FALSE);
    EXPECT_EQ(messages(),
              (Numbers{LVM_GETITEMCOUNT, LVM_DELETEITEM, LVM_DELETEITEM, LVM_DELETEITEM}));
    EXPECT_EQ(sent[1].wParam, 2u);
    EXPECT_EQ(sent[3].wParam, 0u);
}

TEST_F(ListRows, GiveTheAnswerToTheLastDeletion) {
    fill({L"a", L"b"});
    watchMessages();
    for (const LRESULT last : {7, 0}) {
        answer = [last](const SentMessage& message, LRESULT* result) {
            if (message.message != LVM_DELETEITEM) return false;
            *result = message.wParam == 0 ? last : 5;
            return true;
        };
        EXPECT_EQ(KorListView_DeleteAll(list, FALSE, FALSE), last);
    }
}

TEST_F(ListRows, OfAnEmptyListAreNone) {
    watchMessages();
    EXPECT_EQ(KorListView_DeleteAll(list, FALSE, TRUE), 0);
    EXPECT_EQ(messages(), (Numbers{LVM_GETITEMCOUNT}));
}

TEST_F(ListRows, ThatAreSelectedAreDeleted) {
    fill({L"a", L"b", L"c", L"d"});
    selectRow(1);
    selectRow(3);
    EXPECT_EQ(KorListView_DeleteAll(list, TRUE, FALSE), 0) << "row 0 stays";
    EXPECT_EQ(rows(), "a|c");
    selectRow(0);
    EXPECT_EQ(KorListView_DeleteAll(list, 2, FALSE), TRUE);
    EXPECT_EQ(rows(), "c");
}

TEST_F(ListRows, AllStayWhenNoneIsSelected) {
    fill({L"a", L"b", L"c"});
    EXPECT_EQ(KorListView_DeleteAll(list, TRUE, FALSE), 0);
    EXPECT_EQ(rows(), "a|b|c");
}

TEST_F(ListRows, ReleaseTheirObjects) {
    fill({L"a", L"b", L"c"});
    int* objects[] = {new int(1), new int(2), new int(3)};
    for (int i = 0; i < 3; ++i) setParam(i, objects[i]);
    selectRow(0);
    selectRow(2);
    watchFree();
    EXPECT_EQ(KorListView_DeleteAll(list, TRUE, TRUE), TRUE);
    EXPECT_EQ(freed, (std::vector<ULONG_PTR>{reinterpret_cast<ULONG_PTR>(objects[2]),
                                             reinterpret_cast<ULONG_PTR>(objects[0])}));
    EXPECT_EQ(rows(), "b");
    EXPECT_EQ(*objects[1], 2);
    delete objects[1];
}

TEST_F(ListRows, ReleaseNothingWithoutAnObject) {
    fill({L"a"});
    setParam(0, nullptr);
    EXPECT_EQ(KorListView_DeleteAll(list, FALSE, TRUE), TRUE);
    EXPECT_EQ(rowCount(list), 0);
}

TEST_F(ListRows, ReleaseTheirObjectBeforeTheyAreDeleted) {
    fill({L"a"});
    setParam(0, new int(1));
    watchFree();
    size_t freedAtDeletion = 99;
    onNotify = [&](const NMHDR& header, LPARAM) {
        if (header.code == LVN_DELETEITEM) freedAtDeletion = freed.size();
    };
    KorListView_DeleteAll(list, FALSE, TRUE);
    EXPECT_EQ(freedAtDeletion, 1u);
}

TEST_F(ListRows, ThatCannotBeReadReleaseNothing) {
    fill({L"a"});
    watchMessages();
    watchFree();
    answer = [](const SentMessage& message, LRESULT*) { return message.message == LVM_GETITEMW; };
    EXPECT_EQ(KorListView_DeleteAll(list, FALSE, TRUE), TRUE);
    EXPECT_EQ(freed, (std::vector<ULONG_PTR>{0}));
    ASSERT_EQ(sent.size(), 3u);
    EXPECT_EQ(sent[1].item.mask, UINT{LVIF_PARAM});
    EXPECT_EQ(sent[1].item.iItem, 0);
    EXPECT_EQ(sent[1].item.iSubItem, 0);
}

TEST_F(ListRows, MayGoByThemselvesMeanwhile) {
    fill({L"a", L"b", L"c", L"d"});
    for (int i = 0; i < 4; ++i) setParam(i, nullptr);
    watchMessages();
    watchFree();
    answer = [this](const SentMessage& message, LRESULT*) {
        if (message.message == LVM_GETITEMW && message.item.iItem == 2)
            SendMessageW(list, LVM_DELETEALLITEMS, 0, 0);
        return false;
    };
    EXPECT_EQ(KorListView_DeleteAll(list, FALSE, TRUE), 0);
    EXPECT_EQ(freed, (std::vector<ULONG_PTR>{0, 0, 0, 0}));
}

TEST_F(ListRows, MayLoseTheirListMeanwhile) {
    fill({L"a", L"b", L"c"});
    for (int i = 0; i < 3; ++i) setParam(i, new int(i));
    watchMessages();
    watchFree();
    answer = [this](const SentMessage& message, LRESULT*) {
        if (message.message == LVM_GETITEMSTATE && message.wParam == 1) DestroyWindow(list);
        return false;
    };
    for (int i = 0; i < 3; ++i) selectRow(i);
    EXPECT_EQ(KorListView_DeleteAll(list, TRUE, TRUE), 0);
    EXPECT_EQ(freed.size(), 1u)
        << "what the list still holds when it goes is the host's to release";
}

TEST_F(ListRows, OfNoWindowAreNone) {
    watchMessages();
    EXPECT_EQ(KorListView_DeleteAll(nullptr, FALSE, TRUE), 0);
    EXPECT_EQ(KorListView_GetSelection(nullptr), -1);
    DestroyWindow(list);
    EXPECT_EQ(KorListView_DeleteAll(list, FALSE, TRUE), 0);
    EXPECT_EQ(KorListView_GetSelection(list), -1);
    EXPECT_EQ(messages(), Numbers{});
}

TEST_F(ListRows, FirstSelectedIsFound) {
    fill({L"a", L"b", L"c", L"d", L"e", L"f", L"g"});
    EXPECT_EQ(KorListView_GetSelection(list), -1);
    selectRow(5);
    EXPECT_EQ(KorListView_GetSelection(list), 5);
    selectRow(2);
    EXPECT_EQ(KorListView_GetSelection(list), 2);
    selectRow(0);
    EXPECT_EQ(KorListView_GetSelection(list), 0);
}

TEST_F(ListRows, OfAnEmptyListAreNotSelected) { EXPECT_EQ(KorListView_GetSelection(list), -1); }

class ListPointer : public ListRows {
protected:
    ListPointer() { fill({L"first row", L"second row", L"third row"}); }

    // Inside a row's text, on the screen.
    POINT pointIn(int index) const {
        RECT area{};
        area.left = LVIR_LABEL;
        SendMessageW(list, LVM_GETITEMRECT, static_cast<WPARAM>(index),
                     reinterpret_cast<LPARAM>(&area));
        POINT point = {area.left + 3, (area.top + area.bottom) / 2};
        ClientToScreen(list, &point);
        return point;
    }

    LONG indexAt(POINT point) {
        spy.watch("GetMessagePos");
        spy.replace("GetMessagePos", [point](ULONG_PTR*) {
            return static_cast<ULONG_PTR>(static_cast<DWORD>(MAKELONG(point.x, point.y)));
        });
        return KorListView_GetIndexFromCurrentPosition(list);
    }
};

TEST_F(ListPointer, FindsTheRow) {
    for (int i = 0; i < 3; ++i) EXPECT_EQ(indexAt(pointIn(i)), i);
}

TEST_F(ListPointer, FindsNoneElsewhere) {
    EXPECT_EQ(indexAt({pointIn(2).x, 190}), -1) << "below the rows";
    EXPECT_EQ(indexAt({390, pointIn(1).y}), -1) << "right of the list";
}

TEST_F(ListPointer, MayBeLeftOfAndAboveTheScreensOrigin) {
    SetWindowPos(host, nullptr, -50, -200, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    const POINT point = pointIn(1);
    ASSERT_LT(point.x, 0);
    ASSERT_LT(point.y, 0);
    EXPECT_EQ(indexAt(point), 1);
}

TEST_F(ListPointer, IsTheOneOfTheLastMessage) {
    // The row goes to the pointer: on a desktop that is not shown the pointer cannot be moved.
    const POINT point = pointIn(2);
    POINT pointer{};
    GetCursorPos(&pointer);
    RECT place{};
    GetWindowRect(host, &place);
    SetWindowPos(host, nullptr, place.left + pointer.x - point.x, place.top + pointer.y - point.y,
                 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
    PostMessageW(host, WM_APP, 0, 0);
    MSG message{};
    ASSERT_TRUE(GetMessageW(&message, host, WM_APP, WM_APP));
    EXPECT_EQ(static_cast<short>(LOWORD(GetMessagePos())), pointer.x);
    EXPECT_EQ(KorListView_GetIndexFromCurrentPosition(list), 2);
}

TEST_F(ListPointer, IsOverNoRowOfNoWindow) {
    EXPECT_EQ(KorListView_GetIndexFromCurrentPosition(nullptr), -1);
    DestroyWindow(list);
    EXPECT_EQ(KorListView_GetIndexFromCurrentPosition(list), -1);
}

}  // namespace
}  // namespace kortest

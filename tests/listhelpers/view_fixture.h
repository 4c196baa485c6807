// What tests of the helpers need: real list views and tree views, and the messages sent to them.
#pragma once

#include <korcontrols/listhelpers.h>

#include "support/import_spy.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

namespace kortest {

// One message that the library sent, in order.
struct SentMessage {
    HWND window;
    UINT message;
    WPARAM wParam;
    LVITEMW item;            // of list messages that carry one, as it was handed over
    TVINSERTSTRUCTW insert;  // of TVM_INSERTITEMW
};

class ViewTest : public ::testing::Test {
protected:
    ViewTest();
    ~ViewTest() override;

    // A visible report list with some columns, and a tree.
    HWND createList(int columns = 3, DWORD style = 0);
    HWND createTree();

    static int rowCount(HWND list) {
        return static_cast<int>(SendMessageW(list, LVM_GETITEMCOUNT, 0, 0));
    }
    std::string rowText(int row, int column = 0) const;
    std::string rows() const;      // "a|b|c" of column 0
    LVITEMW row(int index) const;  // param, image and all state bits

    // Rows with these texts, and 100 + index as their lParam.
    void fill(const std::vector<const wchar_t*>& texts) const;
    void selectRow(int index) const;

    // From now on what the library sends is written down; `answer` may answer in the control's
    // stead.
    void watchMessages();
    std::vector<UINT> messages() const;

    HWND host = nullptr;
    HWND list = nullptr;
    HWND tree = nullptr;
    ImportSpy spy;
    std::vector<SentMessage> sent;
    std::function<bool(const SentMessage& message, LRESULT* result)> answer;
    std::function<void(const NMHDR& header, LPARAM data)> onNotify;

private:
    static LRESULT CALLBACK hostProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
};

}  // namespace kortest

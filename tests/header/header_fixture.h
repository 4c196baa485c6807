// What the tests of the header strip share.
#pragma once

#include "support/guard_heap.h"
#include "support/import_spy.h"
#include "support/input.h"
#include "support/recording_host.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace kortest {

// An item as HCM_GETITEM gives it, the copied text already freed.
struct HeaderItem {
    LRESULT result;
    std::wstring text;
    int size;
};

int InsertItem(HWND header, int index, const wchar_t* text, int size);
int AppendItem(HWND header, const wchar_t* text, int size);
int SetItem(HWND header, int index, const wchar_t* text, int size);
HeaderItem GetItem(HWND header, int index);

// The labels of the items 0 to count - 1.
std::vector<std::wstring> LabelsOf(HWND header);
std::vector<int> SizesOf(HWND header);

// Appends items labelled "0", "1", ... with these sizes.
void AppendSizes(HWND header, const std::vector<int>& sizes);

// Lets a strip paint everything now.
void Repaint(HWND header);

// Runs on a guard-page heap. When a test ends, its windows go, and the heap must be without faults
// and empty.
class HeaderTest : public ::testing::Test {
protected:
    HeaderTest();
    ~HeaderTest() override;

    // A strip of the given extent along its items and 16, or 30, across.
    HWND createHorizontal(int width = 400) { return host->createHeader(0, width, 16); }
    HWND createVertical(int height = 300) { return host->createHeader(HCS_VERTICAL, 30, height); }

    // Destroys the host with all its windows.
    void destroyWindows() { host.reset(); }

    // What was posted since the last call.
    Lines posted();

    ImportSpy spy;
    GuardHeap heap{spy};
    std::unique_ptr<RecordingHost> host = std::make_unique<RecordingHost>();
};

}  // namespace kortest

// The page of one print.
#pragma once

#include "faults/life.h"

namespace kortest {

// While it lives the print dialog gives this page. What is called goes into the life's notes.
class PrintedPage {
public:
    explicit PrintedPage(Life& life);
    ~PrintedPage();
    PrintedPage(const PrintedPage&) = delete;
    PrintedPage& operator=(const PrintedPage&) = delete;

    BOOL ask(HDC& dc);
    int tell(const char* function);
    int end();

private:
    Life& life_;
    HDC dc_ = nullptr;  // the library deletes it
    HBITMAP bitmap_ = nullptr;
};

}  // namespace kortest

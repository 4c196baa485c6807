// What is known of each function that the library imports: whether a call can fail and how that
// looks, what it makes, and what it gives back.
#pragma once

#include <windows.h>

#include <string>
#include <vector>

namespace kortest {

// What a control may have made and must give back.
enum class Resource {
    kNone,
    kLocalBlock,
    kRuntimeBlock,  // malloc's
    kGlobalBlock,
    kObject,
    kMemoryDC,
    kWindowDC,
    kPaint,  // between BeginPaint and EndPaint
    kMenu,
    kImageList,
    kPage,  // of a property sheet
    kWindow,
    kTimer,
    kClipboard,  // open
};

enum class Fallible {
    kYes,
    kNo,      // `why` says why not
    kAtLoad,  // the compiler's start-up code calls it, a control never does
};

// What else a call does that has to be followed.
enum class Step {
    kNone,
    kTakesIfItCan,  // takes what it takes only with a result
    kTakesPages,    // all pages of the sheet that it shows, whatever comes of it
    kSelects,
};

struct ImportFact {
    const char* name;
    Fallible fallible;
    ULONG_PTR failure = 0;  // the result of a call that fails, and the last error
    DWORD error = 0;
    Resource makes = Resource::kNone;  // the result is its handle
    Resource takes = Resource::kNone;  // this argument is
    int takenArgument = 0;
    const char* why = "";
    Step step = Step::kNone;
};

const std::vector<ImportFact>& ImportFacts();

// Null for a function that the table lacks.
const ImportFact* FindImportFact(const std::string& name);

// Whether this call can fail: a few functions fail for some arguments only.
bool CanFail(const ImportFact& fact, const ULONG_PTR* arguments);

// Answers in the stead of a call that fails. A few results depend on the arguments.
ULONG_PTR AnswerFailure(const ImportFact& fact, ULONG_PTR* arguments);

}  // namespace kortest

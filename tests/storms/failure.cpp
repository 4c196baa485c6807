#include "storms/failure.h"

#include <windows.h>

#include <cstdarg>
#include <cstdio>
#include <sstream>

namespace kortest {

Progress progress;
bool (*explainAccess)(const void* address, bool isWrite, const void* instruction) = nullptr;

namespace {

constexpr size_t kShownOperations = 20;

void Print(const std::string& text) {
    DWORD written = 0;
    WriteFile(GetStdHandle(STD_OUTPUT_HANDLE), text.data(), static_cast<DWORD>(text.size()),
              &written, nullptr);
}

std::string LastOperations() {
    std::ostringstream text;
    if (!progress.sequence || progress.sequence->empty()) return "";
    const size_t last = std::min(progress.step, progress.sequence->size() - 1);
    const size_t first = last + 1 > kShownOperations ? last + 1 - kShownOperations : 0;
    for (size_t i = first; i <= last; ++i) {
        text << "  " << i << ": ";
        Write(text, (*progress.sequence)[i]);
    }
    return text.str();
}

// "korcontrols.dll + 0x1234", so that a crash can be found in the library's map.
std::string PlaceOf(const void* address) {
    HMODULE module = nullptr;
    char path[MAX_PATH] = "?";
    GetModuleHandleExA(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                           GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                       static_cast<LPCSTR>(address), &module);
    if (module) GetModuleFileNameA(module, path, MAX_PATH);
    const std::string name = path;
    std::ostringstream text;
    text << name.substr(name.find_last_of('\\') + 1) << " + 0x" << std::hex
         << reinterpret_cast<ULONG_PTR>(address) - reinterpret_cast<ULONG_PTR>(module);
    return text.str();
}

LONG CALLBACK OnException(EXCEPTION_POINTERS* exception) {
    const EXCEPTION_RECORD& record = *exception->ExceptionRecord;
    switch (record.ExceptionCode) {
    case EXCEPTION_ACCESS_VIOLATION: {
        constexpr ULONG_PTR kExecute = 8;  // the device's procedures are called by such a fault
        if (record.ExceptionInformation[0] == kExecute) return EXCEPTION_CONTINUE_SEARCH;
        const auto* address = reinterpret_cast<const void*>(record.ExceptionInformation[1]);
        if (address == record.ExceptionAddress) return EXCEPTION_CONTINUE_SEARCH;
        const bool isWrite = record.ExceptionInformation[0] == 1;
        if (explainAccess) explainAccess(address, isWrite, record.ExceptionAddress);
        FailStorm("crash: %s of %p at %s", isWrite ? "write" : "read", address,
                  PlaceOf(record.ExceptionAddress).c_str());
    }
    case EXCEPTION_ILLEGAL_INSTRUCTION:
    case EXCEPTION_PRIV_INSTRUCTION:
    case EXCEPTION_INT_DIVIDE_BY_ZERO:
    case EXCEPTION_INT_OVERFLOW:
    case EXCEPTION_STACK_OVERFLOW:
    case EXCEPTION_DATATYPE_MISALIGNMENT:
        FailStorm("crash: exception %08lx at %s", record.ExceptionCode,
                  PlaceOf(record.ExceptionAddress).c_str());
    default: return EXCEPTION_CONTINUE_SEARCH;
    }
}

}  // namespace

void FailStorm(const char* format, ...) {
    char what[1024];
    va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(what, sizeof what, format, arguments);
    va_end(arguments);
    std::fflush(nullptr);
    std::ostringstream text;
    text << "FAILED --control " << progress.control << " --seed " << progress.seed << " --heap "
         << progress.heap << ", step " << progress.step << ": " << what << '\n'
         << LastOperations();
    Print(text.str());
    TerminateProcess(GetCurrentProcess(), 1);
    for (;;) Sleep(INFINITE);
}

void WatchForCrashes() { AddVectoredExceptionHandler(1, OnException); }

}  // namespace kortest

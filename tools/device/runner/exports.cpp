#include "runner/exports.h"

#include "public_headers.inc"
#include "runner/counters.h"
#include "runner/failure.h"
#include "runner/guest_calls.h"
#include "runner/image.h"

#include <algorithm>
#include <iterator>

namespace device {
namespace {

template <typename Result, typename... Arguments>
constexpr unsigned WordsOf(Result (*)(Arguments...)) {
    static_assert(((sizeof(Arguments) <= 4) && ...), "each argument is one word");
    return sizeof...(Arguments);
}

struct Export {
    const char* name;
    int ordinal;
    unsigned words;  // of arguments
    uint32_t address;
};

Export exports[] = {
#define KOR_EXPORT(name, ordinal) {#name, ordinal, WordsOf(decltype(&::name){}), 0},
#include "exports.inc"
#undef KOR_EXPORT
};

Export* FindExport(int ordinal) {
    const auto found = std::find_if(std::begin(exports), std::end(exports),
                                    [=](const Export& entry) { return entry.ordinal == ordinal; });
    return found == std::end(exports) ? nullptr : found;
}

}  // namespace

// Called by the exports below.
extern "C" uint64_t CallExport(int ordinal, const uint32_t* words) {
    const Export& entry = *FindExport(ordinal);
    ++counters().exportCalls;
    return CallGuest(entry.address, words, entry.words, reinterpret_cast<uint32_t>(words));
}

void ConnectExports() {
    for (const GuestExport& found : guest.exports) {
        Export* entry = FindExport(found.ordinal);
        if (!entry || found.name != entry->name) {
            Fail("the image exports %s as %d, the library does not", found.name.c_str(),
                 found.ordinal);
        }
        entry->address = found.address;
    }
    for (const Export& entry : exports) {
        if (!entry.address) Fail("the image does not export %s", entry.name);
    }
}

}  // namespace device

// Each export pushes its ordinal; the words that its caller pushed lie above the return address.
asm(R"(
_EnterExport:
    popl %eax
    leal 4(%esp), %ecx
    pushl %ecx
    pushl %eax
    call _CallExport
    addl $8, %esp
    ret
)");
#define KOR_EXPORT(name, ordinal)                                                                  \
    asm(".globl _" #name "\n_" #name ":\n    pushl $" #ordinal "\n    jmp _EnterExport\n");
#include "exports.inc"
#undef KOR_EXPORT

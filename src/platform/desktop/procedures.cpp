#include "platform/procedures.h"

namespace kor {

FARPROC FindProcedure(HMODULE module, const wchar_t* name) {
    constexpr int kCapacity = 64;
    constexpr wchar_t kLastLatin = 0x7E;
    char narrow[kCapacity];
    int length = 0;
    for (; name[length]; ++length) {
        if (length == kCapacity - 1 || name[length] > kLastLatin) return nullptr;
        narrow[length] = static_cast<char>(name[length]);
    }
    narrow[length] = '\0';
    return GetProcAddress(module, narrow);
}

}  // namespace kor

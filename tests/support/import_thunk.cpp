#include "support/import_thunk.h"

#include <cstdint>
#include <cstring>
#include <initializer_list>
#include <utility>

namespace kortest {
namespace {

constexpr size_t kCodeSize = 64 * 1024;
constexpr size_t kThunkSize = 64;

// Next free place for machine code, or nullptr.
uint8_t* NextThunkPlace() {
    static uint8_t* code = nullptr;
    static size_t used = kCodeSize;
    if (used + kThunkSize > kCodeSize) {
        code = static_cast<uint8_t*>(
            VirtualAlloc(nullptr, kCodeSize, MEM_COMMIT | MEM_RESERVE, PAGE_EXECUTE_READWRITE));
        if (!code) return nullptr;
        used = 0;
    }
    uint8_t* place = code + used;
    used += kThunkSize;
    return place;
}

class CodeWriter {
public:
    explicit CodeWriter(uint8_t* place) : next_(place) {}

    void bytes(std::initializer_list<int> values) {
        for (int value : values) *next_++ = static_cast<uint8_t>(value);
    }
    template <typename Value>
    void immediate(Value value) {
        std::memcpy(next_, &value, sizeof value);
        next_ += sizeof value;
    }

private:
    uint8_t* next_;
};

#ifdef _WIN64
// The first four arguments come in registers and have room on the stack just before the others.
void WriteThunk(uint8_t* place, ThunkTarget target, int index, int, CallingConvention) {
    CodeWriter code(place);
    code.bytes({0x48, 0x89, 0x4C, 0x24, 0x08});  // mov [rsp+8], rcx
    code.bytes({0x48, 0x89, 0x54, 0x24, 0x10});  // mov [rsp+16], rdx
    code.bytes({0x4C, 0x89, 0x44, 0x24, 0x18});  // mov [rsp+24], r8
    code.bytes({0x4C, 0x89, 0x4C, 0x24, 0x20});  // mov [rsp+32], r9
    code.bytes({0x48, 0x8D, 0x54, 0x24, 0x08});  // lea rdx, [rsp+8]
    code.bytes({0xB9});                          // mov ecx, index
    code.immediate(index);
    code.bytes({0x48, 0x83, 0xEC, 0x28});  // sub rsp, 40: room for four, and aligned
    code.bytes({0x48, 0xB8});              // mov rax, target
    code.immediate(target);
    code.bytes({0xFF, 0xD0});              // call rax
    code.bytes({0x48, 0x83, 0xC4, 0x28});  // add rsp, 40
    code.bytes({0xC3});                    // ret
}
#else
void WriteThunk(uint8_t* place, ThunkTarget target, int index, int argumentCount,
                CallingConvention convention) {
    const int popped = convention == CallingConvention::Stdcall ? argumentCount * 4 : 0;
    CodeWriter code(place);
    code.bytes({0x8D, 0x44, 0x24, 0x04});  // lea eax, [esp+4]
    code.bytes({0x50});                    // push eax
    code.bytes({0x68});                    // push index
    code.immediate(index);
    code.bytes({0xB8});  // mov eax, target
    code.immediate(target);
    code.bytes({0xFF, 0xD0});        // call eax
    code.bytes({0x83, 0xC4, 0x08});  // add esp, 8
    code.bytes({0xC2});              // ret popped
    code.immediate(static_cast<uint16_t>(popped));
}
#endif

template <size_t>
using Argument = ULONG_PTR;

// The compiler takes the next two functions for equal and would keep one of them: hence noipa.
template <size_t... places>
[[gnu::noipa]] ULONG_PTR CallStdcall(ULONG_PTR function, const ULONG_PTR* arguments,
                                     std::index_sequence<places...>) {
    using Function = ULONG_PTR(__stdcall*)(Argument<places>...);
    return reinterpret_cast<Function>(function)(arguments[places]...);
}

template <size_t... places>
[[gnu::noipa]] ULONG_PTR CallCdecl(ULONG_PTR function, const ULONG_PTR* arguments,
                                   std::index_sequence<places...>) {
    using Function = ULONG_PTR(__cdecl*)(Argument<places>...);
    return reinterpret_cast<Function>(function)(arguments[places]...);
}

template <int count>
ULONG_PTR CallWithCount(ULONG_PTR function, const ULONG_PTR* arguments, int wanted,
                        CallingConvention convention) {
    if (wanted == count) {
        constexpr auto places = std::make_index_sequence<static_cast<size_t>(count)>();
        return convention == CallingConvention::Cdecl ? CallCdecl(function, arguments, places)
                                                      : CallStdcall(function, arguments, places);
    }
    if constexpr (count > 0) {
        return CallWithCount<count - 1>(function, arguments, wanted, convention);
    }
    return 0;
}

}  // namespace

void* MakeThunk(ThunkTarget target, int index, int argumentCount, CallingConvention convention) {
    uint8_t* place = NextThunkPlace();
    if (place) WriteThunk(place, target, index, argumentCount, convention);
    return place;
}

ULONG_PTR CallWithArguments(ULONG_PTR function, const ULONG_PTR* arguments, int argumentCount,
                            CallingConvention convention) {
    return CallWithCount<kMostArguments>(function, arguments, argumentCount, convention);
}

}  // namespace kortest

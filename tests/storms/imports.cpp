#include "storms/failure.h"
#include "storms/library.h"

#include <cstring>
#include <initializer_list>
#include <iterator>
#include <set>
#include <string>

namespace kortest {
namespace {

// Signed, so that the machine code sees it pass 0.
int32_t callsLeft = INT32_MAX;

template <typename Visitor>
void VisitSlots(Visitor visit) {
    auto* base = reinterpret_cast<BYTE*>(StormModule());
    const auto* dos = reinterpret_cast<IMAGE_DOS_HEADER*>(base);
    const auto* nt = reinterpret_cast<IMAGE_NT_HEADERS*>(base + dos->e_lfanew);
    const auto& directory = nt->OptionalHeader.DataDirectory[IMAGE_DIRECTORY_ENTRY_IMPORT];
    auto* dll = reinterpret_cast<IMAGE_IMPORT_DESCRIPTOR*>(base + directory.VirtualAddress);
    for (; dll->Name; ++dll) {
        auto* name = reinterpret_cast<IMAGE_THUNK_DATA*>(base + dll->OriginalFirstThunk);
        auto* slot = reinterpret_cast<IMAGE_THUNK_DATA*>(base + dll->FirstThunk);
        for (; name->u1.AddressOfData; ++name, ++slot) {
            if (IMAGE_SNAP_BY_ORDINAL(name->u1.Ordinal)) continue;
            auto* entry = reinterpret_cast<IMAGE_IMPORT_BY_NAME*>(base + name->u1.AddressOfData);
            visit(reinterpret_cast<const char*>(base + dll->Name),
                  reinterpret_cast<const char*>(entry->Name),
                  reinterpret_cast<void**>(&slot->u1.Function));
        }
    }
}

void WriteSlot(void** slot, void* value) {
    DWORD protection = 0;
    VirtualProtect(slot, sizeof value, PAGE_READWRITE, &protection);
    *slot = value;
    VirtualProtect(slot, sizeof value, protection, &protection);
}

[[noreturn]] void OnUsedUp() {
    callsLeft = INT32_MAX;
    FailStorm("hang: one step makes calls of the platform without end");
}

uint8_t* CodePage(size_t bytes) {
    static uint8_t* code = nullptr;
    static size_t used = 0;
    constexpr size_t kSize = 64 * 1024;
    if (!code) {
        code = static_cast<uint8_t*>(
            VirtualAlloc(nullptr, kSize, MEM_COMMIT | MEM_RESERVE, PAGE_EXECUTE_READWRITE));
    }
    uint8_t* place = code + used;
    used += bytes;
    return used <= kSize ? place : nullptr;
}

template <typename Value>
uint8_t* Put(uint8_t* place, std::initializer_list<int> bytes, Value value) {
    for (const int byte : bytes) *place++ = static_cast<uint8_t>(byte);
    std::memcpy(place, &value, sizeof value);
    return place + sizeof value;
}

// Takes one off callsLeft, and goes on with `target`: arguments and stack are untouched.
void* MakeCounter(void* target) {
    uint8_t* const begin = CodePage(48);
    if (!begin) return target;
    uint8_t* end = begin;
#ifdef _WIN64
    end = Put(end, {0x48, 0xB8}, &callsLeft);                      // mov rax, &callsLeft
    end = Put(end, {0xFF, 0x08, 0x78}, static_cast<uint8_t>(12));  // dec [rax]; js used up
    end = Put(end, {0x48, 0xB8}, target);                          // mov rax, target
    end = Put(end, {0xFF}, static_cast<uint8_t>(0xE0));            // jmp rax
    end = Put(end, {0x48, 0xB8}, &OnUsedUp);                       // used up: mov rax, OnUsedUp
    Put(end, {0xFF}, static_cast<uint8_t>(0xE0));                  // jmp rax
#else
    end = Put(end, {0xFF, 0x0D}, &callsLeft);         // dec [callsLeft]
    end = Put(end, {0x78}, static_cast<uint8_t>(7));  // js used up
    end = Put(end, {0xB8}, target);                   // mov eax, target
    end = Put(end, {0xFF}, static_cast<uint8_t>(0xE0));
    end = Put(end, {0xB8}, &OnUsedUp);  // used up: mov eax, OnUsedUp
    Put(end, {0xFF}, static_cast<uint8_t>(0xE0));
#endif
    return begin;
}

bool IsNameIn(const char* name, const std::set<std::string>& names) {
    return names.count(name) != 0;
}

}  // namespace

void* ReplaceImport(const char* name, void* function) {
    void* former = nullptr;
    VisitSlots([&](const char*, const char* found, void** slot) {
        if (std::strcmp(name, found) != 0) return;
        former = *slot;
        WriteSlot(slot, function);
    });
    return former;
}

void CountImportCalls() {
    // Variables, not functions; and what never ends calls one of the others as well.
    const std::set<std::string> left = {"_iob", "__initenv", "_fmode", "_commode", "_acmdln"};
    VisitSlots([&](const char* dll, const char* name, void** slot) {
        const std::string library = dll;
        if (library.find("CRT") != std::string::npos || library.find("crt") != std::string::npos) {
            return;
        }
        if (!IsNameIn(name, left)) WriteSlot(slot, MakeCounter(*slot));
    });
}

void AllowImportCalls(int32_t calls) { callsLeft = calls; }

}  // namespace kortest

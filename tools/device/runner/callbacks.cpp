#include "runner/callbacks.h"

#include "runner/counters.h"
#include "runner/failure.h"
#include "runner/guest_calls.h"
#include "runner/host_calls.h"
#include "runner/image.h"

#include <windows.h>

#include <unordered_map>

namespace device {
namespace {

constexpr int kProcessExecuteFlags = 34;
constexpr ULONG kExecuteDisable = 1;

std::unordered_map<uint32_t, Procedure> announced;

DWORD EntryOf(Procedure procedure) {
    switch (procedure) {
    case Procedure::Words2: return reinterpret_cast<DWORD>(&EnterWith2Words);
    case Procedure::Words3: return reinterpret_cast<DWORD>(&EnterWith3Words);
    case Procedure::Words4: return reinterpret_cast<DWORD>(&EnterWith4Words);
    default: return reinterpret_cast<DWORD>(&EnterCdecl);
    }
}

bool IsOwnCode(DWORD address) {
    MEMORY_BASIC_INFORMATION memory{};
    VirtualQuery(reinterpret_cast<void*>(address), &memory, sizeof memory);
    MEMORY_BASIC_INFORMATION own{};
    VirtualQuery(reinterpret_cast<void*>(&IsOwnCode), &own, sizeof own);
    return memory.AllocationBase == own.AllocationBase;
}

LONG CALLBACK OnFault(EXCEPTION_POINTERS* exception) {
    const EXCEPTION_RECORD& record = *exception->ExceptionRecord;
    if (record.ExceptionCode != EXCEPTION_ACCESS_VIOLATION) return EXCEPTION_CONTINUE_SEARCH;
    CONTEXT& context = *exception->ContextRecord;
    if (context.Eip - guest.base < guest.size) {
        const auto found = announced.find(context.Eip);
        if (found == announced.end()) {
            Fail("the host calls image + 0x%x, which was never handed out as a procedure",
                 static_cast<unsigned>(context.Eip - guest.base));
        }
        context.Eax = context.Eip;
        context.Eip = EntryOf(found->second);
        return EXCEPTION_CONTINUE_EXECUTION;
    }
    if (IsOwnCode(context.Eip)) {
        ReportRegisters(cpu);
        Fail("image + 0x%x: %s %08x, where there is no such memory",
             static_cast<unsigned>(cpu.r[arm::kPc] - 8 - guest.base),
             record.ExceptionInformation[0] == 1 ? "a write to" : "a read from",
             static_cast<unsigned>(record.ExceptionInformation[1]));
    }
    return EXCEPTION_CONTINUE_SEARCH;
}

}  // namespace

// Called by the entries of host_calls.cpp.
extern "C" uint64_t EnterFromHost(uint32_t function, const uint32_t* words, unsigned count) {
    ++counters().callbacks;
    return CallGuest(function, words, count, reinterpret_cast<uint32_t>(words));
}

void Announce(uint32_t address, Procedure procedure) {
    if (!guest.isCode(address)) return;
    const auto [place, isNew] = announced.emplace(address, procedure);
    if (!isNew && place->second != procedure) {
        Fail("image + 0x%x is handed out as procedures of two kinds",
             static_cast<unsigned>(address - guest.base));
    }
}

void CatchCallbacks() {
    using SetInformation = LONG(WINAPI*)(HANDLE, int, void*, ULONG);
    const auto setInformation = reinterpret_cast<SetInformation>(
        GetProcAddress(GetModuleHandleW(L"ntdll.dll"), "NtSetInformationProcess"));
    ULONG flags = kExecuteDisable;
    setInformation(GetCurrentProcess(), kProcessExecuteFlags, &flags, sizeof flags);
    AddVectoredExceptionHandler(1, OnFault);
}

}  // namespace device

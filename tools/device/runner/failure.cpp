#include "runner/failure.h"

#include "runner/image.h"

#include <windows.h>

#include <cstdarg>
#include <cstdio>

namespace device {
namespace {

// Bypasses the buffers of the C runtime: the process is about to end.
void Write(const char* text) {
    DWORD written = 0;
    WriteFile(GetStdHandle(STD_ERROR_HANDLE), text, static_cast<DWORD>(lstrlenA(text)), &written,
              nullptr);
}

}  // namespace

void Fail(const char* format, ...) {
    char text[512];
    va_list arguments;
    va_start(arguments, format);
    vsnprintf(text, sizeof text, format, arguments);
    va_end(arguments);
    std::fflush(nullptr);  // the test program's output so far
    Write("device: ");
    Write(text);
    Write("\n");
    TerminateProcess(GetCurrentProcess(), kFailureStatus);
    for (;;) Sleep(INFINITE);
}

void ReportRegisters(const arm::Cpu& cpu) {
    char text[128];
    for (unsigned i = 0; i < 16; i += 4) {
        std::snprintf(text, sizeof text, "device:   r%-2u %08x %08x %08x %08x\n", i,
                      static_cast<unsigned>(cpu.r[i]), static_cast<unsigned>(cpu.r[i + 1]),
                      static_cast<unsigned>(cpu.r[i + 2]), static_cast<unsigned>(cpu.r[i + 3]));
        Write(text);
    }
    std::snprintf(text, sizeof text,
                  "device:   instruction at image + 0x%x, lr at image + 0x%x, image at %08x\n",
                  static_cast<unsigned>(cpu.r[arm::kPc] - 8 - guest.base),
                  static_cast<unsigned>(cpu.r[arm::kLr] - guest.base),
                  static_cast<unsigned>(guest.base));
    Write(text);
}

void FailAtInstruction(arm::Cpu& cpu, const arm::Refusal& refusal) {
    std::fflush(nullptr);
    ReportRegisters(cpu);
    const bool isInImage = refusal.instruction - guest.base < guest.size;
    Fail("image + 0x%x: %s (instruction %08x, address %08x)",
         static_cast<unsigned>(refusal.instruction - guest.base), refusal.reason,
         isInImage ? *reinterpret_cast<unsigned*>(refusal.instruction) : 0u,
         static_cast<unsigned>(refusal.address));
}

}  // namespace device

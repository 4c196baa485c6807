#include "runner/profile.h"

#include "runner/failure.h"
#include "runner/image.h"

#include <windows.h>

#include <cstdio>
#include <vector>

namespace device {
namespace {

constexpr wchar_t kVariable[] = L"KORCONTROLS_DEVICE_PROFILE";

std::wstring file;               // empty without a profile
std::vector<uint64_t> counts;    // by an instruction's word index in the code
std::vector<uint64_t> onBehalf;  // the same for helpers, by the word index of their call

uint32_t PlaceOf(uint32_t address) { return (address - guest.codeBegin) / 4; }

// Indexes are written as offsets into the image, like those of a link map without its base.
void WriteCounts(FILE* out, const char* kind, const std::vector<uint64_t>& of) {
    for (size_t i = 0; i < of.size(); ++i) {
        if (!of[i]) continue;
        const auto offset = guest.codeBegin - guest.base + 4 * static_cast<uint32_t>(i);
        std::fprintf(out, "%s %08x %llu\n", kind, static_cast<unsigned>(offset),
                     static_cast<unsigned long long>(of[i]));
    }
}

}  // namespace

void PrepareProfile() {
    wchar_t path[MAX_PATH] = L"";
    const DWORD length = GetEnvironmentVariableW(kVariable, path, MAX_PATH);
    if (length == 0 || length >= MAX_PATH) return;
    file = path;
    counts.resize(guest.codeSize / 4 + 1);
    onBehalf.resize(counts.size());
}

bool IsProfiling() { return !file.empty(); }

void RunProfiled(arm::Cpu& cpu, uint32_t low, uint32_t size, bool isSoftFloat) {
    const uint32_t caller = cpu.r[arm::kLr] - 4;
    const uint64_t before = cpu.executed;
    while (cpu.next - low < size) {
        ++counts[PlaceOf(cpu.next)];
        arm::Step(cpu);
    }
    if (isSoftFloat && guest.isCode(caller)) onBehalf[PlaceOf(caller)] += cpu.executed - before;
}

void WriteProfile() {
    if (!IsProfiling()) return;
    FILE* out = _wfopen(file.c_str(), L"w");
    if (!out) Fail("the profile cannot be written");
    WriteCounts(out, "executed", counts);
    WriteCounts(out, "helpers", onBehalf);
    std::fclose(out);
}

}  // namespace device

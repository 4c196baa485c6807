#include "runner/imports.h"

#include "arm/operands.h"
#include "runner/counters.h"
#include "runner/failure.h"
#include "runner/guest_calls.h"
#include "runner/holdings.h"
#include "runner/host_calls.h"
#include "runner/image.h"
#include "runner/import_table.h"
#include "runner/own_functions.h"
#include "runner/own_headers.h"

#include <windows.h>

#include <algorithm>
#include <cstring>
#include <deque>
#include <map>

namespace device {
namespace {

constexpr int kNoImport = -1;

struct Binding {
    std::string name;  // as the image has it
    Passing passing;
    int import;         // index in the table that tests see, or kNoImport
    uint32_t function;  // the host's, where it is in no table
    OwnFunction own;    // with Passing::Own
    bool takesProcedures;
    bool writes;         // to memory from its first argument on
    int lengthArgument;  // of such a function; or kUnknownLength
    HoldingCall holding;
};

std::deque<Binding> bindings;              // references stay valid while a call adds one
std::map<std::string, int> neededImports;  // of own functions, by name

// The desktop's libraries, by the names that its import libraries have for them.
const char* const kLibraries[] = {"USER32.dll", "GDI32.dll", "KERNEL32.dll", "COMCTL32.dll",
                                  "msvcrt.dll"};

// The desktop's function of this name; 0 when there is none.
uint32_t FindDesktopFunction(const std::string& name, std::string& library) {
    for (const char* candidate : kLibraries) {
        const auto found =
            reinterpret_cast<uint32_t>(GetProcAddress(LoadLibraryA(candidate), name.c_str()));
        if (!found) continue;
        library = candidate;
        return found;
    }
    return 0;
}

Binding Bind(const GuestImport& import) {
    const std::string desktopName = DesktopName(import.name);
    std::string library;
    const uint32_t function = FindDesktopFunction(desktopName, library);
    Binding binding{import.name,
                    Passing::Words,
                    kNoImport,
                    0,
                    FindOwnFunction(import.name),
                    TakesProcedures(import.name),
                    false,
                    kUnknownLength,
                    FindHolding(import.name)};
    binding.writes = FindDestination(import.name, binding.lengthArgument);
    if (!FindPassing(import.name, library, binding.passing)) {
        Fail("%s!%s: no entry says how it is called", import.library.c_str(), import.name.c_str());
    }
    if (function) {
        binding.import = AddImport(library, desktopName, function);
    } else if (binding.passing != Passing::Own) {
        Fail("%s!%s: the desktop has no such function", import.library.c_str(),
             import.name.c_str());
    }
    return binding;
}

// The argument words of a call that the guest makes, the first four from registers.
struct Words {
    explicit Words(const arm::Cpu& machine) {
        std::memcpy(values, machine.r, 16);
        std::memcpy(values + 4, reinterpret_cast<const void*>(machine.r[arm::kSp]),
                    sizeof values - 16);
    }
    uint32_t values[kHostWords];
};

// What the runtime writes for the guest must be the guest's: each page of it or, if the length is
// not known, its beginning.
void CheckDestination(arm::Cpu& machine, const Binding& binding, const uint32_t* words) {
    const uint32_t begin = words[0];
    const uint32_t length =
        binding.lengthArgument == kUnknownLength ? sizeof(wchar_t) : words[binding.lengthArgument];
    if (!length) return;
    if (begin + length < begin) arm::Refuse(machine, "a write around the end of memory", begin);
    constexpr uint32_t kPage = 1u << arm::kPageBits;
    for (uint32_t at = begin; at - begin < length; at = (at | (kPage - 1)) + 1) {
        arm::CheckWrite(machine, at, 1);
    }
    arm::CheckWrite(machine, begin + length - 1, 1);
}

uint64_t BitsOf(double value) {
    uint64_t bits = 0;
    std::memcpy(&bits, &value, sizeof bits);
    return bits;
}

uint64_t CallBound(const Binding& binding, const uint32_t* words) {
    const uint32_t target =
        binding.import == kNoImport ? binding.function : ImportTarget(binding.import);
    switch (binding.passing) {
    case Passing::DoubleResult: return BitsOf(CallHostForDouble(target, words));
    case Passing::Own: return binding.own(target, words);
    default: return CallHost(target, words);
    }
}

}  // namespace

void BindImports() {
    for (const GuestImport& import : guest.imports) {
        bindings.push_back(Bind(import));
        for (const std::string& name : NeededBy(import.name)) {
            std::string library;
            const uint32_t function = FindDesktopFunction(name, library);
            neededImports[name] = AddImport(library, name, function);
        }
        *import.slot = ImportAddress(static_cast<unsigned>(bindings.size() - 1));
    }
}

uint64_t CallImportedFunction(unsigned index, arm::Cpu& machine, bool& isWide) {
    if (index >= bindings.size()) Fail("a jump to an import that does not exist");
    ++counters().importCalls;
    const Binding& binding = bindings[index];
    const Words words(machine);
    if (binding.takesProcedures) AnnounceProcedures(binding.name, words.values);
    if (binding.writes) CheckDestination(machine, binding, words.values);
    const uint64_t result = CallBound(binding, words.values);
    isWide = binding.passing == Passing::DoubleResult;
    NoteHolding(binding.holding, words.values, static_cast<uint32_t>(result));
    return result;
}

uint32_t CallDesktop(const std::string& name, std::initializer_list<uint32_t> words) {
    uint32_t arguments[kHostWords] = {};
    std::copy(words.begin(), words.end(), arguments);
    return static_cast<uint32_t>(CallHost(ImportTarget(neededImports.at(name)), arguments));
}

uint32_t GuestAddressOf(uint32_t function) {
    if (!function) return 0;
    for (size_t i = 0; i < bindings.size(); ++i) {
        if (bindings[i].import == kNoImport && bindings[i].function == function) {
            return ImportAddress(static_cast<unsigned>(i));
        }
    }
    bindings.push_back({"", Passing::Words, kNoImport, function, nullptr, false, false, 0, {}});
    return ImportAddress(static_cast<unsigned>(bindings.size() - 1));
}

}  // namespace device

// The table of imports is held against what the library imports.
#include "faults/import_facts.h"

#include "device/device_counters.h"
#include "support/import_spy.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>

namespace kortest {
namespace {

using Names = std::set<std::string>;

Names Imported() {
    Names names;
    for (const std::string& name : ImportNames(LibraryModule()))
        names.insert(name.substr(name.find('!') + 1));
    return names;
}

TEST(ImportFacts, NameEachFunctionOnce) {
    std::map<std::string, int> lines;
    for (const ImportFact& fact : ImportFacts()) ++lines[fact.name];
    for (const auto& [name, count] : lines) EXPECT_EQ(count, 1) << name;
}

TEST(ImportFacts, SayWhyACallCannotFail) {
    for (const ImportFact& fact : ImportFacts())
        EXPECT_EQ(fact.fallible == Fallible::kYes, fact.why[0] == '\0') << fact.name;
}

TEST(ImportFacts, HoldEveryFunctionThatIsImported) {
    for (const std::string& name : Imported())
        EXPECT_NE(FindImportFact(name), nullptr) << name << " is not sorted";
}

// What the library, or on the device its stand-in, does not import, though others do.
const Names kNotFor32Bits = {"GetWindowLongPtrW",
                             "LocalSize",
                             "SetWindowLongPtrW",
                             "__iob_func",
                             "ceil",
                             "cos",
                             "floor",
                             "memcpy",
                             "memset",
                             "pow",
                             "sin",
                             "sqrt",
                             "swprintf",
                             "wcstod"};
const Names kNotFor64Bits = {"FreeLibrary",
                             "GetModuleHandleA",
                             "LoadLibraryA",
                             "LocalSize",
                             "SetWindowLongW",
                             "_iob",
                             "ceil",
                             "cos",
                             "floor",
                             "memcpy",
                             "memset",
                             "pow",
                             "sin",
                             "sqrt",
                             "swprintf",
                             "wcstod"};
const Names kNotForDevice = {"GdiFlush",          "GetModuleFileNameW", "GetWindowLongPtrW",
                             "SetWindowLongPtrW", "_snwprintf",         "_wtof",
                             "lstrcmpiW"};

bool IsDevice() { return device::FindCounters() != nullptr; }

// The device's library has no start-up code of a desktop's compiler.
Names NotImportedHere() {
    if (!IsDevice()) return sizeof(void*) == 4 ? kNotFor32Bits : kNotFor64Bits;
    Names names = kNotForDevice;
    for (const ImportFact& fact : ImportFacts())
        if (fact.fallible == Fallible::kAtLoad) names.insert(fact.name);
    return names;
}

Names NotImported() {
    const Names imported = Imported();
    Names names;
    for (const ImportFact& fact : ImportFacts())
        if (!imported.count(fact.name)) names.insert(fact.name);
    return names;
}

TEST(ImportFacts, HoldNoFunctionThatIsNotImported) {
    EXPECT_EQ(NotImported(), NotImportedHere());
    for (const std::string& name : kNotFor32Bits)
        EXPECT_FALSE(kNotFor64Bits.count(name) && kNotForDevice.count(name)) << name;
}

TEST(ImportFacts, EveryFunctionThatCanFailCanBeSpiedOn) {
    for (const ImportFact& fact : ImportFacts()) {
        int count = 0;
        auto convention = CallingConvention::Stdcall;
        if (fact.fallible != Fallible::kYes) continue;
        EXPECT_TRUE(FindImportSignature(fact.name, &count, &convention)) << fact.name;
        EXPECT_LT(fact.takenArgument, std::max(count, 1)) << fact.name;
    }
}

}  // namespace
}  // namespace kortest

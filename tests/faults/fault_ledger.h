// What the library has made and not given back, and what it has selected into which DC.
#pragma once

#include "faults/import_facts.h"
#include "support/import_spy.h"

#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace kortest {

class FaultLedger {
public:
    // From each watched call, after it.
    void note(const ImportFact& fact, const WatchedCall& call);

    void clear();

    // Something that was made for the library by others, or is the host's to give back now.
    void add(Resource resource, ULONG_PTR handle, const std::string& maker);
    void forget(Resource resource, ULONG_PTR handle);

    // The oldest of what this function made; false when there is none.
    bool forgetOldest(const std::string& maker);

    // Frees the local block that holds this text; false when there is none.
    bool freeText(const std::wstring& text);

    // Frees what blocks are left, so that the heap is empty.
    void freeBlocks();

    // One line for each thing that is left; what went with its window is not.
    std::vector<std::string> leftovers() const;

    // One line for each object that was deleted while it was selected, and for each DC that was
    // given back, or is left, with an object of the library's in it.
    std::vector<std::string> selections() const;

    // The blocks that LocalReAlloc was refused.
    const std::set<ULONG_PTR>& blocksNotResized() const { return blocksNotResized_; }

private:
    struct Entry {
        std::string maker;
        int number;   // in order of making
        HWND window;  // of a timer
    };
    struct Selected {
        ULONG_PTR original;
        ULONG_PTR current;
    };
    struct Context {
        std::vector<Selected> selected;
        bool isSpoilt = false;  // a selection into it has failed
    };

    using Key = std::pair<Resource, ULONG_PTR>;

    void take(const ImportFact& fact, const WatchedCall& call);
    void forgetAll(Resource resource);
    void noteSelection(const WatchedCall& call);
    void noteDeletion(ULONG_PTR object);
    ULONG_PTR
    ownIn(const Context& context) const;  // an object of the library's; stock ones may stay
    void leaveContext(ULONG_PTR dc, const char* how);

    std::map<Key, Entry> entries_;
    std::map<ULONG_PTR, Context> contexts_;
    std::vector<std::string> misuses_;
    std::set<ULONG_PTR> blocksNotResized_;
    int made_ = 0;
};

}  // namespace kortest

#include "faults/fault_ledger.h"

#include "support/guard_heap.h"

#include <algorithm>
#include <cstdio>
#include <cwchar>

namespace kortest {
namespace {

// Those that have no handle of their own are counted under one.
bool HasHandle(Resource resource) { return resource != Resource::kClipboard; }

std::string HexText(ULONG_PTR value) {
    char text[24];
    std::snprintf(text, sizeof text, "%llx", static_cast<unsigned long long>(value));
    return text;
}

ULONG_PTR PaintContext(ULONG_PTR paint) {
    return reinterpret_cast<ULONG_PTR>(reinterpret_cast<const PAINTSTRUCT*>(paint)->hdc);
}

// Stock objects are nobody's; those of the host are left to it.
bool IsTrackedKind(ULONG_PTR object) {
    switch (GetObjectType(reinterpret_cast<HGDIOBJ>(object))) {
    case OBJ_PEN:
    case OBJ_BRUSH:
    case OBJ_FONT:
    case OBJ_BITMAP: return true;
    default: return false;
    }
}

}  // namespace

void FaultLedger::clear() {
    entries_.clear();
    contexts_.clear();
    misuses_.clear();
    blocksNotResized_.clear();
}

void FaultLedger::add(Resource resource, ULONG_PTR handle, const std::string& maker) {
    entries_[{resource, handle}] = {maker, ++made_, nullptr};
}

void FaultLedger::forget(Resource resource, ULONG_PTR handle) {
    entries_.erase({resource, handle});
}

bool FaultLedger::forgetOldest(const std::string& maker) {
    auto oldest = entries_.end();
    for (auto entry = entries_.begin(); entry != entries_.end(); ++entry) {
        if (entry->second.maker != maker) continue;
        if (oldest == entries_.end() || entry->second.number < oldest->second.number)
            oldest = entry;
    }
    if (oldest == entries_.end()) return false;
    entries_.erase(oldest);
    return true;
}

bool FaultLedger::freeText(const std::wstring& text) {
    for (auto entry = entries_.begin(); entry != entries_.end(); ++entry) {
        if (entry->first.first != Resource::kLocalBlock) continue;
        const auto* words = reinterpret_cast<const wchar_t*>(entry->first.second);
        if (std::wcsncmp(words, text.c_str(), text.size() + 1) != 0) continue;
        ReleaseLocal(reinterpret_cast<void*>(entry->first.second));
        entries_.erase(entry);
        return true;
    }
    return false;
}

void FaultLedger::freeBlocks() {
    for (const auto& [key, entry] : entries_) {
        const bool isBlock =
            key.first == Resource::kLocalBlock || key.first == Resource::kRuntimeBlock;
        if (isBlock) ReleaseLocal(reinterpret_cast<void*>(key.second));
    }
}

void FaultLedger::note(const ImportFact& fact, const WatchedCall& call) {
    if (fact.step == Step::kSelects) noteSelection(call);
    if (fact.step == Step::kTakesPages) forgetAll(Resource::kPage);
    if (fact.takes != Resource::kNone) take(fact, call);
    if (fact.makes == Resource::kNone || !call.result) return;
    add(fact.makes, HasHandle(fact.makes) ? call.result : 0, call.name);
    if (fact.makes == Resource::kTimer) {
        entries_[{fact.makes, call.result}].window = reinterpret_cast<HWND>(call.arguments[0]);
    }
}

void FaultLedger::forgetAll(Resource resource) {
    const auto first = entries_.lower_bound({resource, 0});
    auto last = first;
    while (last != entries_.end() && last->first.first == resource) ++last;
    entries_.erase(first, last);
}

void FaultLedger::take(const ImportFact& fact, const WatchedCall& call) {
    // What could not be resized, and what the clipboard did not take, is kept.
    if (fact.step == Step::kTakesIfItCan && !call.result) {
        if (fact.takes == Resource::kLocalBlock) blocksNotResized_.insert(call.arguments[0]);
        return;
    }
    if (call.failed) return;
    const ULONG_PTR taken = call.arguments[fact.takenArgument];
    switch (fact.takes) {
    case Resource::kPaint:
        leaveContext(PaintContext(call.arguments[1]), "EndPaint");
        forget(Resource::kPaint, PaintContext(call.arguments[1]));
        return;
    case Resource::kTimer: forget(Resource::kTimer, call.arguments[1]); return;
    case Resource::kClipboard: forget(Resource::kClipboard, 0); return;
    case Resource::kWindowDC: leaveContext(taken, "ReleaseDC"); break;
    case Resource::kMemoryDC: contexts_.erase(taken); break;  // what is in it may go later
    case Resource::kObject: noteDeletion(taken); break;
    default: break;
    }
    forget(fact.takes, taken);
}

void FaultLedger::noteSelection(const WatchedCall& call) {
    Context& context = contexts_[call.arguments[0]];
    if (call.failed) context.isSpoilt = true;
    const ULONG_PTR selected = call.arguments[1], before = call.result;
    if (!before || !IsTrackedKind(selected)) return;
    auto& list = context.selected;
    const auto found = std::find_if(list.begin(), list.end(), [before](const Selected& place) {
        return place.current == before;
    });
    if (found == list.end()) {
        if (selected != before) list.push_back({before, selected});
    } else if (found->original == selected) {
        list.erase(found);
    } else {
        found->current = selected;
    }
}

void FaultLedger::noteDeletion(ULONG_PTR object) {
    for (const auto& [dc, context] : contexts_) {
        for (const Selected& place : context.selected) {
            if (place.current != object || context.isSpoilt) continue;
            misuses_.push_back("object " + HexText(object) + " deleted while selected in DC " +
                               HexText(dc));
        }
    }
}

ULONG_PTR FaultLedger::ownIn(const Context& context) const {
    if (context.isSpoilt) return 0;
    for (const Selected& place : context.selected)
        if (entries_.count({Resource::kObject, place.current})) return place.current;
    return 0;
}

void FaultLedger::leaveContext(ULONG_PTR dc, const char* how) {
    const auto found = contexts_.find(dc);
    if (found == contexts_.end()) return;
    if (const ULONG_PTR object = ownIn(found->second)) {
        misuses_.push_back(std::string(how) + " of DC " + HexText(dc) + " with object " +
                           HexText(object) + " in it");
    }
    contexts_.erase(found);
}

std::vector<std::string> FaultLedger::leftovers() const {
    std::vector<std::string> lines;
    for (const auto& [key, entry] : entries_) {
        const auto handle = reinterpret_cast<HWND>(key.second);
        if (key.first == Resource::kWindow && !IsWindow(handle)) continue;
        if (key.first == Resource::kTimer && !IsWindow(entry.window)) continue;
        lines.push_back("left behind: " + entry.maker + " " + HexText(key.second));
    }
    return lines;
}

std::vector<std::string> FaultLedger::selections() const {
    std::vector<std::string> lines = misuses_;
    for (const auto& [dc, context] : contexts_) {
        if (const ULONG_PTR object = ownIn(context))
            lines.push_back("left in DC " + HexText(dc) + ": object " + HexText(object));
    }
    return lines;
}

}  // namespace kortest

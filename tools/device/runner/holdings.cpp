#include "runner/holdings.h"

#include "runner/counters.h"

#include <unordered_map>
#include <unordered_set>

namespace device {
namespace {

struct Entry {
    const char* name;
    HoldingCall call;
};

constexpr Entry kEntries[] = {
    {"??2@YAPAXI@Z", {Holding::GivesBlock, 0}},
    {"??3@YAXPAX@Z", {Holding::TakesBlock}},
    {"LocalAlloc", {Holding::GivesBlock, 1}},
    {"LocalFree", {Holding::TakesLocalBlock}},
    {"LocalReAlloc", {Holding::ResizesBlock}},
    {"SetClipboardData", {Holding::TakesClipboardBlock}},
    {"free", {Holding::TakesBlock}},
    {"malloc", {Holding::GivesBlock, 0}},
    {"realloc", {Holding::ResizesBlock}},

    {"CreateCompatibleBitmap", {Holding::GivesObject}},
    {"CreateCompatibleDC", {Holding::GivesObject}},
    {"CreateDIBSection", {Holding::GivesObject}},
    {"CreateFontIndirectW", {Holding::GivesObject}},
    {"CreatePen", {Holding::GivesObject}},
    {"CreateRectRgn", {Holding::GivesObject}},
    {"CreateSolidBrush", {Holding::GivesObject}},
    {"GetDC", {Holding::GivesObject}},
    {"ImageList_LoadImage", {Holding::GivesObject}},
    {"DeleteDC", {Holding::TakesObject}},
    {"DeleteObject", {Holding::TakesObject}},
    {"ImageList_Destroy", {Holding::TakesObject}},
    {"ReleaseDC", {Holding::TakesWindowDC}},
};

std::unordered_map<uint32_t, uint32_t> blocks;  // sizes in bytes, by address
std::unordered_multiset<uint32_t> objects;

void ForgetBlock(uint32_t block) {
    const auto found = blocks.find(block);
    if (found == blocks.end()) return;
    counters().heapBytes -= found->second;
    blocks.erase(found);
}

void NoteBlock(uint32_t block, uint32_t size) {
    ForgetBlock(block);  // a block there that the host has freed
    blocks.emplace(block, size);
    counters().heapBytes += size;
}

void NoteObject(uint32_t handle) {
    objects.insert(handle);
    ++counters().gdiObjects;
}

void ForgetObject(uint32_t handle) {
    const auto found = objects.find(handle);
    if (found == objects.end()) return;
    objects.erase(found);
    --counters().gdiObjects;
}

}  // namespace

HoldingCall FindHolding(const std::string& guestName) {
    for (const Entry& entry : kEntries) {
        if (guestName == entry.name) return entry.call;
    }
    return {};
}

void NoteHolding(const HoldingCall& call, const uint32_t* words, uint32_t result) {
    switch (call.effect) {
    case Holding::None: return;
    case Holding::GivesBlock:
        if (result) NoteBlock(result, words[call.sizeArgument]);
        return;
    case Holding::ResizesBlock:
        if (!result) return;
        ForgetBlock(words[0]);
        NoteBlock(result, words[1]);
        return;
    case Holding::TakesBlock: ForgetBlock(words[0]); return;
    case Holding::TakesLocalBlock:
        if (!result) ForgetBlock(words[0]);
        return;
    case Holding::TakesClipboardBlock:
        if (result) ForgetBlock(words[1]);
        return;
    case Holding::GivesObject:
        if (result) NoteObject(result);
        return;
    case Holding::TakesObject:
        if (result) ForgetObject(words[0]);
        return;
    case Holding::TakesWindowDC:
        if (result) ForgetObject(words[1]);
        return;
    }
}

}  // namespace device

// The library as a storm sees it from behind: its imports, its heap, its drawing objects, and (in
// the program that is linked with its objects) its records.
#pragma once

#include <windows.h>

#include <cstdint>

namespace kortest {

class Stage;

// ---- What differs between the storm on the DLL and the one linked with the library's objects
// ------

// Whose import table the library's calls go through.
HMODULE StormModule();

// Whether the library's heap can be replaced without replacing the storm's own.
bool HasOwnImports();

// Looks at what no message and no export tells; ends the storm when something is not in order.
void CheckRecords(Stage& stage);

// Draws again what is on the stage with plain calls, and compares.
void ComparePictures(Stage& stage);

// ---- Imports
// ----------------------------------------------------------------------------------------

// Puts `function` into the import table's slot of this name. The former value, null when the module
// does not import it.
void* ReplaceImport(const char* name, void* function);

// Each call of the platform takes one off the allowance; FailStorm when it is used up.
void CountImportCalls();
void AllowImportCalls(int32_t calls);

// ---- Heap
// -------------------------------------------------------------------------------------------

// Gives the library blocks that end at a page without access. Blocks that were freed stay without
// access until many others have been freed after them.
void GuardLibraryHeap();

// Blocks that the library holds; -1 while the heap is the platform's own.
int LiveBlocks();

// The live blocks made after `count` of them were made, for a message.
const char* DescribeLiveBlocks(int madeBefore);
int BlocksMade();

// Frees a block that the library gave away.
void ReleaseLibraryBlock(void* block);

// ---- Drawing objects
// --------------------------------------------------------------------------------

// Follows what is made and given back.
void FollowHandles();

struct HandleCounts {
    int objects;    // pens, brushes, bitmaps, regions
    int fonts;      // apart, as a grid leaves the headers' font behind
    int contexts;   // DCs of memory and windows
    int paintings;  // BeginPaint without EndPaint
    int menus;
};
HandleCounts LiveHandles();

}  // namespace kortest

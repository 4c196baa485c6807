// The DLL's own global allocation operators, over the platform's C runtime. Out of memory they
// answer null; sources are compiled with -fcheck-new, so that callers may test for it.
#include <cstddef>
#include <cstdlib>
#include <new>

void* operator new(std::size_t size) { return std::malloc(size); }

void operator delete(void* memory) noexcept { std::free(memory); }

void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }

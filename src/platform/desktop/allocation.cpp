// The DLL's own global allocation operators, on top of the platform's C runtime. They return null
// when there is no memory; sources are compiled with -fcheck-new, so that callers may test for it.
#include <cstddef>
#include <cstdlib>
#include <new>

void* operator new(std::size_t size) { return std::malloc(size); }

void operator delete(void* memory) noexcept { std::free(memory); }

void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }

// Lets operator new fail at a chosen place. It is replaced for the whole test program.
#ifndef TESTS_WORKBOOK_FAILING_MEMORY_H
#define TESTS_WORKBOOK_FAILING_MEMORY_H

namespace workbook {

// While it lives, `allocations` more allocations succeed; then one fails, or, with `forGood`, all.
class MemoryShortage {
public:
    MemoryShortage(int allocations, bool forGood);
    ~MemoryShortage();
    // How often memory was refused in the latest shortage. None: it was never needed that much.
    static int refusals();

    MemoryShortage(const MemoryShortage&) = delete;
    MemoryShortage& operator=(const MemoryShortage&) = delete;
};

}  // namespace workbook

#endif

/// Counts what the heap is asked for.
#pragma once

#include <cstddef>

namespace DrawmereTest {

/// Counts the allocations of its thread, by `new`, `malloc` or `realloc`, from its making on.
class AllocationCounter {
public:
    AllocationCounter();

    /// Returns: the allocations so far.
    std::size_t getCount() const;

private:
    std::size_t before;
};

} // namespace DrawmereTest

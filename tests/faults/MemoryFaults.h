/// Makes allocations fail.
#pragma once

#include <cstddef>

namespace DrawmereTest {

/// Lets allocations of this thread fail, by `new`, `malloc` or any of their kin, the library's as
/// well as those of the libraries that it stands on.
class MemoryFaults {
public:
    enum Mode { NONE, ONE, ALL_FROM_THEN_ON };

    /// From its making to `end`, the allocation with this number fails, counted from 0.
    MemoryFaults(Mode mode, std::size_t number);
    MemoryFaults(const MemoryFaults&) = delete;
    MemoryFaults& operator=(const MemoryFaults&) = delete;
    ~MemoryFaults();

    /// Lets every allocation succeed again.
    static void end();

    /// Returns: how often memory was asked for since the making.
    static std::size_t countAsked();

    /// Returns: how many of these failed.
    static std::size_t countFailed();

    /// Returns: how many blocks of all threads are not freed.
    static std::ptrdiff_t countLive();
};

} // namespace DrawmereTest

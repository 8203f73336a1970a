/// Chunks of memory for trees: small documents take single ones, large ones take them from slabs.
#pragma once

#include "foundation/common/MoxChunkMemory.h"

namespace MoxCommonNS {

struct MoxSlab;

/// The head of a chunk; what it is used for follows.
struct alignas(8) MoxChunk {
    /// Chunks stand at multiples of this, so that a block finds its own.
    static constexpr std::size_t alignment = 32768;
    /// A little less, which leaves the general allocator its header and lets it pack chunks.
    static constexpr std::size_t size = alignment - 16;

    int users;     ///< the chunk goes with the last
    MoxSlab* slab; ///< borrowed; null for a chunk that stands alone

    char* begin();

    char* end() { return reinterpret_cast<char*>(this) + size; }

    /// Takes one from the users. Returns: how many are left.
    int drop();
};

/// Gives chunks to one thread, one after the other.
class MoxChunkSource {
public:
    /// What every chunk has room for.
    static constexpr std::size_t room = MoxChunk::size - 32;

    /// Returns: a chunk with one user. Throws: std::bad_alloc.
    MoxChunk* take();

    /// Begins anew with single chunks: what the last ones were taken for is gone.
    void close();

    /// The same while no slab is open. Returns: whether that was so.
    bool rewind();

private:
    MoxChunk* takeOfSlab();
    void closeSlab();

    MoxSlab* slab = nullptr; // owned, as one of its users
    std::size_t nextOfSlab = 0;
    int chunksInRow = 0;
};

} // namespace MoxCommonNS

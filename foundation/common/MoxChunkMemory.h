/// What heaps that cut blocks from chunks have in common.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <new>

#if defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define MOX_SANITIZED 1
#endif
#endif
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define MOX_SANITIZED 1
#endif

namespace MoxCommonNS {

/// Memory from the system, and the sums about it.
/// Throws: std::bad_alloc, where the system has none.
struct MoxChunkMemory {
    /// Whether a sanitizer watches, which wants to see every block by itself.
#ifdef MOX_SANITIZED
    static constexpr bool isWatched = true;
#else
    static constexpr bool isWatched = false;
#endif

    /// Returns: `size`, rounded up to a multiple of `alignment`, a power of two.
    static constexpr std::size_t roundUp(std::size_t size, std::size_t alignment) {
        return (size + alignment - 1) & ~(alignment - 1);
    }

    /// Returns: the chunk that `block` was cut from, where chunks stand at multiples of
    /// `alignment`.
    template <typename Chunk> static Chunk* findChunk(void* block, std::size_t alignment) {
        const std::size_t offset = reinterpret_cast<std::uintptr_t>(block) % alignment;
        return reinterpret_cast<Chunk*>(static_cast<char*>(block) - offset);
    }

    /// Returns: memory for a block too large to be cut. The caller frees it.
    static void* allocateBlock(std::size_t size) {
        void* block = std::malloc(size);
        if (!block) {
            throw std::bad_alloc();
        }
        return block;
    }

    /// Returns: memory for a chunk. The caller frees it.
    static void* allocateChunk(std::size_t alignment, std::size_t size) {
        void* memory = nullptr;
        if (posix_memalign(&memory, alignment, size) != 0) {
            throw std::bad_alloc();
        }
        return memory;
    }
};

} // namespace MoxCommonNS

/// The memory of path segments.
#pragma once

#include "DrawmereExport.h"

#include <cstddef>

namespace DrawmereNS {

/// Cuts blocks from large chunks, one behind the other. Segments come and go as paths do, so a
/// chunk is cut from its start again when all its blocks are gone, and no block is used again
/// before that. Each thread keeps the chunk that it cuts from; full ones go with their last block.
/// Threads: any may release any block. A build with a sanitizer takes every block from the general
/// allocator, so that the sanitizer sees it.
class DRAWMERE_API SVGSegmentHeap {
public:
    /// Returns: a block of `size` bytes, aligned to 8. Throws: std::bad_alloc.
    static void* allocate(std::size_t size);

    /// Gives a block back. `size`: as allocated. Ignores: a null.
    static void release(void* block, std::size_t size);
};

} // namespace DrawmereNS

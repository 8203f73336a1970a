/// The memory of trees: blocks that are cut one behind the other and given back together.
#pragma once

#include "DrawmereExport.h"

#include <cstddef>

namespace MoxCommonNS {

/// Cuts blocks from chunks and gives a chunk back when its last block is gone. A few blocks that
/// were released are used again, as a document that packs what is finished needs them; the rest is
/// not: that suits documents, which grow at their end and go as a whole, and it spares each node
/// the book-keeping of the general allocator.
/// Threads: each cuts from a chunk of its own, and any may release any block. A build with a
/// sanitizer takes every block from the general allocator, so that the sanitizer sees it.
class DRAWMERE_API MoxNodeHeap {
public:
    /// Returns: a block of `size` bytes, aligned to 8. Throws: std::bad_alloc.
    static void* allocate(std::size_t size);

    /// Gives a block back. `size`: as allocated or grown to. Ignores: a null.
    static void release(void* block, std::size_t size);

    /// Lets go of the blocks that this thread would use again, which keep their chunks, and keeps no
    /// more until `startReuse`: a document goes.
    static void stopReuse();

    /// Uses released blocks again.
    static void startReuse();

    /// Returns: memory of `MoxChunkSource::room` bytes, aligned to 8, for what is no node but lives
    /// as long. Throws: std::bad_alloc.
    static char* allocateChunk();

    /// Gives memory of `allocateChunk` back.
    static void releaseChunk(char* chunk);

    /// Makes a block of `size` bytes larger where it stands, which the newest block of the thread
    /// can be while its chunk has room. Returns: whether it has `newSize` bytes now.
    static bool growInPlace(void* block, std::size_t size, std::size_t newSize);
};

} // namespace MoxCommonNS

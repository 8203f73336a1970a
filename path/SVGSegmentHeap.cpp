#include "path/SVGSegmentHeap.h"

#include "foundation/common/MoxChunkMemory.h"
#include "foundation/common/MoxMutex.h"

#include <atomic>
#include <cstdlib>
#include <new>
#include <sys/mman.h>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxChunkMemory;
using MoxCommonNS::MoxMutex;

constexpr std::size_t largestBlock = MoxChunkMemory::isWatched ? 0 : 1024;

/// Chunks stand at multiples of their size, so that a block finds its own, and the system can back
/// each with one huge page. What is never cut takes up no memory.
constexpr std::size_t chunkSize = std::size_t{1} << 21;
constexpr std::size_t blockAlignment = 8;

/// The head of a chunk; its blocks follow.
struct alignas(16) Chunk {
    int users; // its blocks, and the thread that cuts from it

    char* begin() { return reinterpret_cast<char*>(this + 1); }

    char* end() { return reinterpret_cast<char*>(this) + chunkSize; }
};

constexpr std::size_t roundUp(std::size_t size) {
    return MoxChunkMemory::roundUp(size, blockAlignment);
}

/// Returns: how many users are left.
int drop(Chunk* chunk) {
    const int left = MoxMutex::interlockedDecrement(chunk->users);
    if (left == 0) {
        std::free(chunk);
    }
    return left;
}

/// Where a thread cuts its next block.
struct Cutter {
    char* cursor = nullptr;
    char* end = nullptr;
    Chunk* chunk = nullptr; // owned, as one of its users

    std::size_t room() const { return static_cast<std::size_t>(end - cursor); }

    void close() {
        if (chunk) {
            drop(chunk);
        }
        chunk = nullptr;
        cursor = nullptr;
        end = nullptr;
    }

    /// Makes room: in the same chunk when nobody else is left in it, otherwise in a new one.
    void renew();

private:
    bool isAlone() const {
        return chunk && std::atomic_ref(chunk->users).load(std::memory_order_acquire) == 1;
    }
};

// Found without a call: a few bytes fit into the block that every program keeps for such libraries.
[[gnu::tls_model("initial-exec")]] constinit thread_local Cutter cutter;

/// Gives the thread's chunk back when the thread ends.
struct ThreadEnd {
    bool isArmed = false;

    ~ThreadEnd() { cutter.close(); }
};

thread_local ThreadEnd threadEnd;

void Cutter::renew() {
    if (isAlone()) {
        cursor = chunk->begin();
        return;
    }
    const bool isFirst = !chunk;
    close();
    void* memory = MoxChunkMemory::allocateChunk(chunkSize, chunkSize);
    if (!isFirst) {
        // A wish, for long paths: without it the chunk is made of small pages.
        static_cast<void>(madvise(memory, chunkSize, MADV_HUGEPAGE));
    }
    threadEnd.isArmed = true; // the first use makes it, and so its end will come
    chunk = new (memory) Chunk{1};
    cursor = chunk->begin();
    end = chunk->end();
}

} // namespace

void* SVGSegmentHeap::allocate(std::size_t size) {
    const std::size_t rounded = roundUp(size);
    if (rounded > largestBlock) {
        return MoxChunkMemory::allocateBlock(size);
    }
    if (rounded > cutter.room()) {
        cutter.renew();
    }
    char* block = cutter.cursor;
    cutter.cursor += rounded;
    MoxMutex::interlockedIncrement(cutter.chunk->users);
    return block;
}

void SVGSegmentHeap::release(void* block, std::size_t size) {
    if (!block || roundUp(size) > largestBlock) {
        std::free(block);
        return;
    }
    Chunk* chunk = MoxChunkMemory::findChunk<Chunk>(block, chunkSize);
    if (drop(chunk) == 1 && chunk == cutter.chunk) {
        cutter.cursor = chunk->begin();
    }
}

} // namespace DrawmereNS

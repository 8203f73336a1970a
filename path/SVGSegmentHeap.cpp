#include "path/SVGSegmentHeap.h"

#include "foundation/common/MoxMutex.h"

#include <atomic>
#include <cstdint>
#include <cstdlib>
#include <new>
#include <sys/mman.h>

#if defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define SEGMENTS_SANITIZED 1
#endif
#endif
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define SEGMENTS_SANITIZED 1
#endif

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxMutex;

#ifdef SEGMENTS_SANITIZED
constexpr std::size_t largestBlock = 0;
#else
constexpr std::size_t largestBlock = 1024;
#endif

/// Chunks stand at multiples of their size, so that a block finds its own, and the system can back
/// each with one huge page. What is never cut takes up no memory.
constexpr std::size_t chunkSize = std::size_t{1} << 21;
constexpr std::size_t blockAlignment = 8;

/// The head of a chunk; its blocks follow.
struct alignas(16) Chunk {
    int users; // its blocks, and the thread that cuts from it

    char* begin() { return reinterpret_cast<char*>(this + 1); }

    char* end() { return reinterpret_cast<char*>(this) + chunkSize; }

    static Chunk* of(void* block) {
        const std::size_t offset = reinterpret_cast<std::uintptr_t>(block) % chunkSize;
        return reinterpret_cast<Chunk*>(static_cast<char*>(block) - offset);
    }
};

constexpr std::size_t roundUp(std::size_t size) {
    return (size + blockAlignment - 1) & ~(blockAlignment - 1);
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
    void* memory = nullptr;
    if (posix_memalign(&memory, chunkSize, chunkSize) != 0) {
        throw std::bad_alloc();
    }
    if (!isFirst) {
        // A wish, for long paths: without it the chunk is made of small pages.
        static_cast<void>(madvise(memory, chunkSize, MADV_HUGEPAGE));
    }
    threadEnd.isArmed = true; // the first use makes it, and so its end will come
    chunk = new (memory) Chunk{1};
    cursor = chunk->begin();
    end = chunk->end();
}

void* allocateLarge(std::size_t size) {
    void* block = std::malloc(size);
    if (!block) {
        throw std::bad_alloc();
    }
    return block;
}

} // namespace

void* SVGSegmentHeap::allocate(std::size_t size) {
    const std::size_t rounded = roundUp(size);
    if (rounded > largestBlock) {
        return allocateLarge(size);
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
    Chunk* chunk = Chunk::of(block);
    if (drop(chunk) == 1 && chunk == cutter.chunk) {
        cutter.cursor = chunk->begin();
    }
}

} // namespace DrawmereNS

#include "foundation/common/MoxNodeHeap.h"

#include "foundation/common/MoxChunkMemory.h"
#include "foundation/common/MoxMutex.h"

#include <cstdlib>
#include <new>
#include <sys/mman.h>

namespace MoxCommonNS {
namespace {

constexpr std::size_t largestBlock = MoxChunkMemory::isWatched ? 0 : 2048;

/// Chunks stand at multiples of this, so that a block finds its own.
constexpr std::size_t chunkAlignment = 32768;
/// A little less, which leaves the general allocator its header and lets it pack chunks.
constexpr std::size_t chunkSize = chunkAlignment - 16;
constexpr std::size_t blockAlignment = 8;

/// Large documents take their chunks from slabs, which the system can back with one huge page each.
constexpr std::size_t slabSize = std::size_t{1} << 21;
constexpr std::size_t chunksOfSlab = slabSize / chunkAlignment;
/// So many chunks in a row make a document large.
constexpr int chunksBeforeSlabs = 16;

struct Slab;

/// The head of a chunk; its blocks follow.
struct alignas(blockAlignment) Chunk {
    int users;  // its blocks, and the thread that cuts from it
    Slab* slab; // borrowed; null for a chunk that stands alone
};

/// The head of a slab's first chunk.
struct alignas(blockAlignment) Slab {
    Chunk firstChunk;
    int users; // its chunks, and the thread that cuts from it

    char* chunkAt(std::size_t index) {
        return reinterpret_cast<char*>(this) + index * chunkAlignment;
    }
};

constexpr std::size_t roundUp(std::size_t size) {
    return MoxChunkMemory::roundUp(size, blockAlignment);
}

void drop(Slab* slab) {
    if (MoxMutex::interlockedDecrement(slab->users) == 0) {
        std::free(slab);
    }
}

/// Returns: how many users are left; the chunk goes with the last.
int drop(Chunk* chunk) {
    const int left = MoxMutex::interlockedDecrement(chunk->users);
    if (left != 0) {
        return left;
    }
    if (chunk->slab) {
        drop(chunk->slab);
    } else {
        std::free(chunk);
    }
    return 0;
}

/// Where a thread cuts its next block.
struct Cutter {
    char* cursor = nullptr;
    char* end = nullptr;
    Chunk* chunk = nullptr; // owned, as one of its users
    Slab* slab = nullptr;   // owned, as one of its users
    std::size_t nextOfSlab = 0;
    int chunksInRow = 0;

    std::size_t room() const { return static_cast<std::size_t>(end - cursor); }

    bool isNewest(void* block, std::size_t size) const {
        return static_cast<char*>(block) + size == cursor;
    }

    void close() {
        closeChunk();
        closeSlab();
        chunksInRow = 0;
    }

    void renew();
    void rewind();

private:
    void closeChunk();
    void closeSlab();
    void openChunk(char* memory, std::size_t headSize, Slab* owner);
    void openChunkOfSlab();
};

// Every node asks for it: found without a call, as what is here from the start of a program is.
[[gnu::tls_model("initial-exec")]] constinit thread_local Cutter cutter;

/// Gives the thread's chunk back when the thread ends.
struct ThreadEnd {
    bool isArmed = false;

    ~ThreadEnd() { cutter.close(); }
};

thread_local ThreadEnd threadEnd;

void Cutter::closeChunk() {
    if (chunk && drop(chunk) == 0) {
        chunksInRow = 0; // what it was cut for is gone
    }
    chunk = nullptr;
    cursor = nullptr;
    end = nullptr;
}

void Cutter::closeSlab() {
    if (slab) {
        drop(slab);
    }
    slab = nullptr;
}

void Cutter::openChunk(char* memory, std::size_t headSize, Slab* owner) {
    chunk = new (memory) Chunk{1, owner};
    cursor = memory + headSize;
    end = memory + chunkSize;
}

void Cutter::openChunkOfSlab() {
    if (slab && nextOfSlab == chunksOfSlab) {
        closeSlab();
    }
    if (!slab) {
        void* memory = MoxChunkMemory::allocateChunk(slabSize, slabSize);
        // A wish: without it the slab is made of small pages.
        static_cast<void>(madvise(memory, slabSize, MADV_HUGEPAGE));
        slab = static_cast<Slab*>(memory);
        slab->users = 1;
        nextOfSlab = 0;
    }
    const std::size_t headSize = nextOfSlab == 0 ? sizeof(Slab) : sizeof(Chunk);
    MoxMutex::interlockedIncrement(slab->users);
    openChunk(slab->chunkAt(nextOfSlab), headSize, slab);
    ++nextOfSlab;
}

void Cutter::renew() {
    closeChunk();
    threadEnd.isArmed = true; // the first use makes it, and so its end will come
    if (++chunksInRow > chunksBeforeSlabs) {
        openChunkOfSlab();
        return;
    }
    closeSlab();
    openChunk(static_cast<char*>(MoxChunkMemory::allocateChunk(chunkAlignment, chunkSize)),
              sizeof(Chunk), nullptr);
}

/// Cuts from the beginning again where nothing stands any longer, so that one document after
/// another takes the memory of one. A slab goes back: what it was cut for was large.
void Cutter::rewind() {
    if (slab) {
        close();
        return;
    }
    cursor = reinterpret_cast<char*>(chunk) + sizeof(Chunk);
    chunksInRow = 0;
}

} // namespace

void* MoxNodeHeap::allocate(std::size_t size) {
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

void MoxNodeHeap::release(void* block, std::size_t size) {
    const std::size_t rounded = roundUp(size);
    if (!block || rounded > largestBlock) {
        std::free(block);
        return;
    }
    if (cutter.isNewest(block, rounded)) {
        cutter.cursor -= rounded;
    }
    Chunk* chunk = MoxChunkMemory::findChunk<Chunk>(block, chunkAlignment);
    if (drop(chunk) == 1 && chunk == cutter.chunk) {
        cutter.rewind(); // the thread itself is its only user
    }
}

bool MoxNodeHeap::growInPlace(void* block, std::size_t size, std::size_t newSize) {
    const std::size_t rounded = roundUp(size);
    const std::size_t newRounded = roundUp(newSize);
    if (!block || newRounded > largestBlock || !cutter.isNewest(block, rounded) ||
        newRounded - rounded > cutter.room()) {
        return false;
    }
    cutter.cursor += newRounded - rounded;
    return true;
}

} // namespace MoxCommonNS

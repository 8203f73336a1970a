#include "foundation/common/MoxNodeHeap.h"

#include "foundation/common/MoxChunkSource.h"
#include "foundation/common/MoxMutex.h"

#include <cstdlib>
#include <new>
#include <utility>

namespace MoxCommonNS {
namespace {

constexpr std::size_t largestBlock = MoxChunkMemory::isWatched ? 0 : 2048;

constexpr std::size_t blockAlignment = 8;

constexpr std::size_t roundUp(std::size_t size) {
    return MoxChunkMemory::roundUp(size, blockAlignment);
}

/// A block that was released and waits to be used again.
struct Released {
    Released* next; // owned
};

/// The last blocks that a thread has released, by their size. They still count in their chunks.
class ReleasedBlocks {
public:
    /// Returns: whether the block is taken; it is not when there are enough of its size.
    bool put(void* block, std::size_t size) {
        if (!isKept(size) || row(size).count == maxCount) {
            return false;
        }
        Row& blocks = row(size);
        blocks.first = new (block) Released{blocks.first};
        ++blocks.count;
        return true;
    }

    /// Returns: a block of just that size, or null.
    void* take(std::size_t size) {
        if (!isKept(size) || row(size).count == 0) {
            return nullptr;
        }
        Row& blocks = row(size);
        --blocks.count;
        return std::exchange(blocks.first, blocks.first->next);
    }

    static constexpr std::size_t largestSize = 512;

private:
    static constexpr std::size_t maxCount = 32;

    struct Row {
        Released* first = nullptr; // owned
        std::size_t count = 0;
    };

    static bool isKept(std::size_t size) { return size > 0 && size <= largestSize; }

    Row& row(std::size_t size) { return rows[size / blockAlignment - 1]; }

    Row rows[largestSize / blockAlignment];
};

/// Where a thread cuts its next block.
struct Cutter {
    char* cursor = nullptr;
    char* end = nullptr;
    MoxChunk* chunk = nullptr; // owned, as one of its users
    MoxChunkSource chunks;
    MoxChunkSource wholeChunks; // of packed nodes
    bool reuses = true;
    ReleasedBlocks* released = nullptr; // owned; not here, where a program has little room

    std::size_t room() const { return static_cast<std::size_t>(end - cursor); }

    bool isNewest(void* block, std::size_t size) const {
        return static_cast<char*>(block) + size == cursor;
    }

    void* takeReleased(std::size_t size) { return released ? released->take(size) : nullptr; }

    bool putReleased(void* block, std::size_t size) {
        if (!reuses) {
            return false;
        }
        if (!released && chunk) { // a thread that cuts nothing keeps nothing
            released = new (std::nothrow) ReleasedBlocks;
        }
        return released && released->put(block, size);
    }

    void close();
    void renew();
    void letGo(void* block);
    void forgetReleased();

private:
    void rewind();
    void closeChunk();
};

// Every node asks for it: found without a call, as what is here from the start of a program is.
[[gnu::tls_model("initial-exec")]] constinit thread_local Cutter cutter;

/// Gives the thread's chunk back when the thread ends.
struct ThreadEnd {
    bool isArmed = false;

    ~ThreadEnd() {
        cutter.close();
        cutter.wholeChunks.close();
        delete std::exchange(cutter.released, nullptr);
    }
};

thread_local ThreadEnd threadEnd;

void Cutter::close() {
    forgetReleased();
    closeChunk();
    chunks.close();
}

void Cutter::closeChunk() {
    if (chunk && chunk->drop() == 0) {
        chunks.rewind(); // what it was cut for is gone
    }
    chunk = nullptr;
    cursor = nullptr;
    end = nullptr;
}

void Cutter::renew() {
    closeChunk();
    threadEnd.isArmed = true; // the first use makes it, and so its end will come
    chunk = chunks.take();
    cursor = chunk->begin();
    end = chunk->end();
}

/// Cuts from the beginning again where nothing stands any longer, so that one document after
/// another takes the memory of one. A slab goes back: what it was cut for was large.
void Cutter::rewind() {
    if (chunks.rewind()) {
        cursor = chunk->begin();
    } else {
        close();
    }
}

/// Takes a block out of its chunk.
void Cutter::letGo(void* block) {
    auto* owner = MoxChunkMemory::findChunk<MoxChunk>(block, MoxChunk::alignment);
    if (owner->drop() == 1 && owner == chunk) {
        rewind(); // the thread itself is its only user
    }
}

void Cutter::forgetReleased() {
    for (std::size_t size = blockAlignment; size <= ReleasedBlocks::largestSize;
         size += blockAlignment) {
        while (void* block = takeReleased(size)) {
            letGo(block);
        }
    }
}

} // namespace

void* MoxNodeHeap::allocate(std::size_t size) {
    const std::size_t rounded = roundUp(size);
    if (rounded > largestBlock) {
        return MoxChunkMemory::allocateBlock(size);
    }
    if (void* released = cutter.takeReleased(rounded)) {
        return released;
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
    } else if (cutter.putReleased(block, rounded)) {
        return;
    }
    cutter.letGo(block);
}

void MoxNodeHeap::stopReuse() {
    cutter.reuses = false;
    cutter.forgetReleased();
    cutter.wholeChunks.close();
}

void MoxNodeHeap::startReuse() { cutter.reuses = true; }

char* MoxNodeHeap::allocateChunk() {
    if (MoxChunkMemory::isWatched) {
        return static_cast<char*>(MoxChunkMemory::allocateBlock(MoxChunkSource::room));
    }
    threadEnd.isArmed = true;
    return cutter.wholeChunks.take()->begin();
}

void MoxNodeHeap::releaseChunk(char* chunk) {
    if (MoxChunkMemory::isWatched) {
        std::free(chunk);
    } else {
        MoxChunkMemory::findChunk<MoxChunk>(chunk, MoxChunk::alignment)->drop();
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

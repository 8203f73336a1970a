#include "foundation/common/MoxChunkSource.h"

#include "foundation/common/MoxMutex.h"

#include <cstdlib>
#include <new>
#include <sys/mman.h>

namespace MoxCommonNS {
namespace {

/// The system can back a slab with one huge page.
constexpr std::size_t slabSize = std::size_t{1} << 21;
constexpr std::size_t chunksOfSlab = slabSize / MoxChunk::alignment;
/// So many chunks in a row make a document large.
constexpr int chunksBeforeSlabs = 16;

} // namespace

/// The head of a slab's first chunk.
struct alignas(8) MoxSlab {
    MoxChunk firstChunk;
    int users; // its chunks, and the source that takes from it

    char* chunkAt(std::size_t index) {
        return reinterpret_cast<char*>(this) + index * MoxChunk::alignment;
    }

    void drop() {
        if (MoxMutex::interlockedDecrement(users) == 0) {
            std::free(this);
        }
    }
};

static_assert(sizeof(MoxSlab) <= MoxChunk::size - MoxChunkSource::room);

char* MoxChunk::begin() {
    const bool isFirst = slab && this == &slab->firstChunk;
    return reinterpret_cast<char*>(this) + (isFirst ? sizeof(MoxSlab) : sizeof(MoxChunk));
}

int MoxChunk::drop() {
    const int left = MoxMutex::interlockedDecrement(users);
    if (left != 0) {
        return left;
    }
    if (slab) {
        slab->drop();
    } else {
        std::free(this);
    }
    return 0;
}

MoxChunk* MoxChunkSource::take() {
    if (++chunksInRow > chunksBeforeSlabs) {
        return takeOfSlab();
    }
    closeSlab();
    return new (MoxChunkMemory::allocateChunk(MoxChunk::alignment, MoxChunk::size))
        MoxChunk{1, nullptr};
}

MoxChunk* MoxChunkSource::takeOfSlab() {
    if (slab && nextOfSlab == chunksOfSlab) {
        closeSlab();
    }
    if (!slab) {
        void* memory = MoxChunkMemory::allocateChunk(slabSize, slabSize);
        // A wish: without it the slab is made of small pages.
        static_cast<void>(madvise(memory, slabSize, MADV_HUGEPAGE));
        slab = static_cast<MoxSlab*>(memory);
        slab->users = 1;
        nextOfSlab = 0;
    }
    MoxMutex::interlockedIncrement(slab->users);
    return new (slab->chunkAt(nextOfSlab++)) MoxChunk{1, slab};
}

void MoxChunkSource::close() {
    closeSlab();
    chunksInRow = 0;
}

bool MoxChunkSource::rewind() {
    if (slab) {
        return false;
    }
    chunksInRow = 0;
    return true;
}

void MoxChunkSource::closeSlab() {
    if (slab) {
        slab->drop();
    }
    slab = nullptr;
}

} // namespace MoxCommonNS

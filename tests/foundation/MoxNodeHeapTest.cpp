#include "foundation/common/MoxNodeHeap.h"

#include "foundation/common/MoxChunkSource.h"
#include "foundation/common/MoxDocument.h"

#include <cstdint>
#include <cstring>
#include <gtest/gtest.h>
#include <malloc.h>
#include <thread>
#include <vector>

namespace MoxCommonNS {
namespace {

#if defined(__SANITIZE_ADDRESS__)
constexpr bool cutsBlocks = false;
#else
constexpr bool cutsBlocks = true;
#endif

struct Block {
    explicit Block(std::size_t blockSize)
        : size(blockSize), memory(static_cast<unsigned char*>(MoxNodeHeap::allocate(blockSize))) {
        std::memset(memory, mark(), size);
    }

    unsigned char mark() const { return static_cast<unsigned char>(size % 251); }

    bool isIntact() const {
        for (std::size_t i = 0; i < size; ++i) {
            if (memory[i] != mark()) {
                return false;
            }
        }
        return true;
    }

    std::size_t size;
    unsigned char* memory;
};

std::vector<Block> allocateMany(int count) {
    std::vector<Block> blocks;
    for (int i = 0; i < count; ++i) {
        blocks.emplace_back(1 + i * 37 % 3000);
    }
    return blocks;
}

void releaseAll(const std::vector<Block>& blocks) {
    for (const Block& block : blocks) {
        MoxNodeHeap::release(block.memory, block.size);
    }
}

TEST(MoxNodeHeap, BlocksAreAlignedAndDoNotOverlap) {
    const std::vector<Block> blocks = allocateMany(5000);
    for (const Block& block : blocks) {
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(block.memory) % 8, 0U);
        EXPECT_TRUE(block.isIntact());
    }
    releaseAll(blocks);
}

TEST(MoxNodeHeap, TheNewestBlockGrowsWhereItStands) {
    void* block = MoxNodeHeap::allocate(16);
    std::memset(block, 7, 16);
    EXPECT_EQ(MoxNodeHeap::growInPlace(block, 16, 64), cutsBlocks);
    EXPECT_EQ(static_cast<unsigned char*>(block)[15], 7);
    MoxNodeHeap::release(block, cutsBlocks ? 64 : 16);
}

TEST(MoxNodeHeap, AnOlderBlockDoesNotGrow) {
    void* older = MoxNodeHeap::allocate(16);
    void* newest = MoxNodeHeap::allocate(16);
    EXPECT_FALSE(MoxNodeHeap::growInPlace(older, 16, 32));
    MoxNodeHeap::release(newest, 16);
    MoxNodeHeap::release(older, 16);
}

TEST(MoxNodeHeap, NoBlockGrowsBeyondItsChunk) {
    void* block = MoxNodeHeap::allocate(16);
    EXPECT_FALSE(MoxNodeHeap::growInPlace(block, 16, std::size_t{1} << 20));
    EXPECT_FALSE(MoxNodeHeap::growInPlace(nullptr, 0, 16));
    MoxNodeHeap::release(block, 16);
}

TEST(MoxNodeHeap, ANewestBlockThatIsReleasedIsUsedAgain) {
    void* first = MoxNodeHeap::allocate(96);
    MoxNodeHeap::release(first, 96);
    void* second = MoxNodeHeap::allocate(96);
    if (cutsBlocks) {
        EXPECT_EQ(first, second);
    }
    MoxNodeHeap::release(second, 96);
}

TEST(MoxNodeHeap, WhatIsAllReleasedIsCutAgainFromTheBeginning) {
    std::vector<Block> blocks = allocateMany(20);
    void* first = blocks.front().memory;
    std::vector<Block> others = allocateMany(20);
    releaseAll(others);
    releaseAll(blocks);
    MoxNodeHeap::stopReuse();
    MoxNodeHeap::startReuse();
    void* second = MoxNodeHeap::allocate(16);
    if (cutsBlocks) {
        EXPECT_LE(reinterpret_cast<std::uintptr_t>(second),
                  reinterpret_cast<std::uintptr_t>(first));
    }
    MoxNodeHeap::release(second, 16);
}

TEST(MoxNodeHeap, AFewReleasedBlocksAreUsedAgain) {
    void* older = MoxNodeHeap::allocate(88);
    void* newest = MoxNodeHeap::allocate(88);
    MoxNodeHeap::release(older, 88);
    void* other = MoxNodeHeap::allocate(96);
    void* same = MoxNodeHeap::allocate(88);
    if (cutsBlocks) {
        EXPECT_NE(other, older);
        EXPECT_EQ(same, older);
    }
    MoxNodeHeap::release(same, 88);
    MoxNodeHeap::release(other, 96);
    MoxNodeHeap::release(newest, 88);
    MoxNodeHeap::stopReuse();
    MoxNodeHeap::startReuse();
}

TEST(MoxNodeHeap, AWholeChunkCanBeWrittenTo) {
    std::vector<char*> chunks;
    for (int i = 0; i < 100; ++i) { // large enough for slabs
        chunks.push_back(MoxNodeHeap::allocateChunk());
        std::memset(chunks.back(), i, MoxChunkSource::room);
    }
    for (int i = 0; i < 100; ++i) {
        EXPECT_EQ(chunks[i][0], i);
        EXPECT_EQ(chunks[i][MoxChunkSource::room - 1], i);
    }
    std::thread([&chunks] {
        for (char* chunk : chunks) {
            MoxNodeHeap::releaseChunk(chunk);
        }
    }).join();
    MoxNodeHeap::stopReuse();
    MoxNodeHeap::startReuse();
}

TEST(MoxNodeHeap, ReleasingNothingDoesNothing) { MoxNodeHeap::release(nullptr, 0); }

TEST(MoxNodeHeap, AnyThreadMayReleaseABlock) {
    for (int round = 0; round < 20; ++round) {
        std::vector<Block> made;
        std::thread([&made] { made = allocateMany(500); }).join();
        std::vector<Block> own = allocateMany(500);
        std::thread([&own] { releaseAll(own); }).join();
        for (const Block& block : made) {
            EXPECT_TRUE(block.isIntact());
        }
        releaseAll(made);
    }
}

TEST(MoxNodeHeap, TwoThreadsCutWithoutMeeting) {
    const auto work = [] {
        for (int round = 0; round < 50; ++round) {
            const std::vector<Block> blocks = allocateMany(200);
            for (const Block& block : blocks) {
                EXPECT_TRUE(block.isIntact());
            }
            releaseAll(blocks);
        }
    };
    std::thread one(work);
    std::thread other(work);
    one.join();
    other.join();
}

void buildAndDropDocument() {
    const MoxPtr<MoxDocument> document(new MoxDocument);
    const MoxPtr<MoxElement> root = document->createElement(MOXNAME_SVG);
    document->appendChild(root.get());
    for (int i = 0; i < 20000; ++i) {
        const MoxPtr<MoxElement> child = document->createElement(MOXNAME_SVG);
        child->setAttribute(MOXNAME_ID, MoxValue(i));
        root->appendChild(child.get());
    }
}

TEST(MoxNodeHeap, TheMemoryOfADocumentIsGivenBack) {
    buildAndDropDocument();
    const std::size_t before = mallinfo2().uordblks;
    for (int i = 0; i < 10; ++i) {
        buildAndDropDocument();
    }
    constexpr std::size_t someChunks = 4 * 32768;
    if (cutsBlocks) {
        EXPECT_LT(mallinfo2().uordblks, before + someChunks);
    }
}

} // namespace
} // namespace MoxCommonNS

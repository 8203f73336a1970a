#include "path/SVGSegmentHeap.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <thread>
#include <vector>

namespace DrawmereNS {
namespace {

constexpr std::size_t blockSize = 40;
constexpr std::size_t hugeBlock = 100'000;
/// More than one chunk holds.
constexpr std::size_t manyBlocks = 200'000;

std::vector<void*> makeBlocks(std::size_t count) {
    std::vector<void*> blocks;
    for (std::size_t i = 0; i < count; ++i) {
        blocks.push_back(SVGSegmentHeap::allocate(blockSize));
        std::memset(blocks.back(), static_cast<int>(i % 251), blockSize);
    }
    return blocks;
}

bool holds(const void* block, std::size_t index) {
    const auto* bytes = static_cast<const unsigned char*>(block);
    return bytes[0] == index % 251 && bytes[blockSize - 1] == index % 251;
}

void releaseAll(const std::vector<void*>& blocks) {
    for (void* block : blocks) {
        SVGSegmentHeap::release(block, blockSize);
    }
}

TEST(SVGSegmentHeap, BlocksOfSeveralChunksKeepTheirBytesUntilTheyGo) {
    const std::vector<void*> blocks = makeBlocks(manyBlocks);
    std::size_t wrong = 0;
    for (std::size_t i = 0; i < blocks.size(); ++i) {
        wrong += holds(blocks[i], i) ? 0U : 1U;
    }
    EXPECT_EQ(wrong, 0U);
    releaseAll(blocks);
}

TEST(SVGSegmentHeap, BlocksAreAligned) {
    void* odd = SVGSegmentHeap::allocate(33);
    void* next = SVGSegmentHeap::allocate(blockSize);
    EXPECT_EQ(reinterpret_cast<std::uintptr_t>(next) % 8, 0U);
    SVGSegmentHeap::release(odd, 33);
    SVGSegmentHeap::release(next, blockSize);
}

TEST(SVGSegmentHeap, ABlockThatStaysIsNotCutAgain) {
    std::vector<void*> kept = makeBlocks(1);
    releaseAll(makeBlocks(10));
    const std::vector<void*> others = makeBlocks(manyBlocks);
    EXPECT_TRUE(holds(kept[0], 0));
    std::memset(kept[0], 250, blockSize);
    for (std::size_t i = 0; i < others.size(); ++i) {
        ASSERT_TRUE(holds(others[i], i)) << i;
    }
    releaseAll(others);
    releaseAll(kept);
}

TEST(SVGSegmentHeap, AnotherThreadMayReleaseWhatOneThatEndedHasMade) {
    std::vector<void*> blocks;
    std::thread([&blocks] { blocks = makeBlocks(manyBlocks); }).join();
    EXPECT_TRUE(holds(blocks.back(), manyBlocks - 1));
    releaseAll(blocks);
    const std::vector<void*> own = makeBlocks(10);
    std::thread([&own] { releaseAll(own); }).join();
    releaseAll(makeBlocks(manyBlocks));
}

TEST(SVGSegmentHeap, TakesBlocksOfAnySizeAndIgnoresNull) {
    void* block = SVGSegmentHeap::allocate(hugeBlock);
    std::memset(block, 1, hugeBlock);
    SVGSegmentHeap::release(block, hugeBlock);
    SVGSegmentHeap::release(nullptr, blockSize);
}

} // namespace
} // namespace DrawmereNS

#include "images/SVGImageStore.h"

#include "tests/images/KeptImages.h"
#include "tests/support/BrittleBuffer.h"
#include "tests/support/OpenFiles.h"
#include "tests/support/TempDir.h"

#include <sys/resource.h>

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

constexpr std::size_t chunk = SVGImageStore::chunkBytes;

TEST(SVGImageStore, BytesWithinTheBudgetStayInMemory) {
    const TempDir directory;
    SVGImageStore store(100, directory.path());
    for (const std::size_t size : {60, 0, 40}) {
        const std::string bytes = makeBytes(size);
        const SVGStoredImage image = keep(store, bytes);
        EXPECT_FALSE(image.file);
        EXPECT_EQ(image.blockBytes, size);
        EXPECT_EQ(read(image), bytes);
    }
    EXPECT_EQ(countOpenFiles(directory.path()), 0);
    EXPECT_EQ(keep(store, "x").fileBytes, 1U); // the first byte beyond
    EXPECT_EQ(countOpenFiles(directory.path()), 1);
}

TEST(SVGImageStore, AnImageThatDoesNotFitGoesIntoTheFileAsAWhole) {
    const TempDir directory;
    SVGImageStore store(100, directory.path());
    for (const std::size_t size : {std::size_t(101), chunk - 1, chunk, chunk + 1, 3 * chunk}) {
        const std::string bytes = makeBytes(size);
        const SVGStoredImage image = keep(store, bytes);
        EXPECT_EQ(image.fileBytes, size);
        EXPECT_FALSE(image.block);
        EXPECT_EQ(read(image), bytes);
    }
    EXPECT_EQ(keep(store, makeBytes(100)).blockBytes, 100U); // the room is still there
    EXPECT_EQ(countOpenFiles(directory.path()), 1);
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
}

TEST(SVGImageStore, WithoutADirectoryMemoryTakesAll) {
    const TempDir directory;
    SVGImageStore store(100, directory.path("missing"));
    for (const std::size_t size : {std::size_t(101), 2 * chunk + 1, std::size_t(7)}) {
        const std::string bytes = makeBytes(size);
        const SVGStoredImage image = keep(store, bytes);
        EXPECT_EQ(image.blockBytes, size);
        EXPECT_EQ(read(image), bytes);
    }
}

/// Keeps `bytes` while no file may grow beyond `limit`.
SVGStoredImage keepBelow(rlim_t limit, SVGImageStore& store, const std::string& bytes) {
    rlimit before = {};
    getrlimit(RLIMIT_FSIZE, &before);
    const rlimit lower = {.rlim_cur = limit, .rlim_max = before.rlim_max};
    setrlimit(RLIMIT_FSIZE, &lower);
    SVGStoredImage image = keep(store, bytes);
    setrlimit(RLIMIT_FSIZE, &before);
    return image;
}

TEST(SVGImageStore, WhereTheFileIsFullMemoryGoesOn) {
    for (const std::size_t limit : {std::size_t(0), chunk - 1, chunk, 2 * chunk + 7}) {
        const TempDir directory;
        SVGImageStore store(0, directory.path());
        const std::string bytes = makeBytes(2 * chunk + 9);
        const SVGStoredImage image = keepBelow(limit, store, bytes);
        EXPECT_EQ(image.fileBytes, limit / chunk * chunk);
        EXPECT_EQ(image.blockBytes, bytes.size() - image.fileBytes);
        EXPECT_EQ(read(image), bytes);
        EXPECT_EQ(keep(store, "next").blockBytes, 4U);
    }
}

TEST(SVGImageStore, ImagesOutliveTheStoreAndTheFileGoesWithTheLast) {
    const TempDir directory;
    const std::string bytes = makeBytes(200);
    {
        SVGStoredImage first;
        SVGStoredImage second;
        {
            SVGImageStore store(0, directory.path());
            first = keep(store, bytes);
            second = keep(store, "second");
        }
        EXPECT_EQ(read(second), "second");
        EXPECT_EQ(read(first), bytes);
        EXPECT_EQ(countOpenFiles(directory.path()), 1);
    }
    EXPECT_EQ(countOpenFiles(directory.path()), 0);
}

TEST(SVGImageStore, WhatTheStreamDoesNotHaveIsLeftOut) {
    const TempDir directory;
    const std::string bytes = makeBytes(3 * chunk);
    for (const std::size_t budget : {std::size_t(0), 4 * chunk}) {
        for (const std::size_t good : {std::size_t(0), std::size_t(5), chunk, 2 * chunk + 5}) {
            SVGImageStore store(budget, directory.path());
            BrittleBuffer buffer(bytes, good, BrittleBuffer::ENDS);
            std::istream stream(&buffer);
            SVGStoredImage image;
            EXPECT_TRUE(store.keep(stream, bytes.size(), image));
            EXPECT_EQ(read(image), bytes.substr(0, good));
        }
    }
}

TEST(SVGImageStore, NothingBehindTheCountIsRead) {
    const TempDir directory;
    for (const std::size_t budget : {0, 100}) {
        SVGImageStore store(budget, directory.path());
        std::istringstream stream("abcdef");
        SVGStoredImage image;
        EXPECT_TRUE(store.keep(stream, 4, image));
        EXPECT_EQ(read(image), "abcd");
        EXPECT_EQ(stream.get(), 'e');
    }
}

} // namespace
} // namespace DrawmereTest

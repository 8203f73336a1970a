#include "foundation/fontservice/FS_FaceCache.h"

#include "tests/support/TinyFont.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

using namespace DrawmereTest;
using namespace MoxFontService_NS;

namespace {

FS_FaceRequest makeRequest(const std::string& family, std::size_t moreBytes = 0) {
    FS_FaceRequest request;
    request.source.bytes = std::make_shared<const std::string>(TinyFont(family).build() +
                                                               std::string(moreBytes, '\0'));
    return request;
}

} // namespace

TEST(FS_FaceCache, SameRequestGetsTheSameFace) {
    FS_FaceCache cache;
    FS_FaceRequest request = makeRequest("Tiny");
    const std::shared_ptr<FS_Face> face = cache.find(request);
    ASSERT_NE(face, nullptr);
    EXPECT_EQ(cache.find(request), face);
    EXPECT_EQ(cache.size(), 1U);
    EXPECT_NE(cache.find(makeRequest("Tiny")), face);
    request.axes = FS_FaceStyle();
    EXPECT_NE(cache.find(request), face);
    request.faceIndex = 1;
    EXPECT_EQ(cache.find(request), nullptr);
}

TEST(FS_FaceCache, KeepsABoundedCountOfFaces) {
    FS_FaceCache cache;
    const std::shared_ptr<FS_Face> first = cache.find(makeRequest("Tiny First"));
    for (std::size_t i = 0; i < 2 * FS_FaceCache::mostFaces; ++i) {
        ASSERT_NE(cache.find(makeRequest("Tiny " + std::to_string(i))), nullptr);
        EXPECT_LE(cache.size(), FS_FaceCache::mostFaces);
    }
    EXPECT_EQ(utf8(first->familyName), "Tiny First"); // in use, so it stays open
    EXPECT_EQ(first.use_count(), 1);
}

TEST(FS_FaceCache, AFaceInUseStaysOpenWhenAllAreForgotten) {
    FS_FaceCache cache;
    const FS_FaceRequest request = makeRequest("Tiny");
    const std::shared_ptr<FS_Face> face = cache.find(request);
    ASSERT_NE(face, nullptr);
    cache.clear();
    EXPECT_EQ(cache.size(), 0U);
    EXPECT_EQ(utf8(face->familyName), "Tiny");
    EXPECT_NE(cache.find(request), face);
}

TEST(FS_FaceCache, KeepsABoundedSumOfBytesInMemory) {
    FS_FaceCache cache;
    const std::size_t half = FS_FaceCache::mostBytes / 2;
    std::weak_ptr<const std::string> first;
    {
        const FS_FaceRequest request = makeRequest("Tiny", half);
        first = request.source.bytes;
        ASSERT_NE(cache.find(request), nullptr);
    }
    EXPECT_FALSE(first.expired());
    ASSERT_NE(cache.find(makeRequest("Tiny", half)), nullptr);
    EXPECT_TRUE(first.expired());
    EXPECT_EQ(cache.size(), 1U);
}

#include "foundation/fontservice/FS_LruCache.h"

#include <gtest/gtest.h>

using namespace MoxFontService_NS;

TEST(FS_LruCache, ForgetsWhatWasNotAskedForLongest) {
    FS_LruCache<int> cache(2, 1000);
    cache.insert("a", 1, 0);
    cache.insert("b", 2, 0);
    ASSERT_NE(cache.find("a"), nullptr);
    cache.insert("c", 3, 0);
    EXPECT_EQ(cache.find("b"), nullptr);
    ASSERT_NE(cache.find("a"), nullptr);
    EXPECT_EQ(*cache.find("a"), 1);
    EXPECT_EQ(*cache.find("c"), 3);
    EXPECT_EQ(cache.size(), 2U);
}

TEST(FS_LruCache, KeepsTheSumOfCostsBounded) {
    FS_LruCache<int> cache(10, 100);
    cache.insert("a", 1, 50);
    cache.insert("b", 2, 50);
    EXPECT_EQ(cache.size(), 2U);
    cache.insert("c", 3, 60);
    EXPECT_EQ(cache.size(), 1U);
    EXPECT_NE(cache.find("c"), nullptr);
    cache.insert("d", 4, 40);
    EXPECT_EQ(cache.size(), 2U);
}

TEST(FS_LruCache, TheNewestStaysWhateverItCosts) {
    FS_LruCache<int> cache(10, 100);
    cache.insert("a", 1, 10);
    cache.insert("b", 2, 1000);
    EXPECT_EQ(cache.size(), 1U);
    EXPECT_NE(cache.find("b"), nullptr);
    cache.clear();
    EXPECT_EQ(cache.find("b"), nullptr);
    cache.insert("c", 3, 100);
    EXPECT_NE(cache.find("c"), nullptr);
}

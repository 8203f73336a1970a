#include "fonts/SVGCodePointSet.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereNS::SVGCodePointSet;

TEST(SVGCodePointSet, TellsWhatIsNew) {
    SVGCodePointSet set;
    EXPECT_TRUE(set.insert(0));
    EXPECT_TRUE(set.insert(0x10FFFF));
    EXPECT_FALSE(set.insert(0));
    EXPECT_FALSE(set.insert(0x10FFFF));
    EXPECT_TRUE(set.insert(1));
}

TEST(SVGCodePointSet, KeepsAllOfAMany) {
    constexpr std::uint32_t count = 100'000;
    SVGCodePointSet set;
    for (std::uint32_t i = 0; i < count; ++i) {
        ASSERT_TRUE(set.insert(3 * i)) << i;
    }
    for (std::uint32_t i = 0; i < 3 * count; i += 3) {
        ASSERT_FALSE(set.insert(i)) << i;
    }
}

TEST(SVGCodePointSet, ForgetsAllWhenAsked) {
    SVGCodePointSet set;
    set.insert(5);
    set.clear();
    EXPECT_TRUE(set.insert(5));
    EXPECT_FALSE(set.insert(5));
}

TEST(SVGCodePointSet, CharactersOfOneHashAreForgottenRatherThanSearchedForLong) {
    constexpr std::uint32_t spread = 0x9E3779B9;
    SVGCodePointSet set;
    int crowd = 0;
    int forgotten = 0;
    for (std::uint32_t i = 0; i < 0x110000; ++i) {
        if ((i + 1) * spread >> 20 == 0) {
            set.insert(i);
            forgotten += set.insert(i) ? 1 : 0;
            ++crowd;
        }
    }
    ASSERT_GT(crowd, 200);
    EXPECT_EQ(forgotten, crowd - 64);
}

} // namespace
} // namespace DrawmereTest

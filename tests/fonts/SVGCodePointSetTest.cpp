#include "fonts/SVGCodePointSet.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereNS::SVGCodePointSet;

constexpr std::uint32_t lastCodePoint = 0x10FFFF;

TEST(SVGCodePointSet, HasWhatWasInsertedAndNothingElse) {
    SVGCodePointSet set;
    EXPECT_FALSE(set.contains(0));
    for (const std::uint32_t codePoint : {0U, 63U, 64U, 0xFFFFU, lastCodePoint}) {
        EXPECT_FALSE(set.contains(codePoint));
        set.insert(codePoint);
        set.insert(codePoint);
        EXPECT_TRUE(set.contains(codePoint));
    }
    for (const std::uint32_t codePoint : {1U, 62U, 65U, 0xFFFEU, 0x10000U, lastCodePoint - 1}) {
        EXPECT_FALSE(set.contains(codePoint));
    }
}

TEST(SVGCodePointSet, HasRoomForAllThereAre) {
    SVGCodePointSet set;
    for (std::uint32_t i = 0; i <= lastCodePoint; i += 3) {
        ASSERT_FALSE(set.contains(i));
        set.insert(i);
    }
    for (std::uint32_t i = 0; i <= lastCodePoint; ++i) {
        ASSERT_EQ(set.contains(i), i % 3 == 0) << i;
    }
}

TEST(SVGCodePointSet, SkipsTheUnitsThatItHas) {
    SVGCodePointSet set;
    EXPECT_EQ(set.skipKnown(u"abc", 0), 0U);
    EXPECT_EQ(set.skipKnown(u"", 0), 0U);
    set.insert(u'a');
    set.insert(u'\uFFFF');
    EXPECT_EQ(set.skipKnown(u"aa\uFFFFaba", 0), 4U);
    EXPECT_EQ(set.skipKnown(u"aa\uFFFFaba", 4), 4U);
    EXPECT_EQ(set.skipKnown(u"aa\uFFFFaba", 5), 6U);
    set.insert(0x10400); // whose units are none of its own
    EXPECT_EQ(set.skipKnown(u"\U00010400", 0), 0U);
}

TEST(SVGCodePointSet, ForgetsAllWhenAsked) {
    SVGCodePointSet set;
    set.insert(5);
    set.insert(lastCodePoint);
    set.clear();
    EXPECT_FALSE(set.contains(5));
    EXPECT_FALSE(set.contains(lastCodePoint));
    set.insert(6);
    EXPECT_FALSE(set.contains(5));
    EXPECT_TRUE(set.contains(6));
}

} // namespace
} // namespace DrawmereTest

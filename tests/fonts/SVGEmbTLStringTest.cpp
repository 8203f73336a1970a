#include "fonts/SVGEmbTLString.h"

#include "tests/fonts/EmbeddedFont.h"

#include <gtest/gtest.h>
#include <type_traits>

namespace DrawmereTest {
namespace {

SVGGlyphMap mapOf(const std::vector<std::u16string_view>& texts) {
    SVGGlyphMap map;
    for (const std::u16string_view text : texts) {
        map.try_emplace(SVGEmbTLString(text));
    }
    return map;
}

TEST(SVGEmbTLString, IsATextWithNothingMore) {
    EXPECT_EQ(sizeof(SVGEmbTLString), sizeof(UnicodeString));
    EXPECT_TRUE(std::has_virtual_destructor_v<SVGEmbTLString>);
    EXPECT_EQ(utf8(SVGEmbTLString(u"fi")), "fi");
    EXPECT_TRUE(SVGEmbTLString().isEmpty());
}

TEST(SVGEmbTLString, LongerTextsGoFirst) {
    EXPECT_EQ(describe(mapOf({u"f", u"ffi", u"fi", u""})), "ffi=, fi=, f=, =");
    EXPECT_TRUE(SVGEmbTLString(u"aa") < SVGEmbTLString(u"b"));
    EXPECT_FALSE(SVGEmbTLString(u"b") < SVGEmbTLString(u"aa"));
}

TEST(SVGEmbTLString, AmongTextsOfOneLengthHigherCodeUnitsGoFirst) {
    EXPECT_EQ(describe(mapOf({u"ab", u"zz", u"ac"})), "zz=, ac=, ab=");
}

TEST(SVGEmbTLString, OrderGoesByCodeUnitsNotByCharacters) {
    // A character above U+FFFF has two units, the first below U+E000; U+FF01 and a blank have two.
    EXPECT_EQ(describe(mapOf({u"\U0001F600", u"\uFF01 "})), "\uFF01 =, \U0001F600=");
}

TEST(SVGEmbTLString, EqualTextsAreOneKey) {
    EXPECT_EQ(mapOf({u"ab", u"ab"}).size(), 1U);
    EXPECT_FALSE(SVGEmbTLString(u"ab") < SVGEmbTLString(u"ab"));
}

} // namespace
} // namespace DrawmereTest

#include "foundation/common/MoxAsciiChars.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

TEST(MoxAsciiChars, WhiteSpaceIsThatOfXml) {
    for (const char16_t c : {u' ', u'\t', u'\n', u'\r'}) {
        EXPECT_TRUE(isXmlSpace(c));
    }
    for (const char16_t c : {u'\0', u'\f', u'\v', u'\u00A0', u'\u2003', u'a'}) {
        EXPECT_FALSE(isXmlSpace(c));
    }
}

TEST(MoxAsciiChars, DigitsAndLettersOfOtherScriptsAreNone) {
    EXPECT_TRUE(isAsciiDigit(u'0') && isAsciiDigit(u'9'));
    EXPECT_TRUE(isAsciiLetter(u'a') && isAsciiLetter(u'Z'));
    for (const char16_t c : {u'/', u':', u'@', u'[', u'`', u'{', u'\u0661', u'\u00E9'}) {
        EXPECT_FALSE(isAsciiDigit(c));
        EXPECT_FALSE(isAsciiLetter(c));
    }
}

TEST(MoxAsciiChars, LowersCapitalsOnly) {
    EXPECT_EQ(toAsciiLower(u'A'), u'a');
    EXPECT_EQ(toAsciiLower(u'Z'), u'z');
    EXPECT_EQ(toAsciiLower(u'['), u'[');
    EXPECT_EQ(toAsciiLower(u'\u0130'), u'\u0130');
}

TEST(MoxAsciiChars, ComparesInAnyCase) {
    EXPECT_TRUE(equalsIgnoreCase(u"RgB", u"rgb"));
    EXPECT_FALSE(equalsIgnoreCase(u"rgb", u"rgba"));
    EXPECT_FALSE(equalsIgnoreCase(u"rgc", u"rgb"));
}

TEST(MoxAsciiChars, TrimsBothEndsAndNothingBetween) {
    EXPECT_EQ(trimXmlSpace(u" \ta b\r\n"), u"a b");
    EXPECT_EQ(trimXmlSpace(u" \n "), u"");
    EXPECT_EQ(trimXmlSpace(u""), u"");
}

} // namespace

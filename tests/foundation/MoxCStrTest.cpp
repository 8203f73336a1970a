#include "foundation/common/MoxCStr.h"

#include <string>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

TEST(MoxCStr, GivesUtf8UnlessToldOtherwise) {
    const MoxCStr text(u"größe \U0001F600");
    EXPECT_EQ(text.toBytes(), "gr\xC3\xB6\xC3\x9F"
                              "e \xF0\x9F\x98\x80");
    EXPECT_EQ(text.getEncoding(), "UTF-8");
    EXPECT_STREQ(text.toCStr(), text.toBytes().c_str());
}

TEST(MoxCStr, EmptyAndBogusTextsGiveNoBytes) {
    EXPECT_EQ(MoxCStr().toBytes(), "");
    UnicodeString bogus;
    bogus.setToBogus();
    EXPECT_EQ(MoxCStr(bogus).toBytes(), "");
}

TEST(MoxCStr, LoneSurrogateBecomesTheReplacementCharacter) {
    UnicodeString text(u"a");
    text += char16_t(0xD83D);
    text += u'b';
    MoxCStr lone(text);
    EXPECT_EQ(lone.toBytes(), "a\xEF\xBF\xBD"
                              "b");
    lone.setEncoding("UTF-16BE");
    EXPECT_EQ(lone.toBytes(), std::string("\0a\xFF\xFD\0b", 6));
}

TEST(MoxCStr, EncodesInAnyEncodingThatIcuKnows) {
    MoxCStr text(u"é");
    text.setEncoding("ISO-8859-1");
    EXPECT_EQ(text.toBytes(), "\xE9");
    text.setEncoding("windows-1251");
    EXPECT_EQ(text.toBytes(), "\x1A");
    text.setEncoding("utf8");
    EXPECT_EQ(text.toBytes(), "\xC3\xA9");
}

TEST(MoxCStr, UnknownEncodingReadsAsUtf8) {
    for (const char* name : {"no such encoding", "", static_cast<const char*>(nullptr)}) {
        MoxCStr text(u"é");
        text.setEncoding(name);
        EXPECT_EQ(text.toBytes(), "\xC3\xA9");
    }
}

TEST(MoxCStr, ConvertsAgainWhenTheTextChanges) {
    MoxCStr text(u"a");
    EXPECT_EQ(text.toBytes(), "a");
    text += u'b'; // as a plain UnicodeString, which tells nobody
    EXPECT_EQ(text.toBytes(), "ab");
    text = UnicodeString(u"c");
    EXPECT_EQ(text.toBytes(), "c");
}

TEST(MoxCStr, ConvertsOnlyOnceWhileNothingChanges) {
    const MoxCStr text(u"a text that is too long for the inside of a std::string");
    const char* const first = text.toCStr();
    EXPECT_EQ(text.toCStr(), first);
}

TEST(MoxCStr, NewTextKeepsTheEncoding) {
    MoxCStr text;
    text.setEncoding("ISO-8859-1");
    text = UnicodeString(u"ü");
    EXPECT_EQ(text.toBytes(), "\xFC");
}

TEST(MoxCStr, LongTextIsConvertedWhole) {
    MoxCStr text(UnicodeString(100000, UChar32(0xFC), 100000));
    text.setEncoding("ISO-8859-1");
    EXPECT_EQ(text.toBytes(), std::string(100000, '\xFC'));
}

TEST(MoxCStr, NullCharacterStaysInTheBytes) {
    UnicodeString text(u"a");
    text += char16_t(0);
    text += u'b';
    EXPECT_EQ(MoxCStr(text).toBytes(), std::string("a\0b", 3));
}

} // namespace

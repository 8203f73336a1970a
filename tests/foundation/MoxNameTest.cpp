#include "foundation/common/MoxName.h"

#include "foundation/common/MoxNameTable.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;
using DrawmereTest::utf8;

TEST(MoxName, IsNoNameByDefault) {
    EXPECT_EQ(MoxName().number, 0U);
    EXPECT_FALSE(MoxName());
    EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(MoxName())), "");
}

TEST(MoxName, TheEmptyTextIsNoName) {
    EXPECT_EQ(MoxName(UnicodeString()), MoxName());
    UnicodeString bogus;
    bogus.setToBogus();
    EXPECT_EQ(MoxName(bogus), MoxName());
}

TEST(MoxName, NamesAreEqualWhenTheirNumbersAre) {
    const MoxName one(u"some-name");
    EXPECT_TRUE(one);
    EXPECT_EQ(one, MoxName(UnicodeString(u"some-") + u"name"));
    EXPECT_NE(one, MoxName(u"some-Name"));
    EXPECT_EQ(MoxName(MOXNAME_SVG), MoxName::fromNumber(1431));
    EXPECT_NE(MoxName(MOXNAME_SVG), MoxName(MOXNAME_TB));
}

TEST(MoxName, GivesItsTextBack) {
    for (const char16_t* text :
         {u"x", u"xlink:href", u"ünïcödé", u"with blank", u"\xD83D\xDE00",
          u"a text that is far too long to be kept inside a string object"}) {
        EXPECT_EQ(MoxNameTable::getSharedNameString(MoxName(text)), UnicodeString(text));
    }
}

TEST(MoxName, HasThirtyTwoBits) { EXPECT_EQ(sizeof(MoxName), 4U); }

} // namespace

#include "foundation/common/MoxXmlOptions.h"

#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

struct OptionRow {
    const char16_t* list;
    bool indent;
    int decimals;
};

constexpr int all = MoxXmlOptions::allDecimals;

constexpr OptionRow optionRows[] = {
    {u"", false, all},
    {u"indent", true, all},
    {u"decimals=3", false, 3},
    {u"decimals=0", false, 0},
    {u"indent,decimals=2", true, 2},
    {u"decimals=2,indent", true, 2},
    {u"  indent , decimals=12 ", true, 12},
    {u"decimals=007", false, 7},
    {u"decimals=2,decimals=4", false, 4},
    // An entry that is not understood is passed over, alone.
    {u",,,", false, all},
    {u",indent,", true, all},
    {u"Indent", false, all},
    {u"indent=1", false, all},
    {u"indentation", false, all},
    {u"decimals", false, all},
    {u"decimals=", false, all},
    {u"decimals=x", false, all},
    {u"decimals=3x", false, all},
    {u"decimals=-1", false, all},
    {u"decimals=+1", false, all},
    {u"decimals=1.5", false, all},
    {u"decimals= 3", false, all},
    {u"decimals=\u0663", false, all}, // a digit, but none of ASCII
    {u"decimals=3,decimals=x", false, 3},
    {u"standalone,decimals=3,\"indent\"", false, 3},
    // More digits than any number has mean all of them.
    {u"decimals=99999999999999999999", false, 160},
};

TEST(MoxXmlOptions, ReadsTheListAndPassesOverWhatItDoesNotKnow) {
    for (const OptionRow& row : optionRows) {
        const MoxXmlOptions options = MoxXmlOptions::parse(row.list);
        EXPECT_EQ(options.indent, row.indent) << DrawmereTest::utf8(row.list);
        EXPECT_EQ(options.decimals, row.decimals) << DrawmereTest::utf8(row.list);
    }
}

TEST(MoxXmlOptions, ABogusListIsEmpty) {
    UnicodeString bogus;
    bogus.setToBogus();
    EXPECT_FALSE(MoxXmlOptions::parse(bogus).indent);
    EXPECT_EQ(MoxXmlOptions::parse(bogus).decimals, all);
}

} // namespace

#include "foundation/common/MoxBogusString.h"

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

// Made before main, in the order of this source.
const bool wasReadyBeforeMain = MoxBogusString::BOGUS_VALUE.isBogus();

TEST(MoxBogusString, IsBogusAndDiffersFromTheEmptyText) {
    EXPECT_TRUE(MoxBogusString::BOGUS_VALUE.isBogus());
    EXPECT_NE(MoxBogusString::BOGUS_VALUE, UnicodeString());
}

TEST(MoxBogusString, CopyIsBogusUntilItIsSet) {
    UnicodeString copy = MoxBogusString::BOGUS_VALUE;
    EXPECT_TRUE(copy.isBogus());
    copy = UnicodeString(u"set");
    EXPECT_FALSE(copy.isBogus());
    EXPECT_TRUE(MoxBogusString::BOGUS_VALUE.isBogus());
}

TEST(MoxBogusString, IsReadyForStaticObjectsBeforeMain) { EXPECT_TRUE(wasReadyBeforeMain); }

} // namespace

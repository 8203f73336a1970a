#include "foundation/common/MoxEmptyString.h"

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

// Made before main, in the order of this source.
const bool wasReadyBeforeMain =
    MoxEmptyString::EMPTY_VALUE.isEmpty() && !MoxEmptyString::EMPTY_VALUE.isBogus();

TEST(MoxEmptyString, IsEmptyAndNotBogus) {
    EXPECT_TRUE(MoxEmptyString::EMPTY_VALUE.isEmpty());
    EXPECT_FALSE(MoxEmptyString::EMPTY_VALUE.isBogus());
}

TEST(MoxEmptyString, IsReadyForStaticObjectsBeforeMain) { EXPECT_TRUE(wasReadyBeforeMain); }

} // namespace

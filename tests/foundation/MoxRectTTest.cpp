#include "foundation/common/MoxRectT.h"

#include "foundation/common/MoxLength.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

TEST(MoxRectT, IsEmptyAtTheOriginByDefault) {
    const MoxRectT<MoxLength> rect;
    EXPECT_EQ(rect.x2.getRawValue(), 0.0F);
    EXPECT_EQ(rect, MoxRectT<MoxLength>());
}

TEST(MoxRectT, TakesTheFirstCornerBeforeTheSecond) {
    const MoxRectT<int> rect(1, 2, 3, 4);
    EXPECT_EQ(rect.x1, 1);
    EXPECT_EQ(rect.y1, 2);
    EXPECT_EQ(rect.x2, 3);
    EXPECT_EQ(rect.y2, 4);
}

TEST(MoxRectT, KeepsCornersThatAreTurnedRound) {
    const MoxRectT<int> rect(MoxPointT<int>(3, 4), MoxPointT<int>(1, 2));
    EXPECT_EQ(rect, MoxRectT<int>(3, 4, 1, 2));
    EXPECT_NE(rect, MoxRectT<int>(1, 2, 3, 4));
}

} // namespace

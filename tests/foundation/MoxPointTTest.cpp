#include "foundation/common/MoxPointT.h"

#include "foundation/common/MoxLength.h"

#include <gtest/gtest.h>

namespace {

using namespace MoxCommonNS;

TEST(MoxPointT, IsTheOriginByDefault) {
    const MoxPointT<int> point;
    EXPECT_EQ(point, MoxPointT<int>(0, 0));
}

TEST(MoxPointT, KeepsItsCoordinatesInOrder) {
    const MoxPointT<MoxLength> point(MoxLength::fromRaw(1.0F), MoxLength::fromRaw(2.0F));
    EXPECT_EQ(point.x.getRawValue(), 1.0F);
    EXPECT_EQ(point.y.getRawValue(), 2.0F);
}

TEST(MoxPointT, DiffersWhenEitherCoordinateDoes) {
    EXPECT_NE(MoxPointT<int>(1, 2), MoxPointT<int>(1, 3));
    EXPECT_NE(MoxPointT<int>(1, 2), MoxPointT<int>(0, 2));
}

} // namespace

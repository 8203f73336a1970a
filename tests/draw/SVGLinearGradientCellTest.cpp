#include "draw/SVGLinearGradientCell.h"

#include "tests/support/SvgPage.h"

#include <gtest/gtest.h>
#include <limits>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;

int directionOf(float x1, float y1, float x2, float y2) {
    return SVGLinearGradientCell().getDirection({pt(x1), pt(y1)}, {pt(x2), pt(y2)});
}

TEST(SVGLinearGradientCell, DirectionFollowsTheAxisOfTheGreaterDistance) {
    EXPECT_EQ(directionOf(0, 0, 5, 2), 18);
    EXPECT_EQ(directionOf(0, 0, 5, -2), 18);
    EXPECT_EQ(directionOf(5, 0, 0, 2), 66);
    EXPECT_EQ(directionOf(0, 0, 2, 5), 33);
    EXPECT_EQ(directionOf(0, 0, -2, 5), 33);
    EXPECT_EQ(directionOf(0, 5, 2, 0), 36);
}

TEST(SVGLinearGradientCell, DirectionOfEqualDistancesIsAlongX) {
    EXPECT_EQ(directionOf(0, 0, 5, 5), 18);
    EXPECT_EQ(directionOf(0, 0, 5, -5), 18);
    EXPECT_EQ(directionOf(5, 0, 0, -5), 66);
}

TEST(SVGLinearGradientCell, DirectionOfEqualPointsIsLeftwards) {
    EXPECT_EQ(directionOf(3, 4, 3, 4), 66);
}

TEST(SVGLinearGradientCell, DirectionOfDistancesThatCanNotBeComparedIsAlongY) {
    constexpr float undefined = std::numeric_limits<float>::quiet_NaN();
    EXPECT_EQ(directionOf(undefined, 0, 5, 1), 33);
    EXPECT_EQ(directionOf(0, 0, undefined, 0), 36);
}

TEST(SVGLinearGradientCell, StartsEmpty) {
    const SVGLinearGradientCell cell;
    EXPECT_EQ(cell.startColor, MoxColor());
    EXPECT_EQ(cell.endColor, MoxColor());
    EXPECT_EQ(cell.startFlag, 0);
    EXPECT_EQ(cell.endFlag, 0);
    EXPECT_EQ(cell.startValue, 0.0F);
    EXPECT_EQ(cell.endValue, 0.0F);
    EXPECT_EQ(cell.startPoint, MoxPointT<MoxLength>());
    EXPECT_EQ(cell.endPoint, MoxPointT<MoxLength>());
}

TEST(SVGLinearGradientCell, SwapsItsEndsWithAllThatBelongsToThem) {
    SVGLinearGradientCell cell;
    cell.reserved = 11;
    cell.startColor = MoxColor(255, 0, 0);
    cell.endColor = MoxColor(0, 0, 255);
    cell.startFlag = 1;
    cell.endFlag = 2;
    cell.startValue = 0.25F;
    cell.endValue = 0.75F;
    cell.startPoint = {pt(1), pt(2)};
    cell.endPoint = {pt(3), pt(4)};
    cell.replaceStartEnd();
    EXPECT_EQ(cell.reserved, 11U);
    EXPECT_EQ(cell.startColor, MoxColor(0, 0, 255));
    EXPECT_EQ(cell.endColor, MoxColor(255, 0, 0));
    EXPECT_EQ(cell.startFlag, 2);
    EXPECT_EQ(cell.endFlag, 1);
    EXPECT_EQ(cell.startValue, 0.75F);
    EXPECT_EQ(cell.endValue, 0.25F);
    EXPECT_EQ(cell.startPoint, (MoxPointT<MoxLength>(pt(3), pt(4))));
    EXPECT_EQ(cell.endPoint, (MoxPointT<MoxLength>(pt(1), pt(2))));
}

} // namespace
} // namespace DrawmereTest

#include "draw/SVGBasicImpl.h"

#include "tests/draw/ProfileChecks.h"

#include <cmath>
#include <limits>

namespace DrawmereTest {
namespace {

constexpr auto basic = SVGConfig::SVGTYPE_BASIC;

TEST(SVGBasicImpl, HasTheDialectBasic) { EXPECT_EQ(dialectOf<SVGBasicImpl>(), 1); }

TEST(SVGBasicImpl, LetsRectsAndClipPathsIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGBasicImpl>(basic), "clipPath rect");
}

TEST(SVGBasicImpl, DropsAClipPathInAClipPath) {
    EXPECT_FALSE(takesClipPathInClipPath<SVGBasicImpl>());
}

TEST(SVGBasicImpl, ClampsCoordinatesInTheCallersArray) {
    float points[] = {40000, -40000, 32768, -32768, 32767.5F, 0};
    EXPECT_EQ(drawPoints<SVGBasicImpl>(points, 6),
              "<polyline fill=\"none\" points=\"32768,-32768 32768,-32768 32767.5,0 \"/>");
    EXPECT_EQ(points[0], 32768);
    EXPECT_EQ(points[1], -32768);
    EXPECT_EQ(points[4], 32767.5F);
}

TEST(SVGBasicImpl, ClampsTheLastOfAnOddCountTooAndNothingBehindIt) {
    float points[] = {1, 2, 40000, 40000};
    EXPECT_EQ(drawPoints<SVGBasicImpl>(points, 3), "<polyline fill=\"none\" points=\"1,2 \"/>");
    EXPECT_EQ(points[2], 32768);
    EXPECT_EQ(points[3], 40000);
}

TEST(SVGBasicImpl, ClampsInfinitiesAndLeavesUndefinedNumbers) {
    constexpr float infinite = std::numeric_limits<float>::infinity();
    float points[] = {infinite, -infinite, std::nanf(""), 1};
    EXPECT_EQ(drawPoints<SVGBasicImpl>(points, 4),
              "<polyline fill=\"none\" points=\"32768,-32768 0,1 \"/>");
}

TEST(SVGBasicImpl, ClampsNothingWithoutCoordinates) {
    EXPECT_EQ(drawPoints<SVGBasicImpl>(nullptr, 4), "<polyline fill=\"none\" points=\"\"/>");
}

} // namespace
} // namespace DrawmereTest

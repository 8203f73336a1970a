#include "draw/SVGWispImpl.h"

#include "tests/draw/ProfileChecks.h"

namespace DrawmereTest {
namespace {

constexpr auto full = SVGConfig::SVGTYPE_FULL;

TEST(SVGWispImpl, HasTheDialectTiny) { EXPECT_EQ(dialectOf<SVGWispImpl>(), 2); }

TEST(SVGWispImpl, LetsEverythingIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGWispImpl>(full),
              "a circle clipPath ellipse g image line path polygon polyline rect text use");
}

TEST(SVGWispImpl, WritesCoordinatesAsTheyAre) {
    float points[] = {40000, -40000};
    EXPECT_EQ(drawPoints<SVGWispImpl>(points, 2),
              "<polyline fill=\"none\" points=\"40000,-40000 \"/>");
}

} // namespace
} // namespace DrawmereTest

#include "draw/SVGPlazmicImpl.h"

#include "tests/draw/ProfileChecks.h"

namespace DrawmereTest {
namespace {

constexpr auto plazmic = SVGConfig::SVGTYPE_PLAZMIC;

TEST(SVGPlazmicImpl, HasTheDialectFullThoughItsCallsAreThoseOfTiny) {
    EXPECT_EQ(dialectOf<SVGPlazmicImpl>(), 0);
    SVGConfig config;
    const SVGPlazmicImpl impl(&config);
    EXPECT_NE(dynamic_cast<const SVGTinyImpl*>(&impl), nullptr);
}

TEST(SVGPlazmicImpl, LetsRectsAndClipPathsIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGPlazmicImpl>(plazmic), "clipPath rect");
}

TEST(SVGPlazmicImpl, ClampsCoordinatesAsBasicDoes) {
    float points[] = {40000, -40000};
    EXPECT_EQ(drawPoints<SVGPlazmicImpl>(points, 2),
              "<polyline fill=\"none\" points=\"32768,-32768 \"/>");
}

} // namespace
} // namespace DrawmereTest

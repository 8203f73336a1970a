#include "draw/SVGTinyImpl.h"

#include "tests/draw/ProfileChecks.h"

namespace DrawmereTest {
namespace {

constexpr auto tiny = SVGConfig::SVGTYPE_TINY;

TEST(SVGTinyImpl, HasTheDialectTiny) { EXPECT_EQ(dialectOf<SVGTinyImpl>(), 2); }

TEST(SVGTinyImpl, LetsNothingIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGTinyImpl>(tiny), "");
}

TEST(SVGTinyImpl, ClampsCoordinatesAsBasicDoes) {
    float points[] = {40000, -40000};
    EXPECT_EQ(drawPoints<SVGTinyImpl>(points, 2),
              "<polyline fill=\"none\" points=\"32768,-32768 \"/>");
}

} // namespace
} // namespace DrawmereTest

#include "draw/SVGWispImpl.h"

#include "tests/draw/ProfileChecks.h"

namespace DrawmereTest {
namespace {

constexpr auto full = SVGConfig::SVGTYPE_FULL;

TEST(SVGWispImpl, HasTheDialectTiny) { EXPECT_EQ(dialectOf<SVGWispImpl>(), 2); }

TEST(SVGWispImpl, HasTheMembersOfTinyAndLeavesThemAlone) {
    DrawnTree<SVGWispImpl> tree(full);
    tree.impl.startLinearGradient(pt(0), pt(0), pt(1), pt(1), SVGMatrix(), USERSPACEONUSE, GRADPAD);
    tree.impl.setStopColor(MoxColor(255, 0, 0), 1, 1);
    tree.impl.endGradiant();
    EXPECT_TRUE(tree.impl.gradientId.isEmpty());
    EXPECT_EQ(tree.impl.lowStopColor, MoxColor());
    EXPECT_EQ(tree.impl.highStopColor, MoxColor());
    EXPECT_TRUE(tree.impl.noStopYet);
    EXPECT_EQ(tree.impl.highStopOffset, 0.0F);
    EXPECT_EQ(tree.impl.lowStopOffset, 0.0F);
}

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

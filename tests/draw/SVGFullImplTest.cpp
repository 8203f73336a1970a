#include "draw/SVGFullImpl.h"

#include "tests/draw/ProfileChecks.h"

namespace DrawmereTest {
namespace {

constexpr auto full = SVGConfig::SVGTYPE_FULL;

TEST(SVGFullImpl, HasTheDialectFull) { EXPECT_EQ(dialectOf<SVGFullImpl>(), 0); }

TEST(SVGFullImpl, LetsShapesTextsAndClipPathsIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGFullImpl>(full),
              "circle clipPath ellipse line path polygon polyline rect text");
}

TEST(SVGFullImpl, DropsAClipPathInAClipPath) {
    EXPECT_FALSE(takesClipPathInClipPath<SVGFullImpl>());
}

TEST(SVGFullImpl, OutsideAClipDefinitionTakesEverything) {
    DrawnTree tree;
    const MoxPtr<SVGElement> image = tree.make(SVGName::image);
    tree.impl.addElement(image.get(), /*direct=*/true, /*makeCurrent=*/false);
    EXPECT_EQ(image->getParentNode(), tree.root());
}

TEST(SVGFullImpl, WritesCoordinatesAsTheyAre) {
    float points[] = {40000, -40000};
    EXPECT_EQ(drawPoints<SVGFullImpl>(points, 2),
              "<polyline fill=\"none\" points=\"40000,-40000 \"/>");
    EXPECT_EQ(points[0], 40000);
}

} // namespace
} // namespace DrawmereTest

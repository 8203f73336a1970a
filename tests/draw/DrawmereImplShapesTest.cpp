// The shape calls: one element each, its attributes and their order.
#include "draw/DrawmereImpl.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tests/draw/DrawnTree.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace DrawmereTest {
namespace {

using MoxCommonNS::MOXUNIT_INCH;

constexpr auto none = PAINTMODE_NONE;

TEST(DrawmereImplShapes, ARectHasPlaceThenSize) {
    DrawnTree tree;
    tree.impl.drawRect(pt(1), pt(2), pt(3), pt(4), pt(0), pt(0), none);
    EXPECT_EQ(tree.shape(), "<rect x=\"1\" y=\"2\" width=\"3\" height=\"4\" fill=\"none\"/>");
}

TEST(DrawmereImplShapes, ARoundedRectHasBothRadiiBetweenPlaceAndSize) {
    const struct {
        float rx;
        float ry;
        const char* text;
    } rows[] = {
        {5, 6, " rx=\"5\" ry=\"6\""},
        {0, 5, " rx=\"0\" ry=\"5\""},
        {5, 0, " rx=\"5\" ry=\"0\""},
        {-0.0F, 0.0F, ""},
    };

    for (const auto& row : rows) {
        DrawnTree tree;
        tree.impl.drawRect(pt(1), pt(2), pt(3), pt(4), pt(row.rx), pt(row.ry), none);
        EXPECT_EQ(tree.shape(), std::string("<rect x=\"1\" y=\"2\"") + row.text +
                                    " width=\"3\" height=\"4\" fill=\"none\"/>");
    }
}

TEST(DrawmereImplShapes, ACircleHasCentreThenRadius) {
    DrawnTree tree;
    tree.impl.drawCircle(pt(1), pt(2), pt(3), none);
    EXPECT_EQ(tree.shape(), "<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>");
}

TEST(DrawmereImplShapes, AnEllipseHasCentreThenRadii) {
    DrawnTree tree;
    tree.impl.drawEllipse(pt(1), pt(2), pt(3), pt(4), none);
    EXPECT_EQ(tree.shape(), "<ellipse cx=\"1\" cy=\"2\" rx=\"3\" ry=\"4\" fill=\"none\"/>");
}

TEST(DrawmereImplShapes, ALineHasItsTwoEnds) {
    DrawnTree tree;
    tree.impl.drawLine(pt(1), pt(2), pt(3), pt(4), none);
    EXPECT_EQ(tree.shape(), "<line x1=\"1\" y1=\"2\" x2=\"3\" y2=\"4\" fill=\"none\"/>");
}

TEST(DrawmereImplShapes, LengthsAreWrittenInPoints) {
    DrawnTree tree;
    tree.impl.drawLine(MoxLength(1, MOXUNIT_INCH), pt(0.1F), pt(-2.5F), pt(33.333332F), none);
    EXPECT_EQ(tree.shape(),
              "<line x1=\"72\" y1=\"0.1\" x2=\"-2.5\" y2=\"33.333332\" fill=\"none\"/>");
}

TEST(DrawmereImplShapes, NumbersThatAreNoneAreWrittenAsZero) {
    DrawnTree tree;
    tree.impl.drawCircle(pt(std::nanf("")), pt(std::numeric_limits<float>::infinity()), pt(-0.0F),
                         none);
    EXPECT_EQ(tree.shape(), "<circle cx=\"0\" cy=\"0\" r=\"0\" fill=\"none\"/>");
}

TEST(DrawmereImplShapes, APolylineIsOpenAndAPolygonClosed) {
    float points[] = {1, 2, 3.5F, -4};
    DrawnTree open;
    open.impl.drawPoly(points, 4, /*open=*/true, none);
    EXPECT_EQ(open.shape(), "<polyline fill=\"none\" points=\"1,2 3.5,-4 \"/>");
    DrawnTree closed;
    closed.impl.drawPoly(points, 4, /*open=*/false, none);
    EXPECT_EQ(closed.shape(), "<polygon fill=\"none\" points=\"1,2 3.5,-4 \"/>");
}

TEST(DrawmereImplShapes, ThePointsStandBehindThePaintAndEndInABlank) {
    // On purpose: other shapes have their geometry first.
    float points[] = {1, 2, 3, 4};
    DrawnTree tree;
    tree.impl.getGContext()->setStrokeColorName(u"red");
    tree.impl.getGContext()->setFillRule(FILLRULE_NONZERO);
    tree.impl.getGContext()->setFillColorName(u"blue");
    tree.impl.drawPoly(points, 4, /*open=*/false, PAINTMODE_FILLSTROKE);
    EXPECT_EQ(tree.shape(), "<polygon stroke=\"red\" fill=\"blue\" fill-rule=\"nonzero\" "
                            "points=\"1,2 3,4 \"/>");
}

TEST(DrawmereImplShapes, TheLastOfAnOddCountOfCoordinatesIsDropped) {
    float points[] = {1, 2, 3};
    DrawnTree tree;
    tree.impl.drawPoly(points, 3, /*open=*/true, none);
    EXPECT_EQ(tree.shape(), "<polyline fill=\"none\" points=\"1,2 \"/>");
}

TEST(DrawmereImplShapes, ACountBelowOneOrANullGivesAnEmptyList) {
    float points[] = {1, 2};

    const struct {
        float* points;
        int count;
    } rows[] = {{points, 0},
                {points, -1},
                {points, 1},
                {nullptr, 4},
                {points, std::numeric_limits<int>::min()}};

    for (const auto& row : rows) {
        DrawnTree tree;
        tree.impl.drawPoly(row.points, row.count, /*open=*/true, none);
        EXPECT_EQ(tree.shape(), "<polyline fill=\"none\" points=\"\"/>");
    }
}

TEST(DrawmereImplShapes, PaintStandsBehindTheGeometry) {
    DrawnTree tree;
    tree.impl.getGContext()->setFillColorName(u"blue");
    tree.impl.getGContext()->setStrokeColorName(u"red");
    tree.impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILLSTROKE);
    EXPECT_EQ(tree.shape(), "<circle cx=\"1\" cy=\"2\" r=\"3\" stroke=\"red\" fill=\"blue\"/>");
}

TEST(DrawmereImplShapes, AShapeClosesAGroupOfAnotherKind) {
    DrawnTree tree;
    tree.impl.groupManager->setElemMode(PAINTMODE_FILL, ELEMENTTYPE_IMAGE);
    tree.impl.groupManager->addElement(tree.make(SVGName::image).get());
    tree.impl.drawCircle(pt(1), pt(2), pt(3), none);
    float points[] = {1, 2};
    tree.impl.groupManager->setElemMode(PAINTMODE_FILL, ELEMENTTYPE_IMAGE);
    tree.impl.groupManager->addElement(tree.make(SVGName::image).get());
    tree.impl.drawPoly(points, 2, /*open=*/true, none);
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(), "<g>\n<image/>\n</g>\n"
                              "<g>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n</g>\n"
                              "<g>\n<image/>\n</g>\n"
                              "<g>\n<polyline fill=\"none\" points=\"1,2 \"/>\n</g>\n");
}

} // namespace
} // namespace DrawmereTest

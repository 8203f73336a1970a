// Gradients and their stops.
#include "draw/DrawmereImpl.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tests/draw/FilteringImpl.h"
#include "tests/draw/QueuedErrors.h"
#include "tests/support/Golden.h"
#include "tree/SVGTreeManager.h"

#include <limits>

namespace DrawmereTest {
namespace {

constexpr char dot[] = "<g>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n</g>\n";

void drawDot(DrawmereImpl& impl) { impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE); }

void drawWord(DrawmereImpl& impl) {
    impl.drawText(u"word", pt(1), pt(2), PAINTMODE_FILL, nullptr, true, true);
}

UnicodeString startLinear(DrawmereImpl& impl, const SVGMatrix& matrix = {}, int units = 1,
                          int spread = 0) {
    return impl.startLinearGradient(pt(0), pt(0.5F), pt(1), pt(-2), matrix,
                                    static_cast<UNITSTYPE>(units),
                                    static_cast<GRADSPERADMOD>(spread));
}

UnicodeString startRadial(DrawmereImpl& impl, const SVGMatrix& matrix = {}, int units = 1,
                          int spread = 0) {
    return impl.startRadialGradient(pt(0.5F), pt(1), pt(2), pt(0), pt(-1), matrix,
                                    static_cast<UNITSTYPE>(units),
                                    static_cast<GRADSPERADMOD>(spread));
}

/// Returns: a document with one gradient, of which `start` makes the start.
template <typename Start> std::string drawGradient(Start start) {
    DrawnTree tree;
    start(tree.impl);
    tree.impl.endGradiant();
    return tree.content();
}

std::string linear(const std::string& attributes) {
    return "<defs>\n<linearGradient id=\"g0\"" + attributes +
           " x1=\"0\" y1=\"0.5\" x2=\"1\" y2=\"-2\"/>\n</defs>\n";
}

std::string radial(const std::string& attributes) {
    return "<defs>\n<radialGradient id=\"g0\"" + attributes +
           " cx=\"0.5\" cy=\"1\" r=\"2\" fx=\"0\" fy=\"-1\"/>\n</defs>\n";
}

struct AttributeRow {
    int units;
    int spread;
    const char* written;
};

constexpr AttributeRow attributeRows[] = {
    {1, 0, ""},
    {0, 0, " gradientUnits=\"userSpaceOnUse\""},
    {-1, 0, ""},
    {2, 0, ""},
    {1, 1, " spreadMethod=\"reflect\""},
    {1, 2, " spreadMethod=\"repeat\""},
    {1, 3, ""},
    {1, -1, ""},
    {0, 2, " gradientUnits=\"userSpaceOnUse\" spreadMethod=\"repeat\""},
};

TEST(DrawmereImplGradients, WriteUnitsAndSpreadThatAreNotTheUsualOnes) {
    for (const AttributeRow& row : attributeRows) {
        EXPECT_EQ(
            drawGradient([&](DrawmereImpl& impl) { startLinear(impl, {}, row.units, row.spread); }),
            linear(row.written))
            << row.units << " " << row.spread;
        EXPECT_EQ(
            drawGradient([&](DrawmereImpl& impl) { startRadial(impl, {}, row.units, row.spread); }),
            radial(row.written))
            << row.units << " " << row.spread;
    }
}

TEST(DrawmereImplGradients, WriteAnyMatrixButTheIdentity) {
    const struct {
        SVGMatrix matrix;
        const char* written;
    } rows[] = {
        {SVGMatrix(), ""},
        {SVGMatrix(1, 0, 0, 1, 3, 4), " gradientTransform=\"translate(3,4)\""},
        {SVGMatrix(2, 0, 0, 2, 0, 0), " gradientTransform=\"scale(2,2)\""},
        {SVGMatrix(0, 0, 0, 0, 0, 0), " gradientTransform=\"\""}, // says nothing
    };

    for (const auto& row : rows) {
        EXPECT_EQ(drawGradient([&](DrawmereImpl& impl) { startLinear(impl, row.matrix); }),
                  linear(row.written));
        EXPECT_EQ(drawGradient([&](DrawmereImpl& impl) { startRadial(impl, row.matrix); }),
                  radial(row.written));
    }
}

TEST(DrawmereImplGradients, WriteTheMatrixBehindUnitsAndSpread) {
    EXPECT_EQ(drawGradient(
                  [](DrawmereImpl& impl) { startLinear(impl, SVGMatrix(1, 0, 0, 1, 3, 4), 0, 1); }),
              linear(" gradientUnits=\"userSpaceOnUse\" spreadMethod=\"reflect\" "
                     "gradientTransform=\"translate(3,4)\""));
}

TEST(DrawmereImplGradients, OfNoFiniteNumbersAreWrittenWithZeros) {
    constexpr float infinite = std::numeric_limits<float>::infinity();
    constexpr float undefined = std::numeric_limits<float>::quiet_NaN();
    DrawnTree tree;
    tree.impl.startLinearGradient(pt(undefined), pt(infinite), pt(-infinite), pt(1), SVGMatrix(),
                                  OBJECTBOUNDINGBOX, GRADPAD);
    tree.impl.setStopColor(MoxColor(), undefined, infinite);
    tree.impl.endGradiant();
    EXPECT_EQ(tree.content(),
              "<defs>\n<linearGradient id=\"g0\" x1=\"0\" y1=\"0\" x2=\"0\" y2=\"1\">\n"
              "<stop stop-color=\"#000\" offset=\"0\" stop-opacity=\"0\"/>\n"
              "</linearGradient>\n</defs>\n");
}

TEST(DrawmereImplGradients, OfBothKindsAreNumberedInOneSeries) {
    DrawnTree tree;
    EXPECT_EQ(utf8(startRadial(tree.impl)), "g0");
    tree.impl.endGradiant();
    EXPECT_EQ(utf8(startLinear(tree.impl)), "g1");
    tree.impl.endGradiant();
    EXPECT_EQ(utf8(startRadial(tree.impl)), "g2");
}

TEST(DrawmereImplGradients, OfANewDocumentAreNumberedFromZeroAgain) {
    SvgPage page;
    const auto start = [&page] {
        const UnicodeString id = page->startLinearGradient(pt(0), pt(0), pt(1), pt(0), SVGMatrix(),
                                                           OBJECTBOUNDINGBOX, GRADPAD);
        page->endGradiant();
        return utf8(id);
    };
    EXPECT_EQ(start(), "g0");
    EXPECT_EQ(start(), "g1");
    page->finishRootSvg();
    page->initRootSvg(&page.stream);
    EXPECT_EQ(start(), "g0");
}

TEST(DrawmereImplGradients, HoldTheirStopsInTheOrderOfTheCalls) {
    DrawnTree tree;
    startLinear(tree.impl);
    tree.impl.setStopColor(MoxColor(255, 0, 0), 1, 1);
    tree.impl.setStopColor(MoxColor(0x123456), 0.25F, 0.5F);
    tree.impl.setStopColor(MoxColor(0, 0, 255), -3, 7); // nothing is clamped
    tree.impl.endGradiant();
    EXPECT_EQ(tree.content(),
              "<defs>\n<linearGradient id=\"g0\" x1=\"0\" y1=\"0.5\" x2=\"1\" y2=\"-2\">\n"
              "<stop stop-color=\"red\" offset=\"1\" stop-opacity=\"1\"/>\n"
              "<stop stop-color=\"#123456\" offset=\"0.25\" stop-opacity=\"0.5\"/>\n"
              "<stop stop-color=\"#00f\" offset=\"-3\" stop-opacity=\"7\"/>\n"
              "</linearGradient>\n</defs>\n");
}

TEST(DrawmereImplGradients, WriteColoursAsTheConfigurationWantsThem) {
    DrawnTree tree;
    tree.config.colorFlag = false;
    startLinear(tree.impl);
    tree.impl.setStopColor(MoxColor(255, 0, 0), 0, 1);
    EXPECT_EQ(
        toXml(*tree.impl.getDocument(), tree.impl.treeManager->getCurrentNode()->getFirstChild()),
        "<stop stop-color=\"#f00\" offset=\"0\" stop-opacity=\"1\"/>");
}

TEST(DrawmereImplGradients, PaintFillsAndStrokesByTheirId) {
    SvgPage page;
    const UnicodeString fill = page->startLinearGradient({pt(0), pt(10)}, {pt(20), pt(10)},
                                                         SVGMatrix(), USERSPACEONUSE, GRADREFLECT);
    page->setStopColor(MoxColor(255, 0, 0), 0, 1);
    page->setStopColor(MoxColor(0, 0, 255), 1, 0.5F);
    page->endGradiant();
    const UnicodeString stroke =
        page->startRadialGradient(pt(0.5F), pt(0.5F), pt(0.5F), pt(0.25F), pt(0.5F),
                                  SVGMatrix(1, 0, 0, 1, 0.25F, 0), OBJECTBOUNDINGBOX, GRADPAD);
    page->setStopColor(MoxColor(255, 255, 255), 0, 1);
    page->endGradiant();
    page->setFillColorId(fill);
    page->setStrokeColorId(stroke);
    page->drawRect(pt(0), pt(0), pt(50), pt(50), pt(0), pt(0), PAINTMODE_FILLSTROKE);
    EXPECT_GOLDEN(page, "paint/gradients");
}

TEST(DrawmereImplGradients, LetNothingElseIn) {
    DrawnTree tree;
    startLinear(tree.impl);
    drawDot(tree.impl);
    tree.impl.setStopColor(MoxColor(), 0, 1);
    drawDot(tree.impl);
    drawWord(tree.impl);
    tree.impl.doClip();
    tree.impl.startLink(u"u", MoxName());
    tree.impl.endLink();
    tree.impl.endGradiant();
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(),
              "<defs>\n<linearGradient id=\"g0\" x1=\"0\" y1=\"0.5\" x2=\"1\" y2=\"-2\">\n"
              "<stop stop-color=\"#000\" offset=\"0\" stop-opacity=\"1\"/>\n"
              "</linearGradient>\n</defs>\n");
}

TEST(DrawmereImplGradients, LetNoTextInThatAStopFollows) {
    DrawnTree tree;
    startLinear(tree.impl);
    drawWord(tree.impl);
    tree.impl.setStopColor(MoxColor(), 0, 1);
    tree.impl.endGradiant();
    EXPECT_EQ(tree.content().find("word"), std::string::npos);
}

TEST(DrawmereImplGradients, AStopClosesTheGroupOfAText) {
    DrawnTree tree;
    startLinear(tree.impl);
    drawWord(tree.impl);
    ASSERT_NE(tree.impl.groupManager->getGroupRootNode(), nullptr);
    tree.impl.setStopColor(MoxColor(), 0, 1);
    EXPECT_EQ(tree.impl.groupManager->getGroupRootNode(), nullptr);
}

TEST(DrawmereImplGradients, GoThroughTheFilterOfTheProfileWithTheirStops) {
    DrawnTree<FilteringImpl> tree;
    startLinear(tree.impl);
    tree.impl.setStopColor(MoxColor(), 0, 1);
    tree.impl.endGradiant();
    startRadial(tree.impl);
    EXPECT_EQ(tree.impl.told, "linearGradient direct current\nstop direct\n"
                              "radialGradient direct current\n");
}

TEST(DrawmereImplGradients, LetEverythingInToTheTreeBehindTheirEnd) {
    DrawnTree tree;
    const SVGElement* cursor = tree.impl.treeManager->getCurrentNode();
    tree.impl.getGContext()->setStrokeWidth(pt(3));
    startRadial(tree.impl);
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_GRADIENT);
    EXPECT_EQ(tree.impl.getGContext()->getCurrentGC()->strokeWidth, pt(1));
    EXPECT_FALSE(tree.impl.treeManager->unlocked);
    tree.impl.endGradiant();
    EXPECT_TRUE(tree.impl.treeManager->unlocked);
    EXPECT_EQ(tree.impl.getGContext()->getCurrentGC()->strokeWidth, pt(3));
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), cursor);
}

TEST(DrawmereImplGradients, AStopElsewhereDoesNothing) {
    DrawnTree tree;
    tree.impl.setStopColor(MoxColor(), 0, 1);
    drawDot(tree.impl);
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(), dot);
}

TEST(DrawmereImplGradients, AnEndWithoutAStartIsAnError) {
    DrawnTree tree;
    EXPECT_EQ(catchError([&] { tree.impl.endGradiant(); }), otherTypeError);
    drawDot(tree.impl);
    tree.impl.finishRootSvg();
    EXPECT_EQ(tree.content(), dot);
}

TEST(DrawmereImplGradients, WarnUnderTinyWhenTheyAreRadial) {
    // On purpose: a linear gradient gives no warning.
    DrawnTree tree(SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(utf8(startLinear(tree.impl)), "g0");
    tree.impl.endGradiant();
    EXPECT_EQ(takeErrors(tree.config), "");
    EXPECT_EQ(utf8(startRadial(tree.impl)), "g1");
    EXPECT_FALSE(tree.impl.treeManager->unlocked);
    tree.impl.endGradiant();
    EXPECT_EQ(takeErrors(tree.config), "16941 linerGradiant or radialGradiant element is required. "
                                       "It is not supported with SVG Tiny.\n");
}

} // namespace
} // namespace DrawmereTest

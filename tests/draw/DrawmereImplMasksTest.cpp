// Masks and patterns.
#include "draw/DrawmereImpl.h"
#include "refs/SVGRefIDManager.h"
#include "state/SVGGraphicContext.h"
#include "tests/draw/DrawnTree.h"
#include "tests/draw/QueuedErrors.h"
#include "tests/support/Golden.h"
#include "tree/SVGTreeManager.h"

#include <limits>

namespace DrawmereTest {
namespace {

constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

using Rect = MoxRectT<MoxLength>;

Rect rect(float x1, float y1, float x2, float y2) { return {pt(x1), pt(y1), pt(x2), pt(y2)}; }

/// Returns: the one definition of the document.
std::string readDefinition(DrawnTree<>& tree) {
    return toXml(*tree.impl.getDocument(), tree.root()->getFirstChild()->getFirstChild());
}

/// Returns: an empty mask with these units.
std::string drawMask(int units, int contentUnits) {
    DrawnTree tree;
    tree.impl.startMask(pt(1), pt(2.5F), pt(30), pt(40), static_cast<UNITSTYPE>(units),
                        static_cast<UNITSTYPE>(contentUnits));
    tree.impl.endMask();
    return readDefinition(tree);
}

/// Returns: an empty pattern.
std::string drawPattern(const Rect& area, const Rect& viewArea, const SVGMatrix& matrix = {},
                        int units = 1, int contentUnits = 0) {
    DrawnTree tree;
    tree.impl.startPattern(area, viewArea, matrix, static_cast<UNITSTYPE>(units),
                           static_cast<UNITSTYPE>(contentUnits));
    tree.impl.endPattern();
    return readDefinition(tree);
}

// Masks.

TEST(DrawmereImplMasks, WriteTheUnitsThatAreNotTheUsualOnes) {
    const std::string area = " x=\"1\" y=\"2.5\" width=\"30\" height=\"40\"/>";
    EXPECT_EQ(drawMask(1, 0), "<mask id=\"i0\"" + area);
    EXPECT_EQ(drawMask(0, 0), "<mask id=\"i0\" maskUnits=\"userSpaceOnUse\"" + area);
    EXPECT_EQ(drawMask(1, 1), "<mask id=\"i0\" maskContentUnits=\"objectBoundingBox\"" + area);
    EXPECT_EQ(drawMask(0, 1), "<mask id=\"i0\" maskUnits=\"userSpaceOnUse\" "
                              "maskContentUnits=\"objectBoundingBox\"" +
                                  area);
    EXPECT_EQ(drawMask(2, -1), "<mask id=\"i0\"" + area);
}

TEST(DrawmereImplMasks, AreNumberedInOneSeriesWithEmbeddedImages) {
    DrawnTree tree;
    const auto start = [&tree] {
        const UnicodeString id =
            tree.impl.startMask(pt(0), pt(0), pt(1), pt(1), OBJECTBOUNDINGBOX, OBJECTBOUNDINGBOX);
        tree.impl.endMask();
        return utf8(id);
    };
    EXPECT_EQ(start(), "i0");
    EXPECT_EQ(utf8(tree.impl.refIdManager->createReferenceID(SVGRefIDManager::REFIMAGE)), "i1");
    EXPECT_EQ(start(), "i2");
}

TEST(DrawmereImplMasks, HoldPaintedContentAndMaskByTheirId) {
    SvgPage page;
    page->setFillColor(MoxColor(255, 0, 0));
    const UnicodeString id =
        page->startMask(pt(0), pt(0), pt(50), pt(50), USERSPACEONUSE, USERSPACEONUSE);
    page->setFillColor(MoxColor(255, 255, 255));
    page->drawCircle(pt(25), pt(25), pt(20), PAINTMODE_FILL);
    page->endMask();
    page->pushState();
    page->setMaskReference(id);
    page->drawRect(pt(0), pt(0), pt(50), pt(50), pt(0), pt(0), PAINTMODE_FILL);
    page->popState();
    page->drawRect(pt(50), pt(50), pt(50), pt(50), pt(0), pt(0), PAINTMODE_FILL);
    EXPECT_GOLDEN(page, "paint/mask");
}

TEST(DrawmereImplMasks, KeepTheStateAndTheCursorFromBeforeTheirStart) {
    DrawnTree tree;
    const SVGElement* cursor = tree.impl.treeManager->getCurrentNode();
    tree.impl.getGContext()->setStrokeWidth(pt(3));
    tree.impl.startMask(pt(0), pt(0), pt(1), pt(1), USERSPACEONUSE, USERSPACEONUSE);
    EXPECT_EQ(tree.impl.getGContext()->getCurrentGC()->strokeWidth, pt(1));
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_MASK);
    EXPECT_FALSE(tree.impl.inClipDef);
    tree.impl.endMask();
    EXPECT_EQ(tree.impl.getGContext()->getCurrentGC()->strokeWidth, pt(3));
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), cursor);
}

TEST(DrawmereImplMasks, AnEndWithoutAStartIsAnError) {
    DrawnTree tree;
    EXPECT_EQ(catchError([&] { tree.impl.endMask(); }), otherTypeError);
}

TEST(DrawmereImplMasks, WarnUnderTinyAndRunAllTheSame) {
    DrawnTree tree(SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(utf8(tree.impl.startMask(pt(0), pt(0), pt(1), pt(1), USERSPACEONUSE, USERSPACEONUSE)),
              "i0");
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_MASK);
    tree.impl.endMask();
    EXPECT_EQ(takeErrors(tree.config),
              "16942 mask element is required. It is not supported with SVG Tiny.\n");
}

// Patterns.

TEST(DrawmereImplPatterns, WriteTheUnitsThatAreNotTheUsualOnes) {
    const auto draw = [](int units, int contentUnits) {
        return drawPattern(rect(0, 0, 8, 8), rect(0, 0, 8, 8), {}, units, contentUnits);
    };
    const std::string tail = " viewBox=\"0 0 8 8\" x=\"0\" y=\"0\" width=\"8\" height=\"8\"/>";
    EXPECT_EQ(draw(1, 0), "<pattern id=\"t0\"" + tail);
    EXPECT_EQ(draw(0, 0), "<pattern id=\"t0\" patternUnits=\"userSpaceOnUse\"" + tail);
    EXPECT_EQ(draw(1, 1), "<pattern id=\"t0\" patternContentUnits=\"objectBoundingBox\"" + tail);
    EXPECT_EQ(draw(0, 1), "<pattern id=\"t0\" patternUnits=\"userSpaceOnUse\" "
                          "patternContentUnits=\"objectBoundingBox\"" +
                              tail);
    EXPECT_EQ(draw(-1, 2), "<pattern id=\"t0\"" + tail);
}

TEST(DrawmereImplPatterns, WriteAnyMatrixButTheIdentity) {
    const auto draw = [](const SVGMatrix& matrix) {
        return drawPattern(rect(0, 0, 8, 8), rect(0, 0, 4, 4), matrix);
    };
    const std::string tail = " x=\"0\" y=\"0\" width=\"8\" height=\"8\"/>";
    EXPECT_EQ(draw(SVGMatrix()), "<pattern id=\"t0\" viewBox=\"0 0 4 4\"" + tail);
    EXPECT_EQ(draw(SVGMatrix(1, 0, 0, 1, 3, 4)),
              "<pattern id=\"t0\" viewBox=\"0 0 4 4\" patternTransform=\"translate(3,4)\"" + tail);
    EXPECT_EQ(draw(SVGMatrix(1, 2, 3, 4, 5, 6)),
              "<pattern id=\"t0\" viewBox=\"0 0 4 4\" patternTransform=\"matrix(1,2,3,4,5,6)\"" +
                  tail);
}

TEST(DrawmereImplPatterns, WithAMatrixThatSaysNothingHaveAnEmptyTransform) {
    EXPECT_EQ(drawPattern(rect(0, 0, 8, 8), rect(0, 0, 4, 4), SVGMatrix(0, 0, 0, 0, 0, 0)),
              "<pattern id=\"t0\" viewBox=\"0 0 4 4\" patternTransform=\"\" "
              "x=\"0\" y=\"0\" width=\"8\" height=\"8\"/>");
}

TEST(DrawmereImplPatterns, PutTheCornersOfTheirAreaInOrder) {
    const std::string expected = "<pattern id=\"t0\" viewBox=\"0 0 1 1\" x=\"1\" y=\"2.5\" "
                                 "width=\"3\" height=\"4.5\"/>";
    const Rect view = rect(0, 0, 1, 1);
    EXPECT_EQ(drawPattern(rect(1, 2.5F, 4, 7), view), expected);
    EXPECT_EQ(drawPattern(rect(4, 2.5F, 1, 7), view), expected);
    EXPECT_EQ(drawPattern(rect(1, 7, 4, 2.5F), view), expected);
    EXPECT_EQ(drawPattern(rect(4, 7, 1, 2.5F), view), expected);
}

TEST(DrawmereImplPatterns, LeaveTheCornersOfTheViewAsTheyAre) {
    // On purpose: the corners are not put in order, so the size may be negative.
    EXPECT_EQ(drawPattern(rect(0, 0, 1, 1), rect(5, 6, 2, 8.5F)),
              "<pattern id=\"t0\" viewBox=\"5 6 -3 2.5\" x=\"0\" y=\"0\" width=\"1\" "
              "height=\"1\"/>");
}

TEST(DrawmereImplPatterns, TakeDifferencesInSinglePrecision) {
    EXPECT_EQ(drawPattern(rect(0.1F, 0, 0.7F, 1), rect(0.1F, 0, 0.7F, 1)),
              "<pattern id=\"t0\" viewBox=\"0.1 0 0.59999996 1\" x=\"0.1\" y=\"0\" "
              "width=\"0.59999996\" height=\"1\"/>");
}

TEST(DrawmereImplPatterns, OfNoSizeAreWrittenWithZeros) {
    EXPECT_EQ(drawPattern(rect(3, 4, 3, 4), rect(3, 4, 3, 4)),
              "<pattern id=\"t0\" viewBox=\"3 4 0 0\" x=\"3\" y=\"4\" width=\"0\" height=\"0\"/>");
    EXPECT_EQ(drawPattern(rect(undefined, 0, 1, infinite), rect(-infinite, undefined, 1, 2)),
              "<pattern id=\"t0\" viewBox=\"0 0 0 0\" x=\"1\" y=\"0\" width=\"0\" height=\"0\"/>");
}

TEST(DrawmereImplPatterns, HoldPaintedContentAndPaintByTheirId) {
    SvgPage page;
    page->setFillColor(MoxColor(255, 0, 0));
    const UnicodeString first = page->startPattern(rect(0, 0, 8, 8), rect(0, 0, 4, 4), SVGMatrix(),
                                                   USERSPACEONUSE, USERSPACEONUSE);
    page->setFillColor(MoxColor(0, 0, 255));
    page->drawCircle(pt(2), pt(2), pt(1), PAINTMODE_FILL);
    page->endPattern();
    const UnicodeString second = page->startPattern(rect(0, 0, 0.5F, 0.5F), rect(0, 0, 1, 1),
                                                    SVGMatrix(), OBJECTBOUNDINGBOX, USERSPACEONUSE);
    page->endPattern();
    page->drawRect(pt(0), pt(0), pt(50), pt(50), pt(0), pt(0), PAINTMODE_FILL);
    page->setFillColorId(first);
    page->setStrokeColorId(second);
    page->drawRect(pt(50), pt(50), pt(50), pt(50), pt(0), pt(0), PAINTMODE_FILLSTROKE);
    EXPECT_GOLDEN(page, "paint/pattern");
}

TEST(DrawmereImplPatterns, AreNoClipDefinition) {
    DrawnTree tree;
    tree.impl.startPattern(rect(0, 0, 1, 1), rect(0, 0, 1, 1), SVGMatrix(), USERSPACEONUSE,
                           USERSPACEONUSE);
    EXPECT_FALSE(tree.impl.inClipDef);
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_PATTERN);
}

TEST(DrawmereImplPatterns, AnEndWithoutAStartIsAnError) {
    DrawnTree tree;
    EXPECT_EQ(catchError([&] { tree.impl.endPattern(); }), otherTypeError);
}

TEST(DrawmereImplPatterns, WarnUnderTinyAndRunAllTheSame) {
    DrawnTree tree(SVGConfig::SVGTYPE_TINY);
    EXPECT_EQ(utf8(tree.impl.startPattern(rect(0, 0, 1, 1), rect(0, 0, 1, 1), SVGMatrix(),
                                          USERSPACEONUSE, USERSPACEONUSE)),
              "t0");
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_PATTERN);
    tree.impl.endPattern();
    EXPECT_EQ(takeErrors(tree.config),
              "16943 pattern element is required. It is not supported with SVG Tiny.\n");
}

} // namespace
} // namespace DrawmereTest

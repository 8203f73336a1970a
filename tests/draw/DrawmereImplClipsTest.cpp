// Clip paths: their definition, and the clipping by them.
#include "draw/SVGTinyImpl.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tests/draw/FilteringImpl.h"
#include "tests/draw/QueuedErrors.h"
#include "tests/support/Golden.h"
#include "tree/SVGTreeManager.h"

namespace DrawmereTest {
namespace {

constexpr char tinyWarning[] =
    "16940 clipPath element is required. It is not supported with SVG Tiny.\n";

void drawBox(SvgPage& page, float x) {
    page->drawRect(pt(x), pt(10), pt(20), pt(20), pt(0), pt(0), PAINTMODE_FILL);
}

/// Defines a clip path with one box in it.
void defineClip(SvgPage& page, float x) {
    page->startClipDef(USERSPACEONUSE);
    drawBox(page, x);
    page->endClipDef();
}

/// Returns: what a document with one empty clip path holds.
std::string drawClipPath(int units) {
    DrawnTree tree;
    tree.impl.startClipDef(static_cast<UNITSTYPE>(units));
    tree.impl.endClipDef();
    return tree.content();
}

TEST(DrawmereImplClips, WriteTheirUnitsForTheBoundingBoxAlone) {
    const std::string usual = "<defs>\n<clipPath id=\"c0\"/>\n</defs>\n";
    EXPECT_EQ(drawClipPath(1),
              "<defs>\n<clipPath id=\"c0\" clipPathUnits=\"objectBoundingBox\"/>\n</defs>\n");
    for (const int units : {0, 2, -1, 1000}) {
        EXPECT_EQ(drawClipPath(units), usual) << units;
    }
}

TEST(DrawmereImplClips, AreNumberedFromZeroInTheOrderOfTheirStarts) {
    DrawnTree tree;
    tree.impl.startClipDef(USERSPACEONUSE);
    EXPECT_EQ(utf8(tree.impl.clipPathId), "c0");
    tree.impl.endClipDef();
    tree.impl.startClipRect(OBJECTBOUNDINGBOX);
    EXPECT_EQ(utf8(tree.impl.clipPathId), "c1");
    tree.impl.endClipDef();
    EXPECT_EQ(tree.content(),
              "<defs>\n<clipPath id=\"c0\"/>\n"
              "<clipPath id=\"c1\" clipPathUnits=\"objectBoundingBox\"/>\n</defs>\n");
}

TEST(DrawmereImplClips, HoldShapesWithoutPaintAndWithTheClipRule) {
    SvgPage page;
    page->setFillColor(MoxColor(255, 0, 0));
    page->setStrokeColor(MoxColor(0, 0, 255));
    page->startClipDef(USERSPACEONUSE);
    page->setClipRuleAttrVal(CLIPRULE_EVENODD);
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILLSTROKE);
    page->setClipRuleAttrVal(CLIPRULE_NONZERO);
    page->startPathData();
    page->setPathMoveTo({pt(1), pt(2)});
    page->setPathLineTo({pt(3), pt(2)});
    page->setPathLineTo({pt(3), pt(4)});
    page->endPathData(PAINTMODE_STROKE);
    page->drawText(u"Clip", pt(5), pt(6), PAINTMODE_FILL, nullptr, true, true);
    page->endClipDef();
    drawBox(page, 0);
    EXPECT_GOLDEN(page, "paint/clip-definition");
}

TEST(DrawmereImplClips, WritePaintAgainBehindTheirEnd) {
    DrawnTree tree;
    EXPECT_FALSE(tree.impl.inClipDef);
    tree.impl.startClipRect(USERSPACEONUSE);
    EXPECT_TRUE(tree.impl.inClipDef);
    tree.impl.endClipDef();
    EXPECT_FALSE(tree.impl.inClipDef);
}

TEST(DrawmereImplClips, KeepTheStateAndTheCursorFromBeforeTheirStart) {
    DrawnTree tree;
    const SVGElement* cursor = tree.impl.treeManager->getCurrentNode();
    tree.impl.getGContext()->setStrokeWidth(pt(3));
    tree.impl.startClipDef(USERSPACEONUSE);
    EXPECT_EQ(tree.impl.getGContext()->getCurrentGC()->strokeWidth, pt(1));
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_CLIP);
    tree.impl.endClipDef();
    EXPECT_EQ(tree.impl.getGContext()->getCurrentGC()->strokeWidth, pt(3));
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), cursor);
}

TEST(DrawmereImplClips, StayInForceBehindTheirEndAndEndWithTheState) {
    DrawnTree tree;
    tree.impl.pushState(ELEMENT_TYPE_PLAIN);
    tree.impl.startClipDef(USERSPACEONUSE);
    EXPECT_EQ(utf8(tree.impl.getGContext()->clipPathId), "url(#c0)");
    tree.impl.endClipDef();
    EXPECT_EQ(utf8(tree.impl.getGContext()->clipPathId), "url(#c0)");
    tree.impl.popState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(utf8(tree.impl.getGContext()->clipPathId), "");
}

TEST(DrawmereImplClips, AnEndWithoutAStartIsAnError) {
    DrawnTree tree;
    EXPECT_EQ(catchError([&] { tree.impl.endClipDef(); }), otherTypeError);
    tree.impl.pushState(ELEMENT_TYPE_MASK);
    EXPECT_EQ(catchError([&] { tree.impl.endClipDef(); }), otherTypeError);
}

TEST(DrawmereImplClips, AnEndThatFailsLeavesTheDefinitionOpen) {
    DrawnTree tree;
    tree.impl.startClipDef(USERSPACEONUSE);
    tree.impl.pushState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(catchError([&] { tree.impl.endClipDef(); }), otherTypeError);
    EXPECT_TRUE(tree.impl.inClipDef);
}

TEST(DrawmereImplClips, GoThroughTheFilterOfTheProfile) {
    DrawnTree<FilteringImpl> tree;
    tree.impl.startClipDef(USERSPACEONUSE);
    tree.impl.endClipDef();
    tree.impl.startClipRect(USERSPACEONUSE);
    tree.impl.endClipDef();
    EXPECT_EQ(tree.impl.told, "clipPath direct current\nclipPath direct current\n");
}

TEST(DrawmereImplClips, WarnUnderTinyOnceAndRunAllTheSame) {
    DrawnTree<SVGTinyImpl> tree(SVGConfig::SVGTYPE_TINY);
    tree.impl.startClipDef(USERSPACEONUSE);
    EXPECT_EQ(utf8(tree.impl.clipPathId), "c0");
    EXPECT_TRUE(tree.impl.inClipDef);
    tree.impl.endClipDef();
    EXPECT_EQ(takeErrors(tree.config), tinyWarning);
}

TEST(DrawmereImplClips, OfARectangleNeverWarn) {
    DrawnTree<SVGTinyImpl> tree(SVGConfig::SVGTYPE_TINY);
    tree.impl.startClipRect(USERSPACEONUSE);
    EXPECT_EQ(utf8(tree.impl.clipPathId), "c0");
    tree.impl.endClipDef();
    EXPECT_EQ(takeErrors(tree.config), "");
}

TEST(DrawmereImplClips, WarnUnderTinyAlone) {
    for (const SVGConfig::SVGTYPE profile :
         {SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_BASIC, SVGConfig::SVGTYPE_PLAZMIC}) {
        DrawnTree tree(profile);
        tree.impl.startClipDef(USERSPACEONUSE);
        EXPECT_EQ(takeErrors(tree.config), "") << profile;
    }
}

// Clipping.

TEST(DrawmereImplClips, ClipAllThatFollowsUpToThePop) {
    SvgPage page;
    page->pushState();
    page->setTransMatrix(SVGMatrix(1, 0, 0, 1, 30, 40));
    defineClip(page, 5);
    page->doClip();
    drawBox(page, 0);
    page->drawText(u"inside", pt(1), pt(2), PAINTMODE_FILL, nullptr, true, true);
    page->popState();
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "paint/clip");
}

TEST(DrawmereImplClips, OneInAnotherClipByBoth) {
    SvgPage page;
    page->pushState();
    page->setTransMatrix(SVGMatrix(1, 0, 0, 1, 30, 40));
    defineClip(page, 5);
    page->doClip();
    page->setTransMatrix(SVGMatrix(2, 0, 0, 2, 0, 0));
    defineClip(page, 1);
    page->doClip();
    drawBox(page, 0);
    page->popState();
    EXPECT_GOLDEN(page, "paint/clip-in-clip");
}

TEST(DrawmereImplClips, AfterAGroupBeganClipWhatFollowsAlone) {
    SvgPage page;
    page->pushState();
    drawBox(page, 0);
    defineClip(page, 5);
    page->doClip();
    drawBox(page, 20);
    page->popState();
    EXPECT_GOLDEN(page, "paint/clip-after-group");
}

TEST(DrawmereImplClips, WithAGroupOpenClipNothing) {
    // On purpose: with a group open the clipping one stands in it and takes nothing in.
    SvgPage page;
    defineClip(page, 5);
    drawBox(page, 0);
    page->doClip();
    drawBox(page, 20);
    EXPECT_GOLDEN(page, "paint/clip-with-group-open");
}

TEST(DrawmereImplClips, WithAGroupOpenLeaveTheMatrixToWhatFollowsTheGroup) {
    SvgPage page;
    defineClip(page, 5);
    drawBox(page, 0);
    page->setTransMatrix(SVGMatrix(1, 0, 0, 1, 30, 40));
    page->doClip();
    drawBox(page, 20);
    page->drawText(u"behind", pt(1), pt(2), PAINTMODE_FILL, nullptr, true, true);
    EXPECT_GOLDEN(page, "paint/clip-with-group-open-and-matrix");
}

TEST(DrawmereImplClips, WithAGroupOpenLeaveTheCursorWhereItIs) {
    DrawnTree tree;
    tree.impl.startClipDef(USERSPACEONUSE);
    tree.impl.endClipDef();
    tree.impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE);
    const SVGElement* cursor = tree.impl.treeManager->getCurrentNode();
    const SVGElement* group = tree.impl.groupManager->getGroupRootNode();
    ASSERT_NE(group, nullptr);
    tree.impl.doClip();
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), cursor);
    EXPECT_EQ(tree.impl.groupManager->getGroupRootNode(), group);
    EXPECT_EQ(toXml(*tree.impl.getDocument(), group->getFirstChild()->getNextSibling()),
              "<g clip-path=\"url(#c0)\"/>");
    EXPECT_TRUE(tree.impl.getGContext()->clipState);
}

TEST(DrawmereImplClips, WithoutAGroupMoveTheCursorIntoTheirOwn) {
    DrawnTree tree;
    tree.impl.startClipDef(USERSPACEONUSE);
    tree.impl.endClipDef();
    tree.impl.doClip();
    EXPECT_EQ(toXml(*tree.impl.getDocument(), tree.impl.treeManager->getCurrentNode()),
              "<g clip-path=\"url(#c0)\"/>");
    EXPECT_TRUE(tree.impl.getGContext()->clipState);
}

TEST(DrawmereImplClips, WithinADefinitionOfOneDoNothing) {
    DrawnTree tree;
    tree.impl.startClipDef(USERSPACEONUSE);
    const SVGElement* cursor = tree.impl.treeManager->getCurrentNode();
    tree.impl.doClip();
    EXPECT_FALSE(tree.impl.getGContext()->clipState);
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), cursor);
    EXPECT_EQ(cursor->getFirstChild(), nullptr);
    EXPECT_EQ(tree.root()->getFirstChild()->getNextSibling(), nullptr);
}

TEST(DrawmereImplClips, AheadOfAnySavedStateActOnThatOfThePage) {
    DrawnTree tree;
    tree.impl.getGContext()->setClipPathID(u"own");
    tree.impl.doClip();
    EXPECT_EQ(tree.content(), "<g clip-path=\"url(#own)\"/>\n");
}

TEST(DrawmereImplClips, WithoutADefinitionAreAGroupThatClipsNothing) {
    SvgPage page;
    page->doClip();
    drawBox(page, 0);
    EXPECT_EQ(page.body(), "<g>\n<g>\n<rect x=\"0\" y=\"10\" width=\"20\" height=\"20\" "
                           "fill=\"none\"/>\n</g>\n</g>");
}

TEST(DrawmereImplClips, AreNotWrittenInTheTinyDialect) {
    DrawnTree tree;
    tree.impl.getGContext()->setSVGType(SVGConfig::SVGTYPE_TINY);
    tree.impl.startClipRect(USERSPACEONUSE);
    tree.impl.endClipDef();
    tree.impl.doClip();
    EXPECT_EQ(toXml(*tree.impl.getDocument(), tree.impl.treeManager->getCurrentNode()), "<g/>");
}

TEST(DrawmereImplClips, LeaveNoGroupThatNothingIsDrawnIn) {
    SvgPage page;
    page->pushState();
    defineClip(page, 5);
    page->doClip();
    page->popState();
    drawBox(page, 0);
    EXPECT_EQ(page.body(), "<defs>\n<clipPath id=\"c0\">\n<rect x=\"5\" y=\"10\" width=\"20\" "
                           "height=\"20\" fill=\"none\" clip-rule=\"evenodd\"/>\n</clipPath>\n"
                           "</defs>\n<g>\n<rect x=\"0\" y=\"10\" width=\"20\" height=\"20\" "
                           "fill=\"none\"/>\n</g>");
}

TEST(DrawmereImplClips, LeaveNoEmptyGroupWhenTheTreeWasLockedEither) {
    SvgPage page;
    drawBox(page, 0);
    page.drawmere.impl->treeManager->setupStopLock();
    page->doClip();
    page.drawmere.impl->treeManager->defuseStopLock();
    drawBox(page, 0);
    EXPECT_EQ(page.body().find("<g/>"), std::string::npos);
}

} // namespace
} // namespace DrawmereTest

#include "path/SVGDrawElement.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tests/draw/PathData.h"
#include "tests/support/Golden.h"
#include "tests/support/Utf8.h"
#include "tree/SVGTreeManager.h"

#include <limits>

namespace DrawmereTest {
namespace {

constexpr float largest = std::numeric_limits<float>::max();
constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

void drawBox(SvgPage& page, float x) {
    page->drawRect(pt(x), pt(10), pt(20), pt(20), pt(0), pt(0), PAINTMODE_FILL);
}

/// Draws a path of one line.
void drawStroke(SvgPage& page, float x, PAINTMODE mode = PAINTMODE_STROKE) {
    page->startPathData();
    page->setPathMoveTo(at(x, 10));
    page->setPathLineTo(at(x + 20, 30));
    page->endPathData(mode);
}

TEST(DrawmereImplPaths, EveryCallAddsOneCommand) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->startPathData();
    page->setPathMoveTo(at(10, 20));
    page->setPathLineTo(at(15, 20));
    page->setPathLineTo(at(15, 23));
    page->setPathCubicBezierCurveTo(at(16, 25), at(18, 27), at(20, 29));
    page->setPathClosepath();
    page->setPathMoveTo(at(50, 50));
    page->setPathQuadraticBezierCurveTo(at(60, 40.5F), at(70, 50));
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "path/every-command");
}

TEST(DrawmereImplPaths, APathOfOneMoveIsAnElement) {
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) { impl.setPathMoveTo(at(10, 20)); }), "M10,20");
}

TEST(DrawmereImplPaths, APathThatBeginsWithALineStaysAbsolute) {
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) {
                  impl.setPathLineTo(at(1, 2));
                  impl.setPathLineTo(at(3, 4));
              }),
              "L1,2L3,4");
}

TEST(DrawmereImplPaths, BehindAQuadraticCurveTheNumbersAreThoseOfTheAbsolutePoint) {
    EXPECT_EQ(dataOf([](DrawmereImpl& impl) {
                  impl.setPathMoveTo(at(10, 10));
                  impl.setPathQuadraticBezierCurveTo(at(20, 20), at(30, 10));
                  impl.setPathLineTo(at(40, 50));
              }),
              "M10,10q10,10 20,0l40,50");
}

TEST(DrawmereImplPaths, APathJoinsTheOpenGroupAndIsTheLastInIt) {
    SvgPage page;
    drawBox(page, 0);
    drawStroke(page, 20);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "path/last-of-its-group");
}

TEST(DrawmereImplPaths, APathClosesAGroupOfAnotherKind) {
    SvgPage page;
    SVGGroupManager& groups = *page.drawmere.impl->groupManager;
    groups.setElemMode(PAINTMODE_NONE, ELEMENTTYPE_IMAGE);
    groups.addElement(page.drawmere.impl->getDocument()->createSVGElement(SVGName::image).get());
    drawStroke(page, 20, PAINTMODE_NONE);
    EXPECT_EQ(page.body(),
              "<g>\n<image/>\n</g>\n<g>\n<path d=\"M20,10l20,20\" fill=\"none\"/>\n</g>");
}

TEST(DrawmereImplPaths, EachPathHasAGroupOfItsOwn) {
    SvgPage page;
    page->setLineCap(LINECAP_ROUND);
    drawStroke(page, 0);
    page->setLineCap(LINECAP_BUTT);
    drawStroke(page, 20);
    EXPECT_GOLDEN(page, "path/groups-of-their-own");
}

TEST(DrawmereImplPaths, ThePaintStandsBehindTheDataAndBeforeTheState) {
    SvgPage page;
    page->setStrokeColor(MoxColor(0, 0, 255));
    page->setFillColor(MoxColor(255, 0, 0));
    page->setFillRule(FILLRULE_NONZERO);
    drawBox(page, 0);
    page->setStrokeWidth(pt(3));
    page->setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    drawStroke(page, 20, PAINTMODE_FILLSTROKE);
    drawStroke(page, 40, PAINTMODE_NONE);
    EXPECT_GOLDEN(page, "path/paint");
}

TEST(DrawmereImplPaths, APathWithoutSegmentsLeavesTheTreeAndTheOpenGroupAsTheyWere) {
    SvgPage page;
    drawBox(page, 0);
    page->startPathData();
    page->endPathData(PAINTMODE_STROKE);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "path/without-segments");
}

TEST(DrawmereImplPaths, TheEndOfAPathThatNeverBeganDoesNothing) {
    SvgPage page;
    drawBox(page, 0);
    page->endPathData(PAINTMODE_STROKE);
    drawStroke(page, 20);
    page->endPathData(PAINTMODE_FILL);
    page->endPathData(PAINTMODE_FILL);
    EXPECT_EQ(page.drawmere.impl->lastPathPaintMode, PAINTMODE_STROKE);
    EXPECT_EQ(page.drawmere.impl->savedGroupManager, nullptr);
    EXPECT_GOLDEN(page, "path/stray-end");
}

TEST(DrawmereImplPaths, SegmentsWithoutAnOpenPathGoNowhere) {
    SvgPage page;
    page->setPathMoveTo(at(1, 2));
    page->setPathLineTo(at(3, 4));
    page->setPathCubicBezierCurveTo(at(1, 2), at(3, 4), at(5, 6));
    page->setPathQuadraticBezierCurveTo(at(1, 2), at(3, 4));
    page->setPathClosepath();
    page.drawmere.impl->closePath(true);
    page.drawmere.impl->ellipticalArcTo(1, 2, 3, true, true, 4, 5, true);
    page->startPathData();
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_EQ(page.body(), "");
}

TEST(DrawmereImplPaths, ASecondStartDrawsTheOpenPathWithTheModeOfTheOneBefore) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->setFillColor(MoxColor(255, 0, 0));
    drawStroke(page, 0, PAINTMODE_STROKE);
    page->startPathData();
    page->setPathMoveTo(at(20, 10));
    page->setPathLineTo(at(20, 30));
    page->startPathData();
    page->setPathMoveTo(at(40, 10));
    page->setPathLineTo(at(40, 30));
    page->endPathData(PAINTMODE_FILL);
    EXPECT_GOLDEN(page, "path/second-start");
}

TEST(DrawmereImplPaths, ASecondStartBeforeAnyPathHasEndedFills) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    page->setFillColor(MoxColor(255, 0, 0));
    page->startPathData();
    page->setPathMoveTo(at(20, 10));
    page->startPathData();
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "path/second-start-fills");
}

TEST(DrawmereImplPaths, ASecondStartBehindAnEmptyOneKeepsTheModeBefore) {
    SvgPage page;
    drawStroke(page, 0, PAINTMODE_STROKE);
    page->startPathData();
    page->endPathData(PAINTMODE_FILL);
    EXPECT_EQ(page.drawmere.impl->lastPathPaintMode, PAINTMODE_STROKE);
    page->startPathData();
    page->startPathData();
    page->endPathData(PAINTMODE_FILL);
    EXPECT_EQ(page.drawmere.impl->lastPathPaintMode, PAINTMODE_STROKE);
}

// On purpose: a shape, a text or a setting between start and end is lost. Letting it through would
// put it into a group that the path is about to close.
TEST(DrawmereImplPaths, WhatIsDrawnOrSetInAnOpenPathIsLost) {
    SvgPage page;
    drawBox(page, 0);
    page->startPathData();
    page->setPathMoveTo(at(10, 10));
    drawBox(page, 20);
    page->drawText(u"lost", pt(1), pt(2), PAINTMODE_FILL, nullptr, false, true);
    page->setStrokeColor(MoxColor(255, 0, 0));
    page->setStrokeWidth(pt(7));
    page->setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    page->setPathLineTo(at(20, 10));
    page->endPathData(PAINTMODE_STROKE);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "path/lost-inside");
}

TEST(DrawmereImplPaths, APushAndAPopInAnOpenPathLeaveTheGroupsAlone) {
    SvgPage page;
    page->setLineCap(LINECAP_ROUND);
    drawBox(page, 0);
    page->startPathData();
    page->setPathMoveTo(at(10, 10));
    page->pushState();
    page->setPathLineTo(at(20, 10));
    page->popState();
    page->endPathData(PAINTMODE_STROKE);
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "path/states-inside");
}

TEST(DrawmereImplPaths, APushWithoutAPopInAPathLeavesThePageUsable) {
    SvgPage page;
    page->startPathData();
    page->setPathMoveTo(at(10, 10));
    page->pushState();
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_EQ(page.drawmere.impl->treeManager->context, page.drawmere.impl->getGContext());
    page->startLink(u"other.svg", MoxName());
    drawBox(page, 0);
    page->endLink();
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "path/push-left-open");
}

TEST(DrawmereImplPaths, APopInAPathOfAStatePushedBeforeItLeavesThePageUsable) {
    SvgPage page;
    page->pushState();
    page->setLineCap(LINECAP_ROUND);
    page->startPathData();
    page->setPathMoveTo(at(10, 10));
    page->popState();
    page->endPathData(PAINTMODE_STROKE);
    drawBox(page, 0);
    page->popState();
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "path/pop-inside");
}

TEST(DrawmereImplPaths, ALinkInAnOpenPathStandsInTheTreeWithoutThePath) {
    SvgPage page;
    page->startPathData();
    page->setPathMoveTo(at(10, 10));
    page->startLink(u"other.svg", MoxName());
    page->endLink();
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_EQ(page.drawmere.impl->treeManager->context, page.drawmere.impl->getGContext());
    EXPECT_GOLDEN(page, "path/link-inside");
}

TEST(DrawmereImplPaths, TheStateOfThePageIsBackWhenThePathEnds) {
    SvgPage page;
    const SVGGraphicContext* state = page.drawmere.impl->getGContext();
    page->startPathData();
    EXPECT_NE(page.drawmere.impl->getGContext(), state);
    EXPECT_EQ(page.drawmere.impl->groupManager->getType(), 4);
    EXPECT_EQ(page.drawmere.impl->groupManager->getTreeManager(), page.drawmere.impl->treeManager);
    page->setPathMoveTo(at(10, 10));
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_EQ(page.drawmere.impl->getGContext(), state);
    EXPECT_EQ(page.drawmere.impl->groupManager->getType(), 0);
    EXPECT_EQ(page.drawmere.impl->savedGroupManager, nullptr);
}

TEST(DrawmereImplPaths, APathLeftOpenAtTheEndBreaksNothing) {
    SvgPage page;
    drawStroke(page, 0);
    page->startPathData();
    page->setPathMoveTo(at(40, 10));
    EXPECT_GOLDEN(page, "path/left-open");
}

TEST(DrawmereImplPaths, APathLeftOpenAtTheEndLosesItselfAlone) {
    SvgPage page;
    drawBox(page, 0);
    page->startPathData();
    page->setPathMoveTo(at(40, 10));
    EXPECT_GOLDEN(page, "path/left-open-behind-a-shape");
}

TEST(DrawmereImplPaths, PathsAreTheSameInEveryProfile) {
    using enum SVGConfig::SVGTYPE;
    for (const auto profile :
         {SVGTYPE_FULL, SVGTYPE_BASIC, SVGTYPE_TINY, SVGTYPE_WISP, SVGTYPE_PLAZMIC}) {
        SvgPage page(profile);
        page->setStrokeColor(MoxColor());
        drawStroke(page, 10);
        EXPECT_GOLDEN(page, "path/every-profile");
    }
}

TEST(DrawmereImplPaths, PathsInALinkStayInTheLink) {
    SvgPage page;
    page->startLink(u"other.svg", MoxName());
    drawStroke(page, 0);
    drawStroke(page, 20);
    page->endLink();
    drawStroke(page, 40);
    EXPECT_GOLDEN(page, "path/in-link");
}

TEST(DrawmereImplPaths, CoordinatesThatAreNotFiniteAreZeroAndTheLargestKeepTheirDigits) {
    SvgPage page;
    page->startPathData();
    page->setPathMoveTo(at(undefined, infinite));
    page->setPathCubicBezierCurveTo(at(-infinite, 1), at(2, undefined), at(3, 4));
    page->endPathData(PAINTMODE_STROKE);
    page->startPathData();
    page->setPathMoveTo(at(largest, -largest));
    page->setPathLineTo(at(0, 0));
    page->setPathLineTo(at(-largest, -largest));
    page->setPathLineTo(at(largest, largest)); // twice the largest number is infinite
    page->endPathData(PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "path/extreme-coordinates");
}

TEST(DrawmereImplPaths, AHundredThousandPathsAndAPathOfAsManySegmentsAreWrittenWhole) {
    constexpr int many = 100'000;
    SvgPage page;
    for (int i = 0; i < many; ++i) {
        page->startPathData();
        page->endPathData(PAINTMODE_FILL);
    }
    page->startPathData();
    page->setPathMoveTo(at(0, 0));
    for (int i = 1; i <= many; ++i) {
        page->setPathLineTo(at(static_cast<float>(i), static_cast<float>(i)));
    }
    page->endPathData(PAINTMODE_STROKE);
    const XmlReading reading = readXml(page.document());
    EXPECT_EQ(reading.error, "");
    EXPECT_EQ(reading.element("path").attribute("d").size(), 4U + 4U * many);
}

/// Draws a text in a font of `size`. Returns: the size of the font that the group manager holds.
MoxLength sizeAfterText(SvgPage& page, float size) {
    SVGFont font;
    font.setFontAttribute(u"Courier", pt(size), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, u"", false);
    page->setFont(&font, nullptr);
    page->drawText(u"word", pt(1), pt(2), PAINTMODE_FILL, nullptr, false, true);
    return page.drawmere.impl->groupManager->font.fontSize;
}

TEST(DrawmereImplPaths, TheGroupManagerHoldsTheFontOfTheFirstText) {
    SvgPage page;
    EXPECT_EQ(page.drawmere.impl->groupManager->font.fontSize, FONTSIZE_MEDIUM);
    EXPECT_EQ(sizeAfterText(page, 12), pt(12));
    EXPECT_EQ(utf8(page.drawmere.impl->groupManager->font.fontName), "Courier");
    EXPECT_EQ(sizeAfterText(page, 14), pt(12));
}

TEST(DrawmereImplPaths, AfterAPathTheFirstTextHandsItsFontToTheGroupAgain) {
    SvgPage page;
    EXPECT_EQ(sizeAfterText(page, 12), pt(12));
    page->startPathData();
    EXPECT_EQ(page.drawmere.impl->savedGroupManager->font.fontSize, FONTSIZE_MEDIUM);
    page->endPathData(PAINTMODE_FILL);
    EXPECT_EQ(sizeAfterText(page, 16), pt(16));
}

TEST(DrawmereImplPaths, AnObjectThatGoesWithAnOpenPathTakesItAlong) {
    SVGConfig config;
    const auto move = MoxCommonNS::MoxPtr<SVGDrawElement>(new SVGDrawElementMoveTo(at(1, 2)));
    {
        DrawmereImpl impl(&config);
        impl.initRootSvg();
        impl.startPathData();
        impl.groupManager->appendPathCommand(move.get());
        EXPECT_EQ(move->getReferenceCount(), 2);
    }
    EXPECT_EQ(move->getReferenceCount(), 1);
}

} // namespace
} // namespace DrawmereTest

#include "path/SVGPathManager.h"

#include "SVGConfig.h"
#include "foundation/common/MoxError.h"
#include "state/SVGGraphicContext.h"
#include "tests/path/OpenPath.h"
#include "tests/path/Segments.h"
#include "tests/support/Utf8.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>

#include <limits>

namespace DrawmereNS {
namespace {

using DrawmereTest::utf8;

constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

/// A path that tells what its quadratic curve does to `next`.
std::string behindQuadratic(const MoxPtr<SVGDrawElement>& next) {
    return OpenPath().move(10, 10).quadratic(at(20, 20), at(30, 10)).add(next).data();
}

TEST(SVGPathManager, StartsEmptyAndUnlockedWithAStateOfItsOwn) {
    SVGConfig config;
    SVGPathManager manager(&config);
    EXPECT_EQ(manager.getType(), 4);
    EXPECT_TRUE(manager.segments.empty());
    EXPECT_TRUE(manager.getPathSeg().isEmpty());
    EXPECT_FALSE(manager.pathLock);
    EXPECT_EQ(manager.getGContext(), manager.context);
    EXPECT_EQ(manager.getGContext()->getType(), ELEMENT_TYPE_NONE);
    EXPECT_EQ(manager.getGContext()->config, &config);
}

TEST(SVGPathManager, PushesPopsAndScalesDoNothing) {
    OpenPath path;
    path.manager.push(ELEMENT_TYPE_MASK);
    path.manager.pop(ELEMENT_TYPE_PLAIN);
    path.manager.setScale(3);
    path.manager.addStopElem(nullptr);
    EXPECT_EQ(path.manager.getScale(), 1.0F);
    EXPECT_EQ(path.manager.getGContext()->getType(), ELEMENT_TYPE_NONE);
}

TEST(SVGPathManager, TheFirstMoveIsAbsoluteAndAllElseIsRelative) {
    OpenPath path;
    path.move(10, 20).line(15, 20).line(15, 23).cubic(at(16, 25), at(18, 27), at(20, 29)).close();
    EXPECT_EQ(path.data(), "M10,20h5v3c1,2 3,4 5,6z");
}

TEST(SVGPathManager, APathOfOneMoveIsThatMove) {
    EXPECT_EQ(OpenPath().move(10, 20).data(), "M10,20");
}

TEST(SVGPathManager, EachMoveIsRelativeToThePointBefore) {
    EXPECT_EQ(OpenPath().move(1, 2).move(4, 6).data(), "M1,2m3,4");
    EXPECT_EQ(OpenPath().move(1, 2).move(4, 6).move(4, 6).line(5, 7).data(), "M1,2m3,4m0,0l1,1");
}

TEST(SVGPathManager, WhatFollowsACloseIsRelativeToTheStartOfTheSubpath) {
    EXPECT_EQ(OpenPath().move(10, 20).line(15, 25).close().line(12, 25).data(), "M10,20l5,5zl2,5");
    EXPECT_EQ(OpenPath()
                  .move(10, 20)
                  .line(15, 25)
                  .close()
                  .move(30, 30)
                  .line(31, 32)
                  .close()
                  .line(35, 30)
                  .data(),
              "M10,20l5,5zm20,10l1,2zh5");
    EXPECT_EQ(OpenPath().move(10, 20).close().close().line(10, 21).data(), "M10,20zzv1");
}

// On purpose: a path that doesn't begin with an absolute move stays as it is. Making it relative
// would need a point to start from.
TEST(SVGPathManager, APathThatDoesNotBeginWithAnAbsoluteMoveStaysAbsolute) {
    EXPECT_EQ(OpenPath().line(1, 2).line(3, 4).data(), "L1,2L3,4");
    EXPECT_EQ(OpenPath().close().move(1, 2).line(1, 4).data(), "ZM1,2L1,4");
    EXPECT_EQ(OpenPath().cubic(at(1, 2), at(3, 4), at(5, 6)).quadratic(at(1, 2), at(3, 4)).data(),
              "C1,2 3,4 5,6Q1,2 3,4");
    const MoxPtr<SVGDrawElement> relative = moveTo(1, 2);
    relative->setDrawName(DRAWELEMENT_MOVE_RELATIVE);
    EXPECT_EQ(OpenPath().add(relative).line(1, 4).data(), "M1,2L1,4");
}

// On purpose: a quadratic curve gives (0, 0) as its end, so what follows keeps the numbers of the
// absolute point under a relative letter. Using the real end would move every such path.
TEST(SVGPathManager, BehindAQuadraticCurveTheNumbersAreThoseOfTheAbsolutePoint) {
    EXPECT_EQ(behindQuadratic(lineTo(40, 50)), "M10,10q10,10 20,0l40,50");
    EXPECT_EQ(behindQuadratic(lineTo(0, 50)), "M10,10q10,10 20,0v50");
    EXPECT_EQ(behindQuadratic(moveTo(40, 50)), "M10,10q10,10 20,0m40,50");
    EXPECT_EQ(behindQuadratic(quadraticTo(at(40, 50), at(60, 70))),
              "M10,10q10,10 20,0q40,50 60,70");
    EXPECT_EQ(behindQuadratic(cubicTo(at(1, 2), at(3, 4), at(5, 6))),
              "M10,10q10,10 20,0c1,2 3,4 5,6");
    EXPECT_EQ(behindQuadratic(closeSubpath()), "M10,10q10,10 20,0z");
}

TEST(SVGPathManager, ACloseOrALineEndsWhatAQuadraticCurveDoes) {
    EXPECT_EQ(OpenPath().move(10, 10).quadratic(at(20, 20), at(30, 10)).close().line(15, 10).data(),
              "M10,10q10,10 20,0zh5");
    EXPECT_EQ(
        OpenPath().move(10, 10).quadratic(at(20, 20), at(30, 10)).line(40, 50).line(41, 51).data(),
        "M10,10q10,10 20,0l40,50l1,1");
}

TEST(SVGPathManager, SegmentsOfNoAbsoluteNameAreLeftAloneAndMoveNothing) {
    for (const int name : {0, 2, 4, 6, 8, 10, 11, -1, 99}) {
        const MoxPtr<SVGDrawElement> odd = lineTo(7, 8);
        odd->setDrawName(static_cast<DrawmereDrawElementEnum>(name));
        EXPECT_EQ(OpenPath().move(10, 20).add(odd).line(11, 22).data(), "M10,20l7,8l1,2") << name;
    }
}

TEST(SVGPathManager, MakesRelativeWithoutWriting) {
    OpenPath path;
    path.manager.makePathDataRealtive();
    const MoxPtr<SVGDrawElement> line = lineTo(3, 5);
    path.move(1, 2).add(line);
    path.manager.makePathDataRealtive();
    EXPECT_EQ(line->getPoint(), at(2, 3));
    EXPECT_EQ(line->drawName, DRAWELEMENT_LINE_RELATIVE);
    EXPECT_EQ(path.manager.segments.size(), 2U);
    EXPECT_TRUE(path.manager.pathData.isEmpty());
    path.manager.makePathDataRealtive();
    EXPECT_EQ(line->getPoint(), at(2, 3));
}

TEST(SVGPathManager, ASecondCallGivesTheSameText) {
    OpenPath path;
    path.move(1, 2).line(3, 4);
    const UnicodeString& first = path.manager.getPathSeg();
    EXPECT_EQ(utf8(first), "M1,2l2,2");
    EXPECT_TRUE(path.manager.segments.empty());
    EXPECT_EQ(&path.manager.getPathSeg(), &first);
    EXPECT_EQ(utf8(first), "M1,2l2,2");
    EXPECT_TRUE(path.manager.pathLock);
}

TEST(SVGPathManager, TheTakenDataIsTheSameTextAndIsGoneThen) {
    OpenPath path;
    path.move(10, 20).line(15, 23).quadratic(at(20, 20), at(30, 10)).close();
    const MoxValue taken = path.manager.takePathData();
    EXPECT_EQ(taken.getAsciiText(), "M10,20l5,3q5,-3 15,-13z");
    EXPECT_TRUE(path.manager.segments.empty());
    EXPECT_EQ(path.data(), "");
}

TEST(SVGPathManager, TakenWithoutSegmentsRawTextIsTheDataAndNothingIsNull) {
    OpenPath path;
    EXPECT_EQ(path.manager.takePathData().getType(), MoxCommonNS::MOXVALUE_NULL);
    path.manager.addPathSeg(u"z \u00e4", false);
    EXPECT_EQ(utf8(path.manager.takePathData().toString()), "z \xC3\xA4");
    EXPECT_EQ(path.manager.takePathData().getType(), MoxCommonNS::MOXVALUE_NULL);
}

TEST(SVGPathManager, SegmentsWithoutTextMakeNoData) {
    struct Silent : SVGDrawElement {
        Silent() : SVGDrawElement('X') {}
    };

    OpenPath path;
    path.add(MoxPtr<SVGDrawElement>(new Silent));
    EXPECT_EQ(path.manager.takePathData().getType(), MoxCommonNS::MOXVALUE_NULL);
}

TEST(SVGPathManager, RawTextAloneIsTheDataUnchanged) {
    OpenPath path;
    path.manager.addPathSeg(u"A1 2 0 0 1 5 6", true);
    path.manager.addPathSeg(UnicodeString(), true);
    path.manager.addPathSeg(u"z \u00e4", false);
    EXPECT_EQ(path.data(), "A1 2 0 0 1 5 6z \xC3\xA4");
}

// On purpose: raw text goes when there are segments. Keeping it would put arcs, which are raw text,
// in front of the moves and lines they were drawn between.
TEST(SVGPathManager, RawTextGoesWhenThereAreSegments) {
    OpenPath path;
    path.move(1, 2);
    path.manager.addPathSeg(u"a1 2 0 0 1 5 6", false);
    path.line(3, 4);
    path.manager.addPathSeg(u"Z", true);
    EXPECT_EQ(path.data(), "M1,2l2,2");
}

TEST(SVGPathManager, RawTextBehindTheWrittenDataIsAppended) {
    OpenPath path;
    path.move(1, 2);
    EXPECT_EQ(path.data(), "M1,2");
    path.manager.addPathSeg(u"Z", true);
    EXPECT_EQ(path.data(), "M1,2Z");
    path.move(3, 4);
    EXPECT_EQ(path.data(), "M3,4");
}

TEST(SVGPathManager, TakesAReferenceAndReleasesItWithTheData) {
    const MoxPtr<SVGDrawElement> move = moveTo(1, 2);
    OpenPath path;
    path.add(move);
    EXPECT_EQ(move->getReferenceCount(), 2);
    path.manager.getPathSeg();
    EXPECT_EQ(move->getReferenceCount(), 1);
}

TEST(SVGPathManager, DeletesSegmentsAndText) {
    const MoxPtr<SVGDrawElement> move = moveTo(1, 2);
    OpenPath path;
    path.add(move);
    path.manager.addPathSeg(u"Z", true);
    path.manager.deletePathSeg();
    EXPECT_EQ(move->getReferenceCount(), 1);
    EXPECT_TRUE(path.manager.segments.empty());
    EXPECT_EQ(path.data(), "");
    path.move(3, 4);
    EXPECT_EQ(path.data(), "M3,4");
}

TEST(SVGPathManager, ReleasesWhatIsLeftWhenItGoes) {
    const MoxPtr<SVGDrawElement> move = moveTo(1, 2);
    {
        OpenPath path;
        path.add(move).add(move);
        EXPECT_EQ(move->getReferenceCount(), 3);
    }
    EXPECT_EQ(move->getReferenceCount(), 1);
}

TEST(SVGPathManager, IgnoresANullSegment) {
    OpenPath path;
    path.manager.appendPathCommand(nullptr);
    EXPECT_TRUE(path.manager.segments.empty());
    EXPECT_EQ(path.data(), "");
}

// On purpose: a call with false turns the lock over, so on an unlocked manager it locks. Always
// unlocking would let elements into a manager whose lock was never set.
TEST(SVGPathManager, AFalseLockTurnsTheLockOver) {
    SVGConfig config;
    SVGPathManager manager(&config);
    manager.addPathLock(false);
    EXPECT_TRUE(manager.pathLock);
    manager.addPathLock(false);
    EXPECT_FALSE(manager.pathLock);
    manager.addPathLock(true);
    manager.addPathLock(true);
    EXPECT_TRUE(manager.pathLock);
    manager.addPathLock(false);
    EXPECT_FALSE(manager.pathLock);
}

TEST(SVGPathManager, ElementsStayOutWhileTheLockIsOn) {
    OpenPath path;
    SVGTreeManager tree;
    const MoxPtr<SVGElement> rect = tree.document->createSVGElement(SVGName::rect);
    path.manager.addElement(rect.get());
    EXPECT_EQ(path.manager.getGroupRootNode(), nullptr);
    path.manager.treeManager = &tree;
    path.manager.addElement(rect.get());
    EXPECT_EQ(path.manager.getGroupRootNode(), nullptr);
    path.manager.addPathLock(false);
    path.manager.addElement(rect.get());
    EXPECT_EQ(rect->getParentNode(), path.manager.getGroupRootNode());
    path.manager.appendToTree();
}

TEST(SVGPathManager, NotesTheKindAndAllModes) {
    OpenPath path;
    path.manager.setElemMode(PAINTMODE_FILL, ELEMENTTYPE_IMAGE);
    EXPECT_EQ(path.manager.elementMode, ELEMENTTYPE_IMAGE);
    EXPECT_EQ(path.manager.paintMode, PAINTMODE_FILL);
    path.manager.setElemMode(PAINTMODE_STROKE, ELEMENTTYPE_IMAGE);
    EXPECT_EQ(path.manager.paintMode, PAINTMODE_FILLSTROKE);
}

TEST(SVGPathManager, AnotherKindClosesTheGroupAndASecondTextDoesNot) {
    SVGConfig config;
    SVGTreeManager tree;
    tree.setSVGDocProp(u"1.1", &config);
    SVGPathManager manager(&config);
    manager.treeManager = &tree;
    const MoxPtr<SVGElement> rect = tree.document->createSVGElement(SVGName::rect);
    manager.addElement(rect.get());
    const MoxPtr<SVGElement> group(manager.getGroupRootNode());
    manager.setElemMode(PAINTMODE_FILL, ELEMENTTYPE_SHAPE);
    EXPECT_EQ(manager.getGroupRootNode(), group.get());
    manager.setElemMode(PAINTMODE_STROKE, ELEMENTTYPE_TEXT);
    EXPECT_EQ(manager.getGroupRootNode(), nullptr);
    EXPECT_EQ(group->getParentNode(), tree.getCurrentNode());
    EXPECT_EQ(manager.elementMode, ELEMENTTYPE_TEXT);
    EXPECT_EQ(manager.paintMode, PAINTMODE_STROKE); // closing has cleared what the rectangle had
    const MoxPtr<SVGElement> text = tree.document->createSVGElement(SVGName::text);
    manager.addElement(text.get());
    manager.setElemMode(PAINTMODE_FILL, ELEMENTTYPE_TEXT);
    EXPECT_EQ(manager.getGroupRootNode(), text->getParentNode());
    manager.appendToTree();
}

TEST(SVGPathManager, PointsThatAreNoNumbersSpoilNoOthers) {
    EXPECT_EQ(OpenPath().move(1, 2).line(undefined, 5).line(4, 7).line(5, 9).data(),
              "M1,2l0,3l0,2l1,2");
    EXPECT_EQ(OpenPath().move(undefined, 2).line(3, 4).line(5, 6).data(), "M0,2l0,2l2,2");
}

} // namespace
} // namespace DrawmereNS

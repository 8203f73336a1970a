#include "state/SVGGroupManager.h"

#include "foundation/common/MoxError.h"
#include "tests/state/StatePage.h"

#include <gtest/gtest.h>

using namespace DrawmereNS;

namespace {

const SVGMatrix shift(1, 0, 0, 1, 10, 20);
const SVGMatrix twice(2, 0, 0, 2, 0, 0);

std::string rootText(StatePage& page) {
    return utf8(SVGGraphicContext::convertMatrixToString(page.state().rootMatrix));
}

std::string groupText(StatePage& page) {
    return utf8(SVGGraphicContext::convertMatrixToString(page.state().groupGC.transMatrix));
}

bool hasCurrentMatrix(StatePage& page) {
    return !SVGGraphicContext::IsUnitMatrix(page.state().currentGC.transMatrix);
}

TEST(SVGGroupManager, StartsClosedWithAStateOfItsOwn) {
    SVGConfig config;
    const SVGGroupManager manager(&config);
    EXPECT_EQ(manager.getGroupRootNode(), nullptr);
    EXPECT_EQ(manager.getTreeManager(), nullptr);
    ASSERT_NE(manager.getGContext(), nullptr);
    EXPECT_EQ(manager.getGContext(), manager.context);
    EXPECT_EQ(manager.getGContext()->config, &config);
    EXPECT_FALSE(manager.pathLock);
    EXPECT_EQ(manager.elementMode, ELEMENTTYPE_SHAPE);
    EXPECT_EQ(manager.paintMode, 0);
    EXPECT_EQ(manager.config, &config);
    EXPECT_EQ(manager.font.fontSize, FONTSIZE_MEDIUM);
}

TEST(SVGGroupManager, ItsVirtualOperationsDoNothing) {
    SVGGroupManager manager(nullptr);
    manager.appendPathCommand(nullptr);
    manager.addPathSeg(u"M0,0", true);
    manager.deletePathSeg();
    manager.addPathLock(true);
    manager.addStopElem(nullptr);
    manager.setElemMode(PAINTMODE_FILL, ELEMENTTYPE_TEXT);
    manager.push(ELEMENT_TYPE_PLAIN);
    manager.pop(ELEMENT_TYPE_MASK);
    manager.setScale(3);
    EXPECT_EQ(manager.getType(), 0);
    EXPECT_TRUE(manager.getPathSeg().isEmpty());
    EXPECT_EQ(manager.takePathData().getType(), MoxCommonNS::MOXVALUE_NULL);
    EXPECT_FALSE(manager.pathLock);
    EXPECT_EQ(manager.elementMode, ELEMENTTYPE_SHAPE);
    EXPECT_EQ(manager.paintMode, 0);
    EXPECT_EQ(manager.getScale(), 1.0F);
}

TEST(SVGGroupManager, AnElementOpensAGroupThatStandsNowhere) {
    StatePage page;
    SVGElement* rect = page.drawRect();
    SVGElement* group = page.manager.getGroupRootNode();
    ASSERT_NE(group, nullptr);
    EXPECT_EQ(SVGUtil::getSVGLocalName(group), SVGName(SVGName::g));
    EXPECT_EQ(rect->getParentNode(), group);
    EXPECT_EQ(group->getParentNode(), nullptr);
    EXPECT_TRUE(childrenOf(page.root()).empty());
}

TEST(SVGGroupManager, AnotherElementJoinsTheOpenGroup) {
    StatePage page;
    page.drawRect();
    page.state().setStrokeColorName(u"red");
    page.state().setStrokeWidth(pt(3));
    SVGElement* second = page.drawRect();
    EXPECT_EQ(childrenOf(page.manager.getGroupRootNode()).size(), 2U);
    EXPECT_EQ(attributesOf(second), "stroke-width=3");
}

TEST(SVGGroupManager, LineCapStandsOnTheGroupNotOnTheLine) {
    StatePage page;
    page.state().setLineCap(LINECAP_ROUND);
    SVGElement* line = page.draw(SVGName::line);
    EXPECT_EQ(attributesOf(line), "");
    EXPECT_EQ(attributesOf(page.close()), "stroke-linecap=round");
}

TEST(SVGGroupManager, OpeningLeavesTheMatricesWhereTheyAre) {
    StatePage page;
    page.state().groupGC.transMatrix = twice;
    page.state().setTransMatrix(shift);
    page.drawRect();
    EXPECT_EQ(groupText(page), "scale(2,2)");
    EXPECT_TRUE(hasCurrentMatrix(page));
}

TEST(SVGGroupManager, ThePathLockDropsElements) {
    StatePage page;
    page.manager.pathLock = true;
    page.drawRect();
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
}

TEST(SVGGroupManager, ThePathLockComesBeforeTheMissingTree) {
    StatePage page;
    page.manager.treeManager = nullptr;
    page.manager.pathLock = true;
    EXPECT_NO_THROW(page.drawRect());
}

TEST(SVGGroupManager, AMissingTreeIsAnError) {
    StatePage page;
    page.manager.treeManager = nullptr;
    const MoxPtr<SVGElement> rect = page.make(SVGName::rect);
    try {
        page.manager.addElement(rect.get());
        FAIL() << "nothing thrown";
    } catch (const MoxError& error) {
        EXPECT_EQ(error.getCode(), 16408);
        EXPECT_EQ(error.getMessage(), u"Append an element to a NULL tree.");
    }
    EXPECT_EQ(rect->getParentNode(), nullptr);
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
}

TEST(SVGGroupManager, ANullElementIsIgnored) {
    StatePage page;
    page.manager.addElement(nullptr);
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
}

TEST(SVGGroupManager, ClosingHangsTheGroupAtTheCursor) {
    StatePage page;
    SVGElement* container = page.enterContainer();
    page.drawRect();
    SVGElement* group = page.close();
    EXPECT_EQ(group->getParentNode(), container);
    EXPECT_EQ(page.tree.getCurrentNode(), container);
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
}

TEST(SVGGroupManager, ClosingTakesKindAndModesBack) {
    StatePage page;
    page.drawImage();
    EXPECT_EQ(page.manager.elementMode, ELEMENTTYPE_IMAGE);
    EXPECT_EQ(page.manager.paintMode, PAINTMODE_FILL);
    page.close();
    EXPECT_EQ(page.manager.elementMode, ELEMENTTYPE_SHAPE);
    EXPECT_EQ(page.manager.paintMode, PAINTMODE_NONE);
}

TEST(SVGGroupManager, ClosingUnderTheRootMovesTheMatricesToTheRoot) {
    StatePage page;
    page.state().rootMatrix = twice;
    page.state().setTransMatrix(shift);
    SVGElement* rect = page.drawRect();
    EXPECT_EQ(attributesOf(rect), "transform=translate(10,20)");
    EXPECT_EQ(attributesOf(page.close()), "transform=scale(2,2)");
    EXPECT_EQ(rootText(page), "matrix(2,0,0,2,20,40)");
    EXPECT_EQ(groupText(page), "");
    EXPECT_FALSE(hasCurrentMatrix(page));
}

TEST(SVGGroupManager, ClosingElsewhereMovesTheCurrentMatrixToTheGroup) {
    StatePage page;
    page.enterContainer();
    page.state().groupGC.transMatrix = twice;
    page.state().setTransMatrix(shift);
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "transform=scale(2,2)");
    EXPECT_EQ(groupText(page), "matrix(2,0,0,2,20,40)");
    EXPECT_EQ(rootText(page), "");
    EXPECT_FALSE(hasCurrentMatrix(page));
}

TEST(SVGGroupManager, ClosingMovesTheAttributesAfterTheyAreWritten) {
    StatePage page;
    page.drawRect();
    page.state().setMiterLimit(9);
    EXPECT_EQ(attributesOf(page.close()), "");
    EXPECT_EQ(page.state().groupGC.miterLimit, 9);
}

TEST(SVGGroupManager, AMatrixSetWithNothingDrawnMovesToTheRoot) {
    StatePage page;
    page.state().setTransMatrix(shift);
    page.manager.appendToTree();
    EXPECT_EQ(rootText(page), "translate(10,20)");
    EXPECT_FALSE(hasCurrentMatrix(page));
    EXPECT_TRUE(childrenOf(page.root()).empty());
}

TEST(SVGGroupManager, AMatrixSetWithNothingDrawnMovesToTheGroupElsewhere) {
    StatePage page;
    page.enterContainer();
    page.state().setTransMatrix(shift);
    page.manager.appendToTree();
    EXPECT_EQ(groupText(page), "translate(10,20)");
    EXPECT_EQ(rootText(page), "");
    EXPECT_FALSE(hasCurrentMatrix(page));
}

TEST(SVGGroupManager, WithoutACursorAMatrixMovesToTheRoot) {
    StatePage page;
    page.tree.currentNode = nullptr;
    page.state().setTransMatrix(shift);
    page.manager.appendToTree();
    EXPECT_EQ(rootText(page), "translate(10,20)");
    page.manager.treeManager = nullptr;
    page.state().setTransMatrix(twice);
    page.manager.appendToTree();
    EXPECT_EQ(rootText(page), "matrix(2,0,0,2,10,20)");
}

TEST(SVGGroupManager, NothingOpenAndNoMatrixChangesNothing) {
    StatePage page;
    page.state().setMiterLimit(9);
    page.manager.appendToTree();
    EXPECT_EQ(page.state().groupGC.miterLimit, 4);
}

TEST(SVGGroupManager, AGroupClosedUnderTheStopLockIsLost) {
    StatePage page;
    page.state().setTransMatrix(shift);
    page.drawRect();
    page.tree.setupStopLock();
    page.manager.appendToTree();
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
    EXPECT_TRUE(childrenOf(page.root()).empty());
    EXPECT_EQ(groupText(page), "translate(10,20)"); // it stood under no root
}

TEST(SVGGroupManager, AGroupWhoseTreeWentAwayIsLost) {
    StatePage page;
    page.drawRect();
    page.manager.treeManager = nullptr;
    page.manager.appendToTree();
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
}

TEST(SVGGroupManager, GroupAttributesNeedAGroup) {
    StatePage page;
    page.state().setMiterLimit(9);
    page.manager.setGroupAttrs();
    page.drawRect();
    page.manager.setGroupAttrs();
    EXPECT_EQ(attributesOf(page.manager.getGroupRootNode()), "stroke-miterlimit=9");
}

TEST(SVGGroupManager, KeepsTheFontItIsGiven) {
    SVGGroupManager manager(nullptr);
    FONTATTRIBUTE font;
    font.fontSize = pt(12);
    font.fontFamily = u"Serif";
    manager.setFontAttribute(font);
    EXPECT_EQ(manager.font.fontSize, pt(12));
    EXPECT_EQ(manager.font.fontFamily, u"Serif");
}

TEST(SVGGroupManager, AMatrixOfNaNsDrawsOn) {
    StatePage page;
    const float nan = std::numeric_limits<float>::quiet_NaN();
    page.state().setTransMatrix(SVGMatrix(nan, nan, nan, nan, nan, nan));
    EXPECT_EQ(attributesOf(page.drawRect()), "transform=matrix(0,0,0,0,0,0)");
    page.close();
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "transform=matrix(0,0,0,0,0,0)");
}

} // namespace

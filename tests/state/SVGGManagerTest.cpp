#include "state/SVGGManager.h"

#include "foundation/common/MoxError.h"
#include "tests/state/StatePage.h"

#include <gtest/gtest.h>

#include <array>

using namespace DrawmereNS;

namespace {

constexpr ELEMENT_TYPE savedTypes[] = {
    ELEMENT_TYPE_PLAIN, ELEMENT_TYPE_PATTERN, ELEMENT_TYPE_GRADIENT,
    ELEMENT_TYPE_MASK,  ELEMENT_TYPE_CLIP,    ELEMENT_TYPE_UNUSED,
};

/// The error that `pop(type)` throws: its code and text.
std::string popError(SVGGManager& manager, int type) {
    try {
        manager.pop(static_cast<ELEMENT_TYPE>(type));
    } catch (const MoxError& error) {
        return std::to_string(error.getCode()) + " " + utf8(error.getMessage());
    }
    return "";
}

const char* const emptyStack = "16406 Pop a empty stack.";
const char* const otherType = "16407 Pop type is not same with push type.";

SVGFont sharingFont() {
    SVGFont font;
    font.setFontAttribute(u"Serif", pt(0), 400, FSTYLE_NORMAL, u"", false);
    font.setFontAdjust(pt(0));
    font.setFontStretch(static_cast<FONTSTRECH>(0));
    return font;
}

/// How many groups two texts make, the first in `one`, the second in `two`.
std::size_t groupsOfTexts(const SVGFont& one, const SVGFont& two) {
    StatePage page;
    page.state().setFont(one);
    page.drawText();
    page.state().setFont(two);
    page.drawText();
    page.close();
    return childrenOf(page.root()).size();
}

TEST(SVGGManager, StartsWithOneSavedStateAndScale) {
    SVGConfig config;
    const SVGGManager manager(&config);
    ASSERT_EQ(manager.contextStack.size(), 1U);
    EXPECT_EQ(manager.contextStack.back()->getType(), -2);
    EXPECT_EQ(manager.scaleStack, std::deque<float>{1.0F});
    EXPECT_EQ(manager.getType(), 0);
}

TEST(SVGGManager, ADifferenceInAttributesNeverClosesAGroup) {
    StatePage page;
    page.state().setStrokeColorName(u"red");
    SVGElement* first = page.drawRect();
    page.state().setStrokeWidth(pt(3));
    SVGElement* second = page.drawRect();
    page.close();
    EXPECT_EQ(childrenOf(page.root()).size(), 1U);
    EXPECT_EQ(attributesOf(first), "");
    EXPECT_EQ(attributesOf(second), "stroke-width=3");
}

TEST(SVGGManager, AnotherKindClosesTheGroup) {
    StatePage page;
    page.drawRect();
    page.drawImage();
    page.drawRect();
    page.close();
    EXPECT_EQ(childrenOf(page.root()).size(), 3U);
}

TEST(SVGGManager, ImagesShareAGroup) {
    StatePage page;
    page.drawImage();
    page.drawImage();
    page.close();
    EXPECT_EQ(childrenOf(page.root()).size(), 1U);
}

TEST(SVGGManager, ATextAndAShapeDontShareAGroup) {
    StatePage page;
    page.state().setFont(sharingFont());
    page.drawText();
    page.drawRect();
    page.drawText();
    page.close();
    EXPECT_EQ(childrenOf(page.root()).size(), 3U);
}

TEST(SVGGManager, EachTextInARealFontStartsItsOwnGroup) {
    SVGFont font = sharingFont();
    font.fontSize = pt(12);
    EXPECT_EQ(groupsOfTexts(font, font), 2U);
    EXPECT_EQ(groupsOfTexts(SVGFont(), SVGFont()), 2U);
}

TEST(SVGGManager, ATextBehindATextHasAGroupOfTextsToo) {
    StatePage page;
    SVGFont font = sharingFont();
    font.fontSize = pt(12);
    page.state().setFont(font);
    page.drawText();
    page.drawText();
    EXPECT_EQ(page.manager.elementMode, ELEMENTTYPE_TEXT);
    EXPECT_EQ(attributesOf(page.close()), "font-size=12 font-weight=400");
}

TEST(SVGGManager, TextsWithoutASizeShareAGroup) {
    EXPECT_EQ(groupsOfTexts(sharingFont(), sharingFont()), 1U);
}

TEST(SVGGManager, EachDifferenceOfFontsPartsTexts) {
    const SVGFont font = sharingFont();
    SVGFont other = font;
    other.fontName = u"Sans";
    EXPECT_EQ(groupsOfTexts(font, other), 2U);
    other = font;
    other.fontWeight = 700;
    EXPECT_EQ(groupsOfTexts(font, other), 2U);
    other = font;
    other.fontStyle = FSTYLE_ITALIC;
    EXPECT_EQ(groupsOfTexts(font, other), 2U);
    other = font;
    other.fontFamily = u"Other"; // not part of the test
    EXPECT_EQ(groupsOfTexts(font, other), 1U);
}

TEST(SVGGManager, ANumberThatIsNotZeroInEitherFontPartsTexts) {
    std::array<SVGFont, 4> others;
    others.fill(sharingFont());
    others[0].fontSize = pt(1);
    others[1].fontAdjust = pt(-1);
    others[2].fontVariant = FVARIANT_SMALLCAPS;
    others[3].fontStretch = FONTSTRECH_NORMAL;
    for (const SVGFont& other : others) {
        EXPECT_EQ(groupsOfTexts(sharingFont(), other), 2U);
        EXPECT_EQ(groupsOfTexts(other, sharingFont()), 2U);
        EXPECT_EQ(groupsOfTexts(other, other), 2U);
    }
}

TEST(SVGGManager, ModesGatherUntilTheGroupCloses) {
    SVGGManager manager(nullptr);
    manager.setElemMode(PAINTMODE_FILL, ELEMENTTYPE_SHAPE);
    manager.setElemMode(PAINTMODE_STROKE, ELEMENTTYPE_SHAPE);
    EXPECT_EQ(manager.paintMode, PAINTMODE_FILLSTROKE);
    manager.setElemMode(PAINTMODE_FILL, ELEMENTTYPE_TEXT);
    EXPECT_EQ(manager.elementMode, ELEMENTTYPE_TEXT);
    EXPECT_NE(manager.paintMode & PAINTMODE_TEXT, 0);
}

TEST(SVGGManager, PushAndPopCloseTheGroup) {
    StatePage page;
    page.drawRect();
    page.manager.push(ELEMENT_TYPE_PLAIN);
    page.drawRect();
    page.manager.pop(ELEMENT_TYPE_PLAIN);
    page.drawRect();
    page.close();
    EXPECT_EQ(childrenOf(page.root()).size(), 3U);
}

TEST(SVGGManager, APlainPushKeepsAllAttributes) {
    StatePage page;
    page.state().setMiterLimit(9);
    page.manager.push(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(page.state().getType(), ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(page.state().currentGC.miterLimit, 9);
}

TEST(SVGGManager, ATypedPushStartsFromTheDefaults) {
    for (const ELEMENT_TYPE type : savedTypes) {
        StatePage page;
        page.state().setMiterLimit(9);
        page.state().setClipPathID(u"c1");
        page.state().rootMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
        page.manager.push(type);
        EXPECT_EQ(page.state().getType(), type);
        EXPECT_EQ(page.state().clipPathId, u"url(#c1)");
        EXPECT_EQ(page.state().currentGC.miterLimit, type == ELEMENT_TYPE_PLAIN ? 9 : 4);
        EXPECT_EQ(SVGGraphicContext::IsUnitMatrix(page.state().rootMatrix),
                  type != ELEMENT_TYPE_PLAIN);
    }
}

TEST(SVGGManager, PopBringsEverythingBack) {
    for (const ELEMENT_TYPE type : savedTypes) {
        StatePage page;
        SVGGraphicContext& state = page.state();
        state.setMiterLimit(9);
        state.setFillRule(FILLRULE_NONZERO);
        state.setClipPathID(u"c1");
        state.setClipState(true);
        state.setSVGType(SVGConfig::SVGTYPE_TINY);
        state.tinyFillColors[u"g1"] = u"#abc";
        page.drawRect();
        page.close();
        state.rootMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
        page.manager.push(type);
        state.setMiterLimit(5);
        state.groupGC.miterLimit = 6;
        state.setFillRule(FILLRULE_NONZERO);
        state.setClipPathID(u"c2");
        state.setClipState(false);
        state.setSVGType(SVGConfig::SVGTYPE_BASIC);
        state.tinyFillColors.clear();
        state.rootMatrix = SVGMatrix(3, 0, 0, 3, 0, 0);
        page.manager.pop(type);
        EXPECT_EQ(&page.state(), &state);
        EXPECT_EQ(state.config, &page.config);
        EXPECT_EQ(state.currentGC.miterLimit, 9);
        EXPECT_EQ(state.groupGC.miterLimit, 9);
        EXPECT_EQ(state.changeCount, 0);
        EXPECT_EQ(state.clipPathId, u"url(#c1)");
        EXPECT_TRUE(state.clipState);
        EXPECT_EQ(state.getSVGType(), SVGConfig::SVGTYPE_TINY);
        EXPECT_EQ(state.tinyFillColors[u"g1"], u"#abc");
        EXPECT_EQ(state.rootMatrix.a, 2);
    }
}

TEST(SVGGManager, APushBehindAPopSavesAllOfTheStateItFinds) {
    StatePage page;
    page.manager.push(ELEMENT_TYPE_PLAIN);
    page.state().setFillColorName(u"red");
    page.manager.pop(ELEMENT_TYPE_PLAIN);
    page.state().setFillColorName(u"blue");
    page.state().setClipPathID(u"c1");
    page.manager.push(ELEMENT_TYPE_MASK);
    EXPECT_EQ(page.manager.contextStack.back()->getType(), ELEMENT_TYPE_MASK);
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_PLAIN), otherType);
    page.state().setClipPathID(u"c2");
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_MASK), "");
    EXPECT_EQ(page.state().currentGC.fillColor, u"blue");
    EXPECT_EQ(page.state().clipPathId, u"url(#c1)");
}

TEST(SVGGManager, NothingIsBeingDefinedAfterAnyPop) {
    StatePage page;
    page.manager.push(ELEMENT_TYPE_MASK);
    page.manager.push(ELEMENT_TYPE_PLAIN);
    page.manager.pop(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(page.state().getType(), ELEMENT_TYPE_NONE);
    page.manager.pop(ELEMENT_TYPE_MASK);
    EXPECT_EQ(page.state().getType(), ELEMENT_TYPE_NONE);
}

TEST(SVGGManager, ALinkClosesTheGroupAndSavesNothing) {
    StatePage page;
    page.drawRect();
    page.manager.push(ELEMENT_TYPE_LINK);
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
    EXPECT_EQ(page.manager.contextStack.size(), 1U);
    EXPECT_EQ(page.manager.scaleStack.size(), 1U);
    EXPECT_EQ(page.state().getType(), ELEMENT_TYPE_NONE);
    page.drawRect();
    page.manager.push(ELEMENT_TYPE_MASK);
    page.drawRect();
    page.manager.pop(ELEMENT_TYPE_LINK); // of another type than the saved one, and no error
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
    EXPECT_EQ(page.manager.contextStack.size(), 2U);
    EXPECT_EQ(page.state().getType(), ELEMENT_TYPE_MASK);
}

TEST(SVGGManager, OnePlainPopTooManyIsOneOfAnotherType) {
    StatePage page;
    page.manager.push(ELEMENT_TYPE_PLAIN);
    page.manager.pop(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_PLAIN), otherType);
    EXPECT_EQ(page.manager.contextStack.size(), 1U);
}

TEST(SVGGManager, APopOfAnotherTypeClosesTheGroupAndKeepsTheState) {
    StatePage page;
    page.manager.push(ELEMENT_TYPE_MASK);
    page.state().setMiterLimit(9);
    page.manager.setScale(3);
    page.drawRect();
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_CLIP), otherType);
    EXPECT_EQ(page.manager.getGroupRootNode(), nullptr);
    EXPECT_EQ(childrenOf(page.root()).size(), 1U);
    EXPECT_EQ(page.state().currentGC.miterLimit, 9);
    EXPECT_EQ(page.state().getType(), ELEMENT_TYPE_MASK);
    EXPECT_EQ(page.manager.contextStack.size(), 2U);
    EXPECT_EQ(page.manager.getScale(), 3);
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_MASK), "");
}

TEST(SVGGManager, APopOfAnEmptyStackClosesTheGroupAndKeepsTheState) {
    StatePage page;
    page.manager.pop(ELEMENT_TYPE_NONE); // takes the first entry
    EXPECT_TRUE(page.manager.contextStack.empty());
    page.state().setMiterLimit(9);
    page.drawRect();
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_NONE), emptyStack);
    EXPECT_EQ(popError(page.manager, ELEMENT_TYPE_PLAIN), emptyStack);
    EXPECT_EQ(childrenOf(page.root()).size(), 1U);
    EXPECT_EQ(page.state().currentGC.miterLimit, 9);
}

TEST(SVGGManager, UnlistedTypesAreSavedLikeDefiningOnes) {
    StatePage page;
    page.state().setMiterLimit(9);
    page.manager.push(static_cast<ELEMENT_TYPE>(77));
    EXPECT_EQ(page.state().currentGC.miterLimit, 4);
    EXPECT_EQ(popError(page.manager, 78), otherType);
    EXPECT_EQ(popError(page.manager, 77), "");
    EXPECT_EQ(page.state().currentGC.miterLimit, 9);
}

TEST(SVGGManager, AScaleIsSavedAndRestoredAndScalesNothing) {
    StatePage page;
    page.manager.setScale(2);
    page.manager.push(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(page.manager.getScale(), 2);
    page.manager.setScale(3);
    page.state().setMiterLimit(9);
    page.drawRect();
    page.manager.pop(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(page.manager.getScale(), 2);
    EXPECT_EQ(attributesOf(childrenOf(page.root())[0]), "stroke-miterlimit=9");
}

TEST(SVGGManager, WithoutAnySavedStateTheScaleIsOne) {
    SVGGManager manager(nullptr);
    manager.pop(ELEMENT_TYPE_NONE);
    manager.setScale(5);
    EXPECT_EQ(manager.getScale(), 1);
    manager.push(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(manager.getScale(), 1);
}

TEST(SVGGManager, AMatrixSurvivesItsStateOnlyOutsideOfIt) {
    StatePage page;
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 1, 2));
    page.manager.push(ELEMENT_TYPE_PLAIN);
    page.state().setTransMatrix(SVGMatrix(2, 0, 0, 2, 0, 0));
    page.drawRect();
    page.manager.pop(ELEMENT_TYPE_PLAIN);
    SVGElement* rect = page.drawRect();
    SVGElement* group = page.close();
    EXPECT_EQ(attributesOf(rect), "");
    EXPECT_EQ(attributesOf(group), "transform=translate(1,2)");
}

TEST(SVGGManager, AMatrixSetBeforeATextMovesToItsGroup) {
    StatePage page;
    page.enterContainer();
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    EXPECT_EQ(attributesOf(page.drawText()), ""); // its kind closed a group, and none was open
    EXPECT_EQ(attributesOf(page.close()),
              "transform=translate(5,6) font-size=medium font-weight=400");
}

TEST(SVGGManager, AHundredThousandStatesNest) {
    constexpr std::size_t depth = 100000;
    StatePage page;
    for (std::size_t i = 0; i < depth; ++i) {
        page.manager.push(ELEMENT_TYPE_PLAIN);
        page.state().setMiterLimit(static_cast<float>(i));
    }
    EXPECT_EQ(page.manager.contextStack.size(), depth + 1);
    for (std::size_t i = depth; i > 0; --i) {
        ASSERT_EQ(page.state().currentGC.miterLimit, static_cast<float>(i - 1));
        page.manager.pop(ELEMENT_TYPE_PLAIN);
    }
    EXPECT_EQ(page.state().currentGC.miterLimit, 4);
}

TEST(SVGGManager, AHundredThousandOpenStatesDieWithTheirManager) {
    SVGGManager manager(nullptr);
    for (int i = 0; i < 100000; ++i) {
        manager.push(ELEMENT_TYPE_MASK);
    }
    EXPECT_EQ(manager.contextStack.size(), 100001U);
}

TEST(SVGGManager, AMillionDashesAreSavedAndComeBack) {
    StatePage page;
    const std::vector<MoxLength> dashes(1000000, pt(2));
    page.state().setDashLine(dashes.data(), 1000000, pt(0));
    page.manager.push(ELEMENT_TYPE_MASK);
    EXPECT_TRUE(page.state().currentGC.dashArray.empty());
    page.manager.pop(ELEMENT_TYPE_MASK);
    EXPECT_EQ(page.state().currentGC.dashArray, dashes);
}

} // namespace

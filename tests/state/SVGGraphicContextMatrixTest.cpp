#include "state/SVGGraphicContext.h"
#include "tests/state/StatePage.h"

#include <gtest/gtest.h>

#include <limits>

using namespace DrawmereNS;

namespace {

constexpr float infinity = std::numeric_limits<float>::infinity();
constexpr float nan = std::numeric_limits<float>::quiet_NaN();

std::string textOf(const SVGMatrix& m) { return utf8(SVGGraphicContext::convertMatrixToString(m)); }

/// The text of the current matrix after `m` was set in `dialect`.
std::string afterSetting(const SVGMatrix& m, SVGConfig::SVGTYPE dialect = SVGConfig::SVGTYPE_FULL) {
    SVGGraphicContext state(nullptr);
    state.setSVGType(dialect);
    state.setTransMatrix(SVGMatrix(1, 0, 0, 1, 1, 2));
    state.setTransMatrix(m);
    return textOf(state.currentGC.transMatrix);
}

const SVGMatrix shift(1, 0, 0, 1, 10, 20);
const SVGMatrix twice(2, 0, 0, 2, 0, 0);
const SVGMatrix quarter(0, 1, -1, 0, 0, 0);

TEST(SVGGraphicContextMatrix, AMatrixIsWrittenByItsKind) {
    const struct {
        SVGMatrix m;
        const char* text;
    } rows[] = {
        {{1, 0, 0, 1, 0, 0}, ""},
        {{1, 0, 0, 1, 3.5F, -4}, "translate(3.5,-4)"},
        {{1, 0, 0, 1, 0, 4}, "translate(0,4)"},
        {{2, 0, 0, 2, 0, 0}, "scale(2,2)"},
        {{-1, 0, 0, -1, 0, 0}, "scale(-1,-1)"},
        {{1, 0, 0, 2, 0, 0}, "scale(1,2)"},
        {{0, 0, 0, 2, 0, 0}, "scale(0,2)"},
        {{0, 0, 0, 0, 0, 0}, ""},
        {{0, 1, -1, 0, 0, 0}, "rotate(90)"},
        {{0, -1, 1, 0, 0, 0}, "rotate(-90)"},
        {{0.70710677F, 0.70710677F, -0.70710677F, 0.70710677F, 0, 0}, "rotate(45)"},
        {{1, 1e-5F, -1e-5F, 1, 0, 0}, ""}, // a rotation by less than a float can tell
        {{-1, 1e-5F, -1e-5F, -1, 0, 0}, "rotate(180)"},
        {{-1, -1e-5F, 1e-5F, -1, 0, 0}, "rotate(-180)"},
        {{1, 0, 1, 1, 0, 0}, "skewX(45)"},
        {{1, 0, -1, 1, 0, 0}, "skewX(-45)"},
        {{1, 1, 0, 1, 0, 0}, "skewY(45)"},
        {{2, 0, 0, 2, 5, 0}, "matrix(2,0,0,2,5,0)"},
        {{1, 2, 3, 4, 5.5F, 6}, "matrix(1,2,3,4,5.5,6)"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(textOf(row.m), row.text);
    }
}

TEST(SVGGraphicContextMatrix, AnglesAreDoublesThatAreRoundedOnce) {
    // A shorter pi, or an arc in single precision, would change the last digit of each.
    EXPECT_EQ(textOf({1, 0, 4, 1, 0, 0}), "skewX(75.96375)");
    EXPECT_EQ(textOf({1, 9.44F, 0, 1, 0, 0}), "skewY(83.95308)");
    EXPECT_EQ(textOf({0.465F, 0.88531065F, -0.88531065F, 0.465F, 0, 0}), "rotate(62.289776)");
}

TEST(SVGGraphicContextMatrix, AMatrixNearARotationIsWrittenAsOne) {
    EXPECT_EQ(textOf({0.98F, 0.1F, -0.1F, 0.5F, 0, 0}).substr(0, 7), "rotate(");
}

TEST(SVGGraphicContextMatrix, ARotationJustAboveLengthOneIsWrittenInSixNumbers) {
    EXPECT_EQ(textOf({0.6F, 0.80001F, -0.80001F, 0.6F, 0, 0}),
              "matrix(0.6,0.80001,-0.80001,0.6,0,0)");
}

TEST(SVGGraphicContextMatrix, AStaleKindIsNotTrusted) {
    SVGMatrix product = SVGMatrix().scale(3);
    ASSERT_EQ(product.type, MATRIXTYPE_ROTATE);
    EXPECT_EQ(textOf(product), "scale(3,3)");
}

TEST(SVGGraphicContextMatrix, NaNsAndInfinitiesAreWrittenAsZeros) {
    EXPECT_EQ(textOf({nan, nan, nan, nan, nan, nan}), "matrix(0,0,0,0,0,0)");
    EXPECT_EQ(textOf({1, 0, 0, 1, nan, 5}), "translate(0,5)");
    EXPECT_EQ(textOf({1, 0, 0, 1, infinity, 0}), "translate(0,0)");
    EXPECT_EQ(textOf({nan, 0, 0, 2, 0, 0}), "scale(0,2)");
    EXPECT_EQ(textOf({1, 0, nan, 1, 0, 0}), "skewX(0)");
    EXPECT_EQ(textOf({1, 0, infinity, 1, 0, 0}), "skewX(90)");
    EXPECT_EQ(textOf({2, 0, 0, infinity, 0, 1}), "matrix(2,0,0,0,0,1)");
}

TEST(SVGGraphicContextMatrix, TheLongestNumbersFit) {
    const float tiny = -std::numeric_limits<float>::denorm_min();
    const float huge = -std::numeric_limits<float>::max();
    EXPECT_EQ(textOf({tiny, tiny, tiny, huge, huge, huge}).substr(0, 10), "matrix(-0.");
}

TEST(SVGGraphicContextMatrix, TheUnitMatrixIsExact) {
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix({}));
    for (float SVGMatrix::*member : {&SVGMatrix::a, &SVGMatrix::b, &SVGMatrix::c, &SVGMatrix::d,
                                     &SVGMatrix::e, &SVGMatrix::f}) {
        SVGMatrix m;
        m.*member += 1e-6F;
        EXPECT_FALSE(SVGGraphicContext::IsUnitMatrix(m));
        m.*member = nan;
        EXPECT_FALSE(SVGGraphicContext::IsUnitMatrix(m));
    }
}

TEST(SVGGraphicContextMatrix, TheUnitMatrixIsTheOneByItsNumbersNotItsKind) {
    SVGMatrix m;
    m.type = MATRIXTYPE_GENERAL;
    EXPECT_TRUE(SVGGraphicContext::IsUnitMatrix(m));
    EXPECT_EQ(textOf(m), "");
}

TEST(SVGGraphicContextMatrix, SettingMatricesAccumulates) {
    EXPECT_EQ(afterSetting({2, 0, 0, 3, 4, 5}), "matrix(2,0,0,3,5,7)");
    EXPECT_EQ(afterSetting({1, 0, 0, 1, 9, 8}), "translate(10,10)");
}

TEST(SVGGraphicContextMatrix, AScalingByNothingIsIgnored) {
    EXPECT_EQ(afterSetting({0, 0, 0, 0, 0, 0}), "translate(1,2)");
}

TEST(SVGGraphicContextMatrix, AScalingByNothingIsIgnoredByItsNumbersNotItsKind) {
    SVGMatrix product = SVGMatrix().scale(0);
    ASSERT_EQ(product.type, MATRIXTYPE_ROTATE);
    EXPECT_EQ(afterSetting(product), "translate(1,2)");
}

TEST(SVGGraphicContextMatrix, WhatAccumulatesIsNotClassified) {
    SVGGraphicContext state(nullptr);
    state.setTransMatrix(twice);
    EXPECT_EQ(state.currentGC.transMatrix.a, 2);
    EXPECT_EQ(state.currentGC.transMatrix.type, MATRIXTYPE_ROTATE); // as a product comes
    state.groupGC.transMatrix = state.currentGC.transMatrix;
    state.copyCur2Group(/*multiply=*/false);
    EXPECT_EQ(state.groupGC.transMatrix.type, MATRIXTYPE_ROTATE);
}

TEST(SVGGraphicContextMatrix, OtherMatricesWithZerosAreNotIgnored) {
    EXPECT_EQ(afterSetting({0, 0, 0, 2, 0, 0}), "matrix(0,0,0,2,1,2)");
    EXPECT_EQ(afterSetting({0, 0, 0, 0, 1, 0}), "matrix(0,0,0,0,2,2)");
    EXPECT_EQ(afterSetting({1, 0, 0, 1, 0, 0}), "translate(1,2)");
}

TEST(SVGGraphicContextMatrix, SmallProfilesIgnoreLargeNumbers) {
    const SVGMatrix far(1, 0, 0, 1, 40000, 0);
    EXPECT_EQ(afterSetting(far, SVGConfig::SVGTYPE_FULL), "translate(40001,2)");
    EXPECT_EQ(afterSetting(far, SVGConfig::SVGTYPE_BASIC), "translate(1,2)");
    EXPECT_EQ(afterSetting(far, SVGConfig::SVGTYPE_TINY), "translate(1,2)");
}

TEST(SVGGraphicContextMatrix, SmallProfilesAllowTheBoundsInEveryNumber) {
    for (float SVGMatrix::*member : {&SVGMatrix::a, &SVGMatrix::b, &SVGMatrix::c, &SVGMatrix::d,
                                     &SVGMatrix::e, &SVGMatrix::f}) {
        for (const float bound : {32768.0F, -32768.0F}) {
            SVGMatrix m;
            m.*member = bound;
            EXPECT_NE(afterSetting(m, SVGConfig::SVGTYPE_BASIC), "translate(1,2)");
            m.*member = bound * 1.0001F;
            EXPECT_EQ(afterSetting(m, SVGConfig::SVGTYPE_BASIC), "translate(1,2)");
        }
    }
}

TEST(SVGGraphicContextMatrix, NaNsPassTheBoundsOfSmallProfiles) {
    EXPECT_EQ(afterSetting({1, 0, 0, 1, nan, 0}, SVGConfig::SVGTYPE_TINY), "translate(0,0)");
    EXPECT_EQ(afterSetting({1, 0, 0, 1, infinity, 0}, SVGConfig::SVGTYPE_TINY), "translate(1,2)");
}

/// A state with a matrix at each level, and an element under the root or deeper down.
struct Levels : StatePage {
    explicit Levels(bool underRoot) {
        SVGElement* parent = underRoot ? root() : enterContainer();
        element = make(SVGName::g);
        parent->appendChild(element.get());
        state().rootMatrix = shift;
        state().groupGC.transMatrix = twice;
        state().currentGC.transMatrix = quarter;
    }

    std::string write(int mode) {
        state().setTransformAttr(element.get(), mode);
        return attributesOf(element.get());
    }

    /// The three matrices from the root to the current one.
    std::string matrices() {
        return textOf(state().rootMatrix) + "|" + textOf(state().groupGC.transMatrix) + "|" +
               textOf(state().currentGC.transMatrix);
    }

    MoxPtr<SVGElement> element;
};

const char* const untouched = "translate(10,20)|scale(2,2)|rotate(90)";

TEST(SVGGraphicContextMatrix, PlainModesWriteOneLevelAndChangeNothing) {
    const struct {
        int mode;
        const char* text;
    } rows[] = {
        {1, "transform=translate(10,20)"},
        {2, "transform=scale(2,2)"},
        {3, "transform=rotate(90)"},
        {6, "gradientTransform=rotate(90)"},
        {0, ""},
        {7, ""},
        {-1, ""},
    };

    for (const auto& row : rows) {
        Levels levels(/*underRoot=*/true);
        EXPECT_EQ(levels.write(row.mode), row.text) << row.mode;
        EXPECT_EQ(levels.matrices(), untouched) << row.mode;
    }
}

TEST(SVGGraphicContextMatrix, ANestedClipMovesTheCurrentMatrixToTheGroup) {
    Levels levels(/*underRoot=*/false);
    EXPECT_EQ(levels.write(TRANSFORMMODE_NESTEDCLIP), "transform=rotate(90)");
    EXPECT_EQ(levels.matrices(), "translate(10,20)|matrix(0,2,-2,0,0,0)|");
}

TEST(SVGGraphicContextMatrix, AClipUnderTheRootDropsTheCurrentMatrix) {
    Levels levels(/*underRoot=*/true);
    EXPECT_EQ(levels.write(TRANSFORMMODE_CLIP), "transform=translate(10,20)");
    EXPECT_EQ(levels.matrices(), "translate(10,20)|scale(2,2)|");
}

TEST(SVGGraphicContextMatrix, AClipElsewhereMovesEverythingToTheRoot) {
    Levels levels(/*underRoot=*/false);
    EXPECT_EQ(levels.write(TRANSFORMMODE_CLIP), "transform=matrix(0,2,-2,0,0,0)");
    EXPECT_EQ(levels.matrices(), "matrix(0,2,-2,0,10,20)||");
}

TEST(SVGGraphicContextMatrix, AClipThatStandsNowhereCountsAsElsewhere) {
    Levels levels(/*underRoot=*/true);
    levels.root()->removeChild(levels.element.get());
    EXPECT_EQ(levels.write(TRANSFORMMODE_CLIP), "transform=matrix(0,2,-2,0,0,0)");
}

TEST(SVGGraphicContextMatrix, AMatrixThatSaysNothingWritesNothing) {
    for (const int mode : {1, 2, 3, 4, 5, 6}) {
        StatePage page;
        const MoxPtr<SVGElement> element = page.make(SVGName::g);
        page.root()->appendChild(element.get());
        page.state().setTransformAttr(element.get(), mode);
        EXPECT_EQ(attributesOf(element.get()), "") << mode;
    }
    StatePage page;
    const MoxPtr<SVGElement> element = page.make(SVGName::g);
    page.state().currentGC.transMatrix = SVGMatrix(0, 0, 0, 0, 0, 0);
    page.state().setTransformAttr(element.get(), TRANSFORMMODE_CURRENT);
    EXPECT_EQ(attributesOf(element.get()), "");
}

TEST(SVGGraphicContextMatrix, AGroupUnderTheRootTakesTheRootMatrix) {
    StatePage page;
    page.state().rootMatrix = SVGMatrix(1, 0, 0, 1, 7, 8);
    page.state().groupGC.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "transform=translate(7,8)");
}

TEST(SVGGraphicContextMatrix, AGroupElsewhereTakesItsOwnMatrix) {
    StatePage page;
    page.enterContainer();
    page.state().rootMatrix = SVGMatrix(1, 0, 0, 1, 7, 8);
    page.state().groupGC.transMatrix = SVGMatrix(2, 0, 0, 2, 0, 0);
    page.drawRect();
    EXPECT_EQ(attributesOf(page.close()), "transform=scale(2,2)");
}

TEST(SVGGraphicContextMatrix, AnElementInAGroupTakesTheCurrentMatrix) {
    StatePage page;
    page.state().rootMatrix = SVGMatrix(1, 0, 0, 1, 7, 8);
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    EXPECT_EQ(attributesOf(page.drawRect()), "transform=translate(5,6)");
}

TEST(SVGGraphicContextMatrix, ATextTakesTheCurrentMatrixThoughItHasAChild) {
    StatePage page;
    page.state().setTransMatrix(SVGMatrix(1, 0, 0, 1, 5, 6));
    const MoxPtr<SVGElement> text = page.make(SVGName::text);
    page.manager.addElement(text.get());
    EXPECT_EQ(attributesOf(text.get()), "transform=translate(5,6)");
}

TEST(SVGGraphicContextMatrix, AnElementTakesTheMatrixOfThePlaceWhereItStands) {
    const struct {
        SVGName::Number name;
        bool underRoot;
        bool hasChild;
        const char* text;
    } rows[] = {
        {SVGName::rect, true, false, "transform=translate(10,20)"},
        {SVGName::text, true, true, "transform=translate(10,20)"},
        {SVGName::g, true, true, "transform=translate(10,20)"},
        {SVGName::g, false, true, "transform=scale(2,2)"},
        {SVGName::a, false, true, "transform=scale(2,2)"},
        {SVGName::rect, false, true, "transform=scale(2,2)"},
        {SVGName::g, false, false, "transform=rotate(90)"},
        {SVGName::text, false, true, "transform=rotate(90)"},
        {SVGName::rect, false, false, "transform=rotate(90)"},
    };

    for (const auto& row : rows) {
        for (const bool isGroup : {false, true}) { // the matrix doesn't depend on it
            Levels levels(row.underRoot);
            const MoxPtr<SVGElement> element = levels.tree.document->createSVGElement(row.name);
            levels.element->getParentNode()->appendChild(element.get());
            if (row.hasChild) {
                element->appendChild(levels.make(SVGName::desc).get());
            }
            levels.state().AttrValueCompare(element.get(), isGroup, ELEMENTTYPE_IMAGE);
            EXPECT_EQ(attributesOf(element.get()), row.text) << row.name;
        }
    }
}

} // namespace

// Which level of matrix stands where, in which form, and how matrices move outwards.
#include "tests/state/DrawnState.h"

#include <cmath>
#include <limits>

namespace DrawmereTest {
namespace {

constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

SVGMatrix shift(float x, float y) { return {1, 0, 0, 1, x, y}; }

SVGMatrix scaling(float x, float y) { return {x, 0, 0, y, 0, 0}; }

/// Draws a box with `matrix` in a state of its own.
void drawWith(SvgPage& page, const SVGMatrix& matrix) {
    page->pushState();
    page->setTransMatrix(matrix);
    drawBox(page, 0);
    page->popState();
}

TEST(Transforms, TheMatrixStandsOnEachElementOfAnOpenGroup) {
    SvgPage page;
    drawBox(page, 0);
    page->setTransMatrix(shift(10, 20));
    drawBox(page, 20);
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "state/transform-on-elements");
}

TEST(Transforms, AClosedGroupLeavesItsMatrixToTheGroupsThatFollow) {
    SvgPage page;
    page->setTransMatrix(shift(10, 20));
    drawBox(page, 0);
    page->pushState();
    drawBox(page, 20);
    page->setTransMatrix(shift(1, 2));
    drawBox(page, 40);
    page->pushState();
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "state/transform-moves-to-groups");
}

TEST(Transforms, MatricesAccumulateAndThePopTakesThemBack) {
    SvgPage page;
    page->setTransMatrix(shift(10, 20));
    page->pushState();
    page->setTransMatrix(scaling(2, 2));
    drawBox(page, 0);
    page->setTransMatrix(shift(5, 5)); // in the doubled coordinates
    drawBox(page, 20);
    page->pushState();
    drawBox(page, 40);
    page->popState();
    page->popState();
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "state/transforms-accumulate");
}

TEST(Transforms, AMatrixWithNothingDrawnMovesToTheRootLevel) {
    SvgPage page;
    page->setTransMatrix(shift(10, 20));
    page->pushState();
    drawBox(page, 0);
    page->setTransMatrix(shift(0, 3));
    page->popState(); // the state was saved with the first matrix at root level
    drawBox(page, 20);
    EXPECT_GOLDEN(page, "state/transform-without-drawing");
}

TEST(Transforms, EachKindOfMatrixHasItsShortestForm) {
    SvgPage page;
    drawWith(page, SVGMatrix());
    drawWith(page, shift(10, 0));
    drawWith(page, shift(0, -2.5F));
    drawWith(page, scaling(2, 2)); // two numbers even where they are equal
    drawWith(page, scaling(1, 2));
    drawWith(page, scaling(-1, -1)); // not a rotation by 180 degrees
    drawWith(page, {0, 1, -1, 0, 0, 0});
    drawWith(page, {0, -1, 1, 0, 0, 0});
    drawWith(page, {1, 0, 1, 1, 0, 0});
    drawWith(page, {1, -1, 0, 1, 0, 0});
    drawWith(page, {1, 1, 1, 1, 0, 0});
    drawWith(page, {2, 0, 0, 2, 5, 0});  // no pure scaling
    drawWith(page, {0, 1, -1, 0, 5, 0}); // no rotation about the origin
    EXPECT_GOLDEN(page, "state/transform-forms");
}

TEST(Transforms, AMatrixNearARotationIsWrittenAsOneAndOneAboveIsNot) {
    SvgPage page;
    drawWith(page, {0.6F, 0.8F, -0.8F, 0.6F, 0, 0});
    // 12 degrees, whose squares add up to a little above 1
    drawWith(page, {0.9781476F, 0.20791169F, -0.20791169F, 0.9781476F, 0, 0});
    drawWith(page, {0.5F, 0.86F, -0.86F, 0.5F, 0, 0});  // 0.9896 is near enough
    drawWith(page, {0.5F, 0.83F, -0.83F, 0.5F, 0, 0});  // 0.9389 is not
    drawWith(page, {0.5F, 0.86F, -0.86F, 0.25F, 0, 0}); // the fourth number plays no part
    drawWith(page, {0.5F, 0.86F, -0.85F, 0.5F, 0, 0});
    EXPECT_GOLDEN(page, "state/transform-near-rotation");
}

TEST(Transforms, AScalingByZeroBothWaysIsIgnoredAndOneWayIsNot) {
    SvgPage page;
    drawWith(page, scaling(0, 0));
    drawWith(page, scaling(0, 2));
    drawWith(page, scaling(2, 0));
    EXPECT_GOLDEN(page, "state/transform-by-zero");
}

TEST(Transforms, ALinkTakesTheRootMatrixAndItsGroupsTheirOwn) {
    SvgPage page;
    page->setTransMatrix(shift(10, 0));
    page->startLink(u"other.svg", MoxName());
    drawBox(page, 0);
    page->setTransMatrix(shift(0, 20));
    drawBox(page, 20);
    page->pushState(); // closes the group, whose matrix moves to group level
    drawBox(page, 40);
    page->popState();
    page->endLink();
    EXPECT_GOLDEN(page, "state/transform-in-link");
}

TEST(Transforms, AMatrixFromInsideALinkReachesTheSecondGroupBehindIt) {
    SvgPage page;
    page->startLink(u"other.svg", MoxName());
    page->setTransMatrix(shift(0, 20));
    drawBox(page, 0);
    page->endLink();
    // On purpose: the matrix is at group level, and a group under the root takes the root's alone.
    drawBox(page, 20);
    page->pushState();
    drawBox(page, 40);
    page->popState();
    EXPECT_GOLDEN(page, "state/transform-behind-link");
}

TEST(Transforms, AMatrixWithNothingDrawnInALinkMovesToGroupLevel) {
    SvgPage page;
    page->startLink(u"other.svg", MoxName());
    page->setTransMatrix(shift(0, 20));
    page->pushState();
    drawBox(page, 0);
    page->popState();
    page->endLink();
    EXPECT_GOLDEN(page, "state/transform-without-drawing-in-link");
}

struct LimitCase {
    SVGConfig::SVGTYPE profile;
    bool limited;
};

class TransformLimits : public testing::TestWithParam<LimitCase> {};

INSTANTIATE_TEST_SUITE_P(Profiles, TransformLimits,
                         testing::Values(LimitCase{SVGConfig::SVGTYPE_FULL, false},
                                         LimitCase{SVGConfig::SVGTYPE_BASIC, true},
                                         LimitCase{SVGConfig::SVGTYPE_TINY, true},
                                         LimitCase{SVGConfig::SVGTYPE_PLAZMIC, false}));

TEST_P(TransformLimits, SmallProfilesIgnoreMatricesBeyondThem) {
    SvgPage page(GetParam().profile);
    drawWith(page, shift(32768, -32768)); // the bounds are allowed
    drawWith(page, shift(40000, 0));
    drawWith(page, shift(0, -32770));
    drawWith(page, {1, 40000, 0, 1, 0, 0});
    EXPECT_GOLDEN(page, GetParam().limited ? "state/transform-limits-small"
                                           : "state/transform-limits-full");
}

TEST(Transforms, UndefinedAndInfiniteNumbersAreWrittenAsZero) {
    SvgPage page;
    drawWith(page, {undefined, 0, 0, 1, 0, 0});
    drawWith(page, shift(infinite, 5));
    drawWith(page, scaling(-infinite, 2));
    drawBox(page, 20); // what follows is as it was
    EXPECT_GOLDEN(page, "state/transform-not-finite");
}

} // namespace
} // namespace DrawmereTest

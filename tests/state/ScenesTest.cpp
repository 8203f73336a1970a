// What a viewer shows: the picture that the caller means, but for the cases told here.
#include "tests/state/Scenes.h"
#include "tests/state/NaivePage.h"
#include "tests/support/Picture.h"

#include <ostream>

namespace DrawmereTest {
namespace {

struct Scene {
    const char* name;
    void (*draw)(Drawmere&);
    void (*drawNaively)(NaivePage&);
};

void PrintTo(const Scene& scene, std::ostream* out) { *out << scene.name; }

#define SCENE(function)                                                                            \
    Scene { #function, function < Drawmere>, function < NaivePage> }

std::string drawScene(const Scene& scene) {
    SvgPage page;
    scene.draw(page.drawmere);
    return page.document();
}

std::string drawNaively(const Scene& scene) {
    NaivePage page;
    scene.drawNaively(page);
    return page.document();
}

class Scenes : public testing::TestWithParam<Scene> {};

INSTANTIATE_TEST_SUITE_P(
    , Scenes,
    testing::Values(SCENE(allShapes), SCENE(nestedFrames), SCENE(pinwheel),
                    SCENE(transformsInsideAGroup), SCENE(transformsBehindGroups),
                    SCENE(transformsBeforeGroups), SCENE(transformsWithNothingDrawn), SCENE(skews),
                    SCENE(mirrors), SCENE(strokesInOneGroup), SCENE(dashesOnAndOff),
                    SCENE(fillRules), SCENE(opacitiesOfPaint), SCENE(opacitiesOfSingleShapes),
                    SCENE(opacitiesOfLaterShapes), SCENE(transparentColours),
                    SCENE(statesTakenBack), SCENE(grid), SCENE(stretchedStrokes),
                    SCENE(linkedShapes), SCENE(tree), SCENE(manyTurnsInOneGroup), SCENE(hairlines)),
    [](const testing::TestParamInfo<Scene>& scene) { return scene.param.name; });

TEST_P(Scenes, LookLikeTheSameShapesWrittenOneByOne) {
    const Picture picture(drawScene(GetParam()));
    const Picture naive(drawNaively(GetParam()));
    EXPECT_GT(naive.countInk(), 100);
    EXPECT_TRUE(picture.looksLike(naive));
}

// The cases in which the picture is another one. Each is drawn both ways, and a third time by hand
// in the way that the library means it.

template <typename Page> void groupOpacity(Page& page) {
    page.setFillColor(hue(1));
    page.setOpacity(0.5F, OPACITYDEST_ELEMENT);
    box(page, 10, 10, 50, PAINTMODE_FILL);
    page.setOpacity(1, OPACITYDEST_ELEMENT);
    page.setFillColor(hue(2));
    box(page, 40, 40, 50, PAINTMODE_FILL);
}

template <typename Page> void widthWithoutStroke(Page& page) {
    page.setFillColor(hue(1));
    page.setStrokeWidth(pt(9));
    box(page, 10, 10, 30, PAINTMODE_FILL);
    page.setStrokeColor(hue(2));
    box(page, 50, 50, 30, PAINTMODE_STROKE);
}

template <typename Page> void nearlyARotation(Page& page) {
    page.setFillColor(hue(1));
    page.setTransMatrix(SVGMatrix(0.5F, 0.85F, -0.85F, 0.5F, 0, 0));
    box(page, 50, -30, 40, PAINTMODE_FILL);
}

template <typename Page> void smallRotation(Page& page) {
    page.setFillColor(hue(1));
    page.setTransMatrix(shift(-90000, 0)); // far out, where so small an angle shows
    page.pushState();
    page.setTransMatrix(rotation(0.01F));
    box(page, 90020, 20, 40, PAINTMODE_FILL);
    page.popState();
}

template <typename Page> void scalingByZero(Page& page) {
    page.setFillColor(hue(1));
    page.setTransMatrix(scaling(0, 0));
    box(page, 20, 20, 40, PAINTMODE_FILL);
}

template <typename Page> void matrixFromALink(Page& page) {
    page.setFillColor(hue(1));
    page.startLink(u"other.svg", MoxName());
    page.setTransMatrix(shift(0, 40));
    box(page, 5, 5, 20, PAINTMODE_FILL);
    page.endLink();
    box(page, 35, 5, 20, PAINTMODE_FILL);
    page.pushState();
    box(page, 65, 5, 20, PAINTMODE_FILL);
    page.popState();
}

template <typename Page> void linkInALink(Page& page) {
    page.startLink(u"outer.svg", MoxName());
    page.startLink(u"inner.svg", MoxName());
    page.setFillColor(hue(1));
    box(page, 10, 10, 50, PAINTMODE_FILL);
    page.endLink();
    page.setFillColor(hue(2));
    box(page, 40, 40, 50, PAINTMODE_FILL);
    page.endLink();
}

template <typename Page> void unlistedLineCap(Page& page) {
    page.setStrokeColor(hue(1));
    page.setStrokeWidth(pt(20));
    page.setLineCap(LINECAP_ROUND);
    page.drawLine(pt(20), pt(20), pt(80), pt(20), PAINTMODE_STROKE);
    page.setLineCap(static_cast<LINECAP>(7));
    page.drawLine(pt(20), pt(70), pt(80), pt(70), PAINTMODE_STROKE);
}

/// Expects the library to show `meant`, the inside of a root, and not what the naive page shows.
void expectAnotherPicture(const Scene& scene, const std::string& meant) {
    const Picture picture(drawScene(scene));
    EXPECT_FALSE(picture.looksLike(Picture(drawNaively(scene))));
    const Picture expected("<svg xmlns=\"http://www.w3.org/2000/svg\" version=\"1.1\" "
                           "width=\"100pt\" height=\"100pt\" viewBox=\"0 0 100 100\">" +
                           meant + "</svg>");
    EXPECT_TRUE(picture.looksLike(expected));
}

TEST(OtherPictures, TheOpacityOfAGroupsFirstShapeCoversTheWholeGroup) {
    // On purpose: opacity is hoisted like any attribute, though it isn't inherited. A shape can't
    // take it off again; a state of its own gives a shape its own opacity.
    expectAnotherPicture(SCENE(groupOpacity),
                         "<g opacity='.5'>"
                         "<rect x='10' y='10' width='50' height='50' fill='rgb(97,57,173)'/>"
                         "<rect x='40' y='40' width='50' height='50' fill='rgb(194,114,90)'/></g>");
}

TEST(OtherPictures, AWidthSetBeforeAnyStrokeIsLostInItsGroup) {
    // On purpose: a group whose first shape has no stroke writes no width, and a shape that agrees
    // with its group writes none either.
    expectAnotherPicture(
        SCENE(widthWithoutStroke),
        "<rect x='10' y='10' width='30' height='30' fill='rgb(97,57,173)'/>"
        "<rect x='50' y='50' width='30' height='30' fill='none' stroke='rgb(194,114,90)'/>");
}

TEST(OtherPictures, AMatrixNearARotationTurnsAndDoesNotShrink) {
    // On purpose: a matrix close to a rotation is written as one, by its first number.
    expectAnotherPicture(SCENE(nearlyARotation),
                         "<rect x='50' y='-30' width='40' height='40' fill='rgb(97,57,173)' "
                         "transform='rotate(60)'/>");
}

TEST(OtherPictures, ARotationThatLeavesTheFirstNumberAtOneIsNotWritten) {
    // On purpose: the angle is taken from the first number alone, and that says none.
    expectAnotherPicture(SCENE(smallRotation),
                         "<rect x='20' y='20' width='40' height='40' fill='rgb(97,57,173)'/>");
}

TEST(OtherPictures, AScalingByZeroBothWaysIsIgnored) {
    expectAnotherPicture(SCENE(scalingByZero),
                         "<rect x='20' y='20' width='40' height='40' fill='rgb(97,57,173)'/>");
}

TEST(OtherPictures, AMatrixFromInsideALinkReachesTheSecondGroupBehindIt) {
    // On purpose: the matrix waits at group level, which the first group under the root doesn't
    // write.
    expectAnotherPicture(SCENE(matrixFromALink),
                         "<g fill='rgb(97,57,173)'>"
                         "<rect x='5' y='45' width='20' height='20'/>"
                         "<rect x='35' y='5' width='20' height='20'/>"
                         "<rect x='65' y='45' width='20' height='20'/></g>");
}

TEST(OtherPictures, ALinkInALinkIsPaintedBehindAllOfTheOuterOne) {
    // On purpose: links stand under the root, one after the other.
    expectAnotherPicture(SCENE(linkInALink),
                         "<rect x='40' y='40' width='50' height='50' fill='rgb(194,114,90)'/>"
                         "<rect x='10' y='10' width='50' height='50' fill='rgb(97,57,173)'/>");
}

TEST(OtherPictures, AnUnlistedLineCapTakesThatOfTheGroup) {
    // On purpose: an unlisted number writes nothing, and so doesn't undo what the group says.
    expectAnotherPicture(SCENE(unlistedLineCap),
                         "<g stroke='rgb(97,57,173)' stroke-width='20' stroke-linecap='round'>"
                         "<path d='M20 20H80'/><path d='M20 70H80'/></g>");
}

} // namespace
} // namespace DrawmereTest

// Which elements share a group, and what saving and taking back the state does to it.
#include "tests/state/DrawnState.h"

namespace DrawmereTest {
namespace {

constexpr char otherTypeText[] = "Pop type is not same with push type.";

/// Returns: the number and text of what one `popState` throws, empty when it throws nothing.
std::string popError(SvgPage& page) {
    try {
        page->popState();
    } catch (const MoxError& error) {
        return std::to_string(error.getCode()) + " " + error.what();
    }
    return "";
}

TEST(Grouping, ShapesOfAllKindsAndAttributesShareOneGroup) {
    SvgPage page;
    float points[] = {1, 2, 3, 4, 5, 6};
    page->setLineCap(LINECAP_ROUND);
    drawBox(page, 10);
    page->drawCircle(pt(1), pt(2), pt(3), PAINTMODE_FILL);
    page->setLineCap(LINECAP_SQUARE);
    page->drawEllipse(pt(1), pt(2), pt(3), pt(4), PAINTMODE_FILL);
    page->drawLine(pt(1), pt(2), pt(3), pt(4), PAINTMODE_STROKE);
    page->drawPolygon(points, 6, PAINTMODE_FILL);
    page->drawPolyline(points, 6, PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "state/shapes-share-a-group");
}

TEST(Grouping, PushAndPopCloseTheGroup) {
    SvgPage page;
    drawBox(page, 0);
    page->pushState();
    drawBox(page, 20);
    drawBox(page, 40);
    page->popState();
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "state/push-and-pop-close");
}

TEST(Grouping, PushKeepsTheStateInForceAndPopTakesItBack) {
    SvgPage page;
    page->setStrokeColor(MoxColor(0, 0, 255));
    page->setStrokeWidth(pt(2));
    page->pushState();
    drawBox(page, 0);
    page->setStrokeColor(MoxColor(255, 0, 0));
    page->setStrokeWidth(pt(4));
    page->pushState();
    drawBox(page, 20);
    page->setLineCap(LINECAP_ROUND);
    page->popState();
    drawBox(page, 40);
    page->popState();
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "state/pop-takes-state-back");
}

TEST(Grouping, StatesWithNothingDrawnLeaveNothing) {
    SvgPage page;
    page->pushState();
    page->setStrokeWidth(pt(2));
    page->pushState();
    page->popState();
    page->popState();
    EXPECT_EQ(page.body(), "");
}

TEST(Grouping, AScaleIsKeptWithTheStateAndChangesNothing) {
    SvgPage page;
    page->setScale(2);
    drawBox(page, 0);
    page->pushState();
    page->setScale(3);
    drawBox(page, 20);
    page->popState();
    EXPECT_GOLDEN(page, "state/scale-changes-nothing");
}

TEST(Grouping, ALinkClosesTheGroupAndSavesNothing) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    drawBox(page, 0);
    page->startLink(u"other.svg", MoxName());
    page->setStrokeWidth(pt(3));
    drawBox(page, 20);
    page->endLink();
    drawBox(page, 40); // the width of the link's inside goes on
    EXPECT_GOLDEN(page, "state/link-saves-nothing");
}

TEST(Grouping, ALinkInALinkStandsUnderTheRootToo) {
    SvgPage page;
    page->startLink(u"outer.svg", MoxName());
    drawBox(page, 0);
    page->startLink(u"inner.svg", MoxName());
    drawBox(page, 20);
    page->endLink();
    drawBox(page, 40);
    page->endLink();
    drawBox(page, 60);
    EXPECT_GOLDEN(page, "state/link-in-link");
}

TEST(Grouping, StatesInALinkStayInTheLink) {
    SvgPage page;
    page->startLink(u"other.svg", MoxName());
    page->pushState();
    drawBox(page, 0);
    page->popState();
    drawBox(page, 20);
    page->endLink();
    EXPECT_GOLDEN(page, "state/states-in-a-link");
}

TEST(Grouping, TheEndOfALinkThatNeverBeganClosesTheGroupAlone) {
    SvgPage page;
    page->setLineCap(LINECAP_ROUND);
    drawBox(page, 0);
    page->endLink();
    drawBox(page, 20);
    EXPECT_GOLDEN(page, "state/stray-end-of-link");
}

TEST(Grouping, APopTooManyIsOfAnotherTypeAndClosesTheGroupAlone) {
    SvgPage page;
    page->setLineCap(LINECAP_ROUND);
    drawBox(page, 0);
    // On purpose: the state that every document starts with is of no type, so the pop finds another
    // type and not an empty stack.
    EXPECT_EQ(popError(page), std::string("16407 ") + otherTypeText);
    EXPECT_EQ(popError(page), std::string("16407 ") + otherTypeText);
    drawBox(page, 20);
    EXPECT_GOLDEN(page, "state/stray-pop");
}

TEST(Grouping, AfterAStrayPopPushesAndPopsGoOnAsBefore) {
    SvgPage page;
    popError(page);
    page->pushState();
    page->setLineCap(LINECAP_ROUND);
    drawBox(page, 0);
    EXPECT_EQ(popError(page), "");
    drawBox(page, 20);
    EXPECT_EQ(popError(page), std::string("16407 ") + otherTypeText);
    EXPECT_GOLDEN(page, "state/push-after-stray-pop");
}

} // namespace
} // namespace DrawmereTest

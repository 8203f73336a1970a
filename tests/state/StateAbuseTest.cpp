// Settings that no caller should make: each ends in a defined text, and nothing else is lost.
#include "tests/state/DrawnState.h"
#include "tests/support/Command.h"
#include "tests/support/TempDir.h"

#include <limits>

namespace DrawmereTest {
namespace {

constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();
constexpr int manyStates = 100'000;
constexpr std::size_t manyDashes = 1'000'000;

std::size_t countOf(const std::string& text, const std::string& part) {
    std::size_t count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
        ++count;
    }
    return count;
}

/// Returns: what xmllint says against the text, nothing for XML without fault.
std::string findFault(const std::string& xml) {
    const TempDir directory;
    directory.write("page.svg", xml);
    return runCommand({"xmllint", "--noout", "--huge", directory.path("page.svg")}).output;
}

TEST(StateAbuse, WidthsThatAreNoNumbersAreWrittenAsZero) {
    SvgPage page;
    page->setStrokeColor(MoxColor());
    for (const float width : {undefined, infinite, -infinite, -1.0F}) {
        page->setStrokeWidth(pt(width));
        drawBox(page, 0);
    }
    page->setStrokeWidth(pt(2));
    drawBox(page, 20);
    EXPECT_GOLDEN(page, "state/widths-not-finite");
}

TEST(StateAbuse, LimitsDashesAndOffsetsThatAreNoNumbersAreWrittenAsZero) {
    SvgPage page;
    drawBox(page, 0);
    page->setMiterLimit(undefined);
    setDashes(page, {infinite, undefined}, -infinite);
    drawBox(page, 20);
    EXPECT_GOLDEN(page, "state/dashes-not-finite");
}

TEST(StateAbuse, OpacitiesOutOfRangeAreClampedAndAnUndefinedOneIsZero) {
    SvgPage page;
    drawBox(page, 0);
    for (const float opacity : {-0.5F, 1.5F, -infinite, infinite, undefined}) {
        page->setOpacity(opacity, OPACITYDEST_ELEMENT);
        page->setOpacity(opacity, OPACITYDEST_STROKE);
        page->setOpacity(opacity, OPACITYDEST_FILL);
        drawBox(page, 20);
    }
    EXPECT_GOLDEN(page, "state/opacities-out-of-range");
}

TEST(StateAbuse, CoordinatesThatAreNoNumbersAreWrittenAsZero) {
    SvgPage page;
    page->drawRect(pt(undefined), pt(infinite), pt(-infinite), pt(1), pt(0), pt(undefined),
                   PAINTMODE_FILL);
    float points[] = {undefined, infinite, -infinite, 1};
    page->drawPolyline(points, 4, PAINTMODE_STROKE);
    EXPECT_GOLDEN(page, "state/coordinates-not-finite");
}

TEST(StateAbuse, ADashPatternOfAMillionLengthsIsWrittenWhole) {
    SvgPage page;
    const std::vector<MoxLength> dashes(manyDashes, pt(2.5F));
    page->setDashLine(dashes.data(), static_cast<int>(dashes.size()), pt(0));
    drawBox(page, 0);
    drawBox(page, 20);
    EXPECT_EQ(countOf(page.document(), "2.5,"), manyDashes - 1);
    EXPECT_EQ(countOf(page.document(), "stroke-dasharray"), 1U);
    EXPECT_EQ(countOf(page.document(), "<rect"), 2U);
}

TEST(StateAbuse, ANegativeCountOrANullEmptiesTheDashPattern) {
    SvgPage page;
    const MoxLength dash = pt(2);
    setDashes(page, {3, 2});
    drawBox(page, 0);
    page->setDashLine(&dash, -1, pt(0));
    drawBox(page, 20);
    page->setDashLine(nullptr, 5, pt(0));
    drawBox(page, 40);
    EXPECT_GOLDEN(page, "state/dash-counts");
}

TEST(StateAbuse, AHundredThousandNestedStatesLoseNothing) {
    SvgPage page;
    for (int i = 0; i < manyStates; ++i) {
        page->pushState();
        page->setTransMatrix(SVGMatrix(1, 0, 0, 1, 1, 0));
        drawBox(page, 0);
    }
    for (int i = 0; i < manyStates; ++i) {
        page->popState();
    }
    drawBox(page, 20);
    EXPECT_EQ(countOf(page.document(), "<g"), manyStates + 1U);
    EXPECT_NE(page.document().find("<g transform=\"translate(99999,0)\">"), std::string::npos);
    EXPECT_EQ(findFault(page.document()), "");
    EXPECT_TRUE(page.body().ends_with(
        "<g>\n<rect x=\"20\" y=\"10\" width=\"20\" height=\"20\" fill=\"none\"/>\n</g>"));
}

TEST(StateAbuse, StatesThatAreNeverTakenBackLoseNothing) {
    SvgPage page;
    for (int i = 0; i < manyStates; ++i) {
        page->pushState();
    }
    drawBox(page, 0);
    EXPECT_EQ(countOf(page.document(), "<rect"), 1U);
}

TEST(StateAbuse, AHundredThousandNestedLinksLoseNothing) {
    SvgPage page;
    for (int i = 0; i < manyStates; ++i) {
        page->startLink(u"other.svg", MoxName());
    }
    drawBox(page, 0);
    for (int i = 0; i < manyStates; ++i) {
        page->endLink();
    }
    EXPECT_EQ(countOf(page.document(), "<a "), static_cast<std::size_t>(manyStates));
    EXPECT_EQ(countOf(page.document(), "<rect"), 1U);
}

} // namespace
} // namespace DrawmereTest

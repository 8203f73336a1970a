#include "draw/SVGTinyImpl.h"

#include "refs/SVGRefIDManager.h"
#include "tests/draw/ProfileChecks.h"
#include "tests/draw/QueuedErrors.h"
#include "tree/SVGTreeManager.h"

#include <array>

namespace DrawmereTest {
namespace {

constexpr auto tiny = SVGConfig::SVGTYPE_TINY;

const MoxColor red(255, 0, 0);
const MoxColor green(0, 255, 0);
const MoxColor blue(0, 0, 255);

struct TinyTree : DrawnTree<SVGTinyImpl> {
    TinyTree() : DrawnTree(tiny) {}

    UnicodeString startGradient() {
        return impl.startLinearGradient(pt(0), pt(0), pt(1), pt(1), SVGMatrix(), USERSPACEONUSE,
                                        GRADPAD);
    }

    UnicodeString startRadial() {
        return impl.startRadialGradient(pt(0), pt(0), pt(1), pt(0), pt(0), SVGMatrix(),
                                        USERSPACEONUSE, GRADPAD);
    }

    UnicodeString startMask() {
        return impl.startMask(pt(0), pt(0), pt(1), pt(1), USERSPACEONUSE, USERSPACEONUSE);
    }

    UnicodeString startPattern() {
        const MoxRectT<MoxLength> area(pt(0), pt(0), pt(1), pt(1));
        return impl.startPattern(area, area, SVGMatrix(), USERSPACEONUSE, USERSPACEONUSE);
    }

    /// Returns: the fill that the paint `id` comes to.
    std::string fillOf(const UnicodeString& id) {
        impl.getGContext()->setFillColorId(id);
        return utf8(impl.getGContext()->getCurrentGC()->fillColor);
    }

    void drawDot() { impl.drawCircle(pt(1), pt(2), pt(3), PAINTMODE_NONE); }

    /// Returns: what was drawn, the document being finished.
    std::string drawn() {
        impl.finishRootSvg();
        return content();
    }
};

struct Stop {
    MoxColor color;
    float offset;
};

/// Returns: the fill that a gradient with these stops comes to.
std::string averageOf(const std::vector<Stop>& stops) {
    TinyTree tree;
    const UnicodeString id = tree.startGradient();
    for (const Stop& stop : stops) {
        tree.impl.setStopColor(stop.color, stop.offset, 1);
    }
    tree.impl.endGradiant();
    return tree.fillOf(id);
}

constexpr char dot[] = "<g>\n<circle cx=\"1\" cy=\"2\" r=\"3\" fill=\"none\"/>\n</g>\n";

TEST(SVGTinyImpl, HasTheDialectTiny) { EXPECT_EQ(dialectOf<SVGTinyImpl>(), 2); }

TEST(SVGTinyImpl, LetsNothingIntoAClipDefinition) {
    EXPECT_EQ(listClipContent<SVGTinyImpl>(tiny), "");
}

TEST(SVGTinyImpl, ClampsCoordinatesAsBasicDoes) {
    float points[] = {40000, -40000};
    EXPECT_EQ(drawPoints<SVGTinyImpl>(points, 2),
              "<polyline fill=\"none\" points=\"32768,-32768 \"/>");
}

TEST(SVGTinyImpl, BeginsWithoutAGradient) {
    SVGConfig config;
    const SVGTinyImpl impl(&config);
    EXPECT_TRUE(impl.gradientId.isEmpty());
    EXPECT_EQ(impl.lowStopColor, MoxColor());
    EXPECT_EQ(impl.highStopColor, MoxColor());
    EXPECT_TRUE(impl.noStopYet);
    EXPECT_EQ(impl.highStopOffset, 0.0F);
    EXPECT_EQ(impl.lowStopOffset, 0.0F);
}

// Gradients.

TEST(SVGTinyImpl, GradientIsTheColorHalfWayBetweenItsEnds) {
    EXPECT_EQ(averageOf({{red, 0}, {blue, 1}}), "#7f007f");
    EXPECT_EQ(averageOf({{MoxColor(1, 2, 3), 0}, {MoxColor(2, 4, 8), 1}}), "#010305");
    EXPECT_EQ(averageOf({{red, 0}, {red, 1}}), "red");
    EXPECT_EQ(averageOf({{MoxColor(255, 0, 0, 7), 0}, {MoxColor(255, 0, 0, 9), 1}}), "red");
}

TEST(SVGTinyImpl, GradientTakesItsEndsByTheirOffsetsInWhateverOrder) {
    EXPECT_EQ(averageOf({{red, 0}, {green, 0.5F}, {blue, 1}}), "#7f007f");
    EXPECT_EQ(averageOf({{green, 0.5F}, {blue, 1}, {red, 0}}), "#7f007f");
    EXPECT_EQ(averageOf({{blue, 7}, {green, 0}, {red, -3}}), "#7f007f");
}

TEST(SVGTinyImpl, OfTwoStopsAtOneOffsetTheLaterCounts) {
    EXPECT_EQ(averageOf({{red, 0.5F}, {blue, 0.5F}}), "#00f");
    EXPECT_EQ(averageOf({{green, 0}, {red, 0}, {green, 1}, {blue, 1}}), "#7f007f");
}

TEST(SVGTinyImpl, GradientWithOneStopIsItsColor) { EXPECT_EQ(averageOf({{blue, 0.3F}}), "#00f"); }

TEST(SVGTinyImpl, GradientWithoutStopsIsTheDefaultColor) { EXPECT_EQ(averageOf({}), "#000"); }

// On purpose: the colours stay for the next gradient.
TEST(SVGTinyImpl, LaterGradientWithoutStopsTakesTheColorOfTheOneBefore) {
    TinyTree tree;
    tree.startGradient();
    tree.impl.setStopColor(red, 0, 1);
    tree.impl.setStopColor(blue, 1, 1);
    tree.impl.endGradiant();
    const UnicodeString id = tree.startRadial();
    tree.impl.endGradiant();
    EXPECT_EQ(tree.fillOf(id), "#7f007f");
}

TEST(SVGTinyImpl, LaterGradientStartsWithOffsetsOfItsOwn) {
    TinyTree tree;
    tree.startGradient();
    tree.impl.setStopColor(red, 5, 1);
    tree.impl.endGradiant();
    EXPECT_TRUE(tree.impl.noStopYet);
    EXPECT_EQ(tree.impl.highStopOffset, 0.0F);
    EXPECT_EQ(tree.impl.lowStopOffset, 0.0F);
    const UnicodeString id = tree.startGradient();
    tree.impl.setStopColor(blue, 1, 1);
    tree.impl.setStopColor(blue, 2, 1);
    tree.impl.endGradiant();
    EXPECT_EQ(tree.fillOf(id), "#00f");
}

TEST(SVGTinyImpl, GradientIsWrittenAsANumberWhereNamesAreSwitchedOff) {
    TinyTree tree;
    tree.config.colorFlag = false;
    const UnicodeString id = tree.startGradient();
    tree.impl.setStopColor(red, 0, 1);
    tree.impl.endGradiant();
    EXPECT_EQ(tree.fillOf(id), "#f00");
}

TEST(SVGTinyImpl, GradientsHaveIdsAndMasksAndPatternsHaveNone) {
    TinyTree tree;
    const auto before = tree.impl.refIdManager->nextNumbers;
    EXPECT_EQ(utf8(tree.startMask()), "");
    tree.impl.endMask();
    EXPECT_EQ(utf8(tree.startPattern()), "");
    tree.impl.endPattern();
    EXPECT_EQ(tree.impl.refIdManager->nextNumbers, before);
    EXPECT_EQ(utf8(tree.startGradient()), "g0");
    tree.impl.endGradiant();
    EXPECT_EQ(utf8(tree.startRadial()), "g1");
    tree.impl.endGradiant();
    EXPECT_EQ(takeErrors(tree.config), "");
}

TEST(SVGTinyImpl, GradientInAGradientHasNoIdAndChangesNothing) {
    TinyTree tree;
    const UnicodeString id = tree.startGradient();
    tree.impl.setStopColor(red, 0, 1);
    EXPECT_EQ(utf8(tree.startGradient() + tree.startRadial()), "");
    EXPECT_EQ(tree.impl.gradientId, id);
    EXPECT_EQ(tree.impl.getGContext()->getType(), ELEMENT_TYPE_GRADIENT);
    tree.impl.endGradiant();
    EXPECT_EQ(tree.fillOf(id), "red");
    EXPECT_EQ(utf8(tree.startGradient()), "g1");
}

TEST(SVGTinyImpl, WhatIsDrawnInAGradientIsLostAndWhatFollowsIsNot) {
    TinyTree tree;
    tree.startGradient();
    tree.drawDot();
    tree.impl.setStopColor(red, 0, 1);
    tree.drawDot();
    tree.impl.endGradiant();
    tree.drawDot();
    EXPECT_EQ(tree.drawn(), dot);
}

TEST(SVGTinyImpl, StopOutsideAGradientChangesNothing) {
    TinyTree tree;
    tree.impl.setStopColor(red, 0, 1);
    EXPECT_TRUE(tree.impl.noStopYet);
    tree.drawDot();
    EXPECT_EQ(tree.drawn(), dot);
}

TEST(SVGTinyImpl, UnknownPaintIsNone) {
    TinyTree tree;
    EXPECT_EQ(tree.fillOf(u"g7"), "none");
    const UnicodeString id = tree.startGradient();
    EXPECT_EQ(tree.fillOf(id), "none"); // it has not ended
}

TEST(SVGTinyImpl, PaintKeepsItsFirstColor) {
    TinyTree tree;
    tree.impl.getGContext()->tinyFillColors[u"g0"] = u"teal";
    const UnicodeString id = tree.startGradient();
    tree.impl.setStopColor(red, 0, 1);
    tree.impl.endGradiant();
    EXPECT_EQ(tree.fillOf(id), "teal");
}

TEST(SVGTinyImpl, PaintGoesWithTheStateItWasMadeIn) {
    TinyTree tree;
    tree.impl.pushState(ELEMENT_TYPE_PLAIN);
    const UnicodeString id = tree.startGradient();
    tree.impl.setStopColor(red, 0, 1);
    tree.impl.endGradiant();
    tree.impl.pushState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(tree.fillOf(id), "red");
    tree.impl.popState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(tree.fillOf(id), "red");
    tree.impl.popState(ELEMENT_TYPE_PLAIN);
    EXPECT_EQ(tree.fillOf(id), "none");
}

TEST(SVGTinyImpl, StrokeRefersToTheGradientThatIsNowhere) {
    TinyTree tree;
    const UnicodeString id = tree.startGradient();
    tree.impl.endGradiant();
    tree.impl.getGContext()->setStrokeColorId(id);
    EXPECT_EQ(utf8(tree.impl.getGContext()->getCurrentGC()->strokeColor), "url(#g0)");
}

// Definitions.

TEST(SVGTinyImpl, DefinitionsChangeTheTypeOfTheStateAlone) {
    TinyTree tree;
    const SVGGraphicContext& state = *tree.impl.getGContext();
    const SVGElement* cursor = tree.impl.treeManager->getCurrentNode();
    tree.startMask();
    EXPECT_EQ(state.getType(), ELEMENT_TYPE_MASK);
    tree.impl.endMask();
    EXPECT_EQ(state.getType(), ELEMENT_TYPE_NONE);
    tree.startPattern();
    EXPECT_EQ(state.getType(), ELEMENT_TYPE_PATTERN);
    tree.impl.endPattern();
    EXPECT_EQ(state.getType(), ELEMENT_TYPE_NONE);
    EXPECT_EQ(tree.impl.treeManager->getCurrentNode(), cursor);
    EXPECT_TRUE(tree.impl.treeManager->nodeStack.empty());
    EXPECT_EQ(tree.drawn(), "");
}

TEST(SVGTinyImpl, EndsWithoutAStartAreNoFailure) {
    TinyTree tree;
    tree.impl.endMask();
    tree.impl.endPattern();
    tree.impl.endGradiant();
    tree.drawDot();
    EXPECT_EQ(tree.drawn(), dot);
}

TEST(SVGTinyImpl, ClipStaysAwayFromTheStateOfTheTree) {
    TinyTree tree;
    tree.impl.startClipRect(USERSPACEONUSE);
    tree.impl.endClipDef();
    tree.impl.doClip();
    EXPECT_FALSE(tree.impl.getGContext()->clipState);
    tree.drawDot();
    EXPECT_EQ(tree.drawn(), std::string("<defs/>\n") + dot);
}

// Texts.

/// Notes the texts that the single form is called with.
class NotingImpl : public SVGTinyImpl {
public:
    using SVGTinyImpl::drawText;
    using SVGTinyImpl::SVGTinyImpl;

    void drawText(const UnicodeString& text, const MoxLength& x, const MoxLength& y, PAINTMODE mode,
                  TLStringWithGlyphInfo* glyphs, bool wholeRun) override {
        noted += "[" + utf8(text) + " " + std::to_string(static_cast<int>(x.getRawValue())) + " " +
                 std::to_string(static_cast<int>(y.getRawValue())) + " " + std::to_string(mode) +
                 (glyphs ? " glyphs" : "") + (wholeRun ? " whole" : "") + "]";
    }

    std::string noted;
};

using Lengths = std::vector<MoxLength>;

std::string noteTexts(const UnicodeString& text, const Lengths& x, const Lengths& y,
                      int type = ELEMENT_TYPE_NONE) {
    SVGConfig config;
    NotingImpl impl(&config);
    impl.initRootSvg();
    impl.getGContext()->setType(type);
    impl.drawText(text, x, y, {7, 8, 9}, PAINTMODE_FILL, nullptr, /*wholeRun=*/true);
    return impl.noted;
}

TEST(SVGTinyImpl, PositionedUnitsAreTextsOfTheirOwn) {
    EXPECT_EQ(noteTexts(u"abc", {pt(1), pt(2), pt(3)}, {pt(4), pt(5), pt(6), pt(7)}),
              "[a 1 4 1 whole][b 2 5 1 whole][c 3 6 1 whole]");
    EXPECT_EQ(noteTexts(u"a", {pt(1)}, {pt(4)}), "[a 1 4 1 whole]");
}

TEST(SVGTinyImpl, TextWithTooFewPositionsStandsAtTheFirst) {
    EXPECT_EQ(noteTexts(u"abc", {pt(1), pt(2), pt(3)}, {pt(4), pt(5)}), "[abc 1 4 1 whole]");
    EXPECT_EQ(noteTexts(u"abc", {pt(1)}, {pt(4)}), "[abc 1 4 1 whole]");
    EXPECT_EQ(noteTexts(u"abc", {}, {pt(4)}), "[abc 0 4 1 whole]");
    EXPECT_EQ(noteTexts(u"abc", {pt(1)}, {}), "[abc 1 0 1 whole]");
    EXPECT_EQ(noteTexts(u"abc", {}, {}), "[abc 0 0 1 whole]");
}

// On purpose: units, not characters. A surrogate pair becomes two texts.
TEST(SVGTinyImpl, SurrogatePairBecomesTwoTexts) {
    EXPECT_EQ(noteTexts(u"\U0001F600", {pt(1), pt(2)}, {pt(4), pt(5)}),
              "[\uFFFD 1 4 1 whole][\uFFFD 2 5 1 whole]");
    EXPECT_EQ(noteTexts(u"\U0001F600", {pt(1)}, {pt(4)}), "[\U0001F600 1 4 1 whole]");
}

TEST(SVGTinyImpl, EmptyTextIsNotDrawn) { EXPECT_EQ(noteTexts(u"", {pt(1)}, {pt(2)}), ""); }

TEST(SVGTinyImpl, TextInADefinitionIsNotDrawn) {
    for (const int type : {0, 1, 2, 3}) {
        EXPECT_EQ(noteTexts(u"a", {pt(1)}, {pt(2)}, type), "") << type;
        TinyTree tree;
        tree.impl.getGContext()->setType(type);
        tree.impl.drawText(u"a", pt(1), pt(2), PAINTMODE_NONE, nullptr, /*wholeRun=*/true);
        tree.impl.getGContext()->setType(ELEMENT_TYPE_NONE);
        EXPECT_EQ(tree.drawn(), "") << type;
    }
    for (const int type : {-2, -1, 4, 5}) {
        EXPECT_EQ(noteTexts(u"a", {pt(1)}, {pt(2)}, type), "[a 1 2 1 whole]") << type;
    }
}

/// Returns: a text as it is drawn, in the group that states its font.
std::string textGroup(const std::string& attributes, const std::string& text) {
    return "<g font-size=\"medium\" font-weight=\"400\">\n<text " + attributes + " fill=\"none\">" +
           text + "</text>\n</g>\n";
}

TEST(SVGTinyImpl, ItsOwnTextHasNoDirection) {
    TinyTree tree;
    tree.impl.drawText(u"a", pt(1), pt(2), PAINTMODE_NONE, nullptr, /*wholeRun=*/true);
    EXPECT_EQ(tree.drawn(), textGroup("x=\"1\" y=\"2\"", "a"));
}

TEST(SVGTinyImpl, TextOfTheBaseCanBeDrawnToo) {
    TinyTree tree;
    tree.impl.drawText(u"ab", Lengths{pt(1), pt(2)}, Lengths{pt(3), pt(4)}, {}, PAINTMODE_NONE,
                       nullptr, /*wholeRun=*/true, /*leftToRight=*/false);
    EXPECT_EQ(tree.drawn(), textGroup("x=\"1 2\" y=\"3 4\" direction=\"rtl\"", "ab"));
}

TEST(SVGTinyImpl, LettersOfItsOwnTextStandEachInAnElement) {
    TinyTree tree;
    tree.impl.drawText(u"ab", Lengths{pt(1), pt(2)}, Lengths{pt(3), pt(4)}, {}, PAINTMODE_NONE,
                       nullptr, /*wholeRun=*/true);
    EXPECT_EQ(tree.drawn(), textGroup("x=\"1\" y=\"3\"", "a") + textGroup("x=\"2\" y=\"4\"", "b"));
}

} // namespace
} // namespace DrawmereTest

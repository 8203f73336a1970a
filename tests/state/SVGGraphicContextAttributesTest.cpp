#include "state/SVGGraphicContext.h"
#include "tests/state/StatePage.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>

using namespace DrawmereNS;

namespace {

constexpr float infinity = std::numeric_limits<float>::infinity();
constexpr float nan = std::numeric_limits<float>::quiet_NaN();

/// A state with an element that its attributes are written on.
struct Writing : StatePage {
    explicit Writing(SVGConfig::SVGTYPE dialect = SVGConfig::SVGTYPE_FULL) : StatePage(dialect) {
        state().setStrokeColorName(u"red");
    }

    std::string stroke(int flag, bool isGroup = false) {
        state().setStrokeAttribute(element.get(), flag, isGroup);
        return attributesOf(element.get());
    }

    std::string text(int flag, bool isGroup = false) {
        state().setTextAttribute(element.get(), flag, isGroup);
        return attributesOf(element.get());
    }

    std::string opacity(int dest, bool isGroup = false, bool asOpacity = false) {
        state().setOpacityAttribute(element.get(), static_cast<OPACITYDEST>(dest), isGroup,
                                    asOpacity);
        return attributesOf(element.get());
    }

    std::string clipRule(int rule) {
        state().setClipRule(static_cast<CLIPRULE>(rule), element.get());
        return attributesOf(element.get());
    }

    void setDashes(const std::vector<float>& points) {
        std::vector<MoxLength> lengths;
        std::transform(points.begin(), points.end(), std::back_inserter(lengths), pt);
        state().setDashLine(lengths.data(), static_cast<int>(lengths.size()), pt(0));
    }

    MoxPtr<SVGElement> element = make(SVGName::rect);
};

std::string dashText(const std::vector<float>& points) {
    Writing writing;
    writing.setDashes(points);
    return writing.stroke(ATTRIBUTEFLAG_DASHARRAY);
}

std::string widthText(float points) {
    Writing writing;
    writing.state().setStrokeWidth(pt(points));
    return writing.stroke(ATTRIBUTEFLAG_STROKEWIDTH);
}

TEST(SVGGraphicContextAttributes, StrokeWidthIsARealInPoints) {
    EXPECT_EQ(widthText(3.5F), "stroke-width=3.5");
    Writing writing;
    writing.state().setStrokeWidth(MoxLength(1, MoxCommonNS::MOXUNIT_INCH));
    writing.stroke(ATTRIBUTEFLAG_STROKEWIDTH);
    const MoxValue& value = writing.element->getAttribute(SVGName(SVGName::stroke_width));
    EXPECT_EQ(value.getType(), MoxCommonNS::MOXVALUE_REAL);
    EXPECT_EQ(value.getFloat(), 72.0F);
}

TEST(SVGGraphicContextAttributes, StrokeWidthIsAbsentWithoutAStroke) {
    Writing writing;
    writing.state().setStrokeColorName(u"none");
    writing.state().setStrokeWidth(pt(3));
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_STROKEWIDTH), "");
    writing.state().setStrokeColorName(u"nonesuch"); // the whole text counts
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_STROKEWIDTH), "stroke-width=3");
}

TEST(SVGGraphicContextAttributes, AZeroWidthIsAHairline) {
    Writing writing;
    writing.state().setStrokeWidth(pt(0));
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_STROKEWIDTH), "stroke-width=0.00001");
    EXPECT_EQ(writing.element->getAttribute(SVGName(SVGName::stroke_width)).getFloat(), 1e-5F);
    EXPECT_EQ(widthText(-0.0F), "stroke-width=0.00001");
}

TEST(SVGGraphicContextAttributes, AnImpossibleWidthIsWrittenAsZero) {
    EXPECT_EQ(widthText(nan), "stroke-width=0");
    EXPECT_EQ(widthText(infinity), "stroke-width=0");
    EXPECT_EQ(widthText(-2), "stroke-width=-2");
}

TEST(SVGGraphicContextAttributes, LineCapsHaveTheirWordsAndUnlistedOnesNone) {
    const struct {
        int cap;
        const char* text;
    } rows[] = {
        {-2, ""},
        {-1, "stroke-linecap=butt"},
        {0, "stroke-linecap=butt"},
        {1, "stroke-linecap=round"},
        {2, "stroke-linecap=square"},
        {3, ""},
    };

    for (const auto& row : rows) {
        Writing writing;
        writing.state().setLineCap(static_cast<LINECAP>(row.cap));
        EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_LINECAP), row.text) << row.cap;
    }
}

TEST(SVGGraphicContextAttributes, LineJoinsHaveTheirWordsAndUnlistedOnesNone) {
    const struct {
        int join;
        const char* text;
    } rows[] = {
        {-2, ""},
        {-1, "stroke-linejoin=miter"},
        {0, "stroke-linejoin=miter"},
        {1, "stroke-linejoin=round"},
        {2, "stroke-linejoin=bevel"},
        {3, ""},
    };

    for (const auto& row : rows) {
        Writing writing;
        writing.state().setLineJoin(static_cast<LINEJOIN>(row.join));
        EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_LINEJOIN), row.text) << row.join;
    }
}

TEST(SVGGraphicContextAttributes, MiterLimitAndDashOffsetAreReals) {
    Writing writing;
    writing.state().setMiterLimit(2.5F);
    writing.state().setDashLine(nullptr, 0, pt(1.25F));
    writing.stroke(ATTRIBUTEFLAG_MITERLIMIT);
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_DASHOFFSET),
              "stroke-miterlimit=2.5 stroke-dashoffset=1.25");
}

TEST(SVGGraphicContextAttributes, UnknownFlagsWriteNothing) {
    for (const int flag : {0, 3, 33, 63, 64, 512, -1}) {
        Writing writing;
        EXPECT_EQ(writing.stroke(flag), "") << flag;
    }
    for (const int flag : {0, 1, 32, 192, 512, -64}) {
        Writing writing;
        writing.state().setTextAnchor(TEXTANCHOR_START);
        EXPECT_EQ(writing.text(flag), "") << flag;
    }
}

TEST(SVGGraphicContextAttributes, AnEvenDashPatternStandsOnce) {
    EXPECT_EQ(dashText({3, 2}), "stroke-dasharray=3,2");
    EXPECT_EQ(dashText({0.5F, 1.25F, 3, 4}), "stroke-dasharray=0.5,1.25,3,4");
}

TEST(SVGGraphicContextAttributes, AnOddDashPatternStandsTwice) {
    EXPECT_EQ(dashText({3, 2, 1}), "stroke-dasharray=3,2,1,3,2,1");
    EXPECT_EQ(dashText({3}), "stroke-dasharray=3,3");
}

TEST(SVGGraphicContextAttributes, ImpossibleDashesAreZeros) {
    EXPECT_EQ(dashText({nan, infinity}), "stroke-dasharray=0,0");
}

TEST(SVGGraphicContextAttributes, AnEmptyPatternIsNoneOnElementsAndNothingOnGroups) {
    Writing writing;
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_DASHARRAY, /*isGroup=*/true), "");
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_DASHARRAY, /*isGroup=*/false), "stroke-dasharray=none");
}

TEST(SVGGraphicContextAttributes, AMillionDashesAreWritten) {
    const std::string text = dashText(std::vector<float>(1000001, 1.5F));
    EXPECT_EQ(text.size(), std::string("stroke-dasharray=").size() + 2 * 1000001 * 4 - 1);
    EXPECT_EQ(text.substr(text.size() - 8), ",1.5,1.5");
}

TEST(SVGGraphicContextAttributes, DialectsWriteTheSameDashes) {
    for (const auto dialect : {SVGConfig::SVGTYPE_BASIC, SVGConfig::SVGTYPE_TINY}) {
        Writing writing(dialect);
        writing.setDashes({3});
        EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_DASHARRAY), "stroke-dasharray=3,3");
    }
}

TEST(SVGGraphicContextAttributes, AGroupReadsTheGroupsRecord) {
    Writing writing;
    writing.state().setMiterLimit(7);
    writing.state().copyCur2Group(/*multiply=*/false);
    writing.state().setMiterLimit(9);
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_MITERLIMIT, /*isGroup=*/true), "stroke-miterlimit=7");
    EXPECT_EQ(writing.stroke(ATTRIBUTEFLAG_MITERLIMIT, /*isGroup=*/false), "stroke-miterlimit=9");
}

TEST(SVGGraphicContextAttributes, WritingModeIsTheTextOfItsName) {
    Writing writing;
    EXPECT_EQ(writing.text(ATTRIBUTEFLAG_WRITINGMODE), "writing-mode=lr-tb");
    writing.state().setWritingMode(MoxCommonNS::MOXNAME_TB_RL);
    EXPECT_EQ(writing.text(ATTRIBUTEFLAG_WRITINGMODE), "writing-mode=tb-rl");
    EXPECT_EQ(writing.element->getAttribute(SVGName(SVGName::writing_mode)).getType(),
              MoxCommonNS::MOXVALUE_STRING);
}

TEST(SVGGraphicContextAttributes, TextAnchorsHaveTheirWordsAndUnlistedOnesNone) {
    const struct {
        int anchor;
        const char* text;
    } rows[] = {
        {-1, ""},
        {0, "text-anchor=start"},
        {1, "text-anchor=middle"},
        {2, "text-anchor=end"},
        {3, ""},
        {4, ""},
    };

    for (const auto& row : rows) {
        Writing writing;
        writing.state().setTextAnchor(static_cast<TEXTANCHOR>(row.anchor));
        EXPECT_EQ(writing.text(ATTRIBUTEFLAG_TEXTANCHOR), row.text) << row.anchor;
    }
}

TEST(SVGGraphicContextAttributes, TextDecorationsHaveTheirWordsAndUnlistedOnesNone) {
    const struct {
        int decoration;
        const char* text;
    } rows[] = {
        {-1, ""},
        {0, ""},
        {1, "text-decoration=underline"},
        {2, "text-decoration=overline"},
        {3, "text-decoration=line-through"},
        {4, "text-decoration=blink"},
        {5, ""},
    };

    for (const auto& row : rows) {
        Writing writing;
        writing.state().setTextDecoration(static_cast<TEXTDECORATION>(row.decoration));
        EXPECT_EQ(writing.text(ATTRIBUTEFLAG_TEXTDECORATION), row.text) << row.decoration;
    }
}

TEST(SVGGraphicContextAttributes, EqualOpacitiesWriteNothing) {
    Writing writing;
    EXPECT_EQ(writing.opacity(0) + writing.opacity(1) + writing.opacity(2), "");
    EXPECT_EQ(writing.opacity(0, true) + writing.opacity(1, true) + writing.opacity(2, true), "");
}

TEST(SVGGraphicContextAttributes, OpacitiesOfElementsAreComparedWithTheGroup) {
    Writing writing;
    writing.state().setOpacity(0.5F, OPACITYDEST_FILL);
    writing.state().copyCur2Group(/*multiply=*/false);
    EXPECT_EQ(writing.opacity(2), "");
    writing.state().setOpacity(1.0F, OPACITYDEST_FILL);
    EXPECT_EQ(writing.opacity(2), "fill-opacity=1");
}

TEST(SVGGraphicContextAttributes, OpacitiesOfGroupsAreComparedWithTheDefaults) {
    Writing writing;
    writing.state().setOpacity(0.25F, OPACITYDEST_STROKE);
    writing.state().setOpacity(0.5F, OPACITYDEST_FILL);
    writing.state().setOpacity(0.75F, OPACITYDEST_ELEMENT);
    writing.state().copyCur2Group(/*multiply=*/false);
    writing.opacity(1, true);
    writing.opacity(2, true);
    writing.opacity(3, true);
    writing.opacity(-1, true);
    EXPECT_EQ(writing.opacity(0, true), "stroke-opacity=0.25 fill-opacity=0.5 opacity=0.75");
}

TEST(SVGGraphicContextAttributes, TheFillsOpacityCanStandForTheElements) {
    Writing writing;
    writing.state().setOpacity(0.5F, OPACITYDEST_FILL);
    EXPECT_EQ(writing.opacity(2, false, /*asOpacity=*/true), "opacity=0.5");
    Writing stroked;
    stroked.state().setOpacity(0.5F, OPACITYDEST_STROKE);
    EXPECT_EQ(stroked.opacity(1, false, /*asOpacity=*/true), "stroke-opacity=0.5");
}

TEST(SVGGraphicContextAttributes, OpacitiesOutOfRangeAreWrittenAsTheyAre) {
    Writing writing;
    writing.state().setOpacity(-2, OPACITYDEST_FILL);
    writing.state().setOpacity(nan, OPACITYDEST_STROKE);
    writing.state().setOpacity(7, OPACITYDEST_ELEMENT);
    writing.opacity(2);
    writing.opacity(1);
    EXPECT_EQ(writing.opacity(0), "fill-opacity=-2 stroke-opacity=0 opacity=7");
}

TEST(SVGGraphicContextAttributes, TinyHasNoOpacity) {
    Writing writing(SVGConfig::SVGTYPE_TINY);
    writing.state().setOpacity(0.5F, OPACITYDEST_ELEMENT);
    writing.state().setOpacity(0.5F, OPACITYDEST_FILL);
    writing.state().setOpacity(0.5F, OPACITYDEST_STROKE);
    EXPECT_EQ(writing.opacity(0) + writing.opacity(1) + writing.opacity(2), "");
}

TEST(SVGGraphicContextAttributes, BasicHasOpacity) {
    Writing writing(SVGConfig::SVGTYPE_BASIC);
    writing.state().setOpacity(0.5F, OPACITYDEST_ELEMENT);
    EXPECT_EQ(writing.opacity(0), "opacity=0.5");
}

TEST(SVGGraphicContextAttributes, ClipRulesHaveTheirWordsAndUnlistedOnesNone) {
    EXPECT_EQ(Writing().clipRule(0), "clip-rule=nonzero");
    EXPECT_EQ(Writing().clipRule(1), "clip-rule=evenodd");
    EXPECT_EQ(Writing().clipRule(2), "");
    EXPECT_EQ(Writing().clipRule(-1), "");
    EXPECT_EQ(Writing(SVGConfig::SVGTYPE_TINY).clipRule(1), "");
}

TEST(SVGGraphicContextAttributes, TheClipPathStandsWhereThereIsOne) {
    Writing writing;
    writing.state().setClipPathAttrVal(writing.element.get(), true);
    EXPECT_EQ(attributesOf(writing.element.get()), "");
    writing.state().setClipPathID(u"c1");
    writing.state().setClipPathAttrVal(writing.element.get(), false);
    EXPECT_EQ(attributesOf(writing.element.get()), "clip-path=url(#c1)");
}

TEST(SVGGraphicContextAttributes, TinyHasNoClipPath) {
    Writing writing(SVGConfig::SVGTYPE_TINY);
    writing.state().setClipPathID(u"c1");
    writing.state().setClipPathAttrVal(writing.element.get(), true);
    EXPECT_EQ(attributesOf(writing.element.get()), "");
}

TEST(SVGGraphicContextAttributes, ANullElementIsIgnored) {
    Writing writing;
    writing.element = nullptr;
    SVGGraphicContext& state = writing.state();
    state.setStrokeAttribute(nullptr, ATTRIBUTEFLAG_STROKEWIDTH, false);
    state.setTextAttribute(nullptr, ATTRIBUTEFLAG_WRITINGMODE, false);
    state.setOpacity(0.5F, OPACITYDEST_ELEMENT);
    state.setOpacityAttribute(nullptr, OPACITYDEST_ELEMENT, false, false);
    state.setClipRule(CLIPRULE_EVENODD, nullptr);
    state.setClipPathID(u"c1");
    state.setClipPathAttrVal(nullptr, true);
    state.setTransformAttr(nullptr, TRANSFORMMODE_NESTEDCLIP);
    state.AttrValueCompare(nullptr, false, ELEMENTTYPE_TEXT);
    state.setGroupAttrs(nullptr, ELEMENTTYPE_TEXT);
    EXPECT_EQ(state.currentGC.opacity, 0.5F);
}

} // namespace

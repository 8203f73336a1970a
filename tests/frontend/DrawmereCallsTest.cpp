// The drawing calls, which pass on what they are given.
#include "fonts/SVGFontManager.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "foundation/records/TLGraphicImage.h"
#include "foundation/records/TLStringWithGlyphInfo.h"
#include "state/SVGGraphicContext.h"
#include "tests/frontend/RecordingImpl.h"
#include "tests/support/SvgPage.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

#include <limits>

namespace DrawmereTest {
namespace {

using namespace DrawmereNS;
using MoxCommonNS::MoxNamedValueMap;

class NoImage : public TLGraphicImage {
public:
    TLGraphicType getGraphicType() override { return TalGraphic::TLGRAPHICTYPE_PNG; }

    std::istream* getStream() override { return nullptr; }
};

constexpr auto all = PAINTMODE_FILLSTROKE;
const SVGMatrix matrix(1, 2, 3, 4, 5, 6);
const MoxRectT<MoxLength> area(pt(1), pt(2), pt(3), pt(4));
const MoxRectT<MoxLength> viewArea(pt(5), pt(6), pt(7), pt(8));

/// A document whose implementation notes what it is told.
struct RecordedPage : SvgPage {
    RecordedPage() {
        delete drawmere.impl;
        drawmere.impl = impl;
    }

    RecordingImpl* impl = new RecordingImpl(&config); // owned by `drawmere`
};

struct CallRow {
    void (*call)(Drawmere&);
    const char* told;
};

const CallRow implCalls[] = {
    {[](Drawmere& d) { d.pushState(); }, "pushState -1"},
    {[](Drawmere& d) { d.popState(); }, "popState -1"},
    {[](Drawmere& d) { d.setScale(2.5F); }, "setScale 2.5"},
    {[](Drawmere& d) { d.setCanvasSize(pt(1), pt(2)); }, "setCanvasSize 1 2"},
    {[](Drawmere& d) { d.setCanvasSize(pt(1), pt(2), MoxCommonNS::MOXUNIT_MM); },
     "setCanvasSize 1 2 7"},
    {[](Drawmere& d) { d.startClipDef(OBJECTBOUNDINGBOX); }, "startClipDef 1"},
    {[](Drawmere& d) { d.startClipRect(USERSPACEONUSE); }, "startClipRect 0"},
    {[](Drawmere& d) { d.endClipDef(); }, "endClipDef"},
    {[](Drawmere& d) { d.doClip(); }, "doClip"},
    {[](Drawmere& d) { d.drawLine(pt(1), pt(2), pt(3), pt(4), all); }, "drawLine 1 2 3 4 3"},
    {[](Drawmere& d) { d.drawRect(pt(1), pt(2), pt(3), pt(4), pt(5), pt(6), all); },
     "drawRect 1 2 3 4 5 6 3"},
    {[](Drawmere& d) { d.drawCircle(pt(1), pt(2), pt(3), all); }, "drawCircle 1 2 3 3"},
    {[](Drawmere& d) { d.drawEllipse(pt(1), pt(2), pt(3), pt(4), all); }, "drawEllipse 1 2 3 4 3"},
    {[](Drawmere& d) {
         float points[] = {1, 2, 3, 4};
         d.drawPolyline(points, 4, all);
     },
     "drawPoly [1,2,3,4] yes 3"},
    {[](Drawmere& d) {
         float points[] = {1, 2, 3, 4};
         d.drawPolygon(points, 4, all);
     },
     "drawPoly [1,2,3,4] no 3"},
    {[](Drawmere& d) {
         TLStringWithGlyphInfo glyphs;
         d.drawText(u"ab", {pt(1), pt(2)}, {pt(3)}, {4, 5}, all, &glyphs, true, false);
     },
     "drawText 'ab' [1,2] [3] [4,5] 3 one yes no"},
    {[](Drawmere& d) { d.drawText(u"ab", pt(1), pt(2), all, nullptr, false, true); },
     "drawText 'ab' [1] [2] [0] 3 null no yes"},
    {[](Drawmere& d) {
         NoImage image;
         d.drawImage(&image, TalGraphic::TLGRAPHICTYPE_JPEG, pt(1), pt(2), pt(3), pt(4));
     },
     "drawImage one 1 2 3 4"},
    {[](Drawmere& d) {
         EXPECT_EQ(utf8(d.startPattern(area, viewArea, matrix, USERSPACEONUSE, OBJECTBOUNDINGBOX)),
                   "pattern");
     },
     "startPattern [1,2,3,4] [5,6,7,8] [1,2,3,4,5,6] 0 1"},
    {[](Drawmere& d) {
         EXPECT_EQ(utf8(d.startMask(pt(1), pt(2), pt(3), pt(4), OBJECTBOUNDINGBOX, USERSPACEONUSE)),
                   "mask");
     },
     "startMask 1 2 3 4 1 0"},
    {[](Drawmere& d) {
         EXPECT_EQ(utf8(d.startLinearGradient(pt(1), pt(2), pt(3), pt(4), matrix, OBJECTBOUNDINGBOX,
                                              GRADREPEAT)),
                   "linear");
     },
     "startLinearGradient 1 2 3 4 [1,2,3,4,5,6] 1 2"},
    {[](Drawmere& d) {
         EXPECT_EQ(utf8(d.startLinearGradient(MoxPointT<MoxLength>(pt(1), pt(2)),
                                              MoxPointT<MoxLength>(pt(3), pt(4)), matrix,
                                              USERSPACEONUSE, GRADREFLECT)),
                   "linear");
     },
     "startLinearGradient 1 2 3 4 [1,2,3,4,5,6] 0 1"},
    {[](Drawmere& d) {
         EXPECT_EQ(utf8(d.startRadialGradient(pt(1), pt(2), pt(3), pt(4), pt(5), matrix,
                                              USERSPACEONUSE, GRADPAD)),
                   "radial");
     },
     "startRadialGradient 1 2 3 4 5 [1,2,3,4,5,6] 0 0"},
    {[](Drawmere& d) { d.setStopColor(MoxColor(255, 0, 0), 0.5F, 0.25F); },
     "setStopColor #f00 0.5 0.25"},
    {[](Drawmere& d) { d.endGradiant(); }, "endGradiant"},
    {[](Drawmere& d) { d.endMask(); }, "endMask"},
    {[](Drawmere& d) { d.endPattern(); }, "endPattern"},
    {[](Drawmere& d) { d.startLink(u"#a", MoxName(u"new")); }, "startLink '#a' 'new'"},
    {[](Drawmere& d) { d.endLink(); }, "endLink"},
    {[](Drawmere& d) { d.setInternalView(u"v", 1, 2, 3, 4); }, "setInternalView 'v' 1 2 3 4"},
    {[](Drawmere& d) { d.setInternalLinkAnchor(u"a", 1, 2); }, "setInternalLinkAnchor 'a' 1 2"},
    {[](Drawmere& d) { d.setErrorHandler(d.errorHandler); }, "setErrorHandler one"},
    {[](Drawmere& d) { d.startPage(3, area); }, "setInternalLinkAnchor 'Mox-SVG-page-3' 1 2"},
};

TEST(DrawmereCalls, ReachTheImplementationWithTheirArguments) {
    for (const CallRow& row : implCalls) {
        RecordedPage page;
        row.call(page.drawmere);
        EXPECT_EQ(page.impl->told, std::string(row.told) + "\n");
    }
}

TEST(DrawmereCalls, ViewsAndAnchorsAreRememberedForThePage) {
    RecordedPage page;
    page->setInternalView(u"v", 1, 2, 3, 4);
    page->setInternalLinkAnchor(u"a", 1, 2);
    EXPECT_EQ(page.drawmere.pageAnchors, (std::set<UnicodeString>{u"a", u"v"}));
}

// Calls that store something with the graphic state.

std::string number(float value) { return utf8(MoxValue(value).toString()); }

std::string number(MoxLength value) { return number(value.getRawValue()); }

std::string listDashes(const GraphicContext& state) {
    std::string text;
    for (const MoxLength dash : state.dashArray) {
        text += number(dash) + ",";
    }
    return text;
}

struct MemberRow {
    const char* name;
    std::string (*read)(const GraphicContext&);
};

const MemberRow members[] = {
    {"strokeColor", [](const GraphicContext& s) { return utf8(s.strokeColor); }},
    {"strokeWidth", [](const GraphicContext& s) { return number(s.strokeWidth); }},
    {"lineCap", [](const GraphicContext& s) { return std::to_string(s.lineCap); }},
    {"lineJoin", [](const GraphicContext& s) { return std::to_string(s.lineJoin); }},
    {"dashArray", listDashes},
    {"dashOffset", [](const GraphicContext& s) { return number(s.dashOffset); }},
    {"miterLimit", [](const GraphicContext& s) { return number(s.miterLimit); }},
    {"strokeOpacity", [](const GraphicContext& s) { return number(s.strokeOpacity); }},
    {"maskReference", [](const GraphicContext& s) { return utf8(s.maskReference); }},
    {"fillColor", [](const GraphicContext& s) { return utf8(s.fillColor); }},
    {"fillRule", [](const GraphicContext& s) { return utf8(s.fillRule); }},
    {"fillOpacity", [](const GraphicContext& s) { return number(s.fillOpacity); }},
    {"fontName", [](const GraphicContext& s) { return utf8(s.font.fontName); }},
    {"letterSpacing", [](const GraphicContext& s) { return number(s.letterSpacing); }},
    {"wordSpacing", [](const GraphicContext& s) { return number(s.wordSpacing); }},
    {"writingMode",
     [](const GraphicContext& s) {
         return utf8(MoxCommonNS::MoxNameTable::getSharedNameString(s.writingMode));
     }},
    {"textAnchor", [](const GraphicContext& s) { return std::to_string(s.textAnchor); }},
    {"textDecoration", [](const GraphicContext& s) { return std::to_string(s.textDecoration); }},
    {"clipRule", [](const GraphicContext& s) { return std::to_string(s.clipRule); }},
    {"opacity", [](const GraphicContext& s) { return number(s.opacity); }},
    {"transMatrix",
     [](const GraphicContext& s) {
         return utf8(SVGGraphicContext::convertMatrixToString(s.transMatrix));
     }},
};

/// Returns: the members of the current state that are not what they are by default, with values.
std::string listChanges(Drawmere& drawmere) {
    const GraphicContext& state = *drawmere.impl->getGContext()->getCurrentGC();
    const GraphicContext fresh;
    std::string text;
    for (const MemberRow& member : members) {
        if (member.read(state) != member.read(fresh)) {
            text += (text.empty() ? "" : " ") + std::string(member.name) + "=" + member.read(state);
        }
    }
    return text;
}

const CallRow stateCalls[] = {
    {[](Drawmere& d) { d.setTransMatrix(matrix); }, "transMatrix=matrix(1,2,3,4,5,6)"},
    {[](Drawmere& d) { d.setFillColor(MoxColor(255, 0, 0, 51)); }, "fillColor=red fillOpacity=0.2"},
    {[](Drawmere& d) { d.setFillColorId(u"g"); }, "fillColor=url(#g)"},
    {[](Drawmere& d) { d.setFillColorName(u"x"); }, "fillColor=x"},
    {[](Drawmere& d) { d.setStrokeColor(MoxColor(255, 0, 0, 51)); },
     "strokeColor=red strokeOpacity=0.2"},
    {[](Drawmere& d) { d.setStrokeColorName(u"x"); }, "strokeColor=x"},
    {[](Drawmere& d) { d.setStrokeColorId(u"g"); }, "strokeColor=url(#g)"},
    {[](Drawmere& d) { d.setStrokeWidth(pt(2)); }, "strokeWidth=2"},
    {[](Drawmere& d) { d.setFillRule(FILLRULE_NONZERO); }, "fillRule=nonzero"},
    {[](Drawmere& d) {
         SVGFont font;
         font.fontName = u"F";
         d.setFont(&font, nullptr);
     },
     "fontName=F"},
    {[](Drawmere& d) { d.setFont(nullptr, nullptr); }, ""},
    {[](Drawmere& d) { d.setOpacity(0.5F, OPACITYDEST_ELEMENT); }, "opacity=0.5"},
    {[](Drawmere& d) { d.setOpacity(0.5F, OPACITYDEST_STROKE); }, "strokeOpacity=0.5"},
    {[](Drawmere& d) { d.setOpacity(0.5F, OPACITYDEST_FILL); }, "fillOpacity=0.5"},
    {[](Drawmere& d) { d.setMaskReference(u"m"); }, "maskReference=url(#m)"},
    {[](Drawmere& d) { d.setTextAnchor(TEXTANCHOR_END); }, "textAnchor=2"},
    {[](Drawmere& d) { d.setTextDecoration(TEXTDECORATION_BLINK); }, "textDecoration=4"},
    {[](Drawmere& d) {
         const MoxLength dashes[] = {pt(1), pt(2), pt(3)};
         d.setDashLine(dashes, 2, pt(4));
     },
     "dashArray=1,2, dashOffset=4"},
    {[](Drawmere& d) { d.setLetterSpacing(pt(2)); }, "letterSpacing=2"},
    {[](Drawmere& d) { d.setWordSpacing(pt(2)); }, "wordSpacing=2"},
    {[](Drawmere& d) { d.setLineCap(LINECAP_SQUARE); }, "lineCap=2"},
    {[](Drawmere& d) { d.setLineJoin(LINEJOIN_BEVEL); }, "lineJoin=2"},
    {[](Drawmere& d) { d.setMiterLimit(2); }, "miterLimit=2"},
    {[](Drawmere& d) { d.setWritingMode(MoxName(u"tb-rl")); }, "writingMode=tb-rl"},
    {[](Drawmere& d) { d.setClipRuleAttrVal(CLIPRULE_NONZERO); }, "clipRule=0"},
};

TEST(DrawmereCalls, ReachTheGraphicStateAndChangeNothingElse) {
    for (const CallRow& row : stateCalls) {
        SvgPage page;
        row.call(page.drawmere);
        EXPECT_EQ(listChanges(page.drawmere), row.told);
        EXPECT_EQ(page.body(), ""); // nothing is written before an element comes
    }
}

TEST(DrawmereCalls, OpacitiesAreClampedAndAnUndefinedOnePasses) {
    SvgPage page;
    const GraphicContext& state = *page.drawmere.impl->getGContext()->getCurrentGC();

    const struct {
        float given;
        float stored;
    } rows[] = {{1.5F, 1}, {-0.5F, 0}, {0.25F, 0.25F}, {1, 1}, {0, 0}};

    for (const auto& row : rows) {
        page->setOpacity(row.given, OPACITYDEST_ELEMENT);
        EXPECT_EQ(state.opacity, row.stored);
    }
    page->setOpacity(std::numeric_limits<float>::quiet_NaN(), OPACITYDEST_FILL);
    EXPECT_NE(state.fillOpacity, state.fillOpacity);
}

TEST(DrawmereCalls, WithoutADocumentDoNothingAndGiveEmptyIds) {
    SVGConfig config;
    SVGPageUri uri(u"out.svg");
    Drawmere drawmere(&config, &uri);
    for (const CallRow& row : stateCalls) {
        EXPECT_NO_THROW(row.call(drawmere));
    }
    EXPECT_NO_THROW(drawmere.popState());
    float points[] = {1, 2, 3, 4};
    drawmere.drawPolygon(points, 4, all);
    drawmere.drawCircle(pt(1), pt(2), pt(3), all);
    drawmere.startPathData();
    drawmere.setPathMoveTo(MoxPointT<MoxLength>());
    drawmere.endPathData(all);
    drawmere.setInternalView(u"v", 1, 2, 3, 4);
    drawmere.setInternalLinkAnchor(u"a", 1, 2);
    EXPECT_TRUE(drawmere.pageAnchors.empty());
    EXPECT_TRUE(
        drawmere.startMask(pt(1), pt(2), pt(3), pt(4), USERSPACEONUSE, USERSPACEONUSE).isEmpty());
    EXPECT_TRUE(
        drawmere.startPattern(area, area, matrix, USERSPACEONUSE, USERSPACEONUSE).isEmpty());
    EXPECT_TRUE(
        drawmere.startLinearGradient(pt(1), pt(2), pt(3), pt(4), matrix, USERSPACEONUSE, GRADPAD)
            .isEmpty());
    EXPECT_EQ(drawmere.impl, nullptr);
}

// Links by value.

MoxValue name(const char16_t* text) { return MoxValue(MoxName(text)); }

/// One item of a map, `key` null for none.
struct Item {
    const char16_t* key;
    MoxValue value;
};

MoxValue makeMap(const std::vector<Item>& items) {
    MoxNamedValueMap map;
    for (const Item& item : items) {
        map.setNamedItem(MoxName(item.key), item.value);
    }
    return MoxValue(map);
}

std::string startLink(const MoxValue& link) {
    RecordedPage page;
    page->startLink(link);
    return page.impl->told;
}

/// Returns: the URI that a link with this internal destination gets.
std::string startInternalLink(const std::vector<Item>& destination) {
    return startLink(makeMap({{u"internal", makeMap(destination)}}));
}

TEST(DrawmereLinks, AnExternalDestinationIsTakenAsItStands) {
    EXPECT_EQ(startLink(makeMap({{u"external", u"a b.html#c"}})), "startLink 'a b.html#c' ''\n");
    EXPECT_EQ(startLink(makeMap({{u"external", name(u"there")}})), "startLink 'there' ''\n");
}

TEST(DrawmereLinks, ADestinationThatIsNoTextIsEmptyAndStillOpensALink) {
    EXPECT_EQ(startLink(makeMap({{u"external", 5}})), "startLink '' ''\n");
    EXPECT_EQ(startLink(makeMap({{u"external", makeMap({})}})), "startLink '' ''\n");
    EXPECT_EQ(startLink(makeMap({})), "startLink '' ''\n");
    EXPECT_EQ(startLink(MoxValue()), "startLink '' ''\n");
    EXPECT_EQ(startLink(u"text"), "startLink '' ''\n");
}

TEST(DrawmereLinks, AnInternalDestinationGoesBeforeAnExternalOne) {
    const MoxValue both =
        makeMap({{u"external", u"out"}, {u"internal", makeMap({{u"id", u"in"}})}});
    EXPECT_EQ(startLink(both), "startLink '#in' ''\n");
}

TEST(DrawmereLinks, APageBecomesItsMarkWithoutASharp) {
    EXPECT_EQ(startInternalLink({{u"page", 12}}), "startLink 'Mox-SVG-page-12' ''\n");
    EXPECT_EQ(startInternalLink({{u"id", u"a"}, {u"page", 3}}), "startLink 'Mox-SVG-page-3' ''\n");
}

TEST(DrawmereLinks, OfIdNameAndTargetTheFirstThatIsThereIsTaken) {
    EXPECT_EQ(startInternalLink({{u"target", u"t"}, {u"name", u"n"}, {u"id", u"i"}}),
              "startLink '#i' ''\n");
    EXPECT_EQ(startInternalLink({{u"target", u"t"}, {u"name", name(u"n")}}), "startLink '#n' ''\n");
    EXPECT_EQ(startInternalLink({{u"target", u"t"}}), "startLink '#t' ''\n");
    EXPECT_EQ(startInternalLink({{u"id", 7}, {u"name", u"n"}}), "startLink '#' ''\n");
    EXPECT_EQ(startInternalLink({}), "startLink '#' ''\n");
}

TEST(DrawmereLinks, AnInternalDestinationThatIsNoMapIsEmpty) {
    EXPECT_EQ(startLink(makeMap({{u"internal", u"id"}, {u"external", u"out"}})),
              "startLink '#' ''\n");
}

TEST(DrawmereLinks, AnInternalDestinationThatIsNullIsNone) {
    EXPECT_EQ(startLink(makeMap({{u"internal", MoxValue()}, {u"external", u"out"}})),
              "startLink 'out' ''\n");
}

TEST(DrawmereLinks, PageZeroIsAPageAndOneThatIsNoNumberIsPageZero) {
    EXPECT_EQ(startInternalLink({{u"page", 0}}), "startLink 'Mox-SVG-page-0' ''\n");
    EXPECT_EQ(startInternalLink({{u"page", -3}}), "startLink 'Mox-SVG-page--3' ''\n");
    EXPECT_EQ(startInternalLink({{u"page", name(u"x")}}), "startLink 'Mox-SVG-page-0' ''\n");
}

TEST(DrawmereLinks, OnlyANameShows) {
    EXPECT_EQ(startLink(makeMap({{u"external", u"a"}, {u"show", name(u"new")}})),
              "startLink 'a' 'new'\n");
    EXPECT_EQ(startLink(makeMap({{u"external", u"a"}, {u"show", u"new"}})), "startLink 'a' ''\n");
}

} // namespace
} // namespace DrawmereTest

#include "state/SVGGManager.h"
#include "state/SVGGraphicContext.h"
#include "tests/state/AllocationCounter.h"
#include "tests/support/SvgPage.h"
#include "tree/SVGTreeManager.h"

#include <gtest/gtest.h>

#include <functional>
#include <memory>

namespace DrawmereNS {
namespace {

using DrawmereTest::AllocationCounter;
using DrawmereTest::pt;
using DrawmereTest::SvgPage;

/// The longest text that is kept without the heap.
const UnicodeString& text27() {
    static const UnicodeString text(27, u'x', 27);
    return text;
}

/// An id that makes a reference of 27 characters.
const UnicodeString& id21() {
    static const UnicodeString text(21, u'x', 21);
    return text;
}

SVGFont makeFont(const UnicodeString& name) {
    SVGFont font;
    font.setFontAttribute(name, pt(12), FONTWEIGHT_BOLD, FSTYLE_ITALIC, UnicodeString(), false);
    return font;
}

struct Setter {
    const char* name;
    std::function<void(Drawmere&)> call;
};

const Setter setters[] = {
    {"scale", [](Drawmere& d) { d.setScale(2); }},
    {"transform", [](Drawmere& d) { d.setTransMatrix(SVGMatrix(1, 0, 0, 1, 3, 4)); }},
    {"fill", [](Drawmere& d) { d.setFillColor(MoxColor(18, 52, 86, 128)); }},
    {"fill id", [](Drawmere& d) { d.setFillColorId(id21()); }},
    {"fill name", [](Drawmere& d) { d.setFillColorName(text27()); }},
    {"stroke", [](Drawmere& d) { d.setStrokeColor(MoxColor(86, 52, 18, 128)); }},
    {"stroke id", [](Drawmere& d) { d.setStrokeColorId(id21()); }},
    {"stroke name", [](Drawmere& d) { d.setStrokeColorName(text27()); }},
    {"stroke width", [](Drawmere& d) { d.setStrokeWidth(pt(3)); }},
    {"fill rule", [](Drawmere& d) { d.setFillRule(FILLRULE_NONZERO); }},
    {"opacity", [](Drawmere& d) { d.setOpacity(0.5F, OPACITYDEST_FILL); }},
    {"mask", [](Drawmere& d) { d.setMaskReference(id21()); }},
    {"text anchor", [](Drawmere& d) { d.setTextAnchor(TEXTANCHOR_END); }},
    {"text decoration", [](Drawmere& d) { d.setTextDecoration(TEXTDECORATION_BLINK); }},
    {"letter spacing", [](Drawmere& d) { d.setLetterSpacing(pt(1)); }},
    {"word spacing", [](Drawmere& d) { d.setWordSpacing(pt(1)); }},
    {"line cap", [](Drawmere& d) { d.setLineCap(LINECAP_ROUND); }},
    {"line join", [](Drawmere& d) { d.setLineJoin(LINEJOIN_BEVEL); }},
    {"mitre limit", [](Drawmere& d) { d.setMiterLimit(7); }},
    {"writing mode", [](Drawmere& d) { d.setWritingMode(MoxCommonNS::MOXNAME_TB_RL); }},
    {"clip rule", [](Drawmere& d) { d.setClipRuleAttrVal(CLIPRULE_NONZERO); }},
    {"empty dash", [](Drawmere& d) { d.setDashLine(nullptr, 0, pt(0)); }},
};

TEST(Allocation, ASetterAsksTheHeapForNothing) {
    SvgPage page;
    for (const Setter& setter : setters) {
        setter.call(page.drawmere); // makes what is made once for the whole process
        const AllocationCounter counter;
        setter.call(page.drawmere);
        EXPECT_EQ(0U, counter.getCount()) << setter.name;
    }
}

TEST(Allocation, AFontIsSetWithoutTheHeap) {
    SvgPage page;
    SVGFont other = makeFont(id21());
    SVGFont font = makeFont(text27());
    page->setFont(&other, nullptr);
    const AllocationCounter counter;
    page->setFont(&font, nullptr);
    EXPECT_EQ(0U, counter.getCount());
    page->setFont(&font, nullptr);
    EXPECT_EQ(0U, counter.getCount());
}

TEST(Allocation, ALongTextOrADashArrayIsCounted) {
    SvgPage page;
    const UnicodeString longer(28, u'x', 28);
    const MoxLength dashes[] = {pt(1), pt(2)};
    const AllocationCounter counter;
    page->setFillColorId(longer);
    EXPECT_EQ(1U, counter.getCount());
    page->setDashLine(dashes, 2, pt(0));
    EXPECT_EQ(2U, counter.getCount());
}

TEST(Allocation, APushMakesOneContext) {
    SVGConfig config;
    SVGGManager manager(&config);
    constexpr std::size_t pushes = 1000;
    const AllocationCounter counter;
    for (std::size_t i = 0; i < pushes; ++i) {
        manager.push(ELEMENT_TYPE_PLAIN);
    }
    // The stacks themselves grow by blocks of at least 32 entries.
    EXPECT_GE(counter.getCount(), pushes);
    EXPECT_LE(counter.getCount(), pushes + pushes / 16);
}

TEST(Allocation, APushOfACallerMakesOneContextToo) {
    SvgPage page;
    constexpr std::size_t pushes = 1000;
    const AllocationCounter counter;
    for (std::size_t i = 0; i < pushes; ++i) {
        page->pushState();
    }
    EXPECT_GE(counter.getCount(), pushes);
    EXPECT_LE(counter.getCount(), pushes + pushes / 2); // the stack of fonts grows by threes
}

TEST(Allocation, APushBehindAPopMakesNoMoreThanAContext) {
    SvgPage page;
    for (int i = 0; i < 3; ++i) {
        page->pushState();
        page->popState();
    }
    const AllocationCounter counter;
    page->pushState();
    EXPECT_LE(counter.getCount(), 1U);
    page->popState();
    EXPECT_LE(counter.getCount(), 1U);
}

/// A state whose texts and pattern would each need the heap to be copied.
void setLongTexts(GraphicContext& record) {
    const UnicodeString longer(40, u'x', 40);
    record.strokeColor = longer;
    record.fillColor = longer;
    record.maskReference = longer;
    record.font = makeFont(longer);
    record.dashArray.assign(8, pt(2));
}

class Comparison : public testing::TestWithParam<ELEMENTTYPE> {};

TEST_P(Comparison, CopiesNothing) {
    SVGConfig config;
    SVGGraphicContext context(&config);
    setLongTexts(context.currentGC);
    setLongTexts(context.groupGC);
    const MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<SVGElement> group = document->createSVGElement(SVGName::g);
    const MoxPtr<SVGElement> element = document->createSVGElement(SVGName::text);
    group->appendChild(element.get());
    context.AttrValueCompare(element.get(), /*isGroup=*/false, GetParam());
    const AllocationCounter counter;
    context.AttrValueCompare(element.get(), /*isGroup=*/false, GetParam());
    EXPECT_EQ(0U, counter.getCount());
}

TEST(Allocation, ComparisonOfAGroupCopiesNothing) {
    SVGConfig config;
    SVGGraphicContext context(&config);
    setLongTexts(context.currentGC);
    setLongTexts(context.groupGC);
    context.groupGC.maskReference = u"none"; // a mask and a pattern would be written
    context.groupGC.dashArray.clear();
    context.groupGC.miterLimit = 7;
    const MoxPtr<SVGDocument> document(new SVGDocument);
    const MoxPtr<SVGElement> group = document->createSVGElement(SVGName::g);
    for (const ELEMENTTYPE kind : {ELEMENTTYPE_SHAPE, ELEMENTTYPE_IMAGE, ELEMENTTYPE_TEXT}) {
        context.setGroupAttrs(group.get(), kind);
        const AllocationCounter counter;
        context.setGroupAttrs(group.get(), kind);
        EXPECT_EQ(0U, counter.getCount()) << kind;
    }
}

TEST(Allocation, ComparisonOfALongFamilyWithThatOfTheRootCopiesNothing) {
    SVGConfig config;
    SVGTreeManager tree;
    tree.setSVGDocProp(u"1.1", &config);
    SVGGraphicContext context(&config);
    const MoxPtr<SVGElement> group = tree.document->createSVGElement(SVGName::g);
    group->appendChild(tree.document->createSVGElement(SVGName::text).get());
    for (const char16_t unit : {u'x', u'\u00E9'}) { // kept as bytes, and not
        context.groupGC.font = makeFont(UnicodeString(40, unit, 40));
        tree.document->getDocumentElement()->setAttribute(
            SVGName(SVGName::font_family), MoxValue(context.groupGC.font.fontFamily));
        context.setGroupAttrs(group.get(), ELEMENTTYPE_TEXT);
        const AllocationCounter counter;
        context.setGroupAttrs(group.get(), ELEMENTTYPE_TEXT);
        EXPECT_EQ(0U, counter.getCount());
        EXPECT_FALSE(group->hasAttribute(SVGName(SVGName::font_family)));
    }
}

INSTANTIATE_TEST_SUITE_P(Allocation, Comparison,
                         testing::Values(ELEMENTTYPE_SHAPE, ELEMENTTYPE_IMAGE, ELEMENTTYPE_TEXT));

} // namespace
} // namespace DrawmereNS

// The part of the graphic state that writes one attribute at a time.
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxWord.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGElement.h"

#include <string>

namespace DrawmereNS {
namespace {

using MoxCommonNS::findWord;
using MoxCommonNS::MoxNameTable;
using MoxCommonNS::MOXUNIT_POINT;
using MoxCommonNS::MoxWord;

/// What a width of 0 is written as: renderers leave out a stroke of width 0, and a hairline is
/// meant.
constexpr float hairline = 1e-5F;

constexpr MoxWord<LINECAP> lineCapWords[] = {
    {LINECAP_UNSTATED, u"butt"}, // on purpose: written out, unlike an unstated text-anchor
    {LINECAP_BUTT, u"butt"},
    {LINECAP_ROUND, u"round"},
    {LINECAP_SQUARE, u"square"},
};

constexpr MoxWord<LINEJOIN> lineJoinWords[] = {
    {LINEJOIN_UNSTATED, u"miter"}, // on purpose: written out, as an unstated line cap is
    {LINEJOIN_MITER, u"miter"},
    {LINEJOIN_ROUND, u"round"},
    {LINEJOIN_BEVEL, u"bevel"},
};

constexpr MoxWord<TEXTANCHOR> textAnchorWords[] = {
    {TEXTANCHOR_START, u"start"},
    {TEXTANCHOR_MIDDLE, u"middle"},
    {TEXTANCHOR_END, u"end"},
};

constexpr MoxWord<TEXTDECORATION> textDecorationWords[] = {
    {TEXTDECORATION_UNDERLINE, u"underline"},
    {TEXTDECORATION_OVERLINE, u"overline"},
    {TEXTDECORATION_LINETHROUGH, u"line-through"},
    {TEXTDECORATION_BLINK, u"blink"},
};

constexpr MoxWord<CLIPRULE> clipRuleWords[] = {
    {CLIPRULE_NONZERO, u"nonzero"},
    {CLIPRULE_EVENODD, u"evenodd"},
};

void writeWord(SVGElement& element, SVGName name, const char16_t* word) {
    if (word) {
        element.setSVGAttribute(name, MoxValue(word));
    }
}

void writeReal(SVGElement& element, SVGName name, float number) {
    element.setSVGAttribute(name, MoxValue(number));
}

/// Compared in place: a literal with `==` would be made a string first.
bool isNone(const UnicodeString& text) { return text.compare(u"none", 4) == 0; }

void writeWidth(SVGElement& element, const GraphicContext& record, bool) {
    if (isNone(record.strokeColor)) {
        return;
    }
    const float width = record.strokeWidth.getRealValue(MOXUNIT_POINT);
    writeReal(element, SVGName::stroke_width, width == 0.0F ? hairline : width);
}

void writeLineCap(SVGElement& element, const GraphicContext& record, bool) {
    writeWord(element, SVGName::stroke_linecap, findWord(lineCapWords, record.lineCap));
}

void writeLineJoin(SVGElement& element, const GraphicContext& record, bool) {
    writeWord(element, SVGName::stroke_linejoin, findWord(lineJoinWords, record.lineJoin));
}

void writeMiterLimit(SVGElement& element, const GraphicContext& record, bool) {
    writeReal(element, SVGName::stroke_miterlimit, record.miterLimit);
}

void appendLength(std::string& text, MoxLength length) {
    char digits[MoxCommonNS::maxRealText];
    text.append(digits, MoxCommonNS::writeReal(length.getRealValue(MOXUNIT_POINT), digits));
    text.push_back(',');
}

/// The pattern with commas between the lengths; one of an odd count stands twice, as SVG wants
/// pairs.
std::string makeDashText(const std::vector<MoxLength>& pattern) {
    constexpr std::size_t usualLength = 8;
    const std::size_t passes = pattern.size() % 2 + 1;
    std::string text;
    text.reserve(pattern.size() * passes * usualLength);
    for (std::size_t pass = 0; pass < passes; ++pass) {
        for (const MoxLength length : pattern) {
            appendLength(text, length);
        }
    }
    text.pop_back();
    return text;
}

void writeDashArray(SVGElement& element, const GraphicContext& record, bool isGroup) {
    if (!record.dashArray.empty()) {
        element.setSVGAttribute(SVGName::stroke_dasharray,
                                MoxValue::fromAscii(makeDashText(record.dashArray)));
    } else if (!isGroup) {
        writeWord(element, SVGName::stroke_dasharray, u"none");
    }
}

void writeDashOffset(SVGElement& element, const GraphicContext& record, bool) {
    writeReal(element, SVGName::stroke_dashoffset, record.dashOffset.getRealValue(MOXUNIT_POINT));
}

void writeWritingMode(SVGElement& element, const GraphicContext& record, bool) {
    element.setSVGAttribute(SVGName::writing_mode,
                            MoxValue(MoxNameTable::getSharedNameString(record.writingMode)));
}

void writeTextAnchor(SVGElement& element, const GraphicContext& record, bool) {
    writeWord(element, SVGName::text_anchor, findWord(textAnchorWords, record.textAnchor));
}

void writeTextDecoration(SVGElement& element, const GraphicContext& record, bool) {
    writeWord(element, SVGName::text_decoration,
              findWord(textDecorationWords, record.textDecoration));
}

struct AttributeWriter {
    ATTRIBUTEFLAG flag;
    void (*write)(SVGElement& element, const GraphicContext& record, bool isGroup);
};

constexpr AttributeWriter strokeWriters[] = {
    {ATTRIBUTEFLAG_STROKEWIDTH, writeWidth},   {ATTRIBUTEFLAG_LINECAP, writeLineCap},
    {ATTRIBUTEFLAG_LINEJOIN, writeLineJoin},   {ATTRIBUTEFLAG_MITERLIMIT, writeMiterLimit},
    {ATTRIBUTEFLAG_DASHARRAY, writeDashArray}, {ATTRIBUTEFLAG_DASHOFFSET, writeDashOffset},
};

constexpr AttributeWriter textWriters[] = {
    {ATTRIBUTEFLAG_WRITINGMODE, writeWritingMode},
    {ATTRIBUTEFLAG_TEXTANCHOR, writeTextAnchor},
    {ATTRIBUTEFLAG_TEXTDECORATION, writeTextDecoration},
};

template <std::size_t count>
void writeByFlag(const AttributeWriter (&writers)[count], int flag, SVGElement* element,
                 const GraphicContext& record, bool isGroup) {
    for (const AttributeWriter& writer : writers) {
        if (element && writer.flag == flag) {
            writer.write(*element, record, isGroup);
        }
    }
}

struct OpacityRule {
    OPACITYDEST dest;
    float GraphicContext::*member;
    SVGName::Number attribute;
    SVGName::Number attributeAsOpacity;
};

constexpr OpacityRule opacityRules[] = {
    {OPACITYDEST_ELEMENT, &GraphicContext::opacity, SVGName::opacity, SVGName::opacity},
    {OPACITYDEST_STROKE, &GraphicContext::strokeOpacity, SVGName::stroke_opacity,
     SVGName::stroke_opacity},
    {OPACITYDEST_FILL, &GraphicContext::fillOpacity, SVGName::fill_opacity, SVGName::opacity},
};

static_assert(opacityRules[OPACITYDEST_ELEMENT].dest == OPACITYDEST_ELEMENT &&
              opacityRules[OPACITYDEST_STROKE].dest == OPACITYDEST_STROKE &&
              opacityRules[OPACITYDEST_FILL].dest == OPACITYDEST_FILL);

} // namespace

void SVGGraphicContext::setStrokeAttribute(SVGElement* element, int flag, bool isGroup) const {
    writeByFlag(strokeWriters, flag, element, getRecord(isGroup), isGroup);
}

void SVGGraphicContext::setTextAttribute(SVGElement* element, int flag, bool isGroup) const {
    writeByFlag(textWriters, flag, element, getRecord(isGroup), isGroup);
}

void SVGGraphicContext::setOpacityAttribute(SVGElement* element, OPACITYDEST dest, bool isGroup,
                                            bool asOpacity) const {
    const bool isListed = dest >= OPACITYDEST_ELEMENT && dest <= OPACITYDEST_FILL;
    if (isTiny() || !element || !isListed) {
        return;
    }
    const OpacityRule& rule = opacityRules[dest];
    const Levels levels = getLevels(isGroup);
    const float value = levels.subject.*rule.member;
    if (value != levels.reference.*rule.member) {
        writeReal(*element, asOpacity ? rule.attributeAsOpacity : rule.attribute, value);
    }
}

void SVGGraphicContext::setClipRule(CLIPRULE rule, SVGElement* element) const {
    if (!isTiny() && element) {
        writeWord(*element, SVGName::clip_rule, findWord(clipRuleWords, rule));
    }
}

void SVGGraphicContext::setClipPathAttrVal(SVGElement* element, bool /*flag*/) const {
    if (!clipPathId.isEmpty() && !isTiny() && element) {
        element->setSVGAttribute(SVGName::clip_path, MoxValue(clipPathId));
    }
}

} // namespace DrawmereNS

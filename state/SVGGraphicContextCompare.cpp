// The part of the graphic state that decides which attributes an element needs.
#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxNameTable.h"
#include "state/FontValues.h"
#include "state/SVGGraphicContext.h"
#include "tree/SVGElement.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxDocument;
using MoxCommonNS::MoxNameTable;
using MoxCommonNS::MoxNode;
using MoxCommonNS::MoxValueType;
using MoxCommonNS::narrow;

SVGName nameOf(const MoxElement& element) { return SVGName(element.localLink()); }

SVGName nameOf(const MoxNode* node) {
    const bool isElement = node && node->kindLink() == MoxCommonNS::MOXNODE_ELEMENT;
    return isElement ? nameOf(static_cast<const MoxElement&>(*node)) : SVGName();
}

bool isTextOrGroup(SVGName name) { return name == SVGName::text || name == SVGName::g; }

/// The level of matrix that an element takes by where it stands: a closing group under the root
/// takes the root's, any other closing group its own, and what stands in an open group the current.
TRANSFORMMODE findTransformMode(const SVGElement& element, SVGName name) {
    if (nameOf(element.parentLink()) == SVGName::svg) {
        return TRANSFORMMODE_ROOT;
    }
    const bool isContainer = element.firstLink() && name != SVGName::text;
    return isContainer ? TRANSFORMMODE_GROUP : TRANSFORMMODE_CURRENT;
}

bool closesAroundText(const SVGElement& element) {
    return nameOf(element) == SVGName::g && nameOf(element.firstLink()) == SVGName::text;
}

MoxElement* findRoot(const SVGElement& element) {
    const MoxDocument* document = element.getOwnerDocument();
    return document ? narrow<MoxElement>(document->getFirstChild()) : nullptr;
}

/// Compared in place: most families are longer than what a value keeps without the heap.
bool saysText(const MoxValue& value, std::u16string_view text) {
    if (value.isWideText()) {
        return value.getWideText() == text;
    }
    const std::string_view bytes = value.getAsciiText();
    return std::equal(bytes.begin(), bytes.end(), text.begin(), text.end());
}

/// Whether the root's font-family, a text or a name, says `family`; any other value says nothing.
bool saysFamily(const MoxValue& value, const UnicodeString& family) {
    switch (value.getType()) {
    case MoxValueType::MOXVALUE_STRING:
        return saysText(value, viewOf(family));
    case MoxValueType::MOXVALUE_NAME:
        return MoxNameTable::getSharedNameString(value.getNameValue()) == family;
    default:
        return family.isEmpty();
    }
}

/// Gives the family to a root that has none yet.
/// Returns: whether the root now says `family`, so that a group need not.
bool rootTakesFamily(MoxElement* root, const UnicodeString& family) {
    if (!root) {
        return false;
    }
    const MoxName name = SVGName(SVGName::font_family);
    const MoxValue& known = root->getAttribute(name);
    if (known.getType() != MoxValueType::MOXVALUE_NULL) {
        return saysFamily(known, family);
    }
    root->setAttribute(name, MoxValue(family));
    return saysFamily(root->getAttribute(name), family);
}

/// Writes a word; null, for what is normal, writes nothing.
void writeWord(SVGElement* element, SVGName name, const char16_t* word) {
    if (word) {
        element->setSVGAttribute(name, MoxValue(word));
    }
}

void writeUnlessNormal(SVGElement* element, SVGName name, MoxValue&& value) {
    if (value.getAsciiText() != "normal") {
        element->setSVGAttribute(name, std::move(value));
    }
}

} // namespace

SVGGraphicContext::Levels SVGGraphicContext::getLevels(bool isGroup) const {
    return isGroup ? Levels{groupGC, getDefaultGC()} : Levels{currentGC, groupGC};
}

void SVGGraphicContext::AttrValueCompare(SVGElement* element, bool isGroup, ELEMENTTYPE kind) {
    if (!element) {
        return;
    }
    const SVGName name = nameOf(*element);
    setTransformAttr(element, findTransformMode(*element, name));
    if (kind == ELEMENTTYPE_SHAPE || kind == ELEMENTTYPE_TEXT) {
        writeStrokeDifferences(element, isGroup);
    }
    if (kind == ELEMENTTYPE_TEXT) {
        writeTextDifferences(element, isGroup);
    }
    // On purpose: a shape among texts, as in a clip definition, gets neither mask nor opacity.
    if (kind >= ELEMENTTYPE_TEXT && !isTextOrGroup(name)) {
        return;
    }
    const Levels levels = getLevels(isGroup);
    if (!isTiny() && levels.subject.maskReference != levels.reference.maskReference) {
        element->setSVGAttribute(SVGName::mask, MoxValue(levels.subject.maskReference));
    }
    if (levels.subject.opacity != levels.reference.opacity) {
        setOpacityAttribute(element, OPACITYDEST_ELEMENT, isGroup, /*asOpacity=*/false);
    }
}

void SVGGraphicContext::writeStrokeDifferences(SVGElement* element, bool isGroup) const {
    const auto& [subject, reference] = getLevels(isGroup);
    if (subject.lineCap != reference.lineCap) {
        setStrokeAttribute(element, ATTRIBUTEFLAG_LINECAP, isGroup);
    }
    if (subject.lineJoin != reference.lineJoin) {
        setStrokeAttribute(element, ATTRIBUTEFLAG_LINEJOIN, isGroup);
    }
    if (subject.strokeWidth != reference.strokeWidth) {
        setStrokeAttribute(element, ATTRIBUTEFLAG_STROKEWIDTH, isGroup);
    }
    if (subject.miterLimit != reference.miterLimit) {
        setStrokeAttribute(element, ATTRIBUTEFLAG_MITERLIMIT, isGroup);
    }
    if (subject.strokeOpacity != reference.strokeOpacity) {
        setOpacityAttribute(element, OPACITYDEST_STROKE, isGroup, /*asOpacity=*/false);
    }
    if (subject.dashOffset != reference.dashOffset) {
        setStrokeAttribute(element, ATTRIBUTEFLAG_DASHOFFSET, isGroup);
    }
    if (subject.dashArray != reference.dashArray) {
        setStrokeAttribute(element, ATTRIBUTEFLAG_DASHARRAY, isGroup);
    }
    if (subject.fillOpacity != reference.fillOpacity) {
        setOpacityAttribute(element, OPACITYDEST_FILL, isGroup, /*asOpacity=*/false);
    }
}

void SVGGraphicContext::writeTextDifferences(SVGElement* element, bool isGroup) {
    const auto& [subject, reference] = getLevels(isGroup);
    if (closesAroundText(*element)) {
        writeFont(element, subject.font);
    }
    // On purpose: word spacing is compared with the default, so each text of a group that has one
    // carries it; compared with the group, the first text would lose it.
    if (!isTiny() && nameOf(*element) == SVGName::text &&
        subject.wordSpacing != getDefaultGC().wordSpacing) {
        const float spacing = subject.wordSpacing.getRealValue(MoxCommonNS::MOXUNIT_POINT);
        element->setSVGAttribute(SVGName::word_spacing, MoxValue(spacing));
    }
    if (!isTiny() && subject.writingMode != reference.writingMode) {
        setTextAttribute(element, ATTRIBUTEFLAG_WRITINGMODE, isGroup);
    }
    if (subject.textAnchor != reference.textAnchor) {
        setTextAttribute(element, ATTRIBUTEFLAG_TEXTANCHOR, isGroup);
    }
    if (!isTiny() && !isGroup) {
        setTextAttribute(element, ATTRIBUTEFLAG_TEXTDECORATION, isGroup);
    }
}

const MoxValue& SVGGraphicContext::getFamilyValue(const UnicodeString& family) {
    if (lastFamily.getType() != MoxValueType::MOXVALUE_STRING ||
        !saysText(lastFamily, viewOf(family))) {
        lastFamily = MoxValue(family);
    }
    return lastFamily;
}

void SVGGraphicContext::writeFont(SVGElement* group, const SVGFont& font) {
    // On purpose: the first text group gives its family to the root and carries none itself.
    if (!rootTakesFamily(findRoot(*group), font.fontFamily)) {
        group->setSVGAttribute(SVGName::font_family, getFamilyValue(font.fontFamily));
    }
    group->setSVGAttribute(SVGName::font_size, makeFontSizeValue(font.fontSize));
    writeWord(group, SVGName::font_style, findFontStyleWord(font.fontStyle));
    writeUnlessNormal(group, SVGName::font_weight, makeFontWeightValue(font.fontWeight));
    if (!isTiny()) {
        writeWord(group, SVGName::font_stretch, findFontStretchWord(font.fontStretch));
    }
}

void SVGGraphicContext::setGroupAttrs(SVGElement* group, ELEMENTTYPE kind) {
    AttrValueCompare(group, /*isGroup=*/true, kind);
    changeCount = 0;
}

} // namespace DrawmereNS

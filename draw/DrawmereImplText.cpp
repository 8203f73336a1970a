// Text calls: one element for each run.
#include "draw/DrawmereImpl.h"
#include "fonts/SVGFontManager.h"
#include "foundation/common/MoxNameEnum.h"
#include "path/SVGNumberRule.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"

#include <algorithm>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MOXUNIT_POINT;

/// One position serves all characters. A NaN equals nothing, itself included.
bool isUniform(const std::vector<MoxLength>& positions) {
    return positions.size() < 2 ||
           std::all_of(positions.begin(), positions.end(), [&positions](MoxLength position) {
               return position.getRawValue() == positions.front().getRawValue();
           });
}

} // namespace

UnicodeString
DrawmereImpl::makePositionAttributeString(const std::vector<MoxLength>& positions) const {
    char16_t digits[maxRuleText];
    UnicodeString text;
    if (positions.empty()) {
        return text;
    }
    const bool uniform = isUniform(positions);
    if (uniform && positions.front().getRealValue(MOXUNIT_POINT) == 0.0F) {
        return text;
    }
    const std::size_t count = uniform ? 1 : positions.size();
    for (std::size_t i = 0; i < count; ++i) {
        if (i > 0) {
            text.append(u' ');
        }
        const char16_t* end = writeRuleNumber(positions[i], digits);
        text.append(digits, static_cast<std::int32_t>(end - digits));
    }
    return text;
}

void DrawmereImpl::drawText(const UnicodeString& text, const MoxLength& x, const MoxLength& y,
                            PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                            bool leftToRight) {
    drawText(text, std::vector<MoxLength>{x}, std::vector<MoxLength>{y}, std::vector<float>(), mode,
             glyphs, wholeRun, leftToRight);
}

void DrawmereImpl::drawText(const UnicodeString& text, const std::vector<MoxLength>& x,
                            const std::vector<MoxLength>& y, const std::vector<float>& /*rotation*/,
                            PAINTMODE mode, TLStringWithGlyphInfo* glyphs, bool wholeRun,
                            bool leftToRight) {
    if (text.isEmpty()) {
        return;
    }
    const MoxPtr<SVGElement> element = createElement(SVGName::text);
    setPosition(*element, SVGName::x, x);
    setPosition(*element, SVGName::y, y);
    if (!leftToRight) {
        element->setSVGAttribute(SVGName::direction, u"rtl");
    }
    element->appendChildText(text);
    groupManager->setElemMode(mode, ELEMENTTYPE_TEXT);
    addElement(element.get(), /*direct=*/false, /*makeCurrent=*/false);
    // On purpose: the paint comes after the element entered its group, so it stands behind the
    // attributes of the state. Shapes have it before.
    setPaintAttr(element.get(), mode);
    handOverFont();
    registerText(text, glyphs, wholeRun);
}

void DrawmereImpl::setPosition(SVGElement& element, SVGName name,
                               const std::vector<MoxLength>& positions) const {
    const UnicodeString text = makePositionAttributeString(positions);
    if (!text.isEmpty()) {
        element.setSVGAttribute(name, text);
    }
}

void DrawmereImpl::handOverFont() {
    if (groupManager->font.fontSize.getRawValue() < 0.0F) {
        groupManager->setFontAttribute(*getGContext()->getFont());
    }
}

void DrawmereImpl::registerText(const UnicodeString& text, TLStringWithGlyphInfo* glyphs,
                                bool wholeRun) {
    if (!fontManager->currentFont) {
        return;
    }
    const MoxName mode = getGContext()->getCurrentGC()->writingMode;
    const bool vertical = mode == MoxCommonNS::MOXNAME_TB_RL || mode == MoxCommonNS::MOXNAME_TB;
    fontManager->embedTextOrGlyph(text, glyphs, wholeRun, vertical);
}

} // namespace DrawmereNS

// Text calls: one element for each run.
#include "draw/DrawmereImpl.h"
#include "fonts/SVGFontManager.h"
#include "foundation/common/MoxNameEnum.h"
#include "path/SVGNumberRule.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"

#include <algorithm>
#include <memory>
#include <span>
#include <string_view>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MOXUNIT_POINT;

/// One position serves all characters. A NaN equals nothing, itself included.
bool isUniform(std::span<const MoxLength> positions) {
    return positions.size() < 2 ||
           std::all_of(positions.begin(), positions.end(), [&positions](MoxLength position) {
               return position.getRawValue() == positions.front().getRawValue();
           });
}

/// The bytes of a list of positions. Usual lists fit into the object.
class PositionText {
public:
    explicit PositionText(std::span<const MoxLength> positions) {
        if (positions.empty()) {
            return;
        }
        const bool uniform = isUniform(positions);
        if (!uniform || positions.front().getRealValue(MOXUNIT_POINT) != 0.0F) {
            write(uniform ? positions.first(1) : positions);
        }
    }

    std::string_view get() const { return text; }

private:
    static constexpr std::size_t nearCount = 16;
    /// A number and the blank in front of it.
    static constexpr std::size_t maxEntry = maxRuleText + 1;

    void write(std::span<const MoxLength> positions) {
        if (positions.size() > nearCount) {
            far = std::make_unique_for_overwrite<char[]>(positions.size() * maxEntry);
        }
        char* const begin = far ? far.get() : near;
        char* end = begin;
        for (const MoxLength& position : positions) {
            *end = ' ';
            end = writeRuleNumber(position, end + 1);
        }
        text = {begin + 1, static_cast<std::size_t>(end - begin) - 1};
    }

    char near[nearCount * maxEntry];
    std::unique_ptr<char[]> far; // for long lists
    std::string_view text;
};

void setPositions(SVGElement& element, SVGName name, std::span<const MoxLength> positions) {
    const PositionText text(positions);
    if (!text.get().empty()) {
        element.setSVGAttribute(name, MoxValue::fromAscii(text.get()));
    }
}

} // namespace

UnicodeString
DrawmereImpl::makePositionAttributeString(const std::vector<MoxLength>& positions) const {
    return UnicodeString::fromUTF8(PositionText(positions).get());
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
    const MoxPtr<SVGElement> element = createDrawing(SVGName::text, 2, mode);
    setPositions(*element, SVGName::x, x);
    setPositions(*element, SVGName::y, y);
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

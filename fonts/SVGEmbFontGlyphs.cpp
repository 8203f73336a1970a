// The end of a document: a font is written with the outlines of its texts.
#include "fonts/SVGEmbFont.h"
#include "fonts/SVGGlyphPath.h"
#include "tree/SVGTreeManager.h"

#include <algorithm>
#include <limits>

namespace DrawmereNS {
namespace {

constexpr int regularWeight = 400;
constexpr int boldWeight = 700;

MoxValue makeWeightValue(int weight) {
    if (weight == regularWeight) {
        return {u"normal"};
    }
    return weight == boldWeight ? MoxValue(u"bold") : MoxValue(weight);
}

/// Fonts may say anything of their advances, so the sum stays within what an integer holds.
int addAdvances(int advance, int more) {
    constexpr std::int64_t lowest = std::numeric_limits<int>::min();
    constexpr std::int64_t highest = std::numeric_limits<int>::max();
    return static_cast<int>(std::clamp(std::int64_t{advance} + more, lowest, highest));
}

int getAdvance(const FS_GlyphDrawInfo& info, bool vertical) {
    return vertical ? info.verticalAdvance : info.horizontalAdvance;
}

MoxPtr<SVGElement> createElement(const SVGTreeManager& tree, SVGName name) {
    return tree.document->createSVGElement(name);
}

/// The face as it was found, which need not be as it was wanted.
MoxPtr<SVGElement> makeFontFace(const SVGTreeManager& tree, const UnicodeString& family,
                                const FS_FontInfo& face) {
    int weight = 0;
    bool italic = false;
    face.getFontStyle(&weight, &italic, nullptr);
    MoxPtr<SVGElement> element = createElement(tree, SVGName::font_face);
    element->setSVGAttribute(SVGName::font_family, family);
    element->setSVGAttribute(SVGName::font_weight, makeWeightValue(weight));
    element->setSVGAttribute(SVGName::font_style, italic ? u"italic" : u"normal");
    element->setSVGAttribute(SVGName::units_per_em, face.getUnitsPerEm());
    return element;
}

} // namespace

void SVGEmbFont::doEmbedFont(SVGTreeManager* tree) {
    if (!tree || !tree->getCurrentNode()) {
        return;
    }
    loadFont(nullptr);
    const MoxPtr<SVGElement> font = createElement(*tree, SVGName::font);
    font->setSVGAttribute(SVGName::horiz_adv_x, fontInfo.getDefaultCharWidth(0));
    font->appendChild(makeFontFace(*tree, faceFamily, fontInfo).get());
    addMissingGlyph(font.get(), tree);
    const bool hasOutlines = convGlyphs(font.get(), tree);
    tree->addElement(font.get(), /*makeCurrent=*/false);
    if (!hasOutlines) {
        tree->getCurrentNode()->removeChild(font.get());
    }
}

bool SVGEmbFont::convGlyphs(MoxElement* font, SVGTreeManager* tree) {
    int emptyCount = 0;
    convGlyphMap(verticalGlyphs, font, tree, emptyCount, /*vertical=*/true);
    convGlyphMap(horizontalGlyphs, font, tree, emptyCount, /*vertical=*/false);
    // On purpose: a text that can't be read is not counted as one without an outline. So a font of
    // which nothing could be read stays, and a font of blanks goes.
    return static_cast<std::size_t>(emptyCount) != countTexts();
}

void SVGEmbFont::convGlyphMap(const SVGGlyphMap& glyphs, MoxElement* font, SVGTreeManager* tree,
                              int& emptyCount, bool vertical) {
    std::vector<FS_GlyphDrawInfo> infos;
    for (const auto& [text, glyphIds] : glyphs) {
        if (getGlyphDrawInfos(glyphIds, infos, /*flag=*/false)) {
            font->appendChild(convGlyph(infos, text, tree, emptyCount, vertical).get());
        }
    }
}

void SVGEmbFont::addMissingGlyph(MoxElement* font, SVGTreeManager* tree) {
    FS_GlyphDrawInfo info;
    if (!font || !fontInfo.getGlyphDrawInfo(0, info, /*reserved=*/false)) {
        return;
    }
    int emptyCount = 0;
    font->appendChild(convGlyph(info, UnicodeString(), tree, emptyCount).get());
}

bool SVGEmbFont::getGlyphDrawInfos(const std::vector<std::uint16_t>& glyphIds,
                                   std::vector<FS_GlyphDrawInfo>& infos, bool flag) const {
    std::size_t count = 0; // what stands in `infos` is filled anew, which spares its allocations
    for (const std::uint16_t glyphId : glyphIds) {
        if (count == infos.size()) {
            infos.emplace_back();
        }
        if (!fontInfo.getGlyphDrawInfo(glyphId, infos[count], flag)) {
            break;
        }
        ++count;
    }
    infos.resize(count);
    return count == glyphIds.size();
}

MoxPtr<SVGElement> SVGEmbFont::convGlyph(const FS_GlyphDrawInfo& info, const UnicodeString& text,
                                         SVGTreeManager* tree, int& emptyCount) {
    return convGlyph(std::vector<FS_GlyphDrawInfo>{info}, text, tree, emptyCount,
                     /*vertical=*/false);
}

MoxPtr<SVGElement> SVGEmbFont::convGlyph(const std::vector<FS_GlyphDrawInfo>& infos,
                                         const UnicodeString& text, SVGTreeManager* tree,
                                         int& emptyCount, bool vertical) {
    int advance = 0;
    SVGGlyphPath path;
    for (const FS_GlyphDrawInfo& info : infos) {
        path.addGlyph(info, advance, vertical);
        advance = addAdvances(advance, getAdvance(info, vertical));
    }
    if (path.get().empty()) {
        ++emptyCount;
    }
    MoxPtr<SVGElement> element =
        createElement(*tree, text.isEmpty() ? SVGName::missing_glyph : SVGName::glyph);
    if (!text.isEmpty()) {
        element->setSVGAttribute(SVGName::unicode, text);
    }
    element->setSVGAttribute(SVGName::d, MoxValue::fromAscii(path.get()));
    element->setSVGAttribute(vertical ? SVGName::vert_adv_y : SVGName::horiz_adv_x, advance);
    if (vertical || hasVerticalForm(text)) {
        element->setSVGAttribute(SVGName::orientation, vertical ? u"v" : u"h");
    }
    return element;
}

bool SVGEmbFont::hasVerticalForm(const UnicodeString& text) const {
    return !verticalGlyphs.empty() && verticalGlyphs.contains(SVGEmbTLString(viewOf(text)));
}

UnicodeString coordinateString(const MoxPointT<float>& point, int advance, bool vertical) {
    SVGGlyphPath path;
    path.addPoint(point, advance, vertical);
    return UnicodeString::fromUTF8(path.get());
}

} // namespace DrawmereNS

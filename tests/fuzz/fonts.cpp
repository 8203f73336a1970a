// Font files: whatever the bytes are, they are refused or their glyphs can be read and embedded.
#include "foundation/fontservice/FS_FontInfo.h"
#include "foundation/fontservice/FS_GlyphDrawInfo.h"
#include "foundation/fontservice/FS_NewTextMetricEx.h"
#include "tests/fuzz/Require.h"
#include "tests/support/Choices.h"
#include "tests/support/SvgPage.h"
#include "tests/support/XmlReader.h"

using namespace DrawmereTest;
using namespace DrawmereNS;
using namespace MoxFontService_NS;

namespace {

constexpr std::size_t choiceBytes = 4;
constexpr unsigned short glyphCount = 24;
constexpr int codePoints[] = {0x20, 0x41, 0x66, 0x3041, 0x4E00, 0xFF3B, 0xF041, 0x628, 0x10000};
constexpr const char16_t* text = u"Aaf \u3041\u4e00\uff3b\uf041\u0628\u0644\u0627";

void checkGlyph(const FS_FontInfo& font, unsigned short glyph, FS_GlyphDrawInfo& info) {
    const bool isRead = font.getGlyphDrawInfo(glyph, info, false);
    require(isRead || info.polygons.empty(), "a glyph that can't be read has an outline");
    for (const FS_GlyphPolygon& polygon : info.polygons) {
        std::size_t points = 1;
        for (const int type : polygon.segmentTypes) {
            require(type >= FSSEGMENT_LINE && type <= FSSEGMENT_CUBIC, "no kind of segment");
            points += static_cast<std::size_t>(type) + 1;
        }
        require(points == polygon.points.size(), "points without segments");
    }
}

void readEverything(const FS_FontInfo& font) {
    FS_GlyphDrawInfo info;
    for (unsigned short glyph = 0; glyph < glyphCount; ++glyph) {
        checkGlyph(font, glyph, info);
    }
    for (const int codePoint : codePoints) {
        checkGlyph(font, font.getGlyphID(codePoint, true), info);
        checkGlyph(font, font.getGlyphID(codePoint, false), info);
    }
    FS_NewTextMetricEx metrics;
    font.getOutlineTextMetrics(metrics, -1000);
    require(font.getUnitsPerEm() > 0, "an em of nothing");
    font.getDefaultCharWidth(0);
}

void embed(FS_ExtraFonts& fonts, Choices& choices) {
    SvgPage page;
    SVGFont font;
    font.setFontAttribute(u"mutated", pt(10), FONTWEIGHT_NORMAL, FSTYLE_NORMAL, u"",
                          choices.flag());
    font.setEmbedAttribute(true, choices.flag());
    page->setFont(&font, &fonts);
    page->drawText(text, pt(1), pt(2), PAINTMODE_FILL, nullptr, true, true);
    const XmlReading reading = readXml(page.document());
    require(reading.error.empty(), reading.error);
    require(reading.text().find("Aaf") != std::string::npos, "the text is lost");
}

} // namespace

/// The file, and behind it what is done with it.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(inputOf(data, size));
    const std::string tail = bytes.substr(bytes.size() - std::min(bytes.size(), choiceBytes));
    Choices choices(tail);
    FS_ExtraFonts fonts;
    FS_ExtraFont description;
    description.names = {u"mutated"};
    description.faceIndex = static_cast<int>(choices.below(4)) / 3;
    FS_FontInfo font;
    const int weight = static_cast<int>(choices.below(4)) * 300;
    if (!fonts.addBytes(bytes, description) ||
        !font.createFont(u"mutated", weight, choices.flag(), 3, &fonts, true)) {
        return 0;
    }
    readEverything(font);
    embed(fonts, choices);
    return 0;
}

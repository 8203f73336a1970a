/// What the tests of embedded fonts share: the fonts in tests/data/fonts and texts of the maps.
#pragma once

#include "SVGFont.h"
#include "fonts/SVGEmbFont.h"
#include "fonts/SVGEmbTLString.h"
#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/records/TLStringWithGlyphInfo.h"
#include "tests/support/Utf8.h"

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

namespace DrawmereTest {

using namespace DrawmereNS;

using MoxFontService_NS::FS_ExtraFont;
using MoxFontService_NS::FS_ExtraFonts;
using TalFont::TLGlyphEntry;
using TalFont::TLStringWithGlyphInfo;

constexpr std::uint16_t noGlyph = TLGlyphEntry::noGlyph;

// The fonts by the names that the tests give them.
constexpr const char16_t* uprightFace = u"Upright Test"; ///< with forms for vertical text
constexpr const char16_t* hanFace = u"Han Test";         ///< with outlines of cubic curves
constexpr const char16_t* arabicFace = u"Arabic Test";   ///< with outlines of quadratic curves
constexpr const char16_t* latinFace = u"Latin Test";     ///< with ligatures

/// Returns: the path of a file in tests/data/fonts.
inline UnicodeString fontPath(const char* file) {
    return UnicodeString::fromUTF8(std::string(TEST_SOURCE_DIR "/data/fonts/") + file);
}

/// Returns: those fonts, for the calls that take a font.
inline FS_ExtraFonts& testFonts() {
    static FS_ExtraFonts fonts = [] {
        FS_ExtraFonts made;
        const auto add = [&made](const char16_t* name, const char* file) {
            made.addFile(fontPath(file), {.names = {name}});
        };
        add(uprightFace, "TestVRTR-TTF-Regular.ttf");
        add(hanFace, "SourceHanSans-subset-vert.otf");
        add(arabicFace, "SimpArabicTest.ttf");
        add(latinFace, "le-murmure.otf");
        return made;
    }();
    return fonts;
}

/// Returns: a font to embed, by glyphs or by characters.
inline SVGFont makeFont(const UnicodeString& name, bool byGlyphs,
                        FONTWEIGHT weight = FONTWEIGHT_NORMAL, FSTYLE style = FSTYLE_NORMAL) {
    SVGFont font;
    font.setFontAttribute(name, MoxLength::fromRaw(10.0F), weight, style, u"", false);
    font.setEmbedAttribute(true, byGlyphs);
    return font;
}

/// Has `font` take up a text by the glyphs it was shaped into.
inline void embedGlyphs(SVGEmbFont& font, const UnicodeString& text,
                        std::vector<TLGlyphEntry> entries, bool wholeRun, bool vertical) {
    const TLStringWithGlyphInfo glyphs(std::move(entries));
    font.embedGlyphId(text, &glyphs, wholeRun, vertical);
}

/// Returns: the entries of a map in its order, as "fi=7 8, x=4".
inline std::string describe(const SVGGlyphMap& glyphs) {
    std::string text;
    for (const auto& [key, ids] : glyphs) {
        text += (text.empty() ? "" : ", ") + utf8(key) + "=";
        for (std::size_t i = 0; i < ids.size(); ++i) {
            text += (i == 0 ? "" : " ") + std::to_string(ids[i]);
        }
    }
    return text;
}

} // namespace DrawmereTest

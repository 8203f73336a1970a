/// The glyphs that a run of text was shaped into.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>
#include <vector>

namespace TalFont {

/// One glyph of a run. Glyphs that stand for the same characters together follow each other; the
/// first of them carries the count of the characters.
struct TLGlyphEntry {
    static constexpr std::uint16_t noGlyph = 65535; ///< stands for no glyph

    std::int16_t charCount = 0; ///< UTF-16 units it stands for; 0 for a further glyph of the same
    std::uint16_t glyphId = noGlyph; ///< number in the font, `noGlyph` for none
};

/// What shaping made of one run of text: its glyphs, in the order in which they are drawn.
class DRAWMERE_API TLStringWithGlyphInfo {
public:
    TLStringWithGlyphInfo();
    /// Takes the glyphs over.
    explicit TLStringWithGlyphInfo(std::vector<TLGlyphEntry> glyphEntries);

    std::vector<TLGlyphEntry> entries; ///< the glyphs
};

} // namespace TalFont

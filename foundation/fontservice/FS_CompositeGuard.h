/// Keeps glyphs that are made of other glyphs without end from being loaded.
#pragma once

#include <ft2build.h>
#include FT_FREETYPE_H

#include <cstdint>

namespace MoxFontService_NS {

/// Counts the parts of TrueType glyphs. FreeType finds a glyph that holds itself, but neither a
/// chain of parts that is deeper than the stack nor one that doubles in each of its steps.
class FS_CompositeGuard {
public:
    /// Borrows: `fontFace`, for its life. A face without TrueType outlines has no composites.
    explicit FS_CompositeGuard(FT_Face fontFace);

    /// Returns: whether the glyph consists of a bounded count of parts.
    bool isBounded(unsigned glyphId) const;

private:
    bool countParts(unsigned glyphId, int depth, int& budget) const;
    bool isComposite(std::uint32_t place) const;
    bool findGlyph(unsigned glyphId, std::uint32_t& place) const;
    bool readTable(FT_ULong tag, FT_Long place, unsigned char* bytes, FT_ULong count) const;

    FT_Face face; // borrowed
    bool hasComposites = false;
    bool longPlaces = false;
};

} // namespace MoxFontService_NS

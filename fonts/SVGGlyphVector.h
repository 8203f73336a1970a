/// A glyph with the text it stands for.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>

namespace DrawmereNS {

/// Keeps the number of a glyph and a copy of its text, for callers who carry both about.
class DRAWMERE_API SVGGlyphVector {
public:
    /// Copies `count` UTF-16 units of `text`. A `count` below 1 copies nothing and is kept as it
    /// is; a null text counts as one of no units.
    SVGGlyphVector(unsigned short glyIndex, const char16_t* text, int count);
    SVGGlyphVector(const SVGGlyphVector&) = delete;
    SVGGlyphVector& operator=(const SVGGlyphVector&) = delete;
    virtual ~SVGGlyphVector();

    /// Returns: the number of the glyph in its font.
    unsigned short getGlyIndex() const;

    /// Returns: all units of the text, without a terminator and valid as long as this object; null
    /// when there are none. The argument plays no part.
    const char16_t* getUnicode(unsigned short index) const;

    /// Returns: the count of the units. The argument plays no part.
    int getUniCount(unsigned short index) const;

    unsigned short glyIndex;     ///< the number of the glyph
    char16_t* unicode = nullptr; ///< owned
    std::int32_t uniCount;       ///< as it was given
};

} // namespace DrawmereNS

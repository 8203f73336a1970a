/// The key of the glyphs that stand for a text.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <cstdint>
#include <map>
#include <vector>

namespace DrawmereNS {

/// A text with an order of its own: longer texts go before shorter ones, and among texts of one
/// length that with the higher code units goes first. A viewer takes the first glyph whose text
/// matches, so the glyph of a ligature has to stand before those of its parts.
class DRAWMERE_API SVGEmbTLString : public UnicodeString {
public:
    SVGEmbTLString();
    /// Takes a copy of `text`.
    explicit SVGEmbTLString(std::u16string_view text);
    /// Copies the text.
    SVGEmbTLString(const SVGEmbTLString& other);
    /// Copies the text.
    SVGEmbTLString& operator=(const SVGEmbTLString& other);
    ~SVGEmbTLString() override;

    /// Returns: whether this text goes before `other`: it hides the order of the base.
    bool operator<(const SVGEmbTLString& other) const;
};

/// Texts with the numbers of the glyphs that stand for each, in the order of their glyph elements.
using SVGGlyphMap = std::map<SVGEmbTLString, std::vector<std::uint16_t>>;

} // namespace DrawmereNS

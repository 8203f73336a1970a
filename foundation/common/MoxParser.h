/// Reads values and colours from texts.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxColor.h"
#include "foundation/common/MoxString.h"
#include "foundation/common/MoxTokenizer.h"
#include "foundation/common/MoxValue.h"

namespace MoxCommonNS {

/// Reads what SVG 1.1 writes as attribute values, whatever the locale of the process.
class DRAWMERE_API MoxParser {
public:
    /// Reads one value from index `start` of `text` to its end: an integer of 32 bits, a real (also
    /// an integer that is too large), a length (a number and "cm", "mm", "in", "pt" or "pc" in any
    /// case), or a colour that begins with "#". White space at the ends plays no part in these.
    /// Everything else is a string as it stands, also a number that has other text behind it, or
    /// that a single-precision number can't hold.
    /// Shape: a `start` below 0 counts as 0. `type` makes no difference.
    /// Returns: the null value when there is nothing but white space.
    static MoxValue parse(const UnicodeString& text, int start, MoxTokenizer::TokenizerType type);

    /// Reads a colour of SVG 1.1: a colour name in any case, "#rgb", "#rrggbb" or "rgb(...)".
    /// Shape: with `strict` the whole `text` must be the colour, white space at the ends aside;
    /// otherwise the colour at its beginning is read and what follows ignored, such as an
    /// "icc-color(...)".
    /// Returns: a colour value, which is fully transparent for "transparent" and for no colour.
    static MoxValue parseColor(const UnicodeString& text, bool strict);

    /// Reads a colour as `parseColor` does.
    /// Returns: false for no colour, which makes `color` fully transparent; "transparent" is one.
    static bool readColor(const UnicodeString& text, bool strict, MoxColor& color);
};

} // namespace MoxCommonNS

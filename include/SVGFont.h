/// Fonts as callers describe them, and their attributes as text.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxString.h"

#include <cstdint>

namespace DrawmereNS {

using MoxCommonNS::MoxLength;

/// The weight of a font as CSS counts it, 400 normal and 700 bold; a number outside 1 to 1000 is
/// written as "normal".
using FONTWEIGHT = std::int32_t;

constexpr FONTWEIGHT FONTWEIGHT_NORMAL = 400; ///< The weight of plain text.
constexpr FONTWEIGHT FONTWEIGHT_BOLD = 700;   ///< The weight of bold text.

/// The slant of a font; an unlisted number is written as "normal".
enum FSTYLE : std::int32_t {
    FSTYLE_NORMAL = 0,
    FSTYLE_ITALIC = 1,
    FSTYLE_OBLIQUE = 2,
};

/// The small letters of a font; an unlisted number is written as "normal".
enum FVARIANT : std::int32_t {
    FVARIANT_NORMAL = 0,
    FVARIANT_SMALLCAPS = 1,
};

/// The width of a font; an unlisted number means normal.
enum FONTSTRECH : std::int32_t { // sic
    FONTSTRECH_NORMAL = -11,
    FONTSTRECH_WIDER = -10,
    FONTSTRECH_NARROWER = -9,
    FONTSTRECH_ULTRACONDENSED = -8,
    FONTSTRECH_EXTRACONDENSED = -7,
    FONTSTRECH_CONDENSED = -6,
    FONTSTRECH_SEMICONDENSED = -5,
    FONTSTRECH_SEMIEXPANDED = -4,
    FONTSTRECH_EXPANDED = -3,
    FONTSTRECH_EXTRAEXPANDED = -2,
    FONTSTRECH_ULTRAEXPANDED = -1,
};

// Font sizes that are keywords. No real size is negative, so these lengths are free to name them.
constexpr MoxLength FONTSIZE_XXSMALL = MoxLength::fromRaw(-9.0F); ///< "xx-small"
constexpr MoxLength FONTSIZE_XSMALL = MoxLength::fromRaw(-8.0F);  ///< "x-small"
constexpr MoxLength FONTSIZE_SMALL = MoxLength::fromRaw(-7.0F);   ///< "small"
constexpr MoxLength FONTSIZE_MEDIUM = MoxLength::fromRaw(-6.0F);  ///< "medium"
constexpr MoxLength FONTSIZE_LARGE = MoxLength::fromRaw(-5.0F);   ///< "large"
constexpr MoxLength FONTSIZE_XLARGE = MoxLength::fromRaw(-4.0F);  ///< "x-large"
constexpr MoxLength FONTSIZE_XXLARGE = MoxLength::fromRaw(-3.0F); ///< "xx-large"
constexpr MoxLength FONTSIZE_LARGER = MoxLength::fromRaw(-2.0F);  ///< "larger"
constexpr MoxLength FONTSIZE_SMALLER = MoxLength::fromRaw(-1.0F); ///< "smaller"

/// The font-size-adjust that means none.
constexpr MoxLength FONTADJUST_NONE = MoxLength::fromRaw(-1.0F);

/// The identity of a font: equal keys ask for the same face.
class DRAWMERE_API FONTATTRIBUTEKEY {
public:
    /// True for the same name, case included, the same weight, and two upright or two slanted
    /// styles.
    bool operator==(const FONTATTRIBUTEKEY& other) const;

    /// Orders by name in UTF-16 code units, then by weight, then upright before slanted.
    bool operator<(const FONTATTRIBUTEKEY& other) const;

    UnicodeString fontName;                    ///< the name by which the face is looked up
    FONTWEIGHT fontWeight = FONTWEIGHT_NORMAL; ///< 1 to 1000
    FSTYLE fontStyle = FSTYLE_NORMAL;          ///< upright or slanted
};

/// All that is known of a font. Copied by value; `operator==` is that of the key.
class DRAWMERE_API FONTATTRIBUTE : public FONTATTRIBUTEKEY {
public:
    MoxLength fontSize = FONTSIZE_MEDIUM;       ///< a length, or one of the `FONTSIZE_` keywords
    MoxLength fontAdjust = FONTADJUST_NONE;     ///< kept, not written
    FVARIANT fontVariant = FVARIANT_NORMAL;     ///< kept, not written on texts
    FONTSTRECH fontStretch = FONTSTRECH_NORMAL; ///< written, and chooses the face
    bool embedFont = false;                     ///< embed this font as an SVG font
    bool embedGlyphIds = false; ///< when embedded, take the caller's glyph ids, not the characters
    UnicodeString fontFamily;   ///< the ready-made value of the attribute font-family
};

/// The font that a caller sets, with the calls that fill it.
class DRAWMERE_API SVGFont : public FONTATTRIBUTE {
public:
    /// Stores the first four values and makes the family from both names: `family` alone when
    /// `familyOnly` is set; both names, each in apostrophes, when `family` is a second name;
    /// `name` alone otherwise. A name that stands alone is in apostrophes when it holds a blank.
    /// Units: `size` is a length or one of the `FONTSIZE_` keywords.
    void setFontAttribute(const UnicodeString& name, MoxLength size, FONTWEIGHT weight,
                          FSTYLE style, const UnicodeString& family, bool familyOnly);

    /// Says whether the font is embedded, and whether by the caller's glyph ids.
    void setEmbedAttribute(bool embed, bool byGlyphIds);

    /// Stores the font-size-adjust; it is kept and not written.
    void setFontAdjust(MoxLength adjust) { fontAdjust = adjust; }

    /// Stores the variant; it is kept and not written on texts.
    void setFontVariant(FVARIANT variant) { fontVariant = variant; }

    /// Stores the width of the face.
    void setFontStretch(FONTSTRECH stretch) { fontStretch = stretch; }
};

/// Turns a font into the texts of its attributes.
class DRAWMERE_API SVGFontAttr2String {
public:
    /// One text for each attribute; a new record describes no font in particular.
    struct FONTATTRSTRING {
        UnicodeString fontName{u"user"};      ///< the name
        UnicodeString fontSize{u"medium"};    ///< a number or a keyword
        UnicodeString fontAdjust{u"none"};    ///< a number or "none"
        UnicodeString fontWeight{u"normal"};  ///< a number or "normal"
        UnicodeString fontStyle{u"normal"};   ///< a keyword
        UnicodeString fontVariant{u"normal"}; ///< a keyword
        UnicodeString fontStretch{u"normal"}; ///< a keyword
        UnicodeString fontFamily;             ///< as it was set
    };

    /// Fills all of `out` from `font`.
    /// Units: sizes that are no keyword are written in the output unit, without a suffix.
    static void getFontAttrStr(const FONTATTRIBUTE& font, FONTATTRSTRING& out);
};

} // namespace DrawmereNS

/// A font of the document, as text that keeps its characters needs it.
#pragma once

#include "Drawmere.h"
#include "foundation/fontservice/FS_ExtraFonts.h"

#include <mupdf/fitz.h>

#include <bitset>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace DrawmereConvert {

using DrawmereNS::SVGFont;
using icu::UnicodeString;
using MoxFontService_NS::FS_ExtraFonts;

/// Knows the names, widths and the file of one font, and which text stands for which glyph.
///
/// In an embedded font one text has one glyph. A text that wants another one gets it from the same
/// file under a further name, a variant.
class TextFont {
public:
    /// Owns: `font`, kept until the end.
    TextFont(fz_context* context, fz_font* font);
    TextFont(const TextFont&) = delete;
    TextFont& operator=(const TextFont&) = delete;
    ~TextFont();

    /// Returns: whether the font has outlines in a file that can be embedded. Asks the library, the
    /// first time.
    bool canEmbed();

    /// Returns: the variant in which `text` stands for `glyph`: `preferred` when that will do.
    int findVariant(const std::u16string& text, int glyph, int preferred);

    /// Notes that two characters follow each other in a variant, with no position for the second.
    /// Returns: false, and notes nothing, when viewers would take them for a ligature.
    bool joinLetters(int variant, char16_t first, char16_t second);

    /// Returns: a glyph that a blank can stand for in a variant, or nothing.
    std::optional<int> findBlank(int variant);

    /// Returns: whether a glyph has an outline and that is empty.
    bool showsNothing(int glyph);

    /// Returns: whether the outline of a glyph looks alike by both rules of filling.
    bool isFilledAlike(int glyph);

    /// Fills `font` and returns the file of an embedded font, or null for a font that is only
    /// named.
    FS_ExtraFonts* describe(int variant, float size, SVGFont& font);
    void describePlain(float size, SVGFont& font) const;

    /// Returns: the advance of a glyph in the font file, as a part of the em.
    float getAdvance(int glyph);

    /// Returns: the width that a glyph of a font that stands in for another is stretched to, as a
    /// part of the em, or nothing.
    std::optional<float> findStretchedWidth(int glyph) const;

    /// Forgets which texts stand for which glyphs; to be called for each new document.
    void startDocument() { variants.clear(); }

private:
    /// What one variant has been used for in the document in hand. Pairs are of ASCII characters.
    struct Variant {
        using Pairs = std::bitset<128UL * 128UL>;

        std::unordered_map<std::u16string, int> glyphs;
        Pairs loose;      // letters that follow each other
        Pairs inLigature; // letters of one glyph
    };

    /// What is known of a glyph of the file; nothing at first.
    struct Glyph {
        float advance = -1; // as a part of the em, below 0 when not read yet
        std::optional<bool> isFilledAlike;
        std::optional<bool> showsNothing;
    };

    void readNames();
    std::unique_ptr<FS_ExtraFonts> loadFile(const UnicodeString& name) const;
    UnicodeString makeName(int variant) const;
    static bool take(Variant& variant, const std::u16string& text, int glyph);
    Glyph& findGlyph(int glyph);

    fz_context* ctx;
    fz_font* font;
    UnicodeString name;   // tells this file from all others
    UnicodeString family; // a list for viewers that have the font or one like it
    std::vector<std::unique_ptr<FS_ExtraFonts>> files; // by variant
    std::vector<Variant> variants;                     // of the document in hand
    std::vector<Glyph> knownGlyphs;
    bool isTried = false;
};

/// All fonts of a document file, each made when it is first seen.
class FontBook {
public:
    explicit FontBook(fz_context* context) : ctx(context) {}

    TextFont& find(fz_font* font);
    void startDocument();

private:
    static constexpr std::size_t maxFonts = 256;

    fz_context* ctx;
    std::unordered_map<fz_font*, std::unique_ptr<TextFont>> fonts;
};

} // namespace DrawmereConvert

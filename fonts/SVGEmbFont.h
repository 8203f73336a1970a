/// A font that a document carries.
#pragma once

#include "DrawmereErrHandler.h"
#include "DrawmereExport.h"
#include "SVGFont.h"
#include "fonts/SVGCodePointSet.h"
#include "fonts/SVGEmbTLString.h"
#include "fonts/SVGGlyphIndex.h"
#include "foundation/fontservice/FS_FontInfo.h"
#include "foundation/records/TLStringWithGlyphInfo.h"
#include "tree/SVGElement.h"

namespace DrawmereNS {

class SVGTreeManager;

using MoxCommonNS::MoxPointT;
using MoxFontService_NS::FS_ExtraFonts;
using MoxFontService_NS::FS_FontInfo;
using MoxFontService_NS::FS_GlyphDrawInfo;
using TalFont::TLStringWithGlyphInfo;

/// One open face with the texts that were drawn with it, which become the `font` element of SVG 1.1
/// when the document ends. A face that can't be opened is no failure of the run: the document then
/// has the font without glyphs, and `getErrorMessage` tells why.
class DRAWMERE_API SVGEmbFont {
public:
    /// Takes the attributes and opens the face.
    /// Borrows: `extraFonts`, for the call; may be null.
    SVGEmbFont(const SVGFont& font, FS_ExtraFonts* extraFonts);
    SVGEmbFont(const SVGEmbFont&) = delete;
    SVGEmbFont& operator=(const SVGEmbFont&) = delete;
    virtual ~SVGEmbFont();

    /// Opens the face, unless it is open; each failure adds to `errorMessage`.
    /// Borrows: `extraFonts`, for the call; may be null.
    /// Returns: true always: a font without a face stays.
    bool loadFont(FS_ExtraFonts* extraFonts);

    /// Returns: whether both came to one face, by its own family name, weight and slant.
    bool isSameFont(SVGEmbFont& other);

    /// Notes the characters of `text` that the face has, one entry for each. With `vertical` those
    /// that have a form for vertical text go to `verticalGlyphs`.
    void embedText(const UnicodeString& text, bool vertical);

    /// Notes the glyphs that `text` was shaped into: one entry for each cluster, or with `wholeRun`
    /// one for the whole text. The glyphs of a text that is known already stay as they are.
    /// Ignores: null `glyphs`.
    void embedGlyphId(const UnicodeString& text, const TLStringWithGlyphInfo* glyphs, bool wholeRun,
                      bool vertical);

    /// Returns: why the face could not be opened, a few lines for each attempt; empty when it was.
    UnicodeString getErrorMessage() const;

    /// Writes the font under the cursor of `tree`. Nothing stays of a font whose texts all are
    /// without an outline. Each call writes one more.
    /// Ignores: a tree without a root.
    void doEmbedFont(SVGTreeManager* tree);

    /// Appends a `glyph` for each text, those of vertical text first. A text with a glyph that
    /// can't be read gets none.
    /// Returns: false when every text came out without an outline; one that can't be read doesn't
    /// count as such.
    bool convGlyphs(MoxElement* font, SVGTreeManager* tree);

    /// Appends what stands for a character that the font lacks, if the face has a glyph 0.
    void addMissingGlyph(MoxElement* font, SVGTreeManager* tree);

    /// Reads the glyphs into `infos`, up to the first that can't be read. `flag` is handed on.
    /// Returns: whether all were read.
    bool getGlyphDrawInfos(const std::vector<std::uint16_t>& glyphIds,
                           std::vector<FS_GlyphDrawInfo>& infos, bool flag) const;

    /// Makes the element for a text, or for an empty text the one that stands for what is missing.
    /// The glyphs stand one behind the other, each moved on by the advances before it.
    /// Counts in `emptyCount` an element without an outline.
    MoxPtr<SVGElement> convGlyph(const std::vector<FS_GlyphDrawInfo>& infos,
                                 const UnicodeString& text, SVGTreeManager* tree, int& emptyCount,
                                 bool vertical);

    /// The same for one glyph of horizontal text.
    MoxPtr<SVGElement> convGlyph(const FS_GlyphDrawInfo& info, const UnicodeString& text,
                                 SVGTreeManager* tree, int& emptyCount);

    FS_FontInfo fontInfo;             ///< the face
    FONTATTRIBUTE fontAttribute;      ///< of the first request; how text is collected, of the last
    UnicodeString faceFamily;         ///< the value of font-family in the font
    SVGGlyphMap horizontalGlyphs;     ///< others may read both maps and add to them
    SVGGlyphMap verticalGlyphs;       ///< likewise
    DrawmereErrHandler* errorHandler; ///< borrowed; for callers, nothing is reported to it
    UnicodeString errorMessage;       ///< what `getErrorMessage` gives
    std::map<UnicodeString, bool> reservedFlags; ///< stays empty

private:
    void forgetCharacters();
    void embedCodePoint(std::int32_t codePoint, std::u16string_view text, bool vertical);
    void embedClusters(std::u16string_view text, const TLStringWithGlyphInfo& glyphs,
                       bool vertical);
    void embedRun(std::u16string_view text, const TLStringWithGlyphInfo& glyphs, bool vertical);
    /// Returns: the new entry for `text`, which has no glyphs yet; null when there was one before.
    SVGGlyphMap::value_type* add(std::u16string_view text, bool vertical);
    /// Returns: the index of a map, which knows what is in it.
    const SVGGlyphIndex& followMap(bool vertical);

    std::size_t countTexts() const { return horizontalGlyphs.size() + verticalGlyphs.size(); }

    void convGlyphMap(const SVGGlyphMap& glyphs, MoxElement* font, SVGTreeManager* tree,
                      int& emptyCount, bool vertical);
    bool hasVerticalForm(const UnicodeString& text) const;

    // What is asked before the maps, which alone say what there is.
    // The characters that embedText need not look at again.
    SVGCodePointSet horizontalCharacters;
    SVGCodePointSet verticalCharacters;
    SVGGlyphIndex horizontalIndex;
    SVGGlyphIndex verticalIndex;
    std::size_t notedTexts = 0; // as many as there were when this class looked last
};

/// Returns: the text of one point of an outline, moved by `advance` along y when `vertical` and
/// along x otherwise. It is that of real values, not the number rule of paths on pages.
/// Units: font units.
DRAWMERE_API UnicodeString coordinateString(const MoxPointT<float>& point, int advance,
                                            bool vertical);

} // namespace DrawmereNS

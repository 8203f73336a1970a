/// A handle on one face of one font.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxLang.h"
#include "foundation/common/MoxString.h"
#include "foundation/fontservice/FS_ExtraFonts.h"
#include "foundation/fontservice/FS_GlyphDrawInfo.h"
#include "foundation/fontservice/FS_NewTextMetricEx.h"

#include <memory>

namespace MoxFontService_NS {

using MoxCommonNS::MoxLang;

struct FS_FoundFace;

/// One face, found by name: its style, its glyphs and their outlines.
///
/// A handle without a face answers neutral values: 1000 units per em, as SVG 1.1 has it where
/// nothing is said, weight 400, upright, no family name, no glyph, a width of 0. Faces are shared
/// by all handles of the process, on any thread; a handle that nobody changes may be used by
/// several. Copies share the face.
class DRAWMERE_API FS_FontInfo {
public:
    static constexpr unsigned short noGlyph = 65535; ///< stands for no glyph

    FS_FontInfo();
    /// A copy.
    FS_FontInfo(const FS_FontInfo& other);
    /// Copies everything.
    FS_FontInfo& operator=(const FS_FontInfo& other);
    ~FS_FontInfo();

    /// Returns: true once `createFont` has succeeded.
    bool isCreatedFont() const;

    /// Finds the face called `name` among `extra`, else in the system, where a family, full or
    /// PostScript name counts, a generic family of CSS, and an alias that the configuration of
    /// fontconfig declares. Of several faces the nearest `widthClass` (1 to 9) is taken, then the
    /// slant, then the nearest `weight` (1 to 1000). Numbers outside mean 5 and 400. A variable
    /// font is set to the wanted values as far as its axes reach.
    /// Borrows: `extra`, for the call; may be null. The last argument is reserved.
    /// Returns: false for an unknown name and for a file that can't be read; the handle then
    /// stays as it was.
    bool createFont(const UnicodeString& name, int weight, bool italic, int widthClass,
                    FS_ExtraFonts* extra, bool reserved);

    /// Returns: the first name that the caller gave the face; for a face of the system the family
    /// name that together with bold and italic tells it from all others.
    /// A width that one name would hide is part of the answer. The language is reserved.
    UnicodeString getFamilyName(MoxLang::LanguageID language) const;

    /// Tells the weight, the slant and the width class of the face that was found, which may
    /// differ from what was wanted. Each pointer may be null.
    void getFontStyle(int* weight, bool* italic, int* widthClass) const;

    /// Returns: the em square in font units, never below 1.
    int getUnitsPerEm() const;

    /// Returns: the number of the glyph for `codePoint`, with `vertical` that of the form which
    /// the font substitutes in vertical text, if any; `noGlyph` when the face has none. It is
    /// looked up each time: who asks for every character of a text remembers the answers.
    unsigned short getGlyphID(int codePoint, bool vertical) const;

    /// Fills `info` with the unhinted outline; vectors in it are used again.
    /// Returns: false, with `info` emptied, for a glyph that can't be read: there is none, it is
    /// broken or endless, or the font has only bitmaps. The last argument is reserved.
    bool getGlyphDrawInfo(unsigned short glyphId, FS_GlyphDrawInfo& info, bool reserved) const;

    /// Returns: the advance of glyph 0, which stands for all the face lacks, in font units; the
    /// average advance when there is no glyph 0. The argument is reserved.
    float getDefaultCharWidth(int reserved) const;

    /// Fills `metrics`, in units of which `size` make an em; a negative `size` counts like the
    /// positive one, 0 is the em of the font.
    void getOutlineTextMetrics(FS_NewTextMetricEx& metrics, int size) const;

private:
    std::shared_ptr<const FS_FoundFace> found;
};

} // namespace MoxFontService_NS

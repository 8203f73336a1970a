/// The glyphs that a font substitutes in vertical text.
#pragma once

#include <hb.h>

#include <vector>

namespace MoxFontService_NS {

/// The substitutions of the OpenType features vrt2 and vert, of all scripts and languages.
class FS_VerticalForms {
public:
    /// Borrows: `fontFace`, for its life.
    explicit FS_VerticalForms(hb_face_t* fontFace);

    /// Returns: the vertical form of the glyph, else the glyph itself.
    unsigned find(unsigned glyphId) const;

private:
    hb_face_t* face; // borrowed
    std::vector<unsigned> lookups;
};

} // namespace MoxFontService_NS

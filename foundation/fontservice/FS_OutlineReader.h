/// Turns outlines as FreeType loads them into polygons.
#pragma once

#include "foundation/fontservice/FS_GlyphDrawInfo.h"

#include <ft2build.h>
#include FT_OUTLINE_H

#include <vector>

namespace MoxFontService_NS {

/// Reads outlines contour by contour. On-curve points that an outline implies between two control
/// points are made explicit.
class FS_OutlineReader {
public:
    /// An outline of more points is not read: no glyph that means a character needs them.
    static constexpr int mostPoints = 20'000;

    /// Fills `polygons` from `outline`; vectors in it are used again. Contours of a single point,
    /// which mark a place and draw nothing, are left out.
    /// Returns: false, with `polygons` unfinished, for an outline that breaks the rules of its
    /// kind or has too many points.
    static bool read(const FT_Outline& outline, std::vector<FS_GlyphPolygon>& polygons);
};

} // namespace MoxFontService_NS

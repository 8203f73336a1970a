/// The outline and the advances of one glyph, as the font service reads them.
#pragma once

#include "foundation/common/MoxPointT.h"

#include <vector>

namespace MoxFontService_NS {

using MoxCommonNS::MoxPointT;

/// The kind of a segment of a contour, which is also the count of its control points.
enum FSSEGMENT : int {
    FSSEGMENT_LINE = 0,
    FSSEGMENT_QUADRATIC = 1,
    FSSEGMENT_CUBIC = 2,
};

/// One closed contour. The straight line that closes it is not among its segments.
/// Units: font units, y upwards.
struct FS_GlyphPolygon {
    std::vector<int> segmentTypes; ///< one `FSSEGMENT` a segment
    /// The start, then the points of each segment: one for a line, two for a quadratic curve,
    /// three for a cubic one.
    std::vector<MoxPointT<float>> points;
};

/// One glyph.
/// Units: font units.
struct FS_GlyphDrawInfo {
    int horizontalAdvance = 0;             ///< in font units
    int verticalAdvance = 0;               ///< downwards; the em when the font says nothing
    std::vector<FS_GlyphPolygon> polygons; ///< the closed contours
};

} // namespace MoxFontService_NS

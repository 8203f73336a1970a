/// The text of the outlines of glyphs.
#pragma once

#include "foundation/common/MoxPointT.h"
#include "foundation/fontservice/FS_GlyphDrawInfo.h"

#include <cstddef>
#include <memory>
#include <string_view>

namespace DrawmereNS {

using MoxCommonNS::MoxPointT;

/// Collects path data as bytes, in absolute commands and with the numbers of real values.
/// Units: font units, y upwards as the font has it.
class SVGGlyphPath {
public:
    SVGGlyphPath() = default;
    SVGGlyphPath(const SVGGlyphPath&) = delete;
    SVGGlyphPath& operator=(const SVGGlyphPath&) = delete;

    /// Adds the contours of `info`, moved by `advance` along y when `vertical`, else along x. A
    /// contour that has fewer points than its segments want ends with the last whole segment.
    void addGlyph(const MoxFontService_NS::FS_GlyphDrawInfo& info, int advance, bool vertical);

    /// Adds the coordinates of one point.
    void addPoint(const MoxPointT<float>& point, int advance, bool vertical);

    /// Returns: the text so far, valid until more is added.
    std::string_view get() const { return {bytes, used}; }

private:
    void addPolygon(const MoxFontService_NS::FS_GlyphPolygon& polygon, int advance, bool vertical);
    void addByte(char byte);
    void makeRoom(std::size_t count);

    static constexpr std::size_t nearRoom = 8192; // most glyphs fit into it

    char near[nearRoom];
    std::unique_ptr<char[]> far; // for larger ones
    char* bytes = near;
    std::size_t used = 0;
    std::size_t room = nearRoom;
};

} // namespace DrawmereNS

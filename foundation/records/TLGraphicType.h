/// The file types of images.
#pragma once

#include "DrawmereExport.h"

#include <cstdint>
#include <iosfwd>

namespace TalGraphic {

/// The type of an image as its caller knows it. Every other number is a type to which an SVG
/// document can't refer as it is.
enum TLGraphicType : std::int32_t {
    TLGRAPHICTYPE_OTHER = 0, ///< what `findGraphicType` answers for all the rest
    TLGRAPHICTYPE_PNG = 2,
    TLGRAPHICTYPE_JPEG = 5,
    TLGRAPHICTYPE_SVG = 9,
};

/// Returns: the type that the first bytes of `source` tell; the name of a file plays no part. A
/// document is SVG when `<svg` is found in its first kilobyte, behind what may come before it.
/// Borrows: `source`, for the call; it is read from its beginning, and left there.
DRAWMERE_API TLGraphicType findGraphicType(std::istream& source);

} // namespace TalGraphic

/// The file types of images.
#pragma once

#include <cstdint>

namespace TalGraphic {

/// The type of an image as its caller knows it. Every other number is a type to which an SVG
/// document can't refer as it is.
enum TLGraphicType : std::int32_t {
    TLGRAPHICTYPE_PNG = 2,
    TLGRAPHICTYPE_JPEG = 5,
    TLGRAPHICTYPE_SVG = 9,
};

} // namespace TalGraphic

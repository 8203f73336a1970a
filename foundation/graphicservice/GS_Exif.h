/// The one thing that pixels need of Exif data.
#pragma once

#include <cstddef>
#include <cstdint>

namespace MoxGraphicService_NS {

/// Returns: the orientation, 1 to 8, that a block of Exif data (a TIFF file with one directory in
/// front, Exif 2.3) states; 1 when it states none or is damaged.
int readExifOrientation(const std::uint8_t* bytes, std::size_t size);

/// Returns: `orientation` when it is one, 1 otherwise.
int checkOrientation(std::uint32_t orientation);

} // namespace MoxGraphicService_NS

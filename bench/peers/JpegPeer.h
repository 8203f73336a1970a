/// libjpeg-turbo by itself.
#pragma once

#include <cstddef>
#include <string>

namespace DrawmereNS {

/// Makes a JPEG file that is as hard to decode as a photograph.
void writeJpegPhotograph(const std::string& path, int columns, int rows);

/// Decodes a file at the smallest scale of the decoder that leaves at least `columns`.
/// Returns: the count of bytes decoded.
std::size_t decodeJpegScaled(const std::string& path, int columns);

} // namespace DrawmereNS

/// Bitmaps as paths.
#pragma once

#include "tools/convert/ImagePixels.h"

#include <mupdf/fitz.h>

#include <vector>

namespace DrawmereConvert {

/// The corners of a closed line around pixels, as parts of the width and height of the image.
using BitmapLoop = std::vector<fz_point>;

/// Finds the lines around all pixels of `mask` that are more than half set; those around holes run
/// the other way round, so that the nonzero rule fills what is set.
/// Returns: nothing when there would be more than `maxCorners` corners.
std::vector<BitmapLoop> traceBitmap(const ImagePixels& mask, std::size_t maxCorners);

} // namespace DrawmereConvert

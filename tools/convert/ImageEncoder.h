/// Makes files of decoded images.
#pragma once

#include "tools/convert/ImagePixels.h"

#include <mupdf/fitz.h>

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace DrawmereConvert {

/// What the pixels of an image are turned into.
struct ImageLook {
    const ImagePixels* mask = nullptr;    ///< gives the alpha; may be null
    std::optional<std::uint32_t> color{}; ///< of all pixels, 0xRRGGBB
    bool isWhite = false;                 ///< all pixels become white, whatever `color` says
    bool isGray = false;                  ///< colours become greys of their brightness
    int zoom = 1;                         ///< each pixel becomes a square of so many
};

/// Returns: the bytes of a file: a PNG where that is small or something is transparent; else a BMP,
/// of which the library makes a PNG or a JPEG by its content. Empty when there is nothing.
std::string encodeImage(const ImagePixels& pixels, const ImageLook& look);

/// Returns: the bytes of the file that `image` is stored as, when they show what the document
/// shows; empty otherwise.
std::string findStoredImage(fz_context* ctx, fz_image* image);

} // namespace DrawmereConvert

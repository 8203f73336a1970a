/// The headers of BMP files.
#pragma once

#include "foundation/graphicservice/GS_ImageInfo.h"
#include "foundation/graphicservice/GS_Input.h"

#include <cstdint>
#include <vector>

namespace MoxGraphicService_NS {

/// How the pixels of a BMP file are held.
enum class GS_BmpCompression { plain, runs8, runs4 };

/// What the headers of a BMP file tell, all of it checked.
struct GS_BmpHeader {
    GS_ImageInfo info;
    GS_BmpCompression compression = GS_BmpCompression::plain;
    int depth = 0;                         ///< bits a pixel: 1, 4, 8, 16, 24 or 32
    bool isTopDown = false;                ///< the first row in the file is the upper one
    std::uint32_t masks[4] = {0, 0, 0, 0}; ///< of red, green, blue, alpha at 16 and 32 bits
    std::uint32_t pixelOffset = 0;
    std::vector<std::uint8_t> palette; ///< blue, green, red, 0 of each index that depth allows
    std::uint32_t profileOffset = 0;   ///< of an ICC profile in the file, 0 for none
    std::uint32_t profileSize = 0;
};

/// Reads the headers and the palette of the BMP file in `input`: those of OS/2 and all of Windows.
/// Returns: false when they contradict themselves or the size of the file, or tell of something
/// that can't be decoded.
bool readBmpHeader(GS_Input& input, GS_BmpHeader& header);

} // namespace MoxGraphicService_NS

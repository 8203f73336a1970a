/// Writes PNG files of images with few colours, grey ones and such with transparency.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace DrawmereConvert {

/// How the samples of a PNG image count, by the numbers of the format.
enum PNGCOLORS : std::uint8_t {
    PNGCOLORS_GRAY = 0,
    PNGCOLORS_RGB = 2,
    PNGCOLORS_PALETTE = 3,
    PNGCOLORS_RGBA = 6,
};

/// What stands in the headers of a file.
struct PngHeader {
    std::uint32_t width = 0;
    std::uint32_t height = 0;
    int depth = 8; ///< bits a sample
    PNGCOLORS colors = PNGCOLORS_GRAY;
    std::string palette{}; ///< three bytes an entry
    std::string alphas{};  ///< one byte an entry of the palette, as far as they are not opaque
};

/// Returns: a file of `rows`, which stand one behind the other, each of whole bytes and `rowBytes`
/// long. Empty when there is no memory for it.
std::string writePng(const PngHeader& header, const unsigned char* rows, std::size_t rowBytes);

/// Returns: a file around `data`, a zlib stream of rows that are filtered as PNG wants them.
std::string wrapPng(const PngHeader& header, const unsigned char* data, std::size_t size);

} // namespace DrawmereConvert

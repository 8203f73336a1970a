/// The pixels of an image.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <memory>
#include <vector>

namespace MoxGraphicService_NS {

/// Frees what `calloc` gave.
struct GS_Free {
    void operator()(std::uint8_t* bytes) const { std::free(bytes); }
};

/// Pixels of 8 bits a channel, row by row from the top, with nothing between the rows. Colours are
/// those of sRGB unless there is a profile; alpha is not multiplied into them.
struct GS_Bitmap {
    int columns = 0;
    int rows = 0;
    int channels = 0; ///< 1 grey, 2 grey and alpha, 3 red, green, blue, 4 these and alpha
    std::unique_ptr<std::uint8_t[], GS_Free> pixels;
    std::vector<std::uint8_t> profile; ///< an ICC profile, may be empty

    /// Makes room for pixels, all zero. Pages that are never written take no memory, which is all
    /// that a file gets which claims more than it holds.
    /// Returns: false when memory ran out.
    bool allocate(int columnCount, int rowCount, int channelCount);

    /// Returns: the count of bytes of a row.
    std::size_t getRowSize() const;

    /// Returns: the first byte of row `y`.
    std::uint8_t* getRow(int y);
    const std::uint8_t* getRow(int y) const;

    /// Returns: whether the last channel is alpha.
    bool hasAlpha() const;

    /// Returns: whether any pixel is not opaque.
    bool isTransparent() const;

    /// Keeps the profile when its colours are those of the pixels, else drops it: that of a file
    /// whose colours were converted (CMYK) says nothing about them any more.
    void setProfile(const std::uint8_t* bytes, std::size_t size);
};

} // namespace MoxGraphicService_NS

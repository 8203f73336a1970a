#include "foundation/graphicservice/GS_ImageClassifier.h"

#include <bitset>
#include <cstring>

namespace MoxGraphicService_NS {
namespace {

// Colours are told apart by five bits of each channel, so that noise counts little.
constexpr int colorBits = 15;
constexpr std::size_t fewColors = 64;
constexpr std::size_t fewGreys = 24; // of the 32 that five bits have

// A noisy photograph has next to no even pixels, one with a clear sky up to two thirds: the more in
// greys, where there are fewer values to differ by.
constexpr double mostEven = 0.65;
constexpr double mostEvenGrey = 0.75;

std::size_t reduce(const std::uint8_t* pixel, int channels) {
    const bool isGrey = channels < 3;
    const std::size_t red = pixel[0] >> 3;
    const std::size_t green = pixel[isGrey ? 0 : 1] >> 3;
    const std::size_t blue = pixel[isGrey ? 0 : 2] >> 3;
    return red << 10 | green << 5 | blue;
}

/// What is counted over an image.
struct Counts {
    std::bitset<std::size_t{1} << colorBits> colors;
    std::size_t pixels = 0;
    std::size_t even = 0; // like the pixel before or above
};

/// Counts a row from its second pixel on.
void countRow(const GS_Bitmap& bitmap, int y, Counts& counts) {
    const auto size = static_cast<std::size_t>(bitmap.channels);
    const std::uint8_t* pixel = bitmap.getRow(y) + size;
    const std::uint8_t* above = y > 0 ? pixel - bitmap.getRowSize() : pixel - size;
    for (int x = 1; x < bitmap.columns; ++x, pixel += size, above += size) {
        const bool isEven =
            std::memcmp(pixel, pixel - size, size) == 0 || std::memcmp(pixel, above, size) == 0;
        counts.even += isEven ? 1 : 0;
        counts.colors.set(reduce(pixel, bitmap.channels));
    }
    counts.pixels += static_cast<std::size_t>(bitmap.columns - 1);
}

/// Returns: whether there is no third colour.
bool isBilevel(const GS_Bitmap& bitmap) {
    const auto size = static_cast<std::size_t>(bitmap.channels);
    const std::uint8_t* first = bitmap.getRow(0);
    const std::uint8_t* end = bitmap.getRow(bitmap.rows);
    const std::uint8_t* second = nullptr;
    for (const std::uint8_t* pixel = first; pixel != end; pixel += size) {
        if (std::memcmp(pixel, first, size) == 0 ||
            (second && std::memcmp(pixel, second, size) == 0)) {
            continue;
        }
        if (second) {
            return false;
        }
        second = pixel;
    }
    return true;
}

} // namespace

GS_ImageClass classifyBitmap(const GS_Bitmap& bitmap) {
    if (isBilevel(bitmap)) {
        return IMAGECLASS_BILEVEL;
    }
    Counts counts;
    for (int y = 0; y < bitmap.rows; ++y) {
        countRow(bitmap, y, counts);
    }
    const bool isGrey = bitmap.channels < 3;
    const std::size_t few = isGrey ? fewGreys : fewColors;
    const double evenLimit =
        static_cast<double>(counts.pixels) * (isGrey ? mostEvenGrey : mostEven);
    const bool isPhotograph =
        counts.colors.count() >= few && static_cast<double>(counts.even) < evenLimit;
    return isPhotograph ? IMAGECLASS_PHOTOGRAPH : IMAGECLASS_DRAWING;
}

} // namespace MoxGraphicService_NS

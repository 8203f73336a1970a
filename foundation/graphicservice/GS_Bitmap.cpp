#include "foundation/graphicservice/GS_Bitmap.h"

#include <cstring>

namespace MoxGraphicService_NS {
namespace {

// Where the header of an ICC profile names its colours, and its own length.
constexpr std::size_t profileHeaderSize = 128;
constexpr std::size_t colorSpaceOffset = 16;
constexpr std::size_t colorSpaceSize = 4;

} // namespace

bool GS_Bitmap::allocate(int columnCount, int rowCount, int channelCount) {
    const auto rowSize =
        static_cast<std::size_t>(columnCount) * static_cast<unsigned>(channelCount);
    pixels.reset(
        static_cast<std::uint8_t*>(std::calloc(static_cast<std::size_t>(rowCount), rowSize)));
    columns = columnCount;
    rows = rowCount;
    channels = channelCount;
    return pixels != nullptr;
}

std::size_t GS_Bitmap::getRowSize() const {
    return static_cast<std::size_t>(columns) * static_cast<unsigned>(channels);
}

std::uint8_t* GS_Bitmap::getRow(int y) {
    return pixels.get() + static_cast<std::size_t>(y) * getRowSize();
}

const std::uint8_t* GS_Bitmap::getRow(int y) const {
    return pixels.get() + static_cast<std::size_t>(y) * getRowSize();
}

bool GS_Bitmap::hasAlpha() const { return channels % 2 == 0; }

bool GS_Bitmap::isTransparent() const {
    if (!hasAlpha()) {
        return false;
    }
    const auto step = static_cast<std::size_t>(channels);
    const std::size_t size = getRowSize() * static_cast<std::size_t>(rows);
    for (std::size_t i = step - 1; i < size; i += step) {
        if (pixels[i] != UINT8_MAX) {
            return true;
        }
    }
    return false;
}

void GS_Bitmap::setProfile(const std::uint8_t* bytes, std::size_t size) {
    const char* space = channels < 3 ? "GRAY" : "RGB ";
    const bool fits = size >= profileHeaderSize &&
                      std::memcmp(bytes + colorSpaceOffset, space, colorSpaceSize) == 0;
    profile.assign(bytes, fits ? bytes + size : bytes);
}

} // namespace MoxGraphicService_NS

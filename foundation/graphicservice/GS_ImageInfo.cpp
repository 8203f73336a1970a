#include "foundation/graphicservice/GS_ImageInfo.h"

#include "foundation/graphicservice/GS_Graphic.h"

namespace MoxGraphicService_NS {

bool GS_ImageInfo::setSize(std::uint64_t columnCount, std::uint64_t rowCount) {
    constexpr std::uint64_t longestSide = std::uint64_t{1} << 24;
    const auto limit = static_cast<std::uint64_t>(GS_Graphic::getPixelLimit());
    if (columnCount < 1 || rowCount < 1 || columnCount > longestSide || rowCount > longestSide ||
        columnCount * rowCount > limit) {
        return false;
    }
    columns = static_cast<int>(columnCount);
    rows = static_cast<int>(rowCount);
    return true;
}

void GS_ImageInfo::setResolution(double x, double y, double inches) {
    constexpr double highest = 65535.0;
    const auto isSensible = [](double value) { return value >= 1.0 && value <= highest; };
    if (isSensible(x / inches) && isSensible(y / inches)) {
        xResolution = x / inches;
        yResolution = y / inches;
    }
}

bool GS_ImageInfo::isTurned() const { return orientation >= 5; }

} // namespace MoxGraphicService_NS

#include "foundation/graphicservice/GS_RasterImage.h"

#include <algorithm>

namespace MoxGraphicService_NS {

GS_RasterImage::GS_RasterImage(int columnCount, int rowCount)
    : columns(columnCount), rows(rowCount) {}

GS_RasterImage::~GS_RasterImage() = default;

bool GS_RasterImage::hasTransparency() const { return findTransparency(); }

int GS_RasterImage::Columns() const { return columns; }

int GS_RasterImage::Rows() const { return rows; }

void GS_RasterImage::gl_setDownsample(int width, int height, GSMP_SAMPLINGTYPE type) {
    targetColumns = std::max(1, std::min(width, columns));
    targetRows = std::max(1, std::min(height, rows));
    samplingType = type;
}

void GS_RasterImage::gl_setResolution(int x, int y, GS_ResolutionUnit unit) {
    constexpr double centimetersPerInch = 2.54;
    const double perInch = unit == RESOLUTIONUNIT_CENTIMETER ? centimetersPerInch : 1.0;
    const bool isStated = x >= 1 && y >= 1;
    xResolution = isStated ? x * perInch : 0.0;
    yResolution = isStated ? y * perInch : 0.0;
}

GS_Failure GS_RasterImage::getFailure() const { return failure; }

} // namespace MoxGraphicService_NS

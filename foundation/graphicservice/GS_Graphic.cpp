#include "foundation/graphicservice/GS_Graphic.h"

#include "foundation/graphicservice/GS_FileImage.h"
#include "foundation/graphicservice/GS_Format.h"

#include <atomic>
#include <exception>
#include <memory>

namespace MoxGraphicService_NS {
namespace {

constexpr std::int64_t megapixel = std::int64_t{1} << 20;
std::atomic<std::int64_t> pixelLimit = 256 * megapixel;

/// Returns: the raster image in `source`, null when there is none to be read.
std::unique_ptr<GS_RasterImage> openRaster(std::istream& source, GS_Input& input,
                                           const GS_Format* format, float resolution) {
    GS_ImageInfo info;
    if (!format || !format->readInfo(input, info)) {
        return nullptr;
    }
    return std::make_unique<GS_FileImage>(source, *format, info, resolution);
}

} // namespace

GS_Graphic::GS_Graphic(std::istream& source, float resolution) {
    GS_Input input(source);
    char bytes[formatHeadSize];
    const std::string_view head(bytes, input.read(bytes, formatHeadSize));
    try {
        raster = openRaster(source, input, findFormat(head), resolution).release();
    } catch (const std::exception&) { // no memory
        raster = nullptr;
    }
    isLoaded = raster || isVectorFile(head);
    input.seek(0);
}

GS_Graphic::~GS_Graphic() { delete raster; }

bool GS_Graphic::Loaded() const { return isLoaded; }

bool GS_Graphic::isRaster() const { return raster != nullptr; }

void GS_Graphic::setPixelLimit(std::int64_t pixels) {
    if (pixels >= 1) {
        pixelLimit = pixels;
    }
}

std::int64_t GS_Graphic::getPixelLimit() { return pixelLimit; }

} // namespace MoxGraphicService_NS

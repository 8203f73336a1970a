#include "foundation/graphicservice/GS_Graphic.h"

#include <atomic>

namespace MoxGraphicService_NS {
namespace {

constexpr std::int64_t megapixel = std::int64_t{1} << 20;
std::atomic<std::int64_t> pixelLimit = 256 * megapixel;

} // namespace

GS_Graphic::GS_Graphic(std::istream& /*source*/, float /*resolution*/) {}

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

/// A raster image that says what a test wants.
#pragma once

#include "foundation/graphicservice/GS_RasterImage.h"

namespace DrawmereTest {

using namespace MoxGraphicService_NS;

class FakeRaster : public GS_RasterImage {
public:
    explicit FakeRaster(int rasterKind, int width = 100, int height = 50)
        : GS_RasterImage(width, height), kind(rasterKind) {}

    int getRasterKind() override { return kind; }

    void writeToStream(std::ostream& /*target*/, IMAGE_CONVERT_TYPE /*type*/,
                       int /*quality*/) override {}

    void writeToFile(const char* /*path*/, IMAGE_CONVERT_TYPE /*type*/, int /*quality*/) override {}

    int getImageClass() override { return imageClass; }

    bool load() override { return true; }

    int kind;
    int imageClass = IMAGECLASS_DRAWING;
    bool isTransparent = false;

protected:
    bool findTransparency() const override { return isTransparent; }
};

} // namespace DrawmereTest

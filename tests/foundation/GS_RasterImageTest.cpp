#include "foundation/graphicservice/GS_RasterImage.h"

#include <gtest/gtest.h>

#include <ostream>

using namespace MoxGraphicService_NS;

namespace {

/// An image without a file.
class PlainImage : public GS_RasterImage {
public:
    PlainImage() : GS_RasterImage(100, 50) {}

    int getRasterKind() override { return 7; }

    void writeToStream(std::ostream&, IMAGE_CONVERT_TYPE, int) override {}

    void writeToFile(const char*, IMAGE_CONVERT_TYPE, int) override {}

    int getImageClass() override { return IMAGECLASS_DRAWING; }

    bool load() override { return true; }

protected:
    bool findTransparency() const override { return true; }
};

TEST(GS_RasterImage, DownsamplingNeverEnlargesAndLeavesAPixel) {
    PlainImage image;
    image.gl_setDownsample(200, 20, SAMPLINGTYPE_LINEAR);
    EXPECT_EQ(image.targetColumns, 100);
    EXPECT_EQ(image.targetRows, 20);
    image.gl_setDownsample(0, -3, SAMPLINGTYPE_LINEAR);
    EXPECT_EQ(image.targetColumns, 1);
    EXPECT_EQ(image.targetRows, 1);
    EXPECT_EQ(image.Columns(), 100);
    EXPECT_EQ(image.Rows(), 50);
}

TEST(GS_RasterImage, ResolutionIsKeptInPixelsAnInch) {
    PlainImage image;
    image.gl_setResolution(100, 50, RESOLUTIONUNIT_CENTIMETER);
    EXPECT_DOUBLE_EQ(image.xResolution, 254.0);
    EXPECT_DOUBLE_EQ(image.yResolution, 127.0);
    image.gl_setResolution(100, 50, static_cast<GS_ResolutionUnit>(9));
    EXPECT_DOUBLE_EQ(image.xResolution, 100.0);
    image.gl_setResolution(100, 0, RESOLUTIONUNIT_INCH);
    EXPECT_EQ(image.xResolution, 0.0);
}

TEST(GS_RasterImage, TransparencyIsAskedOfTheDerivedClass) {
    EXPECT_TRUE(PlainImage().hasTransparency());
    EXPECT_EQ(PlainImage().getFailure(), FAILURE_NONE);
}

} // namespace

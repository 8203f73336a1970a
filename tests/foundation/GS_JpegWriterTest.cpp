#include "foundation/graphicservice/GS_JpegWriter.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

GS_Bitmap readTower() { return decodeImage(readTestImage("tower_grayscale.jpg")).bitmap; }

TEST(GS_JpegWriter, TransparentPixelsLieOnWhite) {
    const GS_Bitmap bitmap =
        makeBitmap(8, 1, 4, {200, 0, 0, 255, 200, 0, 0, 255, 200, 0, 0, 255, 200, 0, 0, 255, //
                             0,   0, 0, 0,   0,   0, 0, 0,   0,   0, 0, 0,   0,   0, 0, 0});
    const DecodedImage image = decodeImage(writeImage(writeJpeg, bitmap, {.quality = 100}));
    ASSERT_TRUE(image.hasPixels);
    const std::vector<int> pixels = listPixels(image.bitmap);
    EXPECT_NEAR(pixels[21], 255, 8);
    EXPECT_NEAR(pixels[22], 255, 8);
    EXPECT_NEAR(pixels[0], 200, 8);
}

TEST(GS_JpegWriter, HalfTransparentGreyIsMixedWithWhite) {
    const GS_Bitmap bitmap = makeBitmap(1, 1, 2, {0, 128});
    const DecodedImage image = decodeImage(writeImage(writeJpeg, bitmap, {.quality = 100}));
    ASSERT_EQ(image.bitmap.channels, 1);
    EXPECT_NEAR(listPixels(image.bitmap)[0], 127, 2);
}

TEST(GS_JpegWriter, QualityDecidesTheSize) {
    const GS_Bitmap tower = readTower();
    const std::size_t low = writeImage(writeJpeg, tower, {.quality = 10}).size();
    const std::size_t middle = writeImage(writeJpeg, tower, {.quality = 60}).size();
    const std::size_t high = writeImage(writeJpeg, tower, {.quality = 95}).size();
    EXPECT_LT(low * 2, middle);
    EXPECT_LT(middle * 2, high);
}

TEST(GS_JpegWriter, StatesTheResolution) {
    const GS_Bitmap bitmap = makeBitmap(1, 1, 1, {7});
    const DecodedImage image =
        decodeImage(writeImage(writeJpeg, bitmap, {.xResolution = 300.0, .yResolution = 150.0}));
    EXPECT_DOUBLE_EQ(image.info.xResolution, 300.0);
    EXPECT_DOUBLE_EQ(image.info.yResolution, 150.0);
    EXPECT_EQ(decodeImage(writeImage(writeJpeg, bitmap, {})).info.xResolution, 0.0);
}

TEST(GS_JpegWriter, RefusingStreamIsAFailure) {
    std::ostringstream stream;
    stream.setstate(std::ios::badbit);
    GS_Output output(stream);
    EXPECT_FALSE(writeJpeg(makeBitmap(1, 1, 1, {7}), {}, output));
}

TEST(GS_JpegWriter, SideBeyondTheFormIsAFailure) {
    const GS_Bitmap bitmap = makeBitmap(70000, 1, 1, {});
    EXPECT_EQ(writeImage(writeJpeg, bitmap, {}), "");
}

} // namespace

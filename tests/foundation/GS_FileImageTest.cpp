#include "foundation/graphicservice/GS_FileImage.h"

#include "foundation/graphicservice/GS_PngWriter.h"
#include "tests/support/TempDir.h"
#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

/// A file that is open as an image.
struct OpenImage {
    explicit OpenImage(const std::string& bytes) : stream(bytes), graphic(stream, 72.0F) {}

    GS_RasterImage& raster() { return *graphic.raster; }

    std::string write(IMAGE_CONVERT_TYPE type, int quality = 90) {
        std::ostringstream target;
        raster().writeToStream(target, type, quality);
        return target.str();
    }

    std::istringstream stream;
    GS_Graphic graphic;
};

/// A PNG of red, green, blue in a row, with an orientation.
std::string makeTurned(std::uint32_t orientation) {
    const std::string file =
        writeImage(writePng, makeBitmap(3, 1, 3, {255, 0, 0, 0, 255, 0, 0, 0, 255}), {});
    const std::string exif = std::string("MM\0*", 4) + big(8, 4) + big(1, 2) + big(0x112, 2) +
                             big(3, 2) + big(1, 4) + big(orientation, 2) + big(0, 6);
    return insertPngChunk(file, pngChunk("eXIf", exif));
}

/// A JPEG whose structure is whole and whose pixels are not.
std::string makeBroken() {
    const std::string bytes = readTestImage("tower_grayscale.jpg");
    return bytes.substr(0, bytes.size() / 2) + bytesOf({0xFF, 0xD9});
}

TEST(GS_FileImage, TypeNamesTheTargetForm) {
    OpenImage image(readTestImage("restarts.jpg"));
    for (const IMAGE_CONVERT_TYPE type : {CONVERT_BMP_JPEG, CONVERT_GIF_JPEG, CONVERT_TIFF_JPEG,
                                          CONVERT_WEBP_JPEG, CONVERT_PNG_JPEG, CONVERT_JPEG_JPEG}) {
        EXPECT_EQ(image.write(type).substr(0, 2), "\xFF\xD8") << type;
    }
    for (const IMAGE_CONVERT_TYPE type :
         {CONVERT_BMP_PNG, CONVERT_GIF_PNG, CONVERT_TIFF_PNG, CONVERT_WEBP_PNG, CONVERT_PNG_PNG}) {
        EXPECT_EQ(image.write(type).substr(1, 3), "PNG") << type;
    }
    EXPECT_EQ(image.raster().getFailure(), FAILURE_NONE);
    EXPECT_EQ(image.write(static_cast<IMAGE_CONVERT_TYPE>(99)), "");
    EXPECT_EQ(image.raster().getFailure(), FAILURE_TARGET);
}

TEST(GS_FileImage, ConversionNumbersAreFixed) {
    const int numbers[] = {CONVERT_BMP_JPEG,  CONVERT_BMP_PNG,  CONVERT_GIF_JPEG,  CONVERT_GIF_PNG,
                           CONVERT_TIFF_JPEG, CONVERT_TIFF_PNG, CONVERT_WEBP_JPEG, CONVERT_WEBP_PNG,
                           CONVERT_PNG_JPEG,  CONVERT_PNG_PNG,  CONVERT_JPEG_JPEG};
    EXPECT_THAT(numbers, testing::ElementsAre(0, 1, 7, 8, 13, 14, 20, 21, 24, 25, 29));
}

TEST(GS_FileImage, SizeIsThatOfTheUprightImage) {
    OpenImage image(makeTurned(6));
    EXPECT_EQ(image.raster().Columns(), 1);
    EXPECT_EQ(image.raster().Rows(), 3);
    OpenImage mirrored(makeTurned(2));
    EXPECT_EQ(mirrored.raster().Columns(), 3);
}

TEST(GS_FileImage, OrientationIsWorkedIntoThePixels) {
    OpenImage image(makeTurned(8)); // a quarter counterclockwise
    const DecodedImage written = decodeImage(image.write(CONVERT_PNG_PNG));
    EXPECT_EQ(written.info.orientation, 1);
    EXPECT_EQ(written.bitmap.columns, 1);
    EXPECT_EQ(listPixels(written.bitmap), (std::vector<int>{0, 0, 255, 0, 255, 0, 255, 0, 0}));
}

TEST(GS_FileImage, DownsamplingMeansTheUprightSides) {
    OpenImage image(makeTurned(6));
    image.raster().gl_setDownsample(1, 2, SAMPLINGTYPE_AVERAGE);
    const DecodedImage written = decodeImage(image.write(CONVERT_PNG_PNG));
    EXPECT_EQ(written.bitmap.columns, 1);
    EXPECT_EQ(written.bitmap.rows, 2);
    EXPECT_EQ(image.raster().Rows(), 3);
}

TEST(GS_FileImage, SmallJpegIsDecodedSmall) {
    OpenImage image(readTestImage("tower_progressive.jpg"));
    image.raster().gl_setDownsample(100, 60, SAMPLINGTYPE_CUBIC);
    const DecodedImage written = decodeImage(image.write(CONVERT_JPEG_JPEG));
    EXPECT_EQ(written.bitmap.columns, 100);
    EXPECT_EQ(written.bitmap.rows, 60);
    // The small pixels are not taken for the whole ones.
    image.raster().gl_setDownsample(512, 512, SAMPLINGTYPE_CUBIC);
    EXPECT_EQ(sumPixels(decodeImage(image.write(CONVERT_PNG_PNG)).bitmap),
              sumPixels(decodeImage(readTestImage("tower_progressive.jpg")).bitmap));
}

TEST(GS_FileImage, ResolutionIsThatOfTheCallOrOfTheFileOrOfTheConstructor) {
    OpenImage stated(readTestImage("fax4.tiff"));
    EXPECT_NEAR(decodeImage(stated.write(CONVERT_TIFF_PNG)).info.xResolution, 182.88, 0.02);
    stated.raster().gl_setResolution(300, 200, RESOLUTIONUNIT_INCH);
    const GS_ImageInfo set = decodeImage(stated.write(CONVERT_TIFF_JPEG)).info;
    EXPECT_DOUBLE_EQ(set.xResolution, 300.0);
    EXPECT_DOUBLE_EQ(set.yResolution, 200.0);
    OpenImage unstated(readTestImage("mixed-disposal.gif"));
    EXPECT_NEAR(decodeImage(unstated.write(CONVERT_GIF_PNG)).info.xResolution, 72.0, 0.02);
    unstated.raster().gl_setResolution(0, 0, RESOLUTIONUNIT_INCH);
    EXPECT_EQ(decodeImage(unstated.write(CONVERT_GIF_PNG)).info.xResolution, 0.0);
}

TEST(GS_FileImage, QualityIsBroughtIntoItsBounds) {
    OpenImage image(readTestImage("tower_grayscale.jpg"));
    EXPECT_EQ(image.write(CONVERT_JPEG_JPEG, -5), image.write(CONVERT_JPEG_JPEG, 1));
    EXPECT_EQ(image.write(CONVERT_JPEG_JPEG, 900), image.write(CONVERT_JPEG_JPEG, 100));
}

TEST(GS_FileImage, TransparencyIsThatOfThePixels) {
    EXPECT_TRUE(OpenImage(readTestImage("alpha_gif_a.gif")).raster().hasTransparency());
    EXPECT_FALSE(OpenImage(readTestImage("interlaced.gif")).raster().hasTransparency());
    EXPECT_FALSE(OpenImage(readTestImage("restarts.jpg")).raster().hasTransparency());
    EXPECT_TRUE(OpenImage(readTestImage("basi6a16.png")).raster().hasTransparency());
    // A mask of alpha with nothing but opaque pixels.
    const std::string masks =
        little(0xFF0000, 4) + little(0xFF00, 4) + little(0xFF, 4) + little(0xFF000000, 4);
    const std::string opaque = makeBmp(1, 1, 32, 6, masks, bytesOf({3, 2, 1, 255}));
    EXPECT_FALSE(OpenImage(opaque).raster().hasTransparency());
}

TEST(GS_FileImage, DamageIsFoundWhenPixelsAreRead) {
    OpenImage image(makeBroken());
    ASSERT_TRUE(image.graphic.Loaded());
    EXPECT_EQ(image.raster().getFailure(), FAILURE_NONE);
    EXPECT_FALSE(image.raster().load());
    EXPECT_EQ(image.raster().getFailure(), FAILURE_SOURCE);
    EXPECT_EQ(image.raster().getImageClass(), IMAGECLASS_UNKNOWN);
    EXPECT_EQ(image.write(CONVERT_JPEG_JPEG), "");
}

TEST(GS_FileImage, FirstFailureIsKept) {
    OpenImage image(makeBroken());
    image.write(static_cast<IMAGE_CONVERT_TYPE>(99));
    EXPECT_EQ(image.raster().getFailure(), FAILURE_SOURCE);
}

TEST(GS_FileImage, WritesFilesAndReplacesThem) {
    const TempDir place;
    place.write("ä.png", std::string(5000, 'x'));
    OpenImage image(readTestImage("mixed-disposal.gif"));
    image.raster().writeToFile(place.path("ä.png").c_str(), CONVERT_GIF_PNG, 90);
    EXPECT_EQ(image.raster().getFailure(), FAILURE_NONE);
    EXPECT_EQ(sumPixels(decodeImage(place.read("ä.png")).bitmap),
              sumPixels(decodeImage(readTestImage("mixed-disposal.gif")).bitmap));
}

TEST(GS_FileImage, FailureLeavesNoFile) {
    const TempDir place;
    OpenImage broken(makeBroken());
    broken.raster().writeToFile(place.path("a.jpg").c_str(), CONVERT_JPEG_JPEG, 90);
    EXPECT_FALSE(place.has("a.jpg"));
    OpenImage good(readTestImage("restarts.jpg"));
    good.raster().writeToFile(place.path("b.jpg").c_str(), static_cast<IMAGE_CONVERT_TYPE>(99), 90);
    EXPECT_FALSE(place.has("b.jpg"));
    EXPECT_EQ(good.raster().getFailure(), FAILURE_TARGET);
}

TEST(GS_FileImage, DamagedSourceLeavesTheOldFile) {
    const TempDir place;
    place.write("a.jpg", "old");
    OpenImage broken(makeBroken());
    broken.raster().writeToFile(place.path("a.jpg").c_str(), CONVERT_JPEG_JPEG, 90);
    EXPECT_EQ(place.read("a.jpg"), "old");
}

TEST(GS_FileImage, TargetThatCantBeOpenedIsAFailure) {
    const TempDir place;
    OpenImage image(readTestImage("restarts.jpg"));
    image.raster().writeToFile(place.path("none/a.jpg").c_str(), CONVERT_JPEG_JPEG, 90);
    EXPECT_EQ(image.raster().getFailure(), FAILURE_TARGET);
    OpenImage other(readTestImage("restarts.jpg"));
    other.raster().writeToFile(nullptr, CONVERT_JPEG_JPEG, 90);
    EXPECT_EQ(other.raster().getFailure(), FAILURE_TARGET);
}

} // namespace

#include "foundation/graphicservice/GS_PngWriter.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

/// Pixels of many colours, some of them transparent.
GS_Bitmap makeMany(int channels) {
    GS_Bitmap bitmap;
    bitmap.allocate(40, 30, channels);
    std::uint32_t state = 1;
    for (std::size_t i = 0; i < bitmap.getRowSize() * 30; ++i) {
        state = state * 1664525 + 1013904223;
        bitmap.pixels[i] = static_cast<std::uint8_t>(state >> 24);
    }
    return bitmap;
}

/// Returns: depth and colour type in the header of a file.
std::pair<int, int> readForm(const std::string& file) { return {file[24], file[25]}; }

TEST(GS_PngWriter, PixelsComeBackInEveryForm) {
    for (int channels = 1; channels <= 4; ++channels) {
        const GS_Bitmap bitmap = makeMany(channels);
        const DecodedImage image = decodeImage(writeImage(writePng, bitmap, {}));
        ASSERT_TRUE(image.hasPixels);
        EXPECT_EQ(image.bitmap.channels, channels);
        EXPECT_EQ(sumPixels(image.bitmap), sumPixels(bitmap));
    }
}

TEST(GS_PngWriter, FewColorsBecomeAPalette) {
    const std::vector<int> pixels = {255, 0, 0, 0, 255, 0, 0, 0, 255};
    const std::string file = writeImage(writePng, makeBitmap(3, 1, 3, pixels), {});
    EXPECT_EQ(readForm(file), (std::pair<int, int>{2, 3}));
    EXPECT_EQ(listPixels(decodeImage(file).bitmap), pixels);
}

TEST(GS_PngWriter, PaletteHoldsAlphaToo) {
    const std::vector<int> pixels = {255, 0, 0, 255, 0, 255, 0, 0, 0, 0, 255, 100};
    const std::string file = writeImage(writePng, makeBitmap(3, 1, 4, pixels), {});
    EXPECT_EQ(readForm(file), (std::pair<int, int>{2, 3}));
    EXPECT_EQ(listPixels(decodeImage(file).bitmap), pixels);
}

TEST(GS_PngWriter, GreyTakesTheFewestBits) {
    struct Case {
        std::vector<int> greys;
        int depth;
    };

    for (const Case& row :
         {Case{{0, 255}, 1}, Case{{0, 85, 170, 255}, 2}, Case{{0, 17, 34}, 4}, Case{{0, 18}, 8}}) {
        const auto columns = static_cast<int>(row.greys.size());
        const std::string file = writeImage(writePng, makeBitmap(columns, 1, 1, row.greys), {});
        EXPECT_EQ(readForm(file), (std::pair<int, int>{row.depth, 0}));
        EXPECT_EQ(listPixels(decodeImage(file).bitmap), row.greys);
    }
}

TEST(GS_PngWriter, StatesTheResolution) {
    const std::string file = writeImage(writePng, makeBitmap(1, 1, 1, {7}),
                                        {.xResolution = 300.0, .yResolution = 150.0});
    EXPECT_NEAR(decodeImage(file).info.xResolution, 300.0, 0.02);
    EXPECT_NEAR(decodeImage(file).info.yResolution, 150.0, 0.02);
    EXPECT_EQ(decodeImage(writeImage(writePng, makeBitmap(1, 1, 1, {7}), {})).info.xResolution,
              0.0);
}

TEST(GS_PngWriter, ProfileIsKept) {
    const std::string profile = makeProfile("RGB ");
    GS_Bitmap bitmap = makeBitmap(1, 1, 3, {9, 9, 9});
    bitmap.profile.assign(profile.begin(), profile.end());
    const std::string file = writeImage(writePng, bitmap, {});
    EXPECT_EQ(decodeImage(file).bitmap.profile, bitmap.profile);
}

TEST(GS_PngWriter, RefusingStreamIsAFailure) {
    std::ostringstream stream;
    stream.setstate(std::ios::badbit);
    GS_Output output(stream);
    EXPECT_FALSE(writePng(makeBitmap(1, 1, 1, {7}), {}, output));
}

} // namespace

#include "foundation/graphicservice/GS_PngReader.h"

#include "foundation/graphicservice/GS_PngWriter.h"
#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

std::string writeGrey() { return writeImage(writePng, makeBitmap(2, 1, 1, {100, 200}), {}); }

TEST(GS_PngReader, OtherGammaIsBroughtToSrgb) {
    const std::string plain = writeGrey();
    EXPECT_EQ(listPixels(decodeImage(plain).bitmap), (std::vector<int>{100, 200}));
    const std::string usual = insertPngChunk(plain, pngChunk("gAMA", big(45455, 4)));
    EXPECT_EQ(listPixels(decodeImage(usual).bitmap), (std::vector<int>{100, 200}));
    const std::string linear = insertPngChunk(plain, pngChunk("gAMA", big(100000, 4)));
    const std::vector<int> brighter = listPixels(decodeImage(linear).bitmap);
    EXPECT_NEAR(brighter[0], 166, 1); // 255 * (100 / 255) ^ (1 / 2.2)
    EXPECT_NEAR(brighter[1], 228, 1);
    const std::string named = insertPngChunk(linear, pngChunk("sRGB", bytesOf({0})));
    EXPECT_EQ(listPixels(decodeImage(named).bitmap), (std::vector<int>{100, 200}));
}

TEST(GS_PngReader, DataThatEndEarlyAreAFailure) {
    std::string bytes = readTestImage("basi6a16.png");
    const std::size_t data = bytes.find("IDAT") - 4;
    const std::string cut = bytes.substr(0, data) + pngChunk("IDAT", bytes.substr(data + 8, 1000)) +
                            pngChunk("IEND", "");
    const DecodedImage image = decodeImage(cut);
    EXPECT_TRUE(image.hasInfo);
    EXPECT_FALSE(image.hasPixels);
}

TEST(GS_PngReader, DataThatAreNoneAreAFailure) {
    std::string bytes = writeGrey();
    const std::size_t data = bytes.find("IDAT") - 4;
    const std::string other =
        bytes.substr(0, data) + pngChunk("IDAT", "no Deflate data") + pngChunk("IEND", "");
    EXPECT_TRUE(decodeImage(other).hasInfo);
    EXPECT_FALSE(decodeImage(other).hasPixels);
}

TEST(GS_PngReader, BrokenChunkBesideThePixelsChangesNoPixel) {
    const std::string bytes = insertPngChunk(writeGrey(), pngChunk("iCCP", "x"));
    EXPECT_EQ(listPixels(decodeImage(bytes).bitmap), (std::vector<int>{100, 200}));
}

} // namespace

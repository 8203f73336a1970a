#include "foundation/graphicservice/GS_GifReader.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

/// A file with a screen of `columns` by `rows` and a palette of black, red, green, blue; behind it
/// `blocks`.
std::string makeGif(std::uint32_t columns, std::uint32_t rows, const std::string& blocks) {
    return "GIF89a" + little(columns, 2) + little(rows, 2) + bytesOf({0x91, 0, 0}) +
           bytesOf({0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255}) + blocks;
}

/// A picture of 2 by 1 pixels, red and green, at (left, top). The codes, of three bits, are: clear,
/// 1, 2, end.
std::string makePicture(std::uint32_t left, std::uint32_t top) {
    return "," + little(left, 2) + little(top, 2) + little(2, 2) + little(1, 2) + bytesOf({0}) +
           bytesOf({2, 2, 4 | 1 << 3 | (2 & 3) << 6, 5 << 1, 0});
}

std::string makeControl(int transparent) {
    return bytesOf({0x21, 0xF9, 4, 1, 0, 0, transparent, 0});
}

TEST(GS_GifReader, PictureThatFillsTheScreenIsOpaque) {
    const DecodedImage image = decodeImage(makeGif(2, 1, makePicture(0, 0) + ";"));
    EXPECT_FALSE(image.info.mayBeTransparent);
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{255, 0, 0, 0, 255, 0}));
}

TEST(GS_GifReader, ScreenIsTransparentAroundThePicture) {
    const DecodedImage image = decodeImage(makeGif(3, 2, makePicture(1, 1)));
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap),
              (std::vector<int>{0, 0, 0, 0, 0,   0, 0, 0,   0, 0,   0, 0, //
                                0, 0, 0, 0, 255, 0, 0, 255, 0, 255, 0, 255}));
}

TEST(GS_GifReader, PictureIsCutOffWhereTheScreenEnds) {
    const DecodedImage image = decodeImage(makeGif(2, 1, makePicture(1, 0)));
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{0, 0, 0, 0, 255, 0, 0, 255}));
    EXPECT_TRUE(decodeImage(makeGif(2, 1, makePicture(5, 5))).hasPixels);
}

TEST(GS_GifReader, ScreenWithoutASizeTakesThatOfThePicture) {
    const DecodedImage image = decodeImage(makeGif(0, 0, makePicture(0, 0)));
    EXPECT_EQ(image.info.columns, 2);
    EXPECT_EQ(image.info.rows, 1);
}

TEST(GS_GifReader, TransparentIndexIsTransparent) {
    const DecodedImage image = decodeImage(makeGif(2, 1, makeControl(2) + makePicture(0, 0)));
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{255, 0, 0, 255, 0, 0, 0, 0}));
}

TEST(GS_GifReader, SecondPictureIsNotLookedAt) {
    const DecodedImage image =
        decodeImage(makeGif(2, 1, makePicture(0, 0) + "any bytes, broken or not"));
    EXPECT_TRUE(image.hasPixels);
}

TEST(GS_GifReader, IndexBeyondThePaletteIsBlack) {
    std::string file = makeGif(2, 1, makePicture(0, 0));
    file[10] = static_cast<char>(0x90); // a palette of two
    file.erase(19, 6);
    const DecodedImage image = decodeImage(file);
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{255, 0, 0, 0, 0, 0}));
}

TEST(GS_GifReader, CutBeforeTheEndOfThePictureIsRefused) {
    const std::string file = makeGif(2, 1, makeControl(2) + makePicture(0, 0));
    for (std::size_t size = 0; size < file.size(); ++size) {
        EXPECT_FALSE(decodeImage(file.substr(0, size)).hasInfo) << size;
    }
    EXPECT_TRUE(decodeImage(file).hasPixels);
}

TEST(GS_GifReader, FileWithoutAPaletteOrAPictureIsRefused) {
    std::string file = makeGif(2, 1, makePicture(0, 0));
    file[10] = 0;
    file.erase(13, 12);
    EXPECT_FALSE(decodeImage(file).hasInfo);
    EXPECT_FALSE(decodeImage(makeGif(2, 1, ";")).hasInfo);
}

} // namespace

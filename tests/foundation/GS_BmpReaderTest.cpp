#include "foundation/graphicservice/GS_BmpReader.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

const std::string palette = bytesOf({0, 0, 0, 0, 30, 20, 10, 0}); // black, (10, 20, 30)

std::vector<int> read(const std::string& file) {
    const DecodedImage image = decodeImage(file);
    return image.hasPixels ? listPixels(image.bitmap) : std::vector<int>();
}

TEST(GS_BmpReader, RowsComeFromTheBottomOrFromTheTop) {
    const std::string rows = bytesOf({3, 2, 1, 0, 6, 5, 4, 0}); // a pixel each, padded
    EXPECT_EQ(read(makeBmp(1, 2, 24, 0, "", rows)), (std::vector<int>{4, 5, 6, 1, 2, 3}));
    EXPECT_EQ(read(makeBmp(1, -2, 24, 0, "", rows)), (std::vector<int>{1, 2, 3, 4, 5, 6}));
}

TEST(GS_BmpReader, IndicesOfEveryDepthAreLookedUp) {
    const std::vector<int> expected = {10, 20, 30, 0, 0, 0};
    EXPECT_EQ(read(makeBmp(2, 1, 1, 0, palette, bytesOf({0x80, 0, 0, 0}))), expected);
    EXPECT_EQ(read(makeBmp(2, 1, 4, 0, palette, bytesOf({0x10, 0, 0, 0}))), expected);
    EXPECT_EQ(read(makeBmp(2, 1, 8, 0, palette, bytesOf({1, 0, 0, 0}))), expected);
}

TEST(GS_BmpReader, IndexBeyondThePaletteIsBlack) {
    EXPECT_EQ(read(makeBmp(1, 1, 8, 0, palette, bytesOf({200, 0, 0, 0}))),
              (std::vector<int>{0, 0, 0}));
}

TEST(GS_BmpReader, SixteenBitsAreFiveEachWithoutMasks) {
    EXPECT_EQ(read(makeBmp(1, 1, 16, 0, "", little(0x7C1F, 2) + little(0, 2))),
              (std::vector<int>{255, 0, 255}));
}

TEST(GS_BmpReader, FourthByteWithoutAMaskIsNoAlpha) {
    EXPECT_EQ(read(makeBmp(1, 1, 32, 0, "", bytesOf({3, 2, 1, 0}))), (std::vector<int>{1, 2, 3}));
}

TEST(GS_BmpReader, MaskOfAlphaIsHeeded) {
    const std::string masks =
        little(0xFF0000, 4) + little(0xFF00, 4) + little(0xFF, 4) + little(0xFF000000, 4);
    EXPECT_EQ(read(makeBmp(1, 1, 32, 6, masks, bytesOf({3, 2, 1, 9}))),
              (std::vector<int>{1, 2, 3, 9}));
}

TEST(GS_BmpReader, HeaderOfOs2HasShortEntries) {
    const std::string file = "BM" + little(0, 8) + little(32, 4) + little(12, 4) + little(2, 2) +
                             little(1, 2) + little(1, 2) + little(1, 2) +
                             bytesOf({0, 0, 0, 30, 20, 10}) + bytesOf({0x80, 0, 0, 0});
    EXPECT_EQ(read(file), (std::vector<int>{10, 20, 30, 0, 0, 0}));
}

TEST(GS_BmpReader, ProfileOfTheLongestHeaderIsKept) {
    const std::string profile = makeProfile("RGB ");
    std::string head = little(124, 4) + little(1, 4) + little(1, 4) + little(1, 2) + little(24, 2);
    head.resize(124, '\0');
    head.replace(56, 4, little(0x4D424544, 4));
    head.replace(112, 4, little(128, 4)); // counted from the header
    head.replace(116, 4, little(testProfileSize, 4));
    const std::string file =
        "BM" + little(0, 8) + little(138, 4) + head + bytesOf({3, 2, 1, 0}) + profile;
    EXPECT_EQ(decodeImage(file).bitmap.profile.size(), profile.size());
}

} // namespace

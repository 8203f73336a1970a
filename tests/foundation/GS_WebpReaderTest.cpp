#include "foundation/graphicservice/GS_WebpReader.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

TEST(GS_WebpReader, CutAtAnyByteIsRefused) {
    const std::string bytes = readTestImage("test.webp");
    for (std::size_t size = 0; size < bytes.size(); size += size < 100 ? 1 : 97) {
        EXPECT_FALSE(decodeImage(bytes.substr(0, size)).hasInfo) << size;
    }
    EXPECT_TRUE(decodeImage(bytes + "what follows is not read").hasPixels);
}

TEST(GS_WebpReader, ChunkLongerThanTheFileIsRefused) {
    std::string bytes = readTestImage("test.webp");
    bytes.replace(16, 4, little(0xFFFFFFFF, 4));
    EXPECT_FALSE(decodeImage(bytes).hasInfo);
}

TEST(GS_WebpReader, FirstFrameOfAnAnimationStandsForIt) {
    const DecodedImage image = decodeImage(readTestImage("anim.webp"));
    EXPECT_TRUE(image.info.mayBeTransparent);
    ASSERT_TRUE(image.hasPixels);
    EXPECT_TRUE(image.bitmap.isTransparent());
}

/// Returns: test.webp in the extended form, with `chunks` behind the pixels.
std::string extend(int flags, const std::string& chunks) {
    const std::string pixels = readTestImage("test.webp").substr(12);
    const std::string body = "WEBPVP8X" + little(10, 4) + bytesOf({flags, 0, 0, 0}) +
                             little(127, 3) + little(127, 3) + pixels + chunks;
    return "RIFF" + little(static_cast<std::uint32_t>(body.size()), 4) + body;
}

std::string exif(const std::string& prefix) {
    const std::string body = prefix + std::string("II*\0\x08\0\0\0\x01\0", 10) + little(0x112, 2) +
                             little(3, 2) + little(1, 4) + little(8, 4) + little(0, 4);
    return "EXIF" + little(static_cast<std::uint32_t>(body.size()), 4) + body;
}

TEST(GS_WebpReader, OrientationComesFromItsExifChunk) {
    EXPECT_EQ(decodeImage(extend(8, exif(""))).info.orientation, 8);
    EXPECT_EQ(decodeImage(extend(8, exif(std::string("Exif\0\0", 6)))).info.orientation, 8);
    EXPECT_EQ(decodeImage(extend(0, "")).info.orientation, 1);
    EXPECT_TRUE(decodeImage(extend(8, exif(""))).hasPixels);
}

TEST(GS_WebpReader, ProfileOfTheColorsIsKept) {
    const std::string pixels = readTestImage("test.webp").substr(12);
    const std::string body = "WEBPVP8X" + little(10, 4) + bytesOf({0x20, 0, 0, 0}) +
                             little(127, 3) + little(127, 3) + "ICCP" + little(testProfileSize, 4) +
                             makeProfile("RGB ") + pixels;
    const std::string file = "RIFF" + little(static_cast<std::uint32_t>(body.size()), 4) + body;
    EXPECT_EQ(decodeImage(file).bitmap.profile.size(), testProfileSize);
}

} // namespace

#include "foundation/graphicservice/GS_PngStructure.h"

#include "foundation/graphicservice/GS_Graphic.h"
#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

const std::string signature = "\x89PNG\r\n\x1A\n";

std::string header(std::uint32_t columns, std::uint32_t rows, int depth, int type) {
    return pngChunk("IHDR", big(columns, 4) + big(rows, 4) + bytesOf({depth, type, 0, 0, 0}));
}

const std::string data = pngChunk("IDAT", "not looked into");
const std::string end = pngChunk("IEND", "");
const std::string palette = pngChunk("PLTE", "RGBrgb");

bool isRead(const std::string& chunks, GS_ImageInfo& info) {
    std::istringstream stream(signature + chunks);
    GS_Input input(stream);
    return readPngInfo(input, info);
}

bool isRead(const std::string& chunks) {
    GS_ImageInfo info;
    return isRead(chunks, info);
}

TEST(GS_PngStructure, ChunksAreFollowedToTheEnd) {
    GS_ImageInfo info;
    EXPECT_TRUE(isRead(header(3, 2, 8, 2) + data + end, info));
    EXPECT_EQ(info.columns, 3);
    EXPECT_EQ(info.rows, 2);
    EXPECT_FALSE(info.mayBeTransparent);
    EXPECT_TRUE(isRead(header(3, 2, 8, 2) + data + data + end + "what follows is not read"));
}

TEST(GS_PngStructure, CutAtAnyByteIsABreak) {
    const std::string chunks =
        header(3, 2, 8, 3) + pngChunk("tEXt", "a") + palette + data + data + end;
    for (std::size_t size = 0; size < chunks.size(); ++size) {
        EXPECT_FALSE(isRead(chunks.substr(0, size))) << size;
    }
    EXPECT_TRUE(isRead(chunks));
}

TEST(GS_PngStructure, FalseChecksumOfAnyChunkThatCountsIsABreak) {
    const std::string chunks = header(3, 2, 8, 3) + palette + data + end;
    for (std::size_t i = 0; i < chunks.size(); ++i) {
        std::string changed = chunks;
        changed[i] = static_cast<char>(changed[i] ^ 1);
        EXPECT_FALSE(isRead(changed)) << i;
    }
}

TEST(GS_PngStructure, FalseChecksumOfAnotherChunkDropsTheChunkAlone) {
    std::string resolution = pngChunk("pHYs", big(3937, 4) + big(3937, 4) + bytesOf({1}));
    GS_ImageInfo info;
    EXPECT_TRUE(isRead(header(3, 2, 8, 2) + resolution + data + end, info));
    EXPECT_NEAR(info.xResolution, 100.0, 0.01);
    resolution.back() = static_cast<char>(resolution.back() ^ 1);
    GS_ImageInfo other;
    EXPECT_TRUE(isRead(header(3, 2, 8, 2) + resolution + data + end, other));
    EXPECT_EQ(other.xResolution, 0.0);
}

TEST(GS_PngStructure, ChunksOutOfPlaceAreABreak) {
    const std::string head = header(3, 2, 8, 2);
    EXPECT_FALSE(isRead(data + end));
    EXPECT_FALSE(isRead(head + head + data + end));
    EXPECT_FALSE(isRead(head + end));
    EXPECT_FALSE(isRead(head + data + pngChunk("tEXt", "a") + data + end));
    EXPECT_FALSE(isRead(head + data + palette + end));
    EXPECT_FALSE(isRead(head + palette + palette + data + end));
    EXPECT_FALSE(isRead(header(3, 2, 8, 3) + data + end)); // no palette
    EXPECT_FALSE(isRead(header(3, 2, 8, 0) + palette + data + end));
    EXPECT_FALSE(isRead(head + pngChunk("PLTE", "RG") + data + end));
    EXPECT_FALSE(isRead(head + pngChunk("PLTE", std::string(771, 'x')) + data + end));
    EXPECT_FALSE(isRead(head + data + pngChunk("IEND", "x")));
    EXPECT_FALSE(isRead(head + pngChunk("ABCD", "") + data + end)); // must be known
    EXPECT_TRUE(isRead(head + pngChunk("aBCD", "") + data + end));
    EXPECT_FALSE(isRead(head + pngChunk("1234", "") + data + end));
}

TEST(GS_PngStructure, DepthsAreThoseOfTheColorType) {
    for (int type = 0; type < 8; ++type) {
        for (const int depth : {0, 1, 2, 3, 4, 8, 16, 32}) {
            const bool isKnown =
                type == 0   ? depth == 1 || depth == 2 || depth == 4 || depth == 8 || depth == 16
                : type == 3 ? depth == 1 || depth == 2 || depth == 4 || depth == 8
                            : (type == 2 || type == 4 || type == 6) && (depth == 8 || depth == 16);
            const std::string colors = (type & 2) != 0 ? palette : std::string();
            EXPECT_EQ(isRead(header(3, 2, depth, type) + colors + data + end), isKnown)
                << type << " " << depth;
        }
    }
}

TEST(GS_PngStructure, UnknownMethodsAreABreak) {
    for (int i = 0; i < 3; ++i) {
        int methods[] = {0, 0, 0};
        methods[i] = 2;
        const std::string body =
            big(3, 4) + big(2, 4) + bytesOf({8, 2, methods[0], methods[1], methods[2]});
        EXPECT_FALSE(isRead(pngChunk("IHDR", body) + data + end)) << i;
    }
}

TEST(GS_PngStructure, LengthBeyondTheFileIsABreakBeforeItIsRead) {
    EXPECT_FALSE(isRead(header(3, 2, 8, 2) + big(0x7FFFFFFF, 4) + "IDATabc"));
    EXPECT_FALSE(isRead(header(3, 2, 8, 2) + big(0x80000000, 4) + "IDATabc"));
}

TEST(GS_PngStructure, MorePixelsThanTheDataCanHoldAreALie) {
    EXPECT_TRUE(isRead(header(100, 100, 8, 0) + data + end));
    EXPECT_FALSE(isRead(header(10000, 10000, 8, 0) + data + end));
    EXPECT_FALSE(isRead(header(0, 2, 8, 0) + data + end));
    EXPECT_FALSE(isRead(header(2, 0, 8, 0) + data + end));
    EXPECT_FALSE(isRead(header(0x7FFFFFFF, 0x7FFFFFFF, 8, 0) + data + end));
}

TEST(GS_PngStructure, TransparencyIsToldByTheHeader) {
    GS_ImageInfo info;
    EXPECT_TRUE(isRead(header(3, 2, 8, 4) + data + end, info));
    EXPECT_TRUE(info.mayBeTransparent);
    GS_ImageInfo keyed;
    EXPECT_TRUE(isRead(header(3, 2, 8, 0) + pngChunk("tRNS", big(5, 2)) + data + end, keyed));
    EXPECT_TRUE(keyed.mayBeTransparent);
}

TEST(GS_PngStructure, OrientationComesFromItsExifChunk) {
    const DecodedImage image = decodeImage(readTestImage("F-exif-chunk-early.png"));
    EXPECT_EQ(image.info.orientation, 6);
}

} // namespace

#include "foundation/graphicservice/GS_JpegStructure.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

std::string segment(int marker, const std::string& body) {
    return bytesOf({0xFF, marker}) + big(static_cast<std::uint32_t>(body.size() + 2), 2) + body;
}

std::string frame(std::uint32_t columns, std::uint32_t rows, int marker = 0xC0) {
    return segment(marker,
                   bytesOf({8}) + big(rows, 2) + big(columns, 2) + bytesOf({1, 1, 0x11, 0}));
}

const std::string start = bytesOf({0xFF, 0xD8});
const std::string scan = segment(0xDA, bytesOf({1, 1, 0, 0, 63, 0})) + "data";
const std::string end = bytesOf({0xFF, 0xD9});

bool isRead(const std::string& bytes, GS_ImageInfo& info) {
    std::istringstream stream(bytes);
    GS_Input input(stream);
    return readJpegInfo(input, info);
}

bool isRead(const std::string& bytes) {
    GS_ImageInfo info;
    return isRead(bytes, info);
}

TEST(GS_JpegStructure, MarkersAreFollowedToTheEnd) {
    GS_ImageInfo info;
    EXPECT_TRUE(isRead(start + frame(7, 5) + scan + end, info));
    EXPECT_EQ(info.columns, 7);
    EXPECT_EQ(info.rows, 5);
    EXPECT_TRUE(isRead(start + frame(7, 5) + scan + end + "what follows is not read"));
}

TEST(GS_JpegStructure, CutAtAnyByteIsABreak) {
    const std::string bytes = readTestImage("restarts.jpg");
    for (std::size_t size = 0; size < bytes.size(); ++size) {
        EXPECT_FALSE(isRead(bytes.substr(0, size))) << size;
    }
    EXPECT_TRUE(isRead(bytes));
}

TEST(GS_JpegStructure, StuffedBytesRestartsAndFillBytesBelongToTheScan) {
    const std::string inside = bytesOf({1, 0xFF, 0, 2, 0xFF, 0xD0, 3, 0xFF, 0xFF, 0xD7, 4});
    EXPECT_TRUE(isRead(start + frame(7, 5) + scan + inside + bytesOf({0xFF}) + end));
    EXPECT_TRUE(isRead(start + bytesOf({0xFF, 0xFF}) + frame(7, 5) + scan + end));
}

TEST(GS_JpegStructure, SegmentsOutOfPlaceAreABreak) {
    EXPECT_FALSE(isRead(start + end));
    EXPECT_FALSE(isRead(start + frame(7, 5) + end));
    EXPECT_FALSE(isRead(start + scan + frame(7, 5) + end));
    EXPECT_FALSE(isRead(start + frame(7, 5) + frame(7, 5) + scan + end));
    EXPECT_FALSE(isRead(start + "x" + frame(7, 5) + scan + end));
    EXPECT_FALSE(isRead(start + frame(7, 5) + scan + start + end));
    EXPECT_FALSE(isRead(start + bytesOf({0xFF, 0xE1, 0, 1}) + frame(7, 5) + scan + end));
}

TEST(GS_JpegStructure, ProcessesThatAreNotDecodedAreABreak) {
    for (int marker = 0xC0; marker <= 0xCF; ++marker) {
        const bool isKnown = marker <= 0xC2 || marker == 0xC9 || marker == 0xCA;
        EXPECT_EQ(isRead(start + frame(7, 5, marker) + scan + end), isKnown) << marker;
    }
    const std::string deep =
        segment(0xC1, bytesOf({12}) + big(5, 2) + big(7, 2) + bytesOf({1, 1, 0x11, 0}));
    EXPECT_FALSE(isRead(start + deep + scan + end));
    const std::string two = segment(0xC0, bytesOf({8, 0, 5, 0, 7, 2, 1, 0x11, 0, 2, 0x11, 0}));
    EXPECT_FALSE(isRead(start + two + scan + end));
    const std::string unsampled = segment(0xC0, bytesOf({8, 0, 5, 0, 7, 1, 1, 0x01, 0}));
    EXPECT_FALSE(isRead(start + unsampled + scan + end));
    EXPECT_FALSE(isRead(start + frame(7, 5) + scan + segment(0xDC, big(5, 2)) + end));
}

TEST(GS_JpegStructure, MorePixelsThanTheDataCanHoldAreALie) {
    EXPECT_FALSE(isRead(start + frame(7, 0) + scan + end));
    EXPECT_FALSE(isRead(start + frame(0, 5) + scan + end));
    EXPECT_TRUE(isRead(start + frame(48, 48) + scan + end));
    EXPECT_FALSE(isRead(start + frame(480, 480) + scan + end));
}

TEST(GS_JpegStructure, ScansHaveAnEnd) {
    std::string bytes = start + frame(7, 5, 0xC2);
    for (int i = 0; i < 100; ++i) {
        bytes += scan;
    }
    EXPECT_TRUE(isRead(bytes + end));
    EXPECT_FALSE(isRead(bytes + scan + end));
}

TEST(GS_JpegStructure, DensityAndOrientationAreRead) {
    GS_ImageInfo info;
    const std::string density =
        segment(0xE0, std::string("JFIF\0", 5) + bytesOf({1, 2, 2, 0, 100, 0, 50, 0, 0}));
    EXPECT_TRUE(isRead(start + density + frame(7, 5) + scan + end, info));
    EXPECT_DOUBLE_EQ(info.xResolution, 254.0);
    EXPECT_DOUBLE_EQ(info.yResolution, 127.0);
    EXPECT_EQ(info.orientation, 1);
    EXPECT_EQ(decodeImage(readTestImage("portrait_2.jpg")).info.orientation, 2);
}

} // namespace

#include "foundation/graphicservice/GS_BmpHeader.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

bool isRead(const std::string& bytes, GS_BmpHeader& header) {
    std::istringstream stream(bytes);
    GS_Input input(stream);
    return readBmpHeader(input, header);
}

bool isRead(const std::string& bytes) {
    GS_BmpHeader header;
    return isRead(bytes, header);
}

const std::string row = std::string(8, 'x'); // two pixels of 24 bits, padded

TEST(GS_BmpHeader, FactsAreRead) {
    GS_BmpHeader header;
    EXPECT_TRUE(isRead(makeBmp(2, 1, 24, 0, "", row), header));
    EXPECT_EQ(header.info.columns, 2);
    EXPECT_EQ(header.info.rows, 1);
    EXPECT_EQ(header.depth, 24);
    EXPECT_FALSE(header.isTopDown);
    EXPECT_NEAR(header.info.xResolution, 100.0, 0.01);
    EXPECT_TRUE(isRead(makeBmp(2, -1, 24, 0, "", row), header));
    EXPECT_TRUE(header.isTopDown);
    EXPECT_EQ(header.info.rows, 1);
}

TEST(GS_BmpHeader, FileShorterThanItsRowsIsRefused) {
    const std::string file = makeBmp(2, 1, 24, 0, "", row);
    for (std::size_t size = 0; size < file.size(); ++size) {
        EXPECT_FALSE(isRead(file.substr(0, size))) << size;
    }
    EXPECT_FALSE(isRead(makeBmp(2, 2, 24, 0, "", row)));
    EXPECT_FALSE(isRead(makeBmp(0x7FFFFFFF, 1, 24, 0, "", row)));
    EXPECT_FALSE(isRead(makeBmp(2, -0x7FFFFFFF - 1, 24, 0, "", row)));
    EXPECT_FALSE(isRead(makeBmp(0, 1, 24, 0, "", row)));
}

TEST(GS_BmpHeader, CompressionsGoWithTheirDepths) {
    for (int compression = 0; compression <= 6; ++compression) {
        for (const int depth : {0, 1, 2, 4, 8, 16, 24, 32, 64}) {
            const bool isKnown = compression == 0   ? depth != 0 && depth != 2 && depth != 64
                                 : compression == 1 ? depth == 8
                                 : compression == 2 ? depth == 4
                                                    : (compression == 3 || compression == 6) &&
                                                          (depth == 16 || depth == 32);
            const std::string masks =
                little(0x1F, 4) + little(0x3E0, 4) + little(0x7C00, 4) + little(0, 4);
            EXPECT_EQ(isRead(makeBmp(2, 1, depth, compression, masks, row)), isKnown)
                << compression << " " << depth;
        }
    }
    EXPECT_FALSE(isRead(makeBmp(2, -1, 8, 1, little(0, 4), row))); // runs come from the bottom
}

TEST(GS_BmpHeader, MasksAreChecked) {
    const auto withMasks = [](std::uint32_t red, std::uint32_t green, std::uint32_t blue) {
        return makeBmp(2, 1, 16, 3, little(red, 4) + little(green, 4) + little(blue, 4), row);
    };
    EXPECT_TRUE(isRead(withMasks(0xF800, 0x07E0, 0x001F)));
    EXPECT_FALSE(isRead(withMasks(0, 0x07E0, 0x001F)));
    EXPECT_FALSE(isRead(withMasks(0xF801, 0x07E0, 0x001F)));  // two rows of bits
    EXPECT_FALSE(isRead(withMasks(0xFF80, 0x07E0, 0x001F)));  // nine bits
    EXPECT_FALSE(isRead(withMasks(0x10000, 0x07E0, 0x001F))); // outside the pixel
}

TEST(GS_BmpHeader, PaletteIsFilledUpWithBlack) {
    GS_BmpHeader header;
    EXPECT_TRUE(isRead(makeBmp(2, 1, 4, 0, bytesOf({1, 2, 3, 77}), row), header));
    ASSERT_EQ(header.palette.size(), 64U);
    EXPECT_EQ(header.palette[2], 3);
    EXPECT_EQ(header.palette[3], 0);
    EXPECT_EQ(header.palette[4], 0);
}

TEST(GS_BmpHeader, UnknownHeadersAreRefused) {
    std::string file = makeBmp(2, 1, 24, 0, "", row);
    file[14] = 41;
    EXPECT_FALSE(isRead(file));
    std::string planes = makeBmp(2, 1, 24, 0, "", row);
    planes[26] = 2;
    EXPECT_FALSE(isRead(planes));
    std::string inside = makeBmp(2, 1, 24, 0, "", row + row);
    inside[10] = 53; // pixels inside the header
    EXPECT_FALSE(isRead(inside));
}

} // namespace

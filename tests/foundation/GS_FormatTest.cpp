#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

/// What a file of the collection decodes to. The sums were taken from pixels that another program
/// decodes to the same values, up to rounding where a file states a gamma or has 16 bits.
struct KnownImage {
    const char* name;
    int columns;
    int rows;
    int channels;
    std::uint32_t sum;
};

constexpr KnownImage knownImages[] = {
    {"BigTIFF.tif", 64, 64, 3, 0xF2E0F767},
    {"Core_1_Bit.bmp", 435, 353, 3, 0xA38B54E9},
    {"F-exif-chunk-early.png", 400, 400, 3, 0xF3239AB1},
    {"Transparency-lzw.tif", 300, 300, 4, 0x8342C20C},
    {"alpha_gif_a.gif", 256, 256, 4, 0xE6C86941},
    {"anim.webp", 200, 200, 4, 0x0FEBA017},
    {"basi6a16.png", 32, 32, 4, 0xE7BA5B06},
    {"basn0g01.png", 32, 32, 1, 0x7238C005},
    {"basn3p04.png", 32, 32, 3, 0x0EDCBF45},
    {"cmyk-4c-8b.tiff", 157, 151, 4, 0xB653E1E1},
    {"fax4.tiff", 460, 307, 1, 0xABA6A268},
    {"interlaced.gif", 540, 330, 3, 0x65DB6EF2},
    {"jpg-cmyk-2.jpg", 256, 256, 3, 0x330994F2},
    {"lossless1.webp", 1000, 307, 4, 0x22EA12A7},
    {"mixed-disposal.gif", 32, 32, 4, 0xACE8CCCC},
    {"pal4rle.bmp", 127, 64, 3, 0x288E4371},
    {"palette-1c-4b.tiff", 157, 151, 3, 0xE40EFE9A},
    {"portrait_2.jpg", 113, 150, 3, 0xB44BEA3C},
    {"restarts.jpg", 33, 33, 3, 0xEFCF0018},
    {"rgb16-565.bmp", 127, 64, 3, 0xD7AA2928},
    {"rgba32.bmp", 127, 64, 4, 0xE041B498},
    {"seq-1c-8b-multipage-adeefdcc.tiff", 16, 16, 1, 0x29058C73},
    {"tbrn2c08.png", 32, 32, 4, 0xA789AFC6},
    {"test.webp", 128, 128, 3, 0x89F0476D},
    {"tiled-jpeg-ycbcr.tif", 374, 499, 3, 0x1BD7638D},
    {"tower_grayscale.jpg", 512, 512, 1, 0x733C8431},
    {"tower_progressive.jpg", 512, 512, 3, 0x64FDC880},
    {"tp1n3p08.png", 32, 32, 4, 0xFCD786E2},
};

TEST(GS_Format, FilesOfTheCollectionDecodeToKnownPixels) {
    for (const KnownImage& known : knownImages) {
        SCOPED_TRACE(known.name);
        const DecodedImage image = decodeImage(readTestImage(known.name));
        ASSERT_TRUE(image.hasPixels);
        EXPECT_EQ(image.bitmap.columns, known.columns);
        EXPECT_EQ(image.bitmap.rows, known.rows);
        EXPECT_EQ(image.bitmap.channels, known.channels);
        EXPECT_EQ(sumPixels(image.bitmap), known.sum);
    }
}

TEST(GS_Format, DamagedFilesOfTheCollectionAreRefused) {
    for (const char* name : {"Bad_shortfile.bmp", "colormap-shl-overflow.tiff", "max_size.jpg",
                             "x_unexpected_eof.png", "xcsn0g01.png"}) {
        EXPECT_FALSE(decodeImage(readTestImage(name)).hasInfo) << name;
    }
    const DecodedImage gif = decodeImage(readTestImage("issue-117-out-of-range.gif"));
    EXPECT_TRUE(gif.hasInfo);
    EXPECT_FALSE(gif.hasPixels);
}

struct KnownHead {
    std::string head;
    int kind; // -1 for none
};

TEST(GS_Format, FormIsToldByTheFirstBytes) {
    const KnownHead heads[] = {
        {"\x89PNG\r\n\x1A\n", 0},
        {"\x89PNG\r\n\x1A", -1},
        {"\xFF\xD8\xFF\xE0", 1},
        {"\xFF\xD8", -1},
        {"GIF87a", 2},
        {"GIF89a", 2},
        {"GIF88a", -1},
        {std::string("II*\0", 4), 3},
        {std::string("MM\0*", 4), 3},
        {std::string("II+\0", 4), 3},
        {std::string("MM\0+", 4), 3},
        {"BM" + std::string(12, 'x') + little(40, 4), 4},
        {"BM" + std::string(16, 'x'), -1},
        {"BMP is a form of images", -1},
        {"RIFF1234WEBPVP8 ", 5},
        {"RIFF1234WAVE", -1},
        {"", -1},
    };
    for (const KnownHead& known : heads) {
        const GS_Format* format = findFormat(known.head);
        EXPECT_EQ(format ? format->kind : -1, known.kind) << known.head;
    }
}

TEST(GS_Format, ImagesThatAreNotMadeOfPixelsAreKnown) {
    EXPECT_TRUE(isVectorFile("<svg xmlns='http://www.w3.org/2000/svg'/>"));
    EXPECT_TRUE(isVectorFile("\xEF\xBB\xBF \n<?xml version='1.0'?><!-- a --><svg>"));
    EXPECT_TRUE(isVectorFile("%PDF-1.7"));
    EXPECT_TRUE(isVectorFile("%!PS-Adobe-3.0 EPSF-3.0"));
    EXPECT_TRUE(isVectorFile(bytesOf({0xC5, 0xD0, 0xD3, 0xC6})));
    EXPECT_TRUE(isVectorFile(little(1, 4) + std::string(36, 'x') + " EMF"));
    EXPECT_TRUE(isVectorFile(bytesOf({0xD7, 0xCD, 0xC6, 0x9A})));
    EXPECT_TRUE(isVectorFile(bytesOf({1, 0, 9, 0, 0, 3})));
    EXPECT_FALSE(isVectorFile("<html><body/></html>"));
    EXPECT_FALSE(isVectorFile("text about <svg"));
    EXPECT_FALSE(isVectorFile(""));
}

} // namespace

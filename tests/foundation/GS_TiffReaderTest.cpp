#include "foundation/graphicservice/GS_TiffReader.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

struct Tag {
    std::uint32_t number;
    std::uint32_t value;
};

/// A file of 2 by 1 pixels with `pixels` in one strip; each tag is of one short value and stands
/// for the usual one. A profile lies behind the pixels.
std::string makeTiff(const std::string& pixels, std::vector<Tag> tags,
                     const std::string& profile = std::string()) {
    constexpr std::uint32_t pixelOffset = 8;
    const auto size = static_cast<std::uint32_t>(pixels.size());
    for (const Tag& usual : {Tag{256, 2}, Tag{257, 1}, Tag{259, 1}, Tag{273, pixelOffset},
                             Tag{278, 1}, Tag{279, size}}) {
        if (std::ranges::find(tags, usual.number, &Tag::number) == tags.end()) {
            tags.push_back(usual);
        }
    }
    std::ranges::sort(tags, {}, &Tag::number);
    const auto directory = pixelOffset + size + static_cast<std::uint32_t>(profile.size());
    const std::uint32_t count = static_cast<std::uint32_t>(tags.size()) + (profile.empty() ? 0 : 1);
    std::string file =
        std::string("II*\0", 4) + little(directory, 4) + pixels + profile + little(count, 2);
    for (const Tag& tag : tags) {
        file += little(tag.number, 2) + little(3, 2) + little(1, 4) + little(tag.value, 4);
    }
    if (!profile.empty()) {
        file += little(34675, 2) + little(7, 2) +
                little(static_cast<std::uint32_t>(profile.size()), 4) +
                little(pixelOffset + size, 4);
    }
    return file + little(0, 4);
}

// Tags: 259 compression, 258 bits of a sample, 262 colours, 274 orientation, 277 samples, 338
// further samples.

const std::vector<Tag> grey = {{258, 8}, {262, 1}, {277, 1}};

TEST(GS_TiffReader, GreyStaysGrey) {
    const DecodedImage image = decodeImage(makeTiff(bytesOf({10, 200}), grey));
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(image.bitmap.channels, 1);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{10, 200}));
}

TEST(GS_TiffReader, DeflateIsDecoded) {
    const std::string stored = bytesOf({0x78, 1, 1, 2, 0, 0xFD, 0xFF, 10, 200, 0, 0xDE, 0, 0xD3});
    std::vector<Tag> tags = grey;
    tags.push_back({259, 8});
    EXPECT_EQ(listPixels(decodeImage(makeTiff(stored, tags)).bitmap), (std::vector<int>{10, 200}));
    EXPECT_FALSE(decodeImage(makeTiff(stored.substr(0, 7), tags)).hasPixels);
}

TEST(GS_TiffReader, WhiteMayBeZero) {
    const DecodedImage image =
        decodeImage(makeTiff(bytesOf({10, 200}), {{258, 8}, {262, 0}, {277, 1}}));
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{245, 55}));
}

const std::string alphaPixels = bytesOf({200, 100, 40, 128, 9, 9, 9, 0});

std::vector<Tag> withFurtherSample(std::uint32_t kind) {
    return {{258, 8}, {262, 2}, {277, 4}, {338, kind}};
}

TEST(GS_TiffReader, AlphaThatIsApartKeepsAllDigits) {
    const DecodedImage image = decodeImage(makeTiff(alphaPixels, withFurtherSample(2)));
    EXPECT_TRUE(image.info.mayBeTransparent);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{200, 100, 40, 128, 9, 9, 9, 0}));
}

TEST(GS_TiffReader, AlphaThatIsMultipliedInIsTakenOut) {
    const std::string pixels = bytesOf({100, 50, 20, 128, 0, 0, 0, 0});
    const DecodedImage image = decodeImage(makeTiff(pixels, withFurtherSample(1)));
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{199, 100, 40, 128, 0, 0, 0, 0}));
}

// On purpose: a further sample of no stated meaning is no alpha.
TEST(GS_TiffReader, FurtherSampleOfNoStatedMeaningIsNoAlpha) {
    const DecodedImage image = decodeImage(makeTiff(alphaPixels, withFurtherSample(0)));
    EXPECT_FALSE(image.info.mayBeTransparent);
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(image.bitmap.channels, 3);
}

TEST(GS_TiffReader, InksAreMixedAndMayHaveAlpha) {
    const std::string inks = bytesOf({255, 0, 0, 0, 77, 0, 0, 0, 128, 255});
    const std::vector<Tag> tags = {{258, 8}, {262, 5}, {277, 5}, {338, 2}};
    const DecodedImage image = decodeImage(makeTiff(inks, tags));
    ASSERT_TRUE(image.hasPixels);
    EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{0, 255, 255, 77, 127, 127, 127, 255}));
}

TEST(GS_TiffReader, OrientationIsToldAndNotApplied) {
    for (std::uint32_t orientation = 1; orientation <= 8; ++orientation) {
        std::vector<Tag> tags = grey;
        tags.push_back({274, orientation});
        const DecodedImage image = decodeImage(makeTiff(bytesOf({10, 200}), tags));
        EXPECT_EQ(image.info.orientation, static_cast<int>(orientation));
        EXPECT_EQ(listPixels(image.bitmap), (std::vector<int>{10, 200}));
    }
}

TEST(GS_TiffReader, ProfileOfTheColorsIsKept) {
    const std::string file = makeTiff(bytesOf({10, 200}), grey, makeProfile("GRAY"));
    EXPECT_EQ(decodeImage(file).bitmap.profile.size(), testProfileSize);
    const std::string other = makeTiff(bytesOf({10, 200}), grey, makeProfile("CMYK"));
    EXPECT_TRUE(decodeImage(other).hasPixels);
    EXPECT_TRUE(decodeImage(other).bitmap.profile.empty());
}

TEST(GS_TiffReader, ResolutionIsReadFromRationals) {
    const GS_ImageInfo info = decodeImage(readTestImage("fax4.tiff")).info;
    EXPECT_DOUBLE_EQ(info.xResolution, 182.88); // 72 a centimetre
}

TEST(GS_TiffReader, StripBeyondTheFileIsAFailure) {
    std::string file = makeTiff(bytesOf({10, 200}), grey);
    const std::size_t offset = file.find(little(273, 2) + little(3, 2));
    file.replace(offset + 8, 2, little(60000, 2));
    EXPECT_FALSE(decodeImage(file).hasPixels);
}

TEST(GS_TiffReader, FormsThatAreNotDecodedAreRefused) {
    EXPECT_FALSE(
        decodeImage(makeTiff(bytesOf({1, 2, 3, 4}), {{258, 13}, {262, 1}, {277, 1}})).hasInfo);
    EXPECT_FALSE(decodeImage(makeTiff(bytesOf({1, 2}), {{258, 8}, {262, 99}, {277, 1}})).hasInfo);
    EXPECT_FALSE(decodeImage("II*").hasInfo);
    EXPECT_FALSE(decodeImage(std::string("II*\0\x08\0\0\0", 8)).hasInfo);
}

} // namespace

#include "foundation/graphicservice/GS_Resampler.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

constexpr GSMP_SAMPLINGTYPE allTypes[] = {SAMPLINGTYPE_AVERAGE, SAMPLINGTYPE_LINEAR,
                                          SAMPLINGTYPE_CUBIC};

std::vector<int> resample(const GS_Bitmap& bitmap, int columns, int rows, GSMP_SAMPLINGTYPE type) {
    GS_Bitmap target;
    EXPECT_TRUE(resampleBitmap(bitmap, columns, rows, type, target));
    EXPECT_EQ(target.columns, columns);
    EXPECT_EQ(target.rows, rows);
    return listPixels(target);
}

TEST(GS_Resampler, BlackAndWhiteMeetInLinearLight) {
    const GS_Bitmap bitmap = makeBitmap(2, 1, 1, {0, 255});
    // Half the light is 188 by the curve of sRGB, not 128.
    EXPECT_EQ(resample(bitmap, 1, 1, SAMPLINGTYPE_AVERAGE), (std::vector<int>{188}));
}

TEST(GS_Resampler, ColorOfTransparentPixelsDoesNotBleed) {
    const GS_Bitmap bitmap = makeBitmap(2, 1, 4, {200, 10, 20, 255, 0, 255, 0, 0});
    EXPECT_EQ(resample(bitmap, 1, 1, SAMPLINGTYPE_AVERAGE), (std::vector<int>{200, 10, 20, 128}));
    const GS_Bitmap none = makeBitmap(2, 1, 2, {200, 0, 100, 0});
    EXPECT_EQ(resample(none, 1, 1, SAMPLINGTYPE_AVERAGE), (std::vector<int>{0, 0}));
}

TEST(GS_Resampler, EvenColorsStayAsTheyAre) {
    for (const GSMP_SAMPLINGTYPE type : allTypes) {
        for (int grey = 0; grey < 256; ++grey) {
            const GS_Bitmap bitmap = makeBitmap(7, 5, 1, std::vector<int>(35, grey));
            EXPECT_EQ(resample(bitmap, 3, 2, type), std::vector<int>(6, grey)) << type;
        }
    }
}

TEST(GS_Resampler, AverageTakesTheExactShareOfEachPixel) {
    // The middle one of three pixels belongs to both new ones by half.
    const GS_Bitmap bitmap = makeBitmap(3, 1, 1, {255, 0, 0});
    const std::vector<int> pixels = resample(bitmap, 2, 1, SAMPLINGTYPE_AVERAGE);
    EXPECT_EQ(pixels, (std::vector<int>{213, 0})); // two thirds of the light
}

TEST(GS_Resampler, OneAxisMayKeepItsSize) {
    for (const GSMP_SAMPLINGTYPE type : allTypes) {
        const GS_Bitmap bitmap = makeBitmap(2, 3, 1, {10, 10, 20, 20, 30, 30});
        EXPECT_EQ(resample(bitmap, 1, 3, type), (std::vector<int>{10, 20, 30})) << type;
    }
}

TEST(GS_Resampler, FiltersDifferInSharpness) {
    // A white bar on black; the sharper filter keeps more light in its middle.
    std::vector<int> row(40, 0);
    std::fill(row.begin() + 18, row.begin() + 22, 255);
    const GS_Bitmap bitmap = makeBitmap(40, 1, 1, row);
    const int linear = resample(bitmap, 13, 1, SAMPLINGTYPE_LINEAR)[6];
    const int cubic = resample(bitmap, 13, 1, SAMPLINGTYPE_CUBIC)[6];
    EXPECT_GT(cubic, linear);
}

TEST(GS_Resampler, UnlistedTypeIsTheAverage) {
    const GS_Bitmap bitmap = makeBitmap(3, 1, 1, {255, 0, 0});
    EXPECT_EQ(resample(bitmap, 2, 1, static_cast<GSMP_SAMPLINGTYPE>(9)),
              resample(bitmap, 2, 1, SAMPLINGTYPE_AVERAGE));
}

TEST(GS_Resampler, EverySizeAndTypeIsSafe) {
    for (const GSMP_SAMPLINGTYPE type : allTypes) {
        for (int channels = 1; channels <= 4; ++channels) {
            for (int size = 1; size <= 17; ++size) {
                const GS_Bitmap bitmap = makeBitmap(17, 17, channels, {});
                resample(bitmap, size, 18 - size, type);
            }
        }
    }
}

TEST(GS_Resampler, ProfileIsKept) {
    GS_Bitmap bitmap = makeBitmap(2, 1, 1, {1, 2});
    bitmap.profile = {7};
    GS_Bitmap target;
    ASSERT_TRUE(resampleBitmap(bitmap, 1, 1, SAMPLINGTYPE_AVERAGE, target));
    EXPECT_EQ(target.profile, bitmap.profile);
}

} // namespace

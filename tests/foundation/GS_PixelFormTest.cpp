#include "foundation/graphicservice/GS_PixelForm.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

TEST(GS_PixelForm, OpaqueAlphaIsDropped) {
    EXPECT_EQ(GS_PixelForm(makeBitmap(1, 1, 2, {18, 255})).channels, 1);
    EXPECT_TRUE(GS_PixelForm(makeBitmap(1, 1, 2, {18, 255})).colors.empty());
}

TEST(GS_PixelForm, GreyColorsBecomeGrey) {
    const GS_PixelForm form(makeBitmap(2, 1, 3, {0, 0, 0, 255, 255, 255}));
    EXPECT_EQ(form.channels, 1);
    EXPECT_EQ(form.depth, 1);
    EXPECT_TRUE(form.colors.empty());
}

TEST(GS_PixelForm, GreyWithAColorProfileStaysColored) {
    GS_Bitmap bitmap = makeBitmap(2, 1, 3, {0, 0, 0, 255, 255, 255});
    bitmap.profile.assign(200, 0);
    EXPECT_EQ(GS_PixelForm(bitmap).colors, (std::vector<std::uint32_t>{0xFF000000, 0xFFFFFFFF}));
}

TEST(GS_PixelForm, TransparentColorsComeFirst) {
    const GS_PixelForm form(makeBitmap(2, 1, 4, {1, 2, 3, 255, 9, 9, 8, 7}));
    EXPECT_EQ(form.colors, (std::vector<std::uint32_t>{0x07090908, 0xFF010203}));
    std::uint8_t row[8] = {};
    form.convertRow(makeBitmap(2, 1, 4, {1, 2, 3, 255, 9, 9, 8, 7}), 0, row);
    EXPECT_EQ(row[0], 1);
    EXPECT_EQ(row[1], 0);
}

TEST(GS_PixelForm, PaletteHoldsUpTo256Colors) {
    std::vector<int> pixels;
    for (int i = 0; i < 256; ++i) {
        pixels.insert(pixels.end(), {i, 1, 2});
    }
    const GS_PixelForm full(makeBitmap(256, 1, 3, pixels));
    EXPECT_EQ(full.colors.size(), 256U);
    EXPECT_EQ(full.depth, 8);
    pixels.insert(pixels.end(), {0, 3, 2});
    const GS_PixelForm above(makeBitmap(257, 1, 3, pixels));
    EXPECT_TRUE(above.colors.empty());
    EXPECT_EQ(above.channels, 3);
}

} // namespace

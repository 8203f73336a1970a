#include "foundation/graphicservice/GS_Bitmap.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

TEST(GS_Bitmap, RowsFollowEachOther) {
    GS_Bitmap bitmap = makeBitmap(2, 2, 3, {1, 2, 3, 4, 5, 6, 7});
    EXPECT_EQ(bitmap.getRowSize(), 6U);
    EXPECT_EQ(bitmap.getRow(1)[0], 7);
    EXPECT_EQ(bitmap.getRow(1)[5], 0);
}

#if !defined(__SANITIZE_ADDRESS__) // which ends the program at such an allocation
TEST(GS_Bitmap, MoreMemoryThanThereIsIsRefused) {
    GS_Bitmap bitmap;
    EXPECT_FALSE(bitmap.allocate(0x7FFFFFFF, 0x7FFFFFFF, 4));
}
#endif

TEST(GS_Bitmap, OnePixelMakesItTransparent) {
    EXPECT_FALSE(makeBitmap(1, 1, 3, {0, 0, 0}).isTransparent());
    EXPECT_FALSE(makeBitmap(2, 1, 2, {0, 255, 0, 255}).isTransparent());
    EXPECT_TRUE(makeBitmap(2, 1, 2, {0, 255, 0, 254}).isTransparent());
    EXPECT_TRUE(makeBitmap(1, 2, 4, {0, 0, 0, 255, 1, 1, 1, 0}).isTransparent());
}

TEST(GS_Bitmap, ProfileOfOtherColorsIsDropped) {
    struct Case {
        int channels;
        const char* space;
        std::size_t size;
    };

    for (const Case& row : {Case{3, "RGB ", testProfileSize}, Case{4, "RGB ", testProfileSize},
                            Case{1, "GRAY", testProfileSize}, Case{3, "GRAY", 0},
                            Case{1, "RGB ", 0}, Case{3, "CMYK", 0}}) {
        GS_Bitmap bitmap = makeBitmap(1, 1, row.channels, {});
        const std::string profile = makeProfile(row.space);
        const std::vector<std::uint8_t> bytes(profile.begin(), profile.end());
        bitmap.setProfile(bytes.data(), bytes.size());
        EXPECT_EQ(bitmap.profile.size(), row.size) << row.space;
        bitmap.setProfile(bytes.data(), 20);
        EXPECT_TRUE(bitmap.profile.empty());
    }
}

} // namespace

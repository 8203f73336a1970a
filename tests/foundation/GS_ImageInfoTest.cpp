#include "foundation/graphicservice/GS_ImageInfo.h"

#include "foundation/graphicservice/GS_Graphic.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;

namespace {

TEST(GS_ImageInfo, SizesEndAtTheLimits) {
    GS_ImageInfo info;
    EXPECT_TRUE(info.setSize(1, 1));
    EXPECT_FALSE(info.setSize(0, 1));
    EXPECT_FALSE(info.setSize(1, 0));
    EXPECT_TRUE(info.setSize(16384, 16384)); // 256 megapixels
    EXPECT_FALSE(info.setSize(16384, 16385));
    EXPECT_TRUE(info.setSize(1 << 24, 1));
    EXPECT_FALSE(info.setSize((1 << 24) + 1, 1));
    EXPECT_FALSE(info.setSize(0xFFFFFFFF, 0xFFFFFFFF));
    EXPECT_FALSE(info.setSize(1ULL << 32, 1ULL << 32));
}

TEST(GS_ImageInfo, ResolutionOfNoSenseIsLeftOut) {
    for (const double value : {0.0, -1.0, 1e9, 0.5}) {
        GS_ImageInfo info;
        info.setResolution(value, 72.0, 1.0);
        EXPECT_EQ(info.xResolution, 0.0) << value;
    }
    GS_ImageInfo info;
    info.setResolution(100.0, 50.0, 1.0 / 2.54);
    EXPECT_DOUBLE_EQ(info.xResolution, 254.0);
    EXPECT_DOUBLE_EQ(info.yResolution, 127.0);
}

TEST(GS_ImageInfo, OrientationsFromFiveOnSwapTheSides) {
    GS_ImageInfo info;
    for (int orientation = 1; orientation <= 8; ++orientation) {
        info.orientation = orientation;
        EXPECT_EQ(info.isTurned(), orientation >= 5);
    }
}

} // namespace

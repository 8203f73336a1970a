#include "foundation/graphicservice/GS_Orientation.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

// Every orientation is of the same picture:
//   1 2 3
//   4 5 6
struct Stored {
    int orientation;
    int columns;
    std::vector<int> pixels;
};

const Stored storedPictures[] = {
    {2, 3, {3, 2, 1, 6, 5, 4}}, {3, 3, {6, 5, 4, 3, 2, 1}}, {4, 3, {4, 5, 6, 1, 2, 3}},
    {5, 2, {1, 4, 2, 5, 3, 6}}, {6, 2, {3, 6, 2, 5, 1, 4}}, {7, 2, {6, 3, 5, 2, 4, 1}},
    {8, 2, {4, 1, 5, 2, 6, 3}},
};

TEST(GS_Orientation, EveryOrientationGivesTheUprightPicture) {
    for (const Stored& stored : storedPictures) {
        GS_Bitmap upright;
        const GS_Bitmap bitmap = makeBitmap(stored.columns, 6 / stored.columns, 1, stored.pixels);
        ASSERT_TRUE(turnBitmap(bitmap, stored.orientation, upright));
        EXPECT_EQ(upright.columns, 3);
        EXPECT_EQ(upright.rows, 2);
        EXPECT_EQ(listPixels(upright), (std::vector<int>{1, 2, 3, 4, 5, 6})) << stored.orientation;
    }
}

TEST(GS_Orientation, ChannelsStayTogetherAndTheProfileIsKept) {
    GS_Bitmap bitmap = makeBitmap(2, 1, 3, {1, 2, 3, 4, 5, 6});
    bitmap.profile = {7};
    GS_Bitmap turned;
    ASSERT_TRUE(turnBitmap(bitmap, 2, turned));
    EXPECT_EQ(listPixels(turned), (std::vector<int>{4, 5, 6, 1, 2, 3}));
    EXPECT_EQ(turned.profile, bitmap.profile);
}

} // namespace

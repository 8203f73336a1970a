#include "foundation/graphicservice/GS_BmpRuns.h"

#include "tests/support/TestImage.h"

#include <gtest/gtest.h>

using namespace MoxGraphicService_NS;
using namespace DrawmereTest;

namespace {

/// Returns: the reds of an image of 4 by 2 pixels whose palette has its indices as reds; empty when
/// the runs can't be decoded.
std::vector<int> read(std::initializer_list<int> runs, int depth = 8) {
    std::string palette;
    for (int i = 0; i < (depth == 8 ? 256 : 16); ++i) {
        palette += bytesOf({0, 0, i, 0});
    }
    const DecodedImage image =
        decodeImage(makeBmp(4, 2, depth, depth == 8 ? 1 : 2, palette, bytesOf(runs)));
    std::vector<int> reds;
    for (std::size_t i = 0; image.hasPixels && i < 24; i += 3) {
        reds.push_back(image.bitmap.pixels[i]);
    }
    return reds;
}

using Reds = std::vector<int>;

TEST(GS_BmpRuns, RunsFillRowsFromTheBottom) {
    EXPECT_EQ(read({4, 7, 0, 0, 3, 8, 1, 9, 0, 1}), (Reds{8, 8, 8, 9, 7, 7, 7, 7}));
}

TEST(GS_BmpRuns, PixelsWithoutRunsArePaddedToTwoBytes) {
    EXPECT_EQ(read({0, 3, 5, 6, 7, 99, 1, 8, 0, 0, 4, 1, 0, 1}), (Reds{1, 1, 1, 1, 5, 6, 7, 8}));
}

TEST(GS_BmpRuns, HalfBytesTakeTurns) {
    EXPECT_EQ(read({4, 0x12, 0, 0, 0, 3, 0x34, 0x50, 1, 0x60, 0, 1}, 4),
              (Reds{3, 4, 5, 6, 1, 2, 1, 2}));
}

TEST(GS_BmpRuns, JumpLeavesTheFirstColor) {
    EXPECT_EQ(read({1, 7, 0, 2, 1, 1, 2, 8, 0, 1}), (Reds{0, 0, 8, 8, 7, 0, 0, 0}));
    EXPECT_EQ(read({0, 1}), (Reds{0, 0, 0, 0, 0, 0, 0, 0}));
}

// On purpose: what lies beyond the end of a row is dropped.
TEST(GS_BmpRuns, PaddingEncodedAtTheEndOfARowIsDropped) {
    EXPECT_EQ(read({6, 7, 0, 0, 6, 8, 0, 1}), (Reds{8, 8, 8, 8, 7, 7, 7, 7}));
}

TEST(GS_BmpRuns, MarkOfTheEndMayBeMissingBehindTheLastRow) {
    EXPECT_EQ(read({4, 7, 0, 0, 4, 8}), (Reds{8, 8, 8, 8, 7, 7, 7, 7}));
    EXPECT_EQ(read({4, 7, 0, 0, 4, 8, 0, 0}), (Reds{8, 8, 8, 8, 7, 7, 7, 7}));
}

TEST(GS_BmpRuns, RunsThatEndEarlyOrLeaveTheImageAreAFailure) {
    EXPECT_EQ(read({4, 7}), Reds());
    EXPECT_EQ(read({4, 7, 0, 0, 3, 8}), Reds());
    EXPECT_EQ(read({0, 3, 5}), Reds());
    EXPECT_EQ(read({0, 3, 5, 6, 7}), Reds());
    EXPECT_EQ(read({0, 2, 1}), Reds());
    EXPECT_EQ(read({0, 2, 4, 0, 0, 1}), Reds());
    EXPECT_EQ(read({0, 2, 0, 2, 0, 1}), Reds());
    EXPECT_EQ(read({0, 0, 0, 0, 1, 7, 0, 1}), Reds());
    EXPECT_EQ(read({0, 0, 0, 0, 0, 0, 0, 1}), Reds());
}

} // namespace

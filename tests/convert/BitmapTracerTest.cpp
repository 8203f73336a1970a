#include "tools/convert/BitmapTracer.h"

#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

using DrawmereConvert::BitmapLoop;
using DrawmereConvert::ImagePixels;
using DrawmereConvert::traceBitmap;

/// Pixels from rows of text, in which '#' is set.
class TracedRows {
public:
    explicit TracedRows(const std::vector<std::string>& rows) {
        const auto width = static_cast<int>(rows.front().size());
        const auto height = static_cast<int>(rows.size());
        fz_pixmap* pixmap = fz_new_pixmap(ctx, nullptr, width, height, nullptr, 1);
        for (int y = 0; y < height; ++y) {
            for (int x = 0; x < width; ++x) {
                pixmap->samples[y * pixmap->stride + x] = rows[y][x] == '#' ? 255 : 0;
            }
        }
        const ImagePixels pixels(ctx, pixmap);
        loops = traceBitmap(pixels, 100);
        for (BitmapLoop& loop : loops) {
            for (fz_point& point : loop) {
                point = {point.x * static_cast<float>(width), point.y * static_cast<float>(height)};
            }
        }
    }

    ~TracedRows() { fz_drop_context(ctx); }

    TracedRows(const TracedRows&) = delete;
    TracedRows& operator=(const TracedRows&) = delete;

    /// Returns: the area that a loop goes around, negative for one that turns left.
    float area(std::size_t index) const {
        const BitmapLoop& loop = loops.at(index);
        float sum = 0;
        for (std::size_t i = 0; i < loop.size(); ++i) {
            const fz_point& from = loop[i];
            const fz_point& to = loop[(i + 1) % loop.size()];
            sum += (from.x * to.y - to.x * from.y) / 2;
        }
        return sum;
    }

    fz_context* ctx = fz_new_context(nullptr, nullptr, FZ_STORE_DEFAULT);
    std::vector<BitmapLoop> loops;
};

TEST(BitmapTracer, APixelHasFourCorners) {
    const TracedRows traced({"...", ".#.", "..."});
    ASSERT_EQ(traced.loops.size(), 1U);
    EXPECT_EQ(traced.loops[0].size(), 4U);
    EXPECT_FLOAT_EQ(traced.area(0), 1);
}

TEST(BitmapTracer, PixelsSideBySideHaveNoCornersBetweenThem) {
    const TracedRows traced({"####", "####"});
    EXPECT_EQ(traced.loops.at(0).size(), 4U);
    EXPECT_FLOAT_EQ(traced.area(0), 8);
}

TEST(BitmapTracer, AHoleRunsTheOtherWayRound) {
    const TracedRows traced({"###", "#.#", "###"});
    ASSERT_EQ(traced.loops.size(), 2U);
    EXPECT_FLOAT_EQ(traced.area(0), 9);
    EXPECT_FLOAT_EQ(traced.area(1), -1);
}

TEST(BitmapTracer, PixelsThatTouchAtACornerAreAllThere) {
    const TracedRows traced({"#.", ".#"});
    float sum = 0;
    for (std::size_t i = 0; i < traced.loops.size(); ++i) {
        sum += traced.area(i);
    }
    EXPECT_FLOAT_EQ(sum, 2);
}

TEST(BitmapTracer, NothingSetHasNoLoops) { EXPECT_TRUE(TracedRows({"..", ".."}).loops.empty()); }

TEST(BitmapTracer, TooManyCornersAreNothing) {
    const TracedRows traced(std::vector<std::string>(10, "#.#.#.#.#.#.#.#.#.#.#.#.#.#."));
    EXPECT_FALSE(traced.loops.empty());
    const std::vector<std::string> dots = {"#.#.#.#.#.#.#.#.#.#.", "....................",
                                           "#.#.#.#.#.#.#.#.#.#.", "....................",
                                           "#.#.#.#.#.#.#.#.#.#."};
    EXPECT_TRUE(TracedRows(dots).loops.empty());
}

} // namespace
} // namespace DrawmereTest

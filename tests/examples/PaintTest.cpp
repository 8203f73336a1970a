// The example `paint` against the same scenes drawn without SVG.
#include "tests/examples/PaintTwin.h"
#include "tests/support/Command.h"
#include "tests/support/Picture.h"
#include "tests/support/TempDir.h"

#include <fontconfig/fontconfig.h>
#include <gtest/gtest.h>

namespace DrawmereTest {
namespace {

/// A renderer may soften edges and round colours in its own way.
constexpr int tolerance = 24;
constexpr double edgeShare = 0.02;

/// The renderer draws a tile once and turns its pixels, which softens the edges in it.
constexpr double turnedTileShare = 0.1;
constexpr int turnedTileCell = 2 * columns + 2;

/// Returns: the picture of what the example writes.
Picture drawExample() {
    const TempDir directory;
    const CommandResult result = runCommand({PAINT_EXAMPLE, directory.path("paint.svg")});
    EXPECT_EQ(result.status, 0) << result.output;
    return Picture(directory.read("paint.svg"));
}

int toPixel(float start, float step, int index) {
    return static_cast<int>(start + step * static_cast<float>(index));
}

/// Leaves nothing of the font libraries behind, which keep faces for the life of a program.
class Paint : public testing::Test {
protected:
    static void TearDownTestSuite() {
        cairo_debug_reset_static_data();
        FcFini();
    }
};

TEST_F(Paint, CanBeLookedAtWithoutSvg) {
    PaintTwin twin(/*scale=*/2);
    EXPECT_EQ(cairo_surface_write_to_png(twin.draw(), "paint-without-svg.png"),
              CAIRO_STATUS_SUCCESS);
}

TEST_F(Paint, EachSceneLooksAsItDoesWithoutSvg) {
    PaintTwin twin(/*scale=*/1);
    const Picture expected(twin.draw());
    const Picture found = drawExample();
    for (int cell = 0; cell < rows * columns; ++cell) {
        const int x = toPixel(leftMargin, columnStep, cell % columns);
        const int y = toPixel(topMargin, rowStep, cell / columns);
        const int side = static_cast<int>(cellSize);
        EXPECT_LT(found.differenceShare(expected, {x, y, side, side}, tolerance),
                  cell == turnedTileCell ? turnedTileShare : edgeShare)
            << "row " << cell / columns << ", column " << cell % columns;
    }
}

} // namespace
} // namespace DrawmereTest

#include "fonts/SVGGlyphPath.h"

#include "foundation/common/MoxValue.h"
#include "tests/fonts/EmbeddedFont.h"

#include "fonts/SVGEmbFont.h"

#include <gtest/gtest.h>
#include <limits>

namespace DrawmereTest {
namespace {

using MoxFontService_NS::FS_GlyphDrawInfo;
using MoxFontService_NS::FS_GlyphPolygon;

using Point = MoxPointT<float>;

std::string pathOf(const std::vector<FS_GlyphPolygon>& polygons, int advance = 0,
                   bool vertical = false) {
    FS_GlyphDrawInfo info;
    info.polygons = polygons;
    SVGGlyphPath path;
    path.addGlyph(info, advance, vertical);
    return std::string(path.get());
}

TEST(SVGGlyphPath, WritesLinesAndBothKindsOfCurvesWithoutBlanksBetween) {
    EXPECT_EQ(pathOf({{{0, 1}, {{10, 20}, {30, 20}, {40, 20}, {40, 30}}}}),
              "M10 20L30 20Q40 20 40 30Z");
    EXPECT_EQ(pathOf({{{2}, {{1, 2}, {3, 4}, {5, 6}, {7, 8}}}}), "M1 2C3 4 5 6 7 8Z");
}

TEST(SVGGlyphPath, ClosesEachContour) {
    EXPECT_EQ(pathOf({{{0}, {{0, 0}, {1, 1}}}, {{}, {{5, -5}}}}), "M0 0L1 1ZM5 -5Z");
}

TEST(SVGGlyphPath, ASegmentOfAnotherTypeHasNoLetterAndOnePoint) {
    for (const int type : {3, -1, 1000, std::numeric_limits<int>::min()}) {
        EXPECT_EQ(pathOf({{{type, 0}, {{10, 20}, {30, 40}, {50, 60}}}}), "M10 2030 40L50 60Z");
    }
}

TEST(SVGGlyphPath, MovesAlongOneAxis) {
    const FS_GlyphPolygon polygon = {{0}, {{1, 2}, {3, 4}}};
    EXPECT_EQ(pathOf({polygon}, 100, false), "M101 2L103 4Z");
    EXPECT_EQ(pathOf({polygon}, 100, true), "M1 102L3 104Z");
}

TEST(SVGGlyphPath, AContourShortOfPointsEndsWithItsLastWholeSegment) {
    EXPECT_EQ(pathOf({{{0, 2, 0}, {{0, 0}, {1, 1}, {2, 2}, {3, 3}}}}), "M0 0L1 1Z");
    EXPECT_EQ(pathOf({{{0}, {}}, {{0}, {{0, 0}}}}), "M0 0Z");
}

TEST(SVGGlyphPath, HoldsOutlinesOfAnySize) {
    FS_GlyphPolygon polygon = {{}, {{0, 0}}};
    std::string expected = "M0 0";
    for (int i = 0; i < 20'000; ++i) {
        polygon.segmentTypes.push_back(0);
        polygon.points.push_back({static_cast<float>(i), 0.5F});
        expected += "L" + std::to_string(i) + " 0.5";
    }
    EXPECT_EQ(pathOf({polygon}), expected + "Z");
}

TEST(CoordinateString, IsTheTextOfBothNumbersAsRealValues) {
    constexpr float numbers[] = {0.0F,    -0.0F,  1.0F,        -250.0F,      0.1F,    33.333332F,
                                 1.0E-5F, 1.0E9F, 16777216.0F, -8192.00098F, 1.0E30F, 1234.5678F};
    for (const float number : numbers) {
        const UnicodeString text = MoxValue(number).toString();
        EXPECT_EQ(utf8(coordinateString({number, number}, 0, false)),
                  utf8(text) + " " + utf8(text));
    }
    EXPECT_EQ(utf8(coordinateString({0.1F, 33.333332F}, 0, true)), "0.1 33.333332");
}

TEST(CoordinateString, AddsTheAdvanceAlongTheDirectionOfTheText) {
    EXPECT_EQ(utf8(coordinateString({10, 20}, 500, false)), "510 20");
    EXPECT_EQ(utf8(coordinateString({10, 20}, 500, true)), "10 520");
    EXPECT_EQ(utf8(coordinateString({10.5F, 20}, -500, false)), "-489.5 20");
}

TEST(CoordinateString, AddsInSinglePrecision) {
    const float sum = 0.1F + static_cast<float>(16777217);
    EXPECT_EQ(utf8(coordinateString({0.1F, 0}, 16777217, false)),
              utf8(MoxValue(sum).toString()) + " 0");
}

TEST(CoordinateString, WritesNoNumberThatPathsCanNotHave) {
    constexpr float infinity = std::numeric_limits<float>::infinity();
    constexpr float nan = std::numeric_limits<float>::quiet_NaN();
    EXPECT_EQ(utf8(coordinateString({infinity, nan}, 3, false)), "0 0");
}

} // namespace
} // namespace DrawmereTest

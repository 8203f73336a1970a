#include "foundation/fontservice/FS_OutlineReader.h"

#include <gtest/gtest.h>

#include <vector>

using namespace MoxFontService_NS;

namespace {

constexpr char on = FT_CURVE_TAG_ON;
constexpr char conic = FT_CURVE_TAG_CONIC;
constexpr char cubic = FT_CURVE_TAG_CUBIC;

// Reads points 0,0 1,0 2,0 and so on, of these kinds, that form contours up to these indices.
bool read(std::vector<char> tags, std::vector<short> ends, std::vector<FS_GlyphPolygon>& polygons) {
    std::vector<FT_Vector> points;
    for (std::size_t i = 0; i < tags.size(); ++i) {
        points.push_back({static_cast<FT_Pos>(i), 0});
    }
    FT_Outline outline = {};
    outline.n_points = static_cast<short>(tags.size());
    outline.n_contours = static_cast<short>(ends.size());
    outline.points = points.data();
    outline.tags = tags.data();
    outline.contours = ends.data();
    return FS_OutlineReader::read(outline, polygons);
}

// Returns: the kinds of the segments of the only contour; -1 for an outline that can't be read.
std::vector<int> readTypes(const std::vector<char>& tags) {
    std::vector<FS_GlyphPolygon> polygons;
    if (!read(tags, {static_cast<short>(tags.size() - 1)}, polygons)) {
        return {-1};
    }
    return polygons.at(0).segmentTypes;
}

} // namespace

TEST(FS_OutlineReader, CubicCurveMayEndInTheStart) {
    EXPECT_EQ(readTypes({on, cubic, cubic, on}), (std::vector<int>{2}));
    EXPECT_EQ(readTypes({on, on, cubic, cubic}), (std::vector<int>{0, 2}));
}

TEST(FS_OutlineReader, ControlPointsOfACurveBelongTogether) {
    const std::vector<int> unreadable = {-1};
    EXPECT_EQ(readTypes({cubic, cubic, on}), unreadable);
    EXPECT_EQ(readTypes({on, cubic, on}), unreadable);
    EXPECT_EQ(readTypes({on, on, cubic}), unreadable);
    EXPECT_EQ(readTypes({on, cubic, conic, on}), unreadable);
    EXPECT_EQ(readTypes({on, conic, cubic, cubic, on}), unreadable);
    EXPECT_EQ(readTypes({on, cubic, cubic, cubic, on}), unreadable);
    EXPECT_EQ(readTypes({on, cubic, cubic, conic}), unreadable);
    EXPECT_EQ(readTypes({on, on, 3}), unreadable);
}

TEST(FS_OutlineReader, ContoursFollowEachOtherWithinThePoints) {
    std::vector<FS_GlyphPolygon> polygons;
    EXPECT_TRUE(read({on, on, on, on}, {1, 3}, polygons));
    EXPECT_EQ(polygons.size(), 2U);
    EXPECT_FALSE(read({on, on, on, on}, {3, 1}, polygons));
    EXPECT_FALSE(read({on, on, on, on}, {1, 1}, polygons));
    EXPECT_FALSE(read({on, on, on, on}, {1, 4}, polygons));
    EXPECT_FALSE(read({on, on, on, on}, {-1, 3}, polygons));
}

TEST(FS_OutlineReader, OutlineWithoutContoursIsEmpty) {
    std::vector<FS_GlyphPolygon> polygons(3);
    EXPECT_TRUE(read({}, {}, polygons));
    EXPECT_TRUE(polygons.empty());
}

#include "tools/convert/FillRules.h"

#include <gtest/gtest.h>

#include <vector>

namespace DrawmereTest {
namespace {

using Contour = std::vector<FT_Vector>;

/// Asks about an outline of straight lines.
bool isAlike(const std::vector<Contour>& contours) {
    std::vector<FT_Vector> points;
    std::vector<short> ends;
    for (const Contour& contour : contours) {
        points.insert(points.end(), contour.begin(), contour.end());
        ends.push_back(static_cast<short>(points.size() - 1));
    }
    std::vector<char> tags(points.size(), FT_CURVE_TAG_ON);
    FT_Outline outline = {};
    outline.n_contours = static_cast<short>(ends.size());
    outline.n_points = static_cast<short>(points.size());
    outline.points = points.data();
    outline.contours = ends.data();
    outline.tags = tags.data();
    return DrawmereConvert::isFilledAlike(outline);
}

Contour square(long corner, long side) {
    return {{corner, corner},
            {corner + side, corner},
            {corner + side, corner + side},
            {corner, corner + side}};
}

Contour turn(const Contour& contour) { return {contour.rbegin(), contour.rend()}; }

TEST(FillRules, AreAlikeForSimpleShapes) {
    EXPECT_TRUE(isAlike({}));
    EXPECT_TRUE(isAlike({square(0, 100)}));
    EXPECT_TRUE(isAlike({square(0, 100), square(200, 100)}));
}

TEST(FillRules, AreAlikeForAHoleThatRunsTheOtherWay) {
    EXPECT_TRUE(isAlike({square(0, 100), turn(square(20, 60))}));
    EXPECT_TRUE(isAlike({square(0, 100), turn(square(20, 60)), square(40, 20)}));
    EXPECT_FALSE(isAlike({square(0, 100), square(20, 60)}));
    EXPECT_FALSE(isAlike({turn(square(20, 60)), turn(square(0, 100))}));
}

TEST(FillRules, AreNotTakenForAlikeWhereContoursMeet) {
    EXPECT_FALSE(isAlike({square(0, 100), square(50, 100)}));
    EXPECT_FALSE(isAlike({square(0, 100), square(100, 100)})); // one corner
    EXPECT_FALSE(isAlike({{{0, 0}, {100, 100}, {100, 0}, {0, 100}}}));
}

TEST(FillRules, AreNotLookedAtForEver) {
    Contour comb;
    for (int i = 0; i < 1500; ++i) {
        comb.push_back({i * 10, 0});
        comb.push_back({i * 10 + 5, 100});
    }
    comb.push_back({15000, -50});
    comb.push_back({0, -50});
    EXPECT_FALSE(isAlike({comb}));
}

} // namespace
} // namespace DrawmereTest

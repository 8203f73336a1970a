#include "foundation/fontservice/FS_FaceStyle.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

using namespace MoxFontService_NS;

namespace {

// Returns: the weight that is chosen of fonts that have one weight each.
int chooseWeight(const std::vector<int>& weights, int wanted) {
    std::vector<FS_StyleRange> fonts;
    for (const int weight : weights) {
        const FS_FaceStyle style = makeStyle(weight, false, 5);
        fonts.push_back({style, style});
    }
    return weights[chooseFont(fonts, makeStyle(wanted, false, 5))];
}

int chooseWidth(const std::vector<int>& widths, int wanted) {
    std::vector<FS_StyleRange> fonts;
    for (const int width : widths) {
        const FS_FaceStyle style = makeStyle(400, false, width);
        fonts.push_back({style, style});
    }
    return widths[chooseFont(fonts, makeStyle(400, false, wanted))];
}

} // namespace

TEST(FS_FaceStyle, NumbersOutsideTheirRangesAreNormal) {
    EXPECT_EQ(makeStyle(0, true, 0), (FS_FaceStyle{400, true, 5}));
    EXPECT_EQ(makeStyle(-700, false, 10), (FS_FaceStyle{400, false, 5}));
    EXPECT_EQ(makeStyle(1001, false, -3), (FS_FaceStyle{400, false, 5}));
    EXPECT_EQ(makeStyle(1, false, 1), (FS_FaceStyle{1, false, 1}));
    EXPECT_EQ(makeStyle(1000, false, 9), (FS_FaceStyle{1000, false, 9}));
}

TEST(FS_FaceStyle, WidthsInPercentComeBackAsTheirClass) {
    for (int widthClass = 1; widthClass <= 9; ++widthClass) {
        EXPECT_EQ(widthClassOf(widthPercentOf(widthClass)), widthClass);
    }
    EXPECT_EQ(widthClassOf(10), 1);
    EXPECT_EQ(widthClassOf(80), 3);
    EXPECT_EQ(widthClassOf(1000), 9);
    EXPECT_EQ(widthWordOf(5), std::u16string());
    EXPECT_EQ(widthWordOf(3), std::u16string(u"Condensed"));
}

TEST(FS_FaceStyle, MediumWeightsLookUpTo500ThenDownThenUp) {
    EXPECT_EQ(chooseWeight({300, 500, 700}, 400), 500);
    EXPECT_EQ(chooseWeight({300, 600, 700}, 400), 300);
    EXPECT_EQ(chooseWeight({600, 700}, 400), 600);
    EXPECT_EQ(chooseWeight({400, 600}, 500), 400);
    EXPECT_EQ(chooseWeight({400, 450, 490}, 450), 450);
}

TEST(FS_FaceStyle, LightWeightsLookDownFirstAndBoldOnesUp) {
    EXPECT_EQ(chooseWeight({100, 400}, 300), 100);
    EXPECT_EQ(chooseWeight({400, 700}, 300), 400);
    EXPECT_EQ(chooseWeight({500, 900}, 600), 900);
    EXPECT_EQ(chooseWeight({300, 500}, 600), 500);
}

TEST(FS_FaceStyle, WidthsLookFirstOnTheirOwnSideOfNormal) {
    EXPECT_EQ(chooseWidth({3, 6}, 5), 3);
    EXPECT_EQ(chooseWidth({2, 5}, 4), 2);
    EXPECT_EQ(chooseWidth({5, 6}, 4), 5);
    EXPECT_EQ(chooseWidth({5, 9}, 6), 9);
    EXPECT_EQ(chooseWidth({3, 5}, 7), 5);
}

TEST(FS_FaceStyle, WidthDecidesBeforeSlantAndSlantBeforeWeight) {
    const FS_FaceStyle uprightWide = {700, false, 7};
    const FS_FaceStyle uprightBold = {700, false, 5};
    const FS_FaceStyle italicLight = {100, true, 5};
    const std::vector<FS_StyleRange> fonts = {
        {uprightWide, uprightWide}, {uprightBold, uprightBold}, {italicLight, italicLight}};
    EXPECT_EQ(chooseFont(fonts, {700, true, 7}), 0);
    EXPECT_EQ(chooseFont(fonts, {700, true, 5}), 2);
    EXPECT_EQ(chooseFont(fonts, {100, false, 5}), 1);
}

TEST(FS_FaceStyle, AVariableFontFitsAllThatItsAxesReach) {
    const std::vector<FS_StyleRange> fonts = {{{400, false, 5}, {400, false, 5}},
                                              {{300, false, 3}, {800, true, 5}}};
    EXPECT_EQ(chooseFont(fonts, {400, false, 5}), 0);
    EXPECT_EQ(chooseFont(fonts, {410, false, 5}), 1);
    EXPECT_EQ(chooseFont(fonts, {400, true, 5}), 1);
    EXPECT_EQ(chooseFont(fonts, {400, false, 4}), 1);
}

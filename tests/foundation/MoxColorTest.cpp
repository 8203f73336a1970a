#include "foundation/common/MoxColor.h"

#include "foundation/common/MoxParser.h"

#include <cmath>
#include <gtest/gtest.h>
#include <string>

namespace {

using namespace MoxCommonNS;

std::string textOf(MoxColor color, bool withAlpha, bool numbersOnly) {
    std::string bytes;
    return color.toString(/*css=*/true, withAlpha, numbersOnly).toUTF8String(bytes);
}

std::string numberOf(MoxColor color) { return textOf(color, false, /*numbersOnly=*/true); }

std::string nameOf(MoxColor color) { return textOf(color, false, /*numbersOnly=*/false); }

std::string rgbaOf(MoxColor color) { return textOf(color, /*withAlpha=*/true, true); }

TEST(MoxColor, IsOpaqueBlackByDefault) {
    EXPECT_EQ(MoxColor(), MoxColor(0, 0, 0, 255));
    EXPECT_FALSE(MoxColor().hasAlpha());
    EXPECT_EQ(nameOf(MoxColor()), "#000");
}

TEST(MoxColor, PackedFormHoldsTransparencyOnTop) {
    const MoxColor red(0xFF0000);
    EXPECT_EQ(red, MoxColor(255, 0, 0));
    const MoxColor color(0x7F010203);
    EXPECT_EQ(color.getRed(), 1);
    EXPECT_EQ(color.getGreen(), 2);
    EXPECT_EQ(color.getBlue(), 3);
    EXPECT_EQ(color.getAlpha(), 128);
    EXPECT_EQ(MoxColor(1, 2, 3, 128).getPacked(), 0x7F010203U);
}

TEST(MoxColor, ClampsComponents) {
    EXPECT_EQ(MoxColor(-1, 256, 1000000), MoxColor(0, 255, 255));
    EXPECT_EQ(MoxColor(0, 0, 0, -5).getAlpha(), 0);
    EXPECT_EQ(MoxColor(0, 0, 0, 300).getAlpha(), 255);
}

TEST(MoxColor, Alpha255IsNoAlphaPart) {
    EXPECT_FALSE(MoxColor(1, 2, 3, 255).hasAlpha());
    EXPECT_TRUE(MoxColor(1, 2, 3, 254).hasAlpha());
    EXPECT_TRUE(MoxColor(1, 2, 3, 0).hasAlpha());
}

TEST(MoxColor, ClearedAlphaLeavesTheOpaqueColor) {
    MoxColor color(1, 2, 3, 77);
    color.clearAlpha();
    EXPECT_EQ(color, MoxColor(1, 2, 3));
}

TEST(MoxColor, NumbersAreAsShortAsTheyCanBe) {
    const struct {
        unsigned int rgb;
        const char* text;
    } rows[] = {
        {0x000000, "#000"},    {0xFF0000, "#f00"},    {0x112233, "#123"},    {0xAABBCC, "#abc"},
        {0x112234, "#112234"}, {0x102233, "#102233"}, {0x808080, "#808080"}, {0xFEFFFF, "#feffff"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(numberOf(row.rgb), row.text);
    }
}

TEST(MoxColor, NameStandsWhereItIsStrictlyShorter) {
    const struct {
        unsigned int rgb;
        const char* text;
    } rows[] = {
        {0x000000, "#000"},    {0xC0C0C0, "silver"}, {0x808080, "gray"},   {0xFFFFFF, "#fff"},
        {0x800000, "maroon"},  {0xFF0000, "red"},    {0x800080, "purple"}, {0xFF00FF, "#f0f"},
        {0x008000, "green"},   {0x00FF00, "#0f0"},   {0x808000, "olive"},  {0xFFFF00, "#ff0"},
        {0x000080, "navy"},    {0x0000FF, "#00f"},   {0x008080, "teal"},   {0x00FFFF, "#0ff"},
        {0xFFD700, "#ffd700"}, // gold is no name of HTML 4
    };

    for (const auto& row : rows) {
        EXPECT_EQ(nameOf(row.rgb), row.text);
    }
}

TEST(MoxColor, FullyTransparentColorIsTransparentInEveryForm) {
    const MoxColor clear(255, 0, 0, 0);
    EXPECT_EQ(numberOf(clear), "transparent");
    EXPECT_EQ(nameOf(clear), "transparent");
    EXPECT_EQ(rgbaOf(clear), "transparent");
}

TEST(MoxColor, AlphaIsLeftOutUnlessAskedFor) {
    EXPECT_EQ(nameOf(MoxColor(255, 0, 0, 1)), "red");
    EXPECT_EQ(rgbaOf(MoxColor(255, 0, 0, 255)), "#f00");
    EXPECT_EQ(rgbaOf(MoxColor(255, 0, 10, 128)), "rgba(255,0,10,0.5)");
    EXPECT_EQ(rgbaOf(MoxColor(255, 255, 255, 254)), "rgba(255,255,255,0.996)");
}

TEST(MoxColor, AlphaInTextReadsBackAsTheSameNumber) {
    for (int alpha = 1; alpha < 255; ++alpha) {
        const std::string text = rgbaOf(MoxColor(0, 0, 0, alpha));
        ASSERT_EQ(text.substr(0, 11), "rgba(0,0,0,");
        EXPECT_EQ(std::lround(std::stod(text.substr(11)) * 255.0), alpha) << text;
    }
}

TEST(MoxColor, TextReadsBackAsTheSameColor) {
    for (unsigned int rgb = 0; rgb <= 0xFFFFFF; rgb += 0x1111 - 0x10) {
        const MoxColor color(rgb);
        MoxColor read;
        ASSERT_TRUE(MoxParser::readColor(color.toString(true, false, false), true, read));
        ASSERT_EQ(read, color) << nameOf(color);
    }
}

} // namespace

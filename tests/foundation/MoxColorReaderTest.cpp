#include "foundation/common/MoxColorReader.h"

#include <gtest/gtest.h>
#include <string>

namespace {

using namespace MoxCommonNS;

std::string bytesOf(const std::u16string& text) {
    std::string bytes;
    return UnicodeString(text.data(), static_cast<std::int32_t>(text.size())).toUTF8String(bytes);
}

bool isWholeColor(const std::u16string& text, MoxColor& color) {
    MoxColorReader reader(text);
    return reader.read(color) && reader.isAtEnd();
}

TEST(MoxColorReader, ReadsEveryColorNameOfSvg) {
    const struct {
        std::uint32_t rgb;
        std::u16string name;
    } rows[] = {

#define MOX_COLOR(rgb, text) {rgb, text},
#include "foundation/common/MoxSvgColors.def"
#undef MOX_COLOR
    };
    EXPECT_EQ(std::size(rows), 147U);
    for (const auto& row : rows) {
        MoxColor color;
        EXPECT_TRUE(isWholeColor(row.name, color)) << bytesOf(row.name);
        EXPECT_EQ(color, MoxColor(row.rgb)) << bytesOf(row.name);
    }
}

TEST(MoxColorReader, EveryColorNameOfHtmlIsOneOfSvg) {
    const struct {
        std::uint32_t rgb;
        std::u16string name;
    } rows[] = {

#define MOX_COLOR(rgb, text) {rgb, text},
#include "foundation/common/MoxHtmlColors.def"
#undef MOX_COLOR
    };
    EXPECT_EQ(std::size(rows), 16U);
    for (const auto& row : rows) {
        MoxColor color;
        EXPECT_TRUE(isWholeColor(row.name, color)) << bytesOf(row.name);
        EXPECT_EQ(color, MoxColor(row.rgb)) << bytesOf(row.name);
    }
}

TEST(MoxColorReader, ReadsAllFormsOfColors) {
    const struct {
        std::u16string text;
        MoxColor color;
    } rows[] = {
        {u"red", {255, 0, 0}},
        {u"ReD", {255, 0, 0}},
        {u"LightGoldenRodYellow", {0xFAFAD2}},
        {u"grey", {128, 128, 128}},
        {u"#f80", {0xFF8800}},
        {u"#F80a1B", {0xF80A1B}},
        {u" \t\r\n#000\n", {0, 0, 0}},
        {u"rgb(1,2,3)", {1, 2, 3}},
        {u"RGB( 1 ,\t2 ,\n3 )", {1, 2, 3}},
        {u"rgb(+10,-10,300)", {10, 0, 255}},
        {u"rgb(0,00000000000000000000000000000000000007,99999999999999999999999999)", {0, 7, 255}},
        {u"rgb(0%,50%,100%)", {0, 128, 255}},
        {u"rgb(0.4%, .5%, 99.99%)", {1, 1, 255}},
        {u"rgb(-1%,+20%,1000%)", {0, 51, 255}},
        {u"rgb(20.00000000000000000000000000000000000000001%,0%,0%)", {51, 0, 0}},
        {u"transparent", {0, 0, 0, 0}},
        {u"Transparent ", {0, 0, 0, 0}},
    };

    for (const auto& row : rows) {
        MoxColor color(9, 9, 9);
        EXPECT_TRUE(isWholeColor(row.text, color)) << bytesOf(row.text);
        EXPECT_EQ(color, row.color) << bytesOf(row.text);
    }
}

TEST(MoxColorReader, WhatIsNoColorIsRefusedAndLeavesTheColor) {
    const std::u16string texts[] = {
        u"",
        u"  ",
        u"none",
        u"currentColor",
        u"url(#paint)",
        u"reddish",
        u"red2",
        u"red-ish",
        u"red\u00E9",
        u"re",
        u"lightgoldenrodyellowlightgoldenrodyellow",
        u"#",
        u"#1",
        u"#12",
        u"#1234",
        u"#12345",
        u"#1234567",
        u"#12g",
        u"# 123",
        u"##123",
        u"rgb",
        u"rgb(",
        u"rgb()",
        u"rgb (1,2,3)",
        u"rgb(1,2)",
        u"rgb(1,2,3",
        u"rgb(1,2,3,4)",
        u"rgb(1 2 3)",
        u"rgb(1,2%,3)",
        u"rgb(1%,2%,3)",
        u"rgb(1.5,2,3)",
        u"rgb(1.%,2%,3%)",
        u"rgb(.%,2%,3%)",
        u"rgb(1 %,2%,3%)",
        u"rgb(+-1,2,3)",
        u"rgb(- 1,2,3)",
        u"rgb(1e1,2,3)",
        u"rgba(1,2,3)",
        u"red(1,2,3)",
        u"rgb(\u0661,2,3)",
    };
    for (const std::u16string& text : texts) {
        MoxColor color(9, 9, 9);
        MoxColorReader reader(text);
        EXPECT_FALSE(reader.read(color)) << bytesOf(text);
        EXPECT_EQ(color, MoxColor(9, 9, 9)) << bytesOf(text);
    }
}

TEST(MoxColorReader, StopsBehindTheColor) {
    for (const std::u16string text : {u"red icc-color(p,1)", u"#f00 icc-color(p,1)",
                                      u"rgb(255,0,0)icc-color(p,1)", u"red,blue", u"red)"}) {
        MoxColor color;
        MoxColorReader reader(text);
        EXPECT_TRUE(reader.read(color)) << bytesOf(text);
        EXPECT_EQ(color, MoxColor(255, 0, 0)) << bytesOf(text);
        EXPECT_FALSE(reader.isAtEnd()) << bytesOf(text);
    }
}

TEST(MoxColorReader, NullCharacterIsNoColorAndNoEnd) {
    const std::u16string text(u"red\0", 4);
    MoxColor color;
    MoxColorReader reader(text);
    EXPECT_TRUE(reader.read(color));
    EXPECT_FALSE(reader.isAtEnd());
}

} // namespace

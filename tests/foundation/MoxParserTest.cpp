#include "foundation/common/MoxParser.h"

#include <clocale>
#include <gtest/gtest.h>
#include <limits>
#include <string>

namespace {

using namespace MoxCommonNS;

MoxValue parse(const UnicodeString& text, int start = 0) {
    return MoxParser::parse(text, start, MoxTokenizer::TOKENIZER_DEFAULT);
}

std::string bytesOf(const UnicodeString& text) {
    std::string bytes;
    return text.toUTF8String(bytes);
}

TEST(MoxParser, ReadsIntegers) {
    const struct {
        const char16_t* text;
        int number;
    } rows[] = {
        {u"0", 0},
        {u"512", 512},
        {u"-7", -7},
        {u"+7", 7},
        {u" \t12\n", 12},
        {u"-0", 0},
        {u"2147483647", std::numeric_limits<int>::max()},
        {u"-2147483648", std::numeric_limits<int>::min()},
        {u"00000000000000000000000000000000000000000000000000000000000000012", 12},
    };

    for (const auto& row : rows) {
        const MoxValue value = parse(row.text);
        EXPECT_EQ(value.getType(), MOXVALUE_INTEGER) << bytesOf(row.text);
        EXPECT_EQ(value.getIntegerValue(), row.number) << bytesOf(row.text);
    }
}

TEST(MoxParser, ReadsReals) {
    const struct {
        const char16_t* text;
        float number;
    } rows[] = {
        {u"1.5", 1.5F},
        {u"-.25", -0.25F},
        {u"+0.1", 0.1F},
        {u"1e3", 1000.0F},
        {u"1E+3", 1e3F},
        {u"2.5e-3", 0.0025F},
        {u"2147483648", 2147483648.0F},
        {u" 1.0 ", 1.0F},
        {u"99999999999999999999", 1e20F},
    };

    for (const auto& row : rows) {
        const MoxValue value = parse(row.text);
        EXPECT_EQ(value.getType(), MOXVALUE_REAL) << bytesOf(row.text);
        EXPECT_EQ(value.getRealValue(MOXUNIT_NONE), row.number) << bytesOf(row.text);
    }
}

TEST(MoxParser, ReadsNumbersWithAUnitAsLengths) {
    const struct {
        const char16_t* text;
        MoxLength length;
    } rows[] = {
        {u"12pt", {12.0F, MOXUNIT_POINT}}, {u"2.54cm", {2.54F, MOXUNIT_CM}},
        {u"-3MM", {-3.0F, MOXUNIT_MM}},    {u".5In", {0.5F, MOXUNIT_INCH}},
        {u"1e1pc", {10.0F, MOXUNIT_PICA}},
    };

    for (const auto& row : rows) {
        const MoxValue value = parse(row.text);
        EXPECT_EQ(value.getType(), MOXVALUE_LENGTH) << bytesOf(row.text);
        EXPECT_EQ(value.getRealValue(MOXUNIT_POINT), row.length.getRawValue()) << bytesOf(row.text);
    }
}

TEST(MoxParser, ReadsNumericColors) {
    EXPECT_EQ(parse(u"#f00"), MoxValue(MoxColor(255, 0, 0)));
    EXPECT_EQ(parse(u" #012345 "), MoxValue(MoxColor(0x012345)));
}

TEST(MoxParser, EverythingElseIsAStringAsItStands) {
    const char16_t* texts[] = {
        u"auto",  u" auto ", u"red",    u"12abc",  u"12 pt", u"12px",    u"1em",    u"1ex",
        u"1e",    u"1e+",    u"1.",     u".",      u"-",     u"+",       u"+-1",    u"1,5",
        u"1 2",   u"100%",   u"#page1", u"#f00 x", u"inf",   u"nan",     u"0x10",   u"\u0661",
        u"1.5.5", u"pt",     u"1e400",  u"1e-400", u"1e39",  u"1e400cm", u"1e38cm",
    };
    for (const char16_t* text : texts) {
        const MoxValue value = parse(text);
        EXPECT_EQ(value.getType(), MOXVALUE_STRING) << bytesOf(text);
        EXPECT_EQ(value.toString(), UnicodeString(text)) << bytesOf(text);
    }
}

TEST(MoxParser, NothingButWhiteSpaceIsTheNullValue) {
    EXPECT_EQ(parse(u""), MoxValue::NULL_VALUE);
    EXPECT_EQ(parse(u" \t\r\n"), MoxValue::NULL_VALUE);
    UnicodeString bogus;
    bogus.setToBogus();
    EXPECT_EQ(parse(bogus), MoxValue::NULL_VALUE);
}

TEST(MoxParser, StartsAtTheGivenIndex) {
    EXPECT_EQ(parse(u"page12", 4), MoxValue(12));
    EXPECT_EQ(parse(u"page12", 2), MoxValue(UnicodeString(u"ge12")));
}

TEST(MoxParser, StartOutsideTheTextIsSafe) {
    EXPECT_EQ(parse(u"12", -1), MoxValue(12));
    EXPECT_EQ(parse(u"12", std::numeric_limits<int>::min()), MoxValue(12));
    EXPECT_EQ(parse(u"12", 2), MoxValue::NULL_VALUE);
    EXPECT_EQ(parse(u"12", std::numeric_limits<int>::max()), MoxValue::NULL_VALUE);
}

TEST(MoxParser, LocaleHasNoSayInNumbers) {
    const char* old = std::setlocale(LC_NUMERIC, nullptr);
    const std::string saved = old ? old : "C";
    std::setlocale(LC_NUMERIC, "de_DE.UTF-8"); // does nothing on machines without that locale
    EXPECT_EQ(parse(u"1.5"), MoxValue(1.5F));
    EXPECT_EQ(parse(u"1,5").getType(), MOXVALUE_STRING);
    std::setlocale(LC_NUMERIC, saved.c_str());
}

TEST(MoxParser, StrictColorIsTheWholeText) {
    MoxColor color;
    EXPECT_TRUE(MoxParser::readColor(u" red ", /*strict=*/true, color));
    EXPECT_EQ(color, MoxColor(255, 0, 0));
    EXPECT_FALSE(MoxParser::readColor(u"red icc-color(p,1)", /*strict=*/true, color));
    EXPECT_EQ(color, MoxColor(0, 0, 0, 0));
}

TEST(MoxParser, LenientColorIsTheBeginningOfTheText) {
    MoxColor color;
    EXPECT_TRUE(MoxParser::readColor(u"#cd853f icc-color(p,1)", /*strict=*/false, color));
    EXPECT_EQ(color, MoxColor(0xCD853F));
    EXPECT_FALSE(MoxParser::readColor(u"icc-color(p,1) red", /*strict=*/false, color));
    EXPECT_EQ(color, MoxColor(0, 0, 0, 0));
}

TEST(MoxParser, TransparentAndWhatIsNoColorAreFullyTransparent) {
    const MoxValue clear(MoxColor(0, 0, 0, 0));
    for (const char16_t* text : {u"transparent", u"none", u"url(#paint)", u""}) {
        EXPECT_EQ(MoxParser::parseColor(text, /*strict=*/true), clear) << bytesOf(text);
        EXPECT_EQ(MoxParser::parseColor(text, /*strict=*/false), clear) << bytesOf(text);
    }
    MoxColor color;
    EXPECT_TRUE(MoxParser::readColor(u"transparent", true, color));
    EXPECT_FALSE(MoxParser::readColor(u"none", true, color));
}

TEST(MoxParser, ParsedColorIsAColorValue) {
    EXPECT_EQ(MoxParser::parseColor(u"rgb(100%,0%,0%)", true), MoxValue(MoxColor(255, 0, 0)));
}

} // namespace

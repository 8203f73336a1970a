#include "foundation/common/MoxUtil.h"

#include <climits>
#include <clocale>
#include <limits>
#include <string>

#include <gtest/gtest.h>

using namespace MoxCommonNS;

namespace {

std::string utf8(const UnicodeString& text) {
    std::string bytes;
    return text.toUTF8String(bytes);
}

std::string format(long long number, const UnicodeString& picture,
                   const UnicodeString& separator = UnicodeString(), int groupSize = 0) {
    return utf8(MoxUtil::formatNumber(number, picture, separator, groupSize,
                                      MoxLang(icu::Locale::getRoot()), MOXNAME_ALPHABETIC));
}

struct FormatRow {
    long long number;
    const char16_t* picture;
    const char* text;
};

void expectRows(std::initializer_list<FormatRow> rows) {
    for (const FormatRow& row : rows) {
        EXPECT_EQ(format(row.number, row.picture), row.text)
            << row.number << " as " << utf8(row.picture);
    }
}

TEST(MoxUtil, IntegersAreDecimal) {
    EXPECT_EQ(utf8(MoxUtil::toString(0)), "0");
    EXPECT_EQ(utf8(MoxUtil::toString(INT_MAX)), "2147483647");
    EXPECT_EQ(utf8(MoxUtil::toString(INT_MIN)), "-2147483648");
}

TEST(MoxUtil, DoublesArePrintedWithoutExponent) {
    EXPECT_EQ(utf8(MoxUtil::toString(0.1)), "0.1");
    EXPECT_EQ(utf8(MoxUtil::toString(double(0.1F))), "0.1");
    EXPECT_EQ(utf8(MoxUtil::toString(1e-5)), "0.00001");
    EXPECT_EQ(utf8(MoxUtil::toString(-2.5)), "-2.5");
    EXPECT_EQ(utf8(MoxUtil::toString(1.0 / 3)), "0.3333333333333333");
    EXPECT_EQ(utf8(MoxUtil::toString(-0.0)), "0");
    EXPECT_EQ(utf8(MoxUtil::toString(std::numeric_limits<double>::quiet_NaN())), "0");
}

TEST(MoxUtil, LongestDoubleFits) {
    const std::string text = utf8(MoxUtil::toString(-std::numeric_limits<double>::denorm_min()));
    EXPECT_EQ(text.substr(0, 4), "-0.0");
    EXPECT_EQ(text.back(), '5');
}

TEST(MoxUtil, SetLocaleCLeavesTheLocaleOfTheProcessAlone) {
    const std::string before = std::setlocale(LC_ALL, "C.UTF-8") ? "C.UTF-8" : "C";
    MoxUtil::setLocaleC();
    EXPECT_EQ(std::setlocale(LC_ALL, nullptr), before);
    std::setlocale(LC_ALL, "C");
}

TEST(MoxUtil, EmptyFormatReadsAsOne) { expectRows({{3, u"", "3"}, {0, u"", "0"}}); }

TEST(MoxUtil, ZerosBeforeTheOneSetTheLeastCountOfDigits) {
    expectRows({{3, u"1", "3"},
                {3, u"01", "03"},
                {12, u"01", "12"},
                {123, u"01", "123"},
                {7, u"0001", "0007"},
                {0, u"01", "00"}});
}

TEST(MoxUtil, MinusSignAddsToTheLeastCountOfDigits) {
    expectRows({{-3, u"1", "-3"}, {-3, u"01", "-03"}, {-12, u"001", "-012"}});
}

TEST(MoxUtil, ExtremeNumbersKeepAllDigits) {
    expectRows({{LLONG_MAX, u"1", "9223372036854775807"},
                {LLONG_MIN, u"1", "-9223372036854775808"},
                {LLONG_MIN, u"i", "-9223372036854775808"},
                {LLONG_MAX, u"a", "crpxnlskvljfhg"}});
}

TEST(MoxUtil, LettersCountWithoutAZero) {
    expectRows({{1, u"a", "a"},
                {26, u"a", "z"},
                {27, u"a", "aa"},
                {52, u"A", "AZ"},
                {53, u"A", "BA"},
                {702, u"a", "zz"},
                {703, u"A", "AAA"}});
}

TEST(MoxUtil, RomanNumeralsSubtract) {
    expectRows({{1, u"i", "i"},
                {4, u"i", "iv"},
                {9, u"I", "IX"},
                {49, u"i", "xlix"},
                {1994, u"I", "MCMXCIV"},
                {3999, u"I", "MMMCMXCIX"},
                {444, u"i", "cdxliv"}});
}

TEST(MoxUtil, NumbersThatLettersCantExpressAreDecimal) {
    expectRows({{0, u"a", "0"},
                {-1, u"A", "-1"},
                {0, u"i", "0"},
                {-5, u"I", "-5"},
                {4000, u"I", "4000"},
                {0, u"(a)", "(0)"}});
}

TEST(MoxUtil, PunctuationAroundTheTokenIsKept) {
    expectRows({{3, u"-1-", "-3-"},
                {3, u" (01). ", " (03). "},
                {3, u"_01", "_03"},
                {4, u"[[i", "[[iv"},
                {3, u"\U0001F600\u200B1\U0001F600",
                 "\xF0\x9F\x98\x80\xE2\x80\x8B"
                 "3\xF0\x9F\x98\x80"}});
}

TEST(MoxUtil, PunctuationAloneStandsOnBothSides) {
    expectRows({{3, u"-", "-3-"}, {3, u". ", ". 3. "}});
}

TEST(MoxUtil, FirstOfSeveralTokensCountsAndTheLastPunctuationEnds) {
    expectRows({{3, u"01.a.i)", "03)"}, {3, u"(a.01", "(c"}, {3, u"1-1", "3"}});
}

TEST(MoxUtil, UnknownTokenReadsAsOne) {
    expectRows({{3, u"x", "3"},
                {3, u"5", "3"},
                {3, u"0", "3"},
                {3, u"11", "3"},
                {3, u"a1", "3"},
                {3, u"aa", "3"},
                {3, u"(\u4E00)", "(3)"}});
}

TEST(MoxUtil, DigitsOfOtherScriptsAreFollowed) {
    expectRows({{12, u"\u0661", "\xD9\xA1\xD9\xA2"},
                {3, u"\u0660\u0661", "\xD9\xA0\xD9\xA3"},
                {-3, u"\u0967", "-\xE0\xA5\xA9"},
                {30, u"\U0001D7D8\U0001D7D8\U0001D7D9",
                 "\xF0\x9D\x9F\x98\xF0\x9D\x9F\x9B\xF0\x9D\x9F\x98"},
                {3, u"0\u0661", "3"}});
}

TEST(MoxUtil, SeparatorPartsGroupsFromTheRight) {
    EXPECT_EQ(format(1234567, u"1", u",", 3), "1,234,567");
    EXPECT_EQ(format(123, u"1", u",", 3), "123");
    EXPECT_EQ(format(-123456, u"1", u"' '", 3), "-123' '456");
    EXPECT_EQ(format(7, u"0001", u".", 2), "00.07");
    EXPECT_EQ(format(123, u"1", u",", 1), "1,2,3");
    EXPECT_EQ(format(1234, u"(1)", u" ", INT_MAX), "(1234)");
}

TEST(MoxUtil, GroupingNeedsSeparatorAndSize) {
    EXPECT_EQ(format(1234567, u"1", u"", 3), "1234567");
    EXPECT_EQ(format(1234567, u"1", u",", 0), "1234567");
    EXPECT_EQ(format(1234567, u"1", u",", -3), "1234567");
}

TEST(MoxUtil, LongFormatsAreCarriedWhole) {
    const UnicodeString marks(100000, UChar32(u'-'), 100000);
    const UnicodeString zeros(100000, UChar32(u'0'), 100000);
    EXPECT_EQ(format(5, marks + u"1" + marks),
              std::string(100000, '-') + "5" + std::string(100000, '-'));
    EXPECT_EQ(format(5, zeros + u"1"), std::string(100000, '0') + "5");
}

TEST(MoxUtil, LoneSurrogatesInAFormatAreKept) {
    const UnicodeString lone(char16_t(0xDC00));
    const UnicodeString text =
        MoxUtil::formatNumber(3, lone + u"1" + lone, u"", 0, MoxLang(), MOXNAME_ALPHABETIC);
    EXPECT_EQ(text, lone + u"3" + lone);
}

} // namespace

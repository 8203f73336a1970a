#include "path/SVGNumberRule.h"

#include "tests/path/PlainNumberRule.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <limits>

namespace DrawmereNS {
namespace {

using DrawmereTest::NumberRuleCheck;
using MoxCommonNS::MOXUNIT_MM;

constexpr float largest = std::numeric_limits<float>::max();
constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();
constexpr float smallest = std::numeric_limits<float>::denorm_min();
constexpr char largestText[] = "340282346638528859811704183484516925440";

/// What lies this far from zero, and no farther, is zero.
constexpr float limit = MoxLength(0.001F, MOXUNIT_MM).getRawValue();

MoxLength pt(float points) { return MoxLength::fromRaw(points); }

std::string digitsOf(float value) {
    char digits[maxRuleText];
    return {digits, writeRuleDigits(value, digits)};
}

std::string numberOf(MoxLength length) {
    char digits[maxRuleText];
    return {digits, writeRuleNumber(length, digits)};
}

std::string pointOf(float x, float y) {
    char digits[maxRulePoint];
    return {digits, writeRulePoint(MoxPointT<MoxLength>(pt(x), pt(y)), digits)};
}

std::string narrowed(const char16_t* begin, const char16_t* end) { return {begin, end}; }

struct DigitsRow {
    float value;
    const char* text;
};

constexpr DigitsRow digitsRows[] = {
    {12.5F, "12.5"},
    {3.0F, "3"},
    {0.25F, ".25"},
    {-0.25F, "-.25"},
    {100.0F, "100"},
    {1.2344F, "1.234"},
    {0.1F, ".1"},
    {-0.5F, "-.5"},
    {1000000.0F, "1000000"},
    {0.0F, "0"},
    {10.0F, "10"},
    {10.1F, "10.1"},
    {10.01F, "10.01"},
    {10.001F, "10.001"},
    {-10.001F, "-10.001"},
    {1.05F, "1.05"},
    {0.001F, ".001"},
    {0.01F, ".01"},
    {0.999F, ".999"},
    {0.0014F, ".001"},
    {0.0016F, ".002"},
    {0.9996F, "1"},
    {-0.9996F, "-1"},
    {9.9996F, "10"},
    {999.9996F, "1000"},
    {1023.9996F, "1024"},
    {8388607.5F, "8388607.5"},
    {16777214.0F, "16777214"},
    {16777216.0F, "16777216"},
    {-16777218.0F, "-16777218"},
    {4294967296.0F, "4294967296"},
    {9.0e18F, "9000000202358128640"},
    {9223372036854775808.0F, "9223372036854775808"},
    {1.8446744e19F, "18446744073709551616"},
    {1.0e20F, "100000002004087734272"},
};

TEST(SVGNumberRule, WholeNumbersAreWrittenAsSuch) {
    for (int number = -1100; number <= 1100; ++number) {
        const std::string text = number == 0 ? "0" : std::to_string(number);
        EXPECT_EQ(digitsOf(static_cast<float>(number)), text);
        char16_t wide[maxRuleText];
        EXPECT_EQ(narrowed(wide, writeRuleDigits(static_cast<float>(number), wide)), text);
    }
}

TEST(SVGNumberRule, DigitsAreThreeDecimalsWithoutTheZerosThatSayNothing) {
    for (const DigitsRow& row : digitsRows) {
        EXPECT_EQ(digitsOf(row.value), row.text);
    }
}

TEST(SVGNumberRule, WhatRoundsToNothingKeepsItsSign) {
    EXPECT_EQ(digitsOf(0.0004F), "0");
    EXPECT_EQ(digitsOf(-0.0004F), "-0");
    EXPECT_EQ(digitsOf(smallest), "0");
    EXPECT_EQ(digitsOf(-smallest), "-0");
    EXPECT_EQ(digitsOf(-0.0F), "-0");
}

TEST(SVGNumberRule, AHalfGoesToTheEvenThousandth) {
    EXPECT_EQ(digitsOf(0.0625F), ".062");
    EXPECT_EQ(digitsOf(0.1875F), ".188");
    EXPECT_EQ(digitsOf(0.3125F), ".312");
    EXPECT_EQ(digitsOf(-0.4375F), "-.438");
    EXPECT_EQ(digitsOf(1000.0625F), "1000.062");
    EXPECT_EQ(digitsOf(std::nextafter(0.0625F, 1.0F)), ".063");
    EXPECT_EQ(digitsOf(std::nextafter(0.1875F, 0.0F)), ".187");
}

TEST(SVGNumberRule, WhatIsNoNumberOrNotFiniteIsZero) {
    for (const float value : {undefined, -undefined, infinite, -infinite}) {
        EXPECT_EQ(digitsOf(value), "0");
        EXPECT_EQ(numberOf(pt(value)), "0");
    }
}

TEST(SVGNumberRule, TheLargestNumberKeepsAllItsDigits) {
    EXPECT_EQ(digitsOf(largest), largestText);
    EXPECT_EQ(digitsOf(-largest), std::string("-") + largestText);
    EXPECT_EQ(pointOf(-largest, -largest), digitsOf(-largest) + "," + digitsOf(-largest));
    EXPECT_LE(pointOf(-largest, -largest).size(), maxRulePoint);
}

TEST(SVGNumberRule, NothingIsWrittenBehindTheRoomForATextEvenForAMoment) {
    for (const float value : {largest, -largest, -16777215.0F, -8388607.5F, -0.001F, undefined}) {
        char digits[maxRuleText + 8];
        std::fill(std::begin(digits), std::end(digits), '#');
        writeRuleDigits(value, digits);
        EXPECT_EQ(std::string(digits + maxRuleText, 8), "########") << value;
    }
}

TEST(SVGNumberRule, SaysTheSameOfThreeMillionNumbersAsItsPlainestForm) {
    constexpr std::uint64_t stride = 1409; // a prime, so that no bits of the patterns go in step
    NumberRuleCheck rule;
    rule.checkPatterns(stride);
    EXPECT_GE(rule.count, 3'000'000);
    EXPECT_EQ(rule.faults, 0) << rule.lastFault;
}

TEST(SVGNumberRule, SaysTheSameAroundTheMiddleOfTwoThousandths) {
    NumberRuleCheck rule;
    rule.checkTies(20'000);
    EXPECT_EQ(rule.count, 20'000 * 2 * 18);
    EXPECT_EQ(rule.faults, 0) << rule.lastFault;
}

TEST(SVGNumberRule, WritesTheSameInUtf16) {
    for (const DigitsRow& row : digitsRows) {
        const MoxPointT<MoxLength> point(pt(row.value), pt(-row.value));
        char16_t digits[maxRulePoint];
        EXPECT_EQ(narrowed(digits, writeRuleDigits(row.value, digits)), row.text);
        EXPECT_EQ(narrowed(digits, writeRuleNumber(point.x, digits)), numberOf(point.x));
        EXPECT_EQ(narrowed(digits, writeRulePoint(point, digits)), pointOf(row.value, -row.value));
    }
}

TEST(SVGNumberRule, ALengthIsWrittenInPoints) {
    EXPECT_EQ(numberOf(pt(12.5F)), "12.5");
    EXPECT_EQ(numberOf(MoxLength(1, MOXUNIT_MM)), "2.835");
    EXPECT_EQ(numberOf(MoxLength(-1, MoxCommonNS::MOXUNIT_INCH)), "-72");
    EXPECT_EQ(numberOf(MoxLength(0.5F, MoxCommonNS::MOXUNIT_PICA)), "6");
}

TEST(SVGNumberRule, ALengthUpToAThousandthOfAMillimetreIsZeroAndHasNoSign) {
    for (const float value : {0.0F, -0.0F, smallest, -smallest, 0.002F, -0.002F, limit, -limit}) {
        EXPECT_TRUE(isRuleZero(pt(value)));
        EXPECT_EQ(numberOf(pt(value)), "0");
    }
}

TEST(SVGNumberRule, ALongerLengthKeepsADigit) {
    // The limit is 0.0028 points, so what lies beyond it does not round to nothing.
    EXPECT_EQ(numberOf(pt(std::nextafter(limit, 1.0F))), ".003");
    EXPECT_EQ(numberOf(pt(std::nextafter(-limit, -1.0F))), "-.003");
    EXPECT_FALSE(isRuleZero(pt(std::nextafter(limit, 1.0F))));
    EXPECT_FALSE(isRuleZero(pt(std::nextafter(-limit, -1.0F))));
}

TEST(SVGNumberRule, WhatIsNotFiniteCountsAsNoZero) {
    EXPECT_FALSE(isRuleZero(pt(undefined)));
    EXPECT_FALSE(isRuleZero(pt(infinite)));
    EXPECT_FALSE(isRuleZero(pt(-infinite)));
}

TEST(SVGNumberRule, TheCommaOfAPointStandsBeforeANegativeNumberToo) {
    EXPECT_EQ(pointOf(1, 2), "1,2");
    EXPECT_EQ(pointOf(-1.5F, -0.25F), "-1.5,-.25");
    EXPECT_EQ(pointOf(0, undefined), "0,0");
}

} // namespace
} // namespace DrawmereNS

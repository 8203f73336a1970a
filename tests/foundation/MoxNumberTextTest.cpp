#include "foundation/common/MoxNumberText.h"

#include <bit>
#include <charconv>
#include <cmath>
#include <cstdio>
#include <gtest/gtest.h>
#include <limits>
#include <string>

namespace {

using namespace MoxCommonNS;

constexpr float infinity = std::numeric_limits<float>::infinity();
constexpr float notANumber = std::numeric_limits<float>::quiet_NaN();

template <typename Real> std::string realText(Real value) {
    char text[maxRealText];
    return {text, writeReal(value, text)};
}

std::string roundedText(float value, int decimals) {
    char text[maxRealText];
    return {text, writeRoundedReal(value, decimals, text)};
}

std::string integerText(std::int64_t value) {
    char text[maxIntegerText];
    return {text, writeInteger(value, text)};
}

template <typename Real> std::string shortestFixed(Real value) {
    char text[maxRealText];
    return {text, std::to_chars(text, text + maxRealText, value, std::chars_format::fixed).ptr};
}

template <typename Real> Real readBack(const std::string& text) {
    Real value = 0;
    const char* end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, value, std::chars_format::fixed);
    return result.ptr == end ? value : std::numeric_limits<Real>::quiet_NaN();
}

struct FloatRow {
    float value;
    const char* text;
};

constexpr FloatRow floatRows[] = {
    {0.0F, "0"},
    {-0.0F, "0"},
    {notANumber, "0"},
    {infinity, "0"},
    {-infinity, "0"},
    {1.0F, "1"},
    {-1.0F, "-1"},
    {10.0F, "10"},
    {100.0F, "100"},
    {0.1F, "0.1"},
    {-0.1F, "-0.1"},
    {0.5F, "0.5"},
    {0.25F, "0.25"},
    {0.125F, "0.125"},
    {0.0625F, "0.0625"},
    {1.5F, "1.5"},
    {1.05F, "1.05"},
    {1.005F, "1.005"},
    {10.01F, "10.01"},
    {33.333332F, "33.333332"},
    {0.33333334F, "0.33333334"},
    {0.001F, "0.001"},
    {0.0001F, "0.0001"},
    {0.00001F, "0.00001"},
    {1.5e-7F, "0.00000015"},
    {123.456F, "123.456"},
    {1234.5677F, "1234.5677"},
    // On both sides of the border between two ways of finding the digits.
    {8191.999F, "8191.999"},
    {8191.9995F, "8191.9995"},
    {8192.0F, "8192"},
    {8192.001F, "8192.001"},
    {8192.002F, "8192.002"},
    {16384.002F, "16384.002"},
    {65535.996F, "65535.996"},
    {16777215.0F, "16777215"},
    {16777216.0F, "16777216"},
    {-16777216.0F, "-16777216"},
    {33554432.0F, "33554432"},
    {2147483648.0F, "2147483648"},
    {1e10F, "10000000000"},
};

TEST(MoxNumberText, AFloatIsItsShortestDecimal) {
    for (const FloatRow& row : floatRows) {
        EXPECT_EQ(realText(row.value), row.text);
    }
}

TEST(MoxNumberText, LargeAndSmallFloatsHaveNoExponent) {
    struct {
        float value;
        std::size_t length;
    } rows[] = {
        {1e20F, 21},
        {-1e20F, 22},
        {3.4e38F, 39},
        {std::numeric_limits<float>::max(), 39},
        {std::numeric_limits<float>::lowest(), 40},
        {std::numeric_limits<float>::min(), 47},
        {std::numeric_limits<float>::denorm_min(), 47},
        {-std::numeric_limits<float>::denorm_min(), 48},
        {1e-40F, 42},
    };

    for (const auto& row : rows) {
        const std::string text = realText(row.value);
        EXPECT_EQ(text.size(), row.length) << text;
        EXPECT_EQ(text.find_first_not_of("-.0123456789"), std::string::npos) << text;
        EXPECT_EQ(readBack<float>(text), row.value) << text;
    }
}

void expectShortestThatReadsBack(std::uint32_t bits) {
    const auto value = std::bit_cast<float>(bits);
    const std::string text = realText(value);
    if (!std::isfinite(value) || value == 0.0F) {
        ASSERT_EQ(text, "0") << bits;
        return;
    }
    ASSERT_EQ(text.find_first_not_of("-.0123456789"), std::string::npos) << text;
    ASSERT_EQ(std::bit_cast<std::uint32_t>(readBack<float>(text)), bits) << text;
    ASSERT_LE(text.size(), shortestFixed(value).size()) << text;
}

TEST(MoxNumberText, FloatsOfAllExponentsReadBackAndAreShortest) {
    constexpr std::uint64_t stride = 2039; // a prime: the low bits take all patterns
    for (std::uint64_t bits = 0; bits <= 0xFFFFFFFFU; bits += stride) {
        expectShortestThatReadsBack(static_cast<std::uint32_t>(bits));
    }
}

TEST(MoxNumberText, ThousandthsReadBackAndAreShortest) {
    for (int thousandths = 1; thousandths < 8200000; thousandths += 37) {
        const auto value = static_cast<float>(thousandths / 1000.0);
        for (const float neighbour : {value, std::nextafter(value, infinity)}) {
            expectShortestThatReadsBack(std::bit_cast<std::uint32_t>(neighbour));
            expectShortestThatReadsBack(std::bit_cast<std::uint32_t>(-neighbour));
        }
    }
}

TEST(MoxNumberText, ADoubleThatIsAFloatIsWrittenLikeIt) {
    for (const FloatRow& row : floatRows) {
        EXPECT_EQ(realText(static_cast<double>(row.value)), realText(row.value));
    }
}

TEST(MoxNumberText, AnyOtherDoubleIsItsShortestDecimal) {
    constexpr struct {
        double value;
        const char* text;
    } rows[] = {
        {0.1, "0.1"},
        {-0.1, "-0.1"},
        {1.0 / 3.0, "0.3333333333333333"},
        {3.141592653589793, "3.141592653589793"},
        {16777217.0, "16777217"},
        {1e-50, "0.00000000000000000000000000000000000000000000000001"},
        {123456789.125, "123456789.125"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(realText(row.value), row.text);
    }
    for (const double value :
         {1e300, -1e300, std::numeric_limits<double>::max(), std::numeric_limits<double>::lowest(),
          1e39, std::numeric_limits<double>::min(), -std::numeric_limits<double>::denorm_min()}) {
        const std::string text = realText(value);
        EXPECT_EQ(text.find_first_not_of("-.0123456789"), std::string::npos) << text;
        EXPECT_EQ(readBack<double>(text), value) << text;
        EXPECT_LE(text.size(), maxRealText);
    }
    EXPECT_EQ(realText(std::numeric_limits<double>::infinity()), "0");
    EXPECT_EQ(realText(-std::numeric_limits<double>::infinity()), "0");
    EXPECT_EQ(realText(std::numeric_limits<double>::quiet_NaN()), "0");
    EXPECT_EQ(realText(-0.0), "0");
}

struct RoundedRow {
    float value;
    int decimals;
    const char* text;
};

constexpr RoundedRow roundedRows[] = {
    {1.0F, 3, "1"},
    {1.0F, 0, "1"},
    {0.1F, 12, "0.1"},
    {33.333332F, 3, "33.333"},
    {33.333332F, 2, "33.33"},
    {33.333332F, 0, "33"},
    {66.666664F, 1, "66.7"},
    {1.999F, 2, "2"},
    {1.96F, 1, "2"},
    {9.9996F, 3, "10"},
    {-9.9996F, 3, "-10"},
    {1.5F, -4, "2"}, // negative decimals count as none
    // A tie goes to the even digit.
    {0.5F, 0, "0.5"},
    {1.5F, 0, "2"},
    {2.5F, 0, "2"},
    {0.125F, 2, "0.12"},
    {0.375F, 2, "0.38"},
    {8192.5F, 0, "8192"},
    {8193.5F, 0, "8194"},
    // What would become zero keeps its first digit.
    {0.4F, 0, "0.4"},
    {-0.04F, 1, "-0.04"},
    {0.00049F, 3, "0.0004"},
    {0.00099F, 2, "0.0009"},
    {1.5e-9F, 3, "0.000000001"},
    {-9.9e-9F, 6, "-0.000000009"},
    {1e-45F, 12, "0.000000000000000000000000000000000000000000001"},
    {0.0006F, 3, "0.001"},
    // Zero stays zero, and what is no number is one.
    {0.0F, 3, "0"},
    {-0.0F, 3, "0"},
    {notANumber, 3, "0"},
    {infinity, 3, "0"},
    {-infinity, 0, "0"},
    // Large numbers keep every digit before the point.
    {8192.123F, 1, "8192.1"},
    {65535.996F, 2, "65536"},
    {16777216.0F, 3, "16777216"},
};

TEST(MoxNumberText, RoundsToDecimals) {
    for (const RoundedRow& row : roundedRows) {
        EXPECT_EQ(roundedText(row.value, row.decimals), row.text) << row.decimals;
    }
}

std::string withoutTrailingZeros(std::string text) {
    if (text.find('.') != std::string::npos) {
        text.erase(text.find_last_not_of('0') + 1);
        text.erase(text.find_last_not_of('.') + 1);
    }
    return text;
}

/// The rule in slow motion: exact digits of the float, rounded by the C library.
std::string expectedRounding(float value, int decimals) {
    std::string shortest = shortestFixed(value);
    const std::size_t point = shortest.find('.');
    const std::size_t shortestDecimals =
        point == std::string::npos ? 0 : shortest.size() - point - 1;
    if (shortestDecimals <= static_cast<std::size_t>(decimals)) {
        return shortest;
    }
    char buffer[maxRealText];
    std::snprintf(buffer, sizeof(buffer), "%.*f", decimals, static_cast<double>(value));
    const std::string rounded = withoutTrailingZeros(buffer);
    return rounded == "0" || rounded == "-0"
               ? shortest.substr(0, shortest.find_first_of("123456789") + 1)
               : rounded;
}

TEST(MoxNumberText, RoundsLikeExactArithmetic) {
    constexpr std::uint64_t stride = 104729; // a prime
    for (std::uint64_t bits = 1; bits <= 0xFFFFFFFFU; bits += stride) {
        const auto value = std::bit_cast<float>(static_cast<std::uint32_t>(bits));
        if (!std::isfinite(value) || value == 0.0F) {
            continue;
        }
        for (int decimals = 0; decimals <= 12; ++decimals) {
            ASSERT_EQ(roundedText(value, decimals), expectedRounding(value, decimals))
                << bits << " with " << decimals;
        }
    }
}

TEST(MoxNumberText, RoundsCoordinatesLikeExactArithmetic) {
    for (int i = -40000; i <= 40000; ++i) {
        const float value = static_cast<float>(i) * 0.3337F + 0.0005F;
        for (int decimals = 0; decimals <= 6; ++decimals) {
            ASSERT_EQ(roundedText(value, decimals), expectedRounding(value, decimals))
                << value << " with " << decimals;
        }
    }
}

TEST(MoxNumberText, IntegersAreDecimal) {
    constexpr struct {
        std::int64_t value;
        const char* text;
    } rows[] = {
        {0, "0"},
        {7, "7"},
        {-7, "-7"},
        {10, "10"},
        {99, "99"},
        {100, "100"},
        {101, "101"},
        {-1000, "-1000"},
        {12345, "12345"},
        {std::numeric_limits<std::int32_t>::max(), "2147483647"},
        {std::numeric_limits<std::int32_t>::min(), "-2147483648"},
        {std::numeric_limits<std::int64_t>::max(), "9223372036854775807"},
        {std::numeric_limits<std::int64_t>::min(), "-9223372036854775808"},
    };

    for (const auto& row : rows) {
        EXPECT_EQ(integerText(row.value), row.text);
    }
    for (int i = -12345; i < 12345; ++i) {
        ASSERT_EQ(integerText(i), std::to_string(i));
    }
}

} // namespace

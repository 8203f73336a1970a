#include "foundation/common/MoxDigits.h"

#include <cmath>
#include <gtest/gtest.h>
#include <string>

namespace {

using namespace MoxCommonNS;

template <typename Char> std::string wholeText(std::uint64_t number) {
    Char text[20];
    Char* end = writeWhole(number, text);
    return {text, end};
}

template <typename Char> std::string decimalsText(std::uint32_t thousandths) {
    Char text[4];
    Char* end = writeDecimals(thousandths, text);
    return {text, end};
}

TEST(MoxDigits, RoundsTiesToEven) {
    EXPECT_EQ(roundToWhole(0.0), 0.0);
    EXPECT_EQ(roundToWhole(0.5), 0.0);
    EXPECT_EQ(roundToWhole(1.5), 2.0);
    EXPECT_EQ(roundToWhole(2.5), 2.0);
    EXPECT_EQ(roundToWhole(0.49999999999999994), 0.0);
    double number = 0.0;
    for (int i = 0; i < 110; ++i) {
        EXPECT_EQ(roundToWhole(number), std::nearbyint(number)) << number;
        number = number * 1.37 + 0.125;
    }
    EXPECT_LT(number, 0x1p51);
}

TEST(MoxDigits, WritesWholeNumbersOfEveryLength) {
    std::uint64_t number = 0;
    for (int length = 0; length < 20; ++length) {
        for (const std::uint64_t neighbour : {number, number + 1, number - 1}) {
            EXPECT_EQ(wholeText<char>(neighbour), std::to_string(neighbour));
            EXPECT_EQ(wholeText<char16_t>(neighbour), std::to_string(neighbour));
        }
        number = number == 0 ? 10 : number * 10;
    }
    EXPECT_EQ(wholeText<char>(UINT64_MAX), "18446744073709551615");
}

TEST(MoxDigits, WritesDecimalsWithoutTheZerosAtTheirEnd) {
    for (std::uint32_t thousandths = 1; thousandths < 1000; ++thousandths) {
        std::string expected = std::to_string(1000 + thousandths).replace(0, 1, ".");
        expected.erase(expected.find_last_not_of('0') + 1);
        EXPECT_EQ(decimalsText<char>(thousandths), expected);
        EXPECT_EQ(decimalsText<char16_t>(thousandths), expected);
    }
}

} // namespace

/// Decimal digits, three at a time, for texts of bytes and of UTF-16.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>

namespace MoxCommonNS {

/// Returns: `number` rounded to a whole one, ties to even. Range: 0 to 2^51.
inline double roundToWhole(double number) {
    // Where doubles lie one apart, the addition itself rounds.
    constexpr double shift = 0x1.8p52;
    return (number + shift) - shift;
}

/// The digits of 0 to 999, three each.
inline constexpr std::array<char, 3000> digitTriples = [] {
    std::array<char, 3000> digits = {};
    for (std::size_t i = 0; i < 1000; ++i) {
        digits[3 * i] = static_cast<char>('0' + i / 100);
        digits[3 * i + 1] = static_cast<char>('0' + i / 10 % 10);
        digits[3 * i + 2] = static_cast<char>('0' + i % 10);
    }
    return digits;
}();

/// Writes a number below 1000 with its leading zeros. Returns: the end of the text.
template <typename Char> Char* writeTriple(std::uint32_t number, Char* out) {
    const char* digits = &digitTriples[std::size_t{3} * number];
    out[0] = static_cast<Char>(digits[0]);
    out[1] = static_cast<Char>(digits[1]);
    out[2] = static_cast<Char>(digits[2]);
    return out + 3;
}

/// Writes a whole number. Returns: the end of the text.
template <typename Char> Char* writeWhole(std::uint64_t number, Char* out) {
    if (number >= 1000) {
        out = writeWhole(number / 1000, out);
        return writeTriple(static_cast<std::uint32_t>(number % 1000), out);
    }
    const char* digits = &digitTriples[3 * number];
    if (number >= 100) {
        *out++ = static_cast<Char>(digits[0]);
    }
    if (number >= 10) {
        *out++ = static_cast<Char>(digits[1]);
    }
    *out = static_cast<Char>(digits[2]);
    return out + 1;
}

/// Writes a point and up to three decimals, without the zeros at their end.
/// Shape: `thousandths` lies in 1 to 999; `out` has room for four characters.
template <typename Char> Char* writeDecimals(std::uint32_t thousandths, Char* out) {
    const char* digits = &digitTriples[std::size_t{3} * thousandths];
    out[0] = static_cast<Char>('.');
    out[1] = static_cast<Char>(digits[0]);
    out[2] = static_cast<Char>(digits[1]);
    out[3] = static_cast<Char>(digits[2]);
    if (digits[2] != '0') {
        return out + 4;
    }
    return digits[1] != '0' ? out + 3 : out + 2;
}

} // namespace MoxCommonNS

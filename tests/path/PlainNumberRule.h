/// The number rule of path data in its plainest form, and the samples that both forms have to agree
/// on.
#pragma once

#include "path/SVGNumberRule.h"

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <string>
#include <string_view>

namespace DrawmereTest {

/// Room for what the C library prints of any float.
using PlainBuffer = char[64];

/// Returns: where the text ends when the zeros behind the last digit that counts are cut, and with
/// them a point that nothing follows.
inline char* cutTrailingZeros(char* point) {
    if (point[3] != '0') {
        return point + 4;
    }
    char* last = point + 2;
    while (*last == '0') {
        --last;
    }
    return last == point ? point : last + 1;
}

/// Returns: the text of `value`, made step by step from what the C library prints.
inline std::string_view writePlainly(float value, PlainBuffer& buffer) {
    if (!std::isfinite(value)) {
        return "0";
    }
    std::snprintf(buffer, sizeof buffer, "%.3f", static_cast<double>(value));
    const char* begin = buffer;
    char* point = std::strchr(buffer, '.');
    const char* end = cutTrailingZeros(point);
    const bool isFraction = end != point;
    if (isFraction && std::strncmp(buffer, "0.", 2) == 0) {
        begin = buffer + 1;
    } else if (isFraction && std::strncmp(buffer, "-0.", 3) == 0) {
        buffer[1] = '-';
        begin = buffer + 1;
    }
    return {begin, static_cast<std::size_t>(end - begin)};
}

/// Compares the two forms of the rule, float by float.
struct NumberRuleCheck {
    void check(float value) {
        char digits[DrawmereNS::maxRuleText];
        const char* end = DrawmereNS::writeRuleDigits(value, digits);
        const std::string_view found(digits, static_cast<std::size_t>(end - digits));
        PlainBuffer buffer;
        const std::string_view expected = writePlainly(value, buffer);
        ++count;
        if (found != expected) {
            ++faults;
            lastFault = std::string(expected) + " was written as " + std::string(found);
        }
    }

    /// Checks the floats around `value`, and those around its negative.
    void checkAround(float value) {
        constexpr std::uint32_t reach = 4;
        constexpr std::uint32_t signBit = 0x80000000;
        const auto bits = std::bit_cast<std::uint32_t>(value);
        for (std::uint32_t near = bits - reach; near <= bits + reach; ++near) {
            check(std::bit_cast<float>(near));
            check(std::bit_cast<float>(near | signBit));
        }
    }

    /// Checks every `stride`th bit pattern, and so all exponents and both signs.
    void checkPatterns(std::uint64_t stride) {
        for (std::uint64_t bits = 0; bits <= UINT32_MAX; bits += stride) {
            check(std::bit_cast<float>(static_cast<std::uint32_t>(bits)));
        }
    }

    /// Checks what lies around the middle between two thousandths: `howMany` floats that are such a
    /// middle, and as many that lie next to one.
    void checkTies(int howMany) {
        for (int i = 0; i < howMany; ++i) {
            checkAround(static_cast<float>(2 * i + 1) / 16.0F);
            checkAround(static_cast<float>((static_cast<double>(i) + 0.5) / 1000.0));
        }
    }

    std::int64_t count = 0;
    std::int64_t faults = 0;
    std::string lastFault;
};

} // namespace DrawmereTest

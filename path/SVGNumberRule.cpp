#include "path/SVGNumberRule.h"

#include "foundation/common/MoxDigits.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <iterator>

namespace DrawmereNS {
namespace {

using MoxCommonNS::digitTriples;
using MoxCommonNS::MOXUNIT_MM;
using MoxCommonNS::MOXUNIT_POINT;
using MoxCommonNS::roundToWhole;
using MoxCommonNS::writeWhole;

/// From here on floats are whole numbers.
constexpr float wholeFrom = 16777216.0F;
/// From here on a whole number may not fit into 64 bits.
constexpr float hugeFrom = 9.0e18F;

constexpr float zeroLimit = MoxLength(0.001F, MOXUNIT_MM).getRawValue();

/// Whole numbers from here on have more than three digits.
constexpr float shortFrom = 1000.0F;

/// Below this the digits before the point are at most three.
constexpr double shortThousandths = 1.0e6;

/// Writes a point and three decimals, and cuts what is not needed of them. Which digits are zero
/// follows no pattern, so lengths are counted and not decided by jumps.
template <typename Char> Char* writeFraction(std::uint32_t thousandths, Char* out) {
    const char* digits = &digitTriples[std::size_t{3} * thousandths];
    out[0] = static_cast<Char>('.');
    out[1] = static_cast<Char>(digits[0]);
    out[2] = static_cast<Char>(digits[1]);
    out[3] = static_cast<Char>(digits[2]);
    const int endsInOne = digits[2] == '0' ? 1 : 0;
    const int endsInTwo = digits[1] == '0' ? endsInOne : 0;
    const int isWhole = thousandths == 0 ? 2 : 0; // the point goes with its last digit
    return out + 4 - endsInOne - endsInTwo - isWhole;
}

/// Writes a number below a thousand.
template <typename Char> Char* writeShort(std::uint32_t thousandths, Char* out) {
    const std::uint32_t whole = thousandths / 1000;
    const std::uint32_t fraction = thousandths % 1000;
    const bool isDropped = whole == 0 && fraction != 0;
    const int zeros = (whole < 100 ? 1 : 0) + (whole < 10 ? 1 : 0) + (isDropped ? 1 : 0);
    const char* digits = &digitTriples[std::size_t{3} * whole] + zeros;
    out[0] = static_cast<Char>(digits[0]);
    out[1] = static_cast<Char>(digits[1]);
    out[2] = static_cast<Char>(digits[2]);
    return writeFraction(fraction, out + 3 - zeros);
}

template <typename Char> Char* writeHuge(float magnitude, Char* out) {
    char digits[maxRuleText];
    const char* end =
        std::to_chars(digits, std::end(digits), magnitude, std::chars_format::fixed, 0).ptr;
    return std::copy(static_cast<const char*>(digits), end, out);
}

/// The text of a whole number below a thousand.
struct ShortText {
    char digits[3];
    std::uint8_t length;
};

constexpr std::array<ShortText, 1000> shortTexts = [] {
    std::array<ShortText, 1000> texts = {};
    for (std::size_t i = 0; i < texts.size(); ++i) {
        const std::size_t zeros = (i < 100 ? 1 : 0) + (i < 10 ? 1 : 0);
        for (std::size_t k = zeros; k < 3; ++k) {
            texts[i].digits[k - zeros] = digitTriples[3 * i + k];
        }
        texts[i].length = static_cast<std::uint8_t>(3 - zeros);
    }
    return texts;
}();

template <typename Char> Char* writeShortWhole(std::uint32_t whole, Char* out) {
    const ShortText& text = shortTexts[whole];
    out[0] = static_cast<Char>(text.digits[0]);
    out[1] = static_cast<Char>(text.digits[1]);
    out[2] = static_cast<Char>(text.digits[2]);
    return out + text.length;
}

template <typename Char> Char* writeMagnitude(float magnitude, Char* out) {
    if (magnitude >= wholeFrom) {
        return magnitude < hugeFrom ? writeWhole(static_cast<std::uint64_t>(magnitude), out)
                                    : writeHuge(magnitude, out);
    }
    // Exact: a float has 24 bits and a thousand 10, so ties are ties, and they go to even.
    const double thousandths = roundToWhole(static_cast<double>(magnitude) * 1000.0);
    if (thousandths < shortThousandths) {
        return writeShort(static_cast<std::uint32_t>(thousandths), out);
    }
    const auto number = static_cast<std::uint64_t>(thousandths);
    out = writeWhole(number / 1000, out);
    return writeFraction(static_cast<std::uint32_t>(number % 1000), out);
}

} // namespace

bool isRuleZero(MoxLength length) { return std::abs(length.getRawValue()) <= zeroLimit; }

template <typename Char> Char* writeRuleDigits(float value, Char* out) {
    const float magnitude = std::abs(value);
    *out = '-'; // overwritten unless the number is negative
    Char* const digits = out + (std::signbit(value) ? 1 : 0);
    // Most numbers of path data in small units are short and whole. A NaN fails the comparison.
    if (magnitude < shortFrom) {
        const auto whole = static_cast<std::uint32_t>(static_cast<std::int32_t>(magnitude));
        if (static_cast<float>(whole) == magnitude) {
            return writeShortWhole(whole, digits);
        }
    } else if (!std::isfinite(value)) {
        *out = '0';
        return out + 1;
    }
    return writeMagnitude(magnitude, digits);
}

template <typename Char> Char* writeRuleNumber(MoxLength length, Char* out) {
    if (isRuleZero(length)) {
        *out = '0';
        return out + 1;
    }
    return writeRuleDigits(length.getRealValue(MOXUNIT_POINT), out);
}

template <typename Char> Char* writeRulePoint(const MoxPointT<MoxLength>& point, Char* out) {
    out = writeRuleNumber(point.x, out);
    *out++ = ',';
    return writeRuleNumber(point.y, out);
}

template char* writeRuleDigits(float, char*);
template char16_t* writeRuleDigits(float, char16_t*);
template char* writeRuleNumber(MoxLength, char*);
template char16_t* writeRuleNumber(MoxLength, char16_t*);
template char* writeRulePoint(const MoxPointT<MoxLength>&, char*);
template char16_t* writeRulePoint(const MoxPointT<MoxLength>&, char16_t*);

} // namespace DrawmereNS

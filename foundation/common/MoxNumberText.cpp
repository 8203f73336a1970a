#include "foundation/common/MoxNumberText.h"

#include "foundation/common/MoxDigits.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <iterator>
#include <limits>

namespace MoxCommonNS {
namespace {

/// Below this, at most one number of three decimals reads back as a given float, and it is the
/// shortest: floats lie closer together than thousandths do.
constexpr float thousandthsLimit = 8192.0F;

struct DecimalScale {
    double factor;
    std::uint32_t toThousandths;
};

/// By the number of decimals; more than three take the slow way.
constexpr DecimalScale decimalScales[] = {{1.0, 1000}, {10.0, 100}, {100.0, 10}, {1000.0, 1}};

char* writeThousandths(std::uint32_t thousandths, char* out) {
    out = writeWhole(thousandths / 1000, out);
    const std::uint32_t fraction = thousandths % 1000;
    return fraction != 0 ? writeDecimals(fraction, out) : out;
}

char* dropTrailingZeros(char* begin, char* end) {
    while (end != begin && end[-1] == '0') {
        --end;
    }
    return end;
}

template <typename Real> char* writeShortest(Real value, char* out) {
    return std::to_chars(out, out + maxRealText, value, std::chars_format::fixed).ptr;
}

int countDecimals(const char* begin, const char* end) {
    const char* point = std::find(begin, end, '.');
    return point == end ? 0 : static_cast<int>(end - point - 1);
}

/// Keeps the first digit that is not zero of a text that begins with "0.".
char* writeFirstDigit(float magnitude, char* out) {
    char* end = writeShortest(magnitude, out);
    char* digit = std::find_if(out + 2, end, [](char c) { return c != '0'; });
    return std::min(digit + 1, end);
}

/// The way for values whose scaled form is not exact in double precision.
char* writeRoundedSlowly(float magnitude, int decimals, char* out) {
    char* end = writeShortest(magnitude, out);
    if (countDecimals(out, end) <= decimals) {
        return end;
    }
    end = std::to_chars(out, out + maxRealText, static_cast<double>(magnitude),
                        std::chars_format::fixed, decimals)
              .ptr;
    if (decimals == 0) {
        return end;
    }
    end = dropTrailingZeros(out, end);
    return end[-1] == '.' ? end - 1 : end;
}

char* writeRounded(float magnitude, int decimals, char* out) {
    char* end = nullptr;
    if (decimals < static_cast<int>(std::size(decimalScales)) && magnitude < thousandthsLimit) {
        // Exact: a float times a thousand fits into a double, so ties are ties and go to even.
        const DecimalScale& scale = decimalScales[decimals];
        const double scaled = roundToWhole(static_cast<double>(magnitude) * scale.factor);
        end = writeThousandths(static_cast<std::uint32_t>(scaled) * scale.toThousandths, out);
    } else {
        end = writeRoundedSlowly(magnitude, decimals, out);
    }
    const bool becameZero = end == out + 1 && *out == '0';
    return becameZero ? writeFirstDigit(magnitude, out) : end;
}

} // namespace

std::size_t writeReal(float value, char* out) {
    if (!(std::abs(value) <= std::numeric_limits<float>::max()) || value == 0.0F) {
        *out = '0';
        return 1;
    }
    char* end = out;
    if (value < 0.0F) {
        *end++ = '-';
    }
    const float magnitude = std::abs(value);
    if (magnitude < thousandthsLimit) {
        const double thousandths = roundToWhole(static_cast<double>(magnitude) * 1000.0);
        if (static_cast<float>(thousandths / 1000.0) == magnitude) {
            return writeThousandths(static_cast<std::uint32_t>(thousandths), end) - out;
        }
    }
    return writeShortest(magnitude, end) - out;
}

std::size_t writeReal(double value, char* out) {
    const auto narrowed = static_cast<float>(value);
    if (static_cast<double>(narrowed) == value || !std::isfinite(value)) {
        return writeReal(narrowed, out);
    }
    return writeShortest(value, out) - out;
}

std::size_t writeRoundedReal(float value, int decimals, char* out) {
    if (!std::isfinite(value) || value == 0.0F) {
        *out = '0';
        return 1;
    }
    char* end = out;
    if (value < 0.0F) {
        *end++ = '-';
    }
    return writeRounded(std::abs(value), std::max(decimals, 0), end) - out;
}

std::size_t writeInteger(std::int64_t value, char* out) {
    char* end = out;
    auto magnitude = static_cast<std::uint64_t>(value);
    if (value < 0) {
        *end++ = '-';
        magnitude = 0 - magnitude;
    }
    return writeWhole(magnitude, end) - out;
}

} // namespace MoxCommonNS

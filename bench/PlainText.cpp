#include "bench/PlainText.h"

#include <charconv>
#include <cstring>
#include <string_view>
#include <vector>

namespace DrawmereNS {
namespace {

constexpr int decimals = 3;

char* dropTrailingZeros(char* end) {
    while (end[-1] == '0') {
        --end;
    }
    return end[-1] == '.' ? end - 1 : end;
}

using Pair = std::array<char, 2>;

/// Returns: the two characters of base64 for each number of twelve bits.
std::vector<Pair> makePairs() {
    constexpr std::string_view alphabet =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    std::vector<Pair> pairs;
    for (const char first : alphabet) {
        for (const char second : alphabet) {
            pairs.push_back({first, second});
        }
    }
    return pairs;
}

} // namespace

char* printPlainNumber(char* begin, float value) {
    char* const limit = begin + maxPlainNumber;
    return dropTrailingZeros(
        std::to_chars(begin, limit, value, std::chars_format::fixed, decimals).ptr);
}

std::array<char, 8> makePlainColor(std::uint32_t rgb) {
    constexpr std::string_view digits = "0123456789abcdef";
    std::array<char, 8> text = {'#'};
    for (std::size_t i = 6; i > 0; --i) {
        text[i] = digits[rgb & 0xFU];
        rgb >>= 4U;
    }
    return text;
}

/// Two characters at a time by a table.
char* printPlainBase64(char* begin, const unsigned char* bytes, std::size_t count) {
    static const std::vector<Pair> pairs = makePairs();
    char* out = begin;
    for (; count >= 3; count -= 3, bytes += 3, out += 4) {
        std::memcpy(out, &pairs[bytes[0] << 4U | bytes[1] >> 4U], 2);
        std::memcpy(out + 2, &pairs[(bytes[1] & 0xFU) << 8U | bytes[2]], 2);
    }
    if (count > 0) {
        const unsigned int second = count > 1 ? bytes[1] : 0U;
        std::memcpy(out, &pairs[bytes[0] << 4U | second >> 4U], 2);
        out[2] = count > 1 ? pairs[(second & 0xFU) << 8U][0] : '=';
        out[3] = '=';
        out += 4;
    }
    return out;
}

} // namespace DrawmereNS

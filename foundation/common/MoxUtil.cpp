#include "foundation/common/MoxUtil.h"

#include "foundation/common/MoxNumberText.h"

#include <algorithm>
#include <charconv>
#include <limits>

#include <unicode/uchar.h>

namespace MoxCommonNS {
namespace {

struct RomanNumeral {
    unsigned value;
    const char16_t* letters;
};

constexpr RomanNumeral romanNumerals[] = {
    {1000, u"m"}, {900, u"cm"}, {500, u"d"}, {400, u"cd"}, {100, u"c"}, {90, u"xc"}, {50, u"l"},
    {40, u"xl"},  {10, u"x"},   {9, u"ix"},  {5, u"v"},    {4, u"iv"},  {1, u"i"},
};

constexpr long long largestRoman = 3999;

/// How the digits of a decimal number are set.
struct DigitStyle {
    UChar32 zero = u'0';
    std::int32_t least = 1; // count of digits, filled up with zeros
    const UnicodeString& separator;
    int groupSize = 0;
};

/// A format, taken apart.
struct NumberFormat {
    UnicodeString prefix;
    UnicodeString token = u"1";
    UnicodeString suffix;
};

bool isAlphanumeric(UChar32 character) {
    return (U_MASK(u_charType(character)) & (U_GC_L_MASK | U_GC_N_MASK)) != 0;
}

/// Returns: the first index from `begin` on whose character is alphanumeric or not, as `wanted`
/// says.
std::int32_t findKind(const UnicodeString& text, std::int32_t begin, bool wanted) {
    std::int32_t index = begin;
    while (index < text.length() && isAlphanumeric(text.char32At(index)) != wanted) {
        index = text.moveIndex32(index, 1);
    }
    return index;
}

/// Returns: where the characters that are not alphanumeric at the end of `text` begin.
std::int32_t findTail(const UnicodeString& text) {
    std::int32_t index = text.length();
    while (index > 0 && !isAlphanumeric(text.char32At(index - 1))) {
        index = text.moveIndex32(index, -1);
    }
    return index;
}

NumberFormat readFormat(const UnicodeString& format) {
    const std::int32_t begin = findKind(format, 0, true);
    const std::int32_t end = findKind(format, begin, false);
    NumberFormat result;
    result.prefix = UnicodeString(format, 0, begin);
    // A format of punctuation alone is its first and its last piece at once.
    result.suffix = UnicodeString(format, findTail(format));
    if (begin < end) {
        result.token = UnicodeString(format, begin, end - begin);
    }
    return result;
}

/// Reads a token of zeros that ends in a one, all digits of one script.
/// Returns: false for any other token, with `style` as it was.
bool readDigitToken(const UnicodeString& token, DigitStyle& style) {
    const UChar32 one = token.char32At(token.length() - 1);
    if (u_charDigitValue(one) != 1) {
        return false;
    }
    const UChar32 zero = one - 1;
    const std::int32_t lastBegin = token.moveIndex32(token.length(), -1);
    for (std::int32_t index = 0; index < lastBegin; index = token.moveIndex32(index, 1)) {
        if (token.char32At(index) != zero) {
            return false;
        }
    }
    style.zero = zero;
    style.least = token.countChar32();
    return true;
}

UnicodeString toDecimal(long long number, const DigitStyle& style) {
    const auto bits = static_cast<unsigned long long>(number);
    const unsigned long long magnitude = number < 0 ? 0 - bits : bits;
    char digits[std::numeric_limits<unsigned long long>::digits10 + 1];
    const char* const end = std::to_chars(digits, digits + sizeof digits, magnitude).ptr;
    const auto count = static_cast<std::int32_t>(end - digits);
    const bool isGrouped = !style.separator.isEmpty() && style.groupSize > 0;
    UnicodeString text = number < 0 ? UnicodeString(u'-') : UnicodeString();
    for (std::int32_t rest = std::max(count, style.least); rest > 0; --rest) {
        text += style.zero + (rest > count ? 0 : digits[count - rest] - '0');
        if (isGrouped && rest > 1 && (rest - 1) % style.groupSize == 0) {
            text += style.separator;
        }
    }
    return text;
}

/// Writes a, b, ... z, aa, ab, ...
UnicodeString toLetters(long long number) {
    UnicodeString text;
    for (long long rest = number; rest > 0; rest = (rest - 1) / 26) {
        text.insert(0, static_cast<char16_t>(u'a' + (rest - 1) % 26));
    }
    return text;
}

UnicodeString toRoman(long long number) {
    UnicodeString text;
    auto rest = static_cast<unsigned>(number);
    for (const RomanNumeral& numeral : romanNumerals) {
        for (; rest >= numeral.value; rest -= numeral.value) {
            text += numeral.letters;
        }
    }
    return text;
}

struct LetterToken {
    UnicodeString (*write)(long long number);
    long long largest;
    char16_t token;
    bool isUpper;
};

constexpr LetterToken letterTokens[] = {
    {toLetters, std::numeric_limits<long long>::max(), u'a', false},
    {toLetters, std::numeric_limits<long long>::max(), u'A', true},
    {toRoman, largestRoman, u'i', false},
    {toRoman, largestRoman, u'I', true},
};

/// Returns: the row of a token of letters that can write `number`, null when there is none.
const LetterToken* findLetterToken(const UnicodeString& token, long long number) {
    for (const LetterToken& row : letterTokens) {
        if (token == row.token && number >= 1 && number <= row.largest) {
            return &row;
        }
    }
    return nullptr;
}

UnicodeString writeNumber(long long number, const UnicodeString& token, DigitStyle style) {
    if (const LetterToken* const letters = findLetterToken(token, number)) {
        UnicodeString text = letters->write(number);
        return letters->isUpper ? text.toUpper(icu::Locale::getRoot()) : text;
    }
    readDigitToken(token, style);
    return toDecimal(number, style);
}

} // namespace

UnicodeString MoxUtil::toString(int value) {
    char digits[maxIntegerText];
    const std::size_t size = writeInteger(value, digits);
    return UnicodeString(digits, static_cast<std::int32_t>(size), US_INV);
}

UnicodeString MoxUtil::toString(double value) {
    char digits[maxRealText];
    const std::size_t size = writeReal(value, digits);
    return UnicodeString(digits, static_cast<std::int32_t>(size), US_INV);
}

void MoxUtil::setLocaleC() {}

UnicodeString MoxUtil::formatNumber(long long number, const UnicodeString& format,
                                    const UnicodeString& separator, int groupSize, const MoxLang&,
                                    MoxNameEnum) {
    const NumberFormat parts = readFormat(format);
    const DigitStyle style{.separator = separator, .groupSize = groupSize};
    return parts.prefix + writeNumber(number, parts.token, style) + parts.suffix;
}

} // namespace MoxCommonNS

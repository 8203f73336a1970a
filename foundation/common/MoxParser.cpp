#include "foundation/common/MoxParser.h"

#include "foundation/common/MoxAsciiChars.h"
#include "foundation/common/MoxColorReader.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxUnitWords.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <iterator>
#include <string>
#include <string_view>

namespace MoxCommonNS {
namespace {

std::u16string_view viewFrom(const UnicodeString& text, int start) {
    const std::u16string_view all(text.getBuffer(), static_cast<std::size_t>(text.length()));
    return all.substr(static_cast<std::size_t>(std::clamp(start, 0, text.length())));
}

/// The number that a text begins with, as SVG 1.1 writes numbers.
struct NumberSpan {
    std::size_t length = 0; // 0 when the text begins with no number
    bool isWhole = true;
};

std::size_t countDigits(std::u16string_view text, std::size_t start) {
    const auto first = text.begin() + static_cast<std::ptrdiff_t>(std::min(start, text.size()));
    return static_cast<std::size_t>(std::find_if_not(first, text.end(), isAsciiDigit) - first);
}

bool isSign(std::u16string_view text, std::size_t index) {
    return index < text.size() && (text[index] == u'+' || text[index] == u'-');
}

/// Returns: the length of the exponent at `start`, 0 when there is none.
std::size_t exponentLength(std::u16string_view text, std::size_t start) {
    if (start >= text.size() || toAsciiLower(text[start]) != u'e') {
        return 0;
    }
    const std::size_t before = isSign(text, start + 1) ? 2 : 1;
    const std::size_t digits = countDigits(text, start + before);
    return digits == 0 ? 0 : before + digits;
}

NumberSpan findNumber(std::u16string_view text) {
    const std::size_t sign = isSign(text, 0) ? 1 : 0;
    const std::size_t whole = countDigits(text, sign);
    NumberSpan span;
    std::size_t end = sign + whole;
    if (end < text.size() && text[end] == u'.') {
        const std::size_t decimals = countDigits(text, end + 1);
        if (decimals == 0) {
            return {};
        }
        end += 1 + decimals;
        span.isWhole = false;
    } else if (whole == 0) {
        return {};
    }
    const std::size_t exponent = exponentLength(text, end);
    span.isWhole = span.isWhole && exponent == 0;
    span.length = end + exponent;
    return span;
}

/// Returns: the bytes of a number in the form that `std::from_chars` reads, so without a plus sign.
std::string numberBytes(std::u16string_view number) {
    number.remove_prefix(number.front() == u'+' ? 1 : 0);
    std::string bytes(number.size(), '\0');
    std::ranges::transform(number, bytes.begin(), [](char16_t c) { return static_cast<char>(c); });
    return bytes;
}

template <typename Number> bool convert(const std::string& bytes, Number& number) {
    const char* end = bytes.data() + bytes.size();
    return std::from_chars(bytes.data(), end, number).ec == std::errc();
}

/// Reads an integer or a real, neither with a unit.
bool readPlainNumber(const std::string& bytes, bool isWhole, MoxValue& value) {
    std::int32_t whole = 0;
    if (isWhole && convert(bytes, whole)) {
        value = MoxValue(whole);
        return true;
    }
    float real = 0.0F;
    if (!convert(bytes, real)) {
        return false;
    }
    value = MoxValue(real);
    return true;
}

bool readLength(const std::string& bytes, std::u16string_view suffix, MoxValue& value) {
    const MoxWord<MoxUnitType>* unit = std::ranges::find_if(
        unitWords, [&](const auto& row) { return equalsIgnoreCase(suffix, row.word); });
    float number = 0.0F;
    if (unit == std::end(unitWords) || !convert(bytes, number)) {
        return false;
    }
    const MoxLength length(number, unit->key);
    value = MoxValue(length);
    return std::isfinite(length.getRawValue());
}

bool readNumber(std::u16string_view text, MoxValue& value) {
    const NumberSpan span = findNumber(text);
    if (span.length == 0) {
        return false;
    }
    const std::string bytes = numberBytes(text.substr(0, span.length));
    const std::u16string_view suffix = text.substr(span.length);
    return suffix.empty() ? readPlainNumber(bytes, span.isWhole, value)
                          : readLength(bytes, suffix, value);
}

bool readWholeColor(std::u16string_view text, MoxColor& color) {
    MoxColorReader reader(text);
    return reader.read(color) && reader.isAtEnd();
}

bool readNumericColor(std::u16string_view text, MoxValue& value) {
    MoxColor color;
    if (text.front() != u'#' || !readWholeColor(text, color)) {
        return false;
    }
    value = MoxValue(color);
    return true;
}

} // namespace

MoxValue MoxParser::parse(const UnicodeString& text, int start,
                          MoxTokenizer::TokenizerType /*type*/) {
    const std::u16string_view rest = viewFrom(text, start);
    const std::u16string_view content = trimXmlSpace(rest);
    if (content.empty()) {
        return MoxValue::NULL_VALUE;
    }
    MoxValue value;
    if (readNumber(content, value) || readNumericColor(content, value)) {
        return value;
    }
    return MoxValue(UnicodeString(rest.data(), static_cast<std::int32_t>(rest.size())));
}

MoxValue MoxParser::parseColor(const UnicodeString& text, bool strict) {
    MoxColor color;
    readColor(text, strict, color);
    return MoxValue(color);
}

bool MoxParser::readColor(const UnicodeString& text, bool strict, MoxColor& color) {
    MoxColor read;
    MoxColorReader reader(viewFrom(text, 0));
    const bool isColor = reader.read(read) && (!strict || reader.isAtEnd());
    color = isColor ? read : MoxColor(0, 0, 0, 0);
    return isColor;
}

} // namespace MoxCommonNS

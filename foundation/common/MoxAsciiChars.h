/// Questions about single characters that no locale has a say in.
#pragma once

#include <cstddef>
#include <string_view>

namespace MoxCommonNS {

/// Returns: true for the white space of XML 1.0: blank, tab, line feed and carriage return.
constexpr bool isXmlSpace(char16_t c) {
    return c == u' ' || c == u'\t' || c == u'\n' || c == u'\r';
}

constexpr bool isAsciiDigit(char16_t c) { return c >= u'0' && c <= u'9'; }

constexpr char16_t toAsciiLower(char16_t c) {
    return c >= u'A' && c <= u'Z' ? static_cast<char16_t>(c + (u'a' - u'A')) : c;
}

constexpr bool isAsciiLetter(char16_t c) {
    return toAsciiLower(c) >= u'a' && toAsciiLower(c) <= u'z';
}

/// Returns: true when `text` is `lower`, which is in lower case, written in any case.
constexpr bool equalsIgnoreCase(std::u16string_view text, std::u16string_view lower) {
    if (text.size() != lower.size()) {
        return false;
    }
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (toAsciiLower(text[i]) != lower[i]) {
            return false;
        }
    }
    return true;
}

/// Returns: `text` without the white space at both ends.
constexpr std::u16string_view trimXmlSpace(std::u16string_view text) {
    while (!text.empty() && isXmlSpace(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isXmlSpace(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

} // namespace MoxCommonNS

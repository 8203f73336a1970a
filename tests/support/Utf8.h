/// Texts as bytes, for expectations that print what they found.
#pragma once

#include <string>

#include <unicode/unistr.h>

namespace DrawmereTest {

/// Returns: the text in UTF-8; a bogus text as "(bogus)".
inline std::string utf8(const icu::UnicodeString& text) {
    std::string bytes;
    return text.isBogus() ? "(bogus)" : text.toUTF8String(bytes);
}

} // namespace DrawmereTest

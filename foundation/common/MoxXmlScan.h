/// The search for characters that can't stand in a document as they are.
#pragma once

#include <cstddef>
#include <string_view>

#if defined(__SSE2__)
#include <bit>
#include <cstdint>
#include <cstring>
#include <emmintrin.h>
#endif

namespace MoxCommonNS {

/// Returns: whether an ASCII character is markup or a control character, which may have to be
/// written as a reference; the place decides whether it really has to.
constexpr bool mayBeXmlMarkup(char c) {
    return static_cast<unsigned char>(c) < 0x20 || c == '<' || c == '>' || c == '&' || c == '"' ||
           c == '\x7F';
}

#if defined(__SSE2__)

/// Returns: a bit for each of sixteen characters, set as `mayBeXmlMarkup` says.
inline unsigned int findXmlMarkupOfSixteen(__m128i text) {
    const auto equals = [](__m128i block, char c) {
        return _mm_cmpeq_epi8(block, _mm_set1_epi8(c));
    };
    const __m128i lastControl = _mm_set1_epi8(0x1F);
    // '<' and '>' differ in one bit.
    const __m128i angle = equals(_mm_or_si128(text, _mm_set1_epi8('<' ^ '>')), '<' | '>');
    const __m128i control = _mm_cmpeq_epi8(_mm_max_epu8(text, lastControl), lastControl);
    const __m128i other =
        _mm_or_si128(_mm_or_si128(equals(text, '&'), equals(text, '"')), equals(text, '\x7F'));
    const __m128i found = _mm_or_si128(_mm_or_si128(angle, control), other);
    return static_cast<unsigned int>(_mm_movemask_epi8(found));
}

/// Returns: whether `mayBeXmlMarkup` says no to all of `count` characters, 4 to 16.
inline bool isFreeOfXmlMarkup(const char* text, std::size_t count) {
    if (count >= 8) { // the halves may overlap
        const __m128i first = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(text));
        const __m128i last = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(text + count - 8));
        return findXmlMarkupOfSixteen(_mm_unpacklo_epi64(first, last)) == 0;
    }
    std::int32_t first = 0;
    std::int32_t last = 0;
    std::memcpy(&first, text, sizeof(first));
    std::memcpy(&last, text + count - sizeof(last), sizeof(last));
    const __m128i four = _mm_unpacklo_epi32(_mm_cvtsi32_si128(first), _mm_cvtsi32_si128(last));
    constexpr unsigned int eight = 0xFF;
    return (findXmlMarkupOfSixteen(four) & eight) == 0;
}

#endif

/// Returns: where the first character of the kind of `mayBeXmlMarkup` stands, from `i` on; the
/// length of the text when there is none.
inline std::size_t findXmlMarkup(std::string_view text, std::size_t i) {
#if defined(__SSE2__)
    constexpr std::size_t blockSize = 16;
    for (; i + blockSize <= text.size(); i += blockSize) {
        const unsigned int found = findXmlMarkupOfSixteen(
            _mm_loadu_si128(reinterpret_cast<const __m128i*>(text.data() + i)));
        if (found != 0) {
            return i + static_cast<std::size_t>(std::countr_zero(found));
        }
    }
    const std::size_t rest = text.size() - i;
    if (i < text.size() && rest >= 4 && isFreeOfXmlMarkup(text.data() + i, rest)) {
        return text.size();
    }
#endif
    while (i < text.size() && !mayBeXmlMarkup(text[i])) {
        ++i;
    }
    return i;
}

} // namespace MoxCommonNS

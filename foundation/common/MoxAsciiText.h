/// Texts that consist of ASCII characters alone.
#pragma once

#include <algorithm>
#include <cstddef>
#include <string_view>
#include <type_traits>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

namespace MoxCommonNS {

/// Returns: whether all of `text`, of bytes or UTF-16, is ASCII. It looks at all units: a loop
/// without a way out takes many at once.
template <typename Unit> bool isAscii(std::basic_string_view<Unit> text) {
#if defined(__SSE2__)
    constexpr std::size_t blockSize = sizeof(__m128i) / sizeof(Unit);
    if (text.size() >= blockSize) {
        const auto load = [&text](std::size_t i) {
            return _mm_loadu_si128(reinterpret_cast<const __m128i*>(text.data() + i));
        };
        __m128i seen = load(text.size() - blockSize); // the blocks may overlap
        for (std::size_t i = 0; i + blockSize < text.size(); i += blockSize) {
            seen = _mm_or_si128(seen, load(i));
        }
        const __m128i beyond = sizeof(Unit) == 1 ? _mm_set1_epi8(static_cast<char>(0x80))
                                                 : _mm_set1_epi16(static_cast<short>(0xFF80));
        const __m128i found = _mm_and_si128(seen, beyond);
        return _mm_movemask_epi8(_mm_cmpeq_epi8(found, _mm_setzero_si128())) == 0xFFFF;
    }
#endif
    std::make_unsigned_t<Unit> seen = 0;
    for (const Unit unit : text) {
        seen = static_cast<std::make_unsigned_t<Unit>>(seen | unit);
    }
    return seen < 0x80;
}

/// Writes ASCII units as bytes. Shape: `target[text.size()]`.
inline void narrowAscii(std::u16string_view text, char* target) {
#if defined(__SSE2__)
    constexpr std::size_t blockSize = 8;
    if (text.size() >= blockSize) {
        const auto narrow = [&text, target](std::size_t i) {
            const __m128i block =
                _mm_loadu_si128(reinterpret_cast<const __m128i*>(text.data() + i));
            _mm_storel_epi64(reinterpret_cast<__m128i*>(target + i),
                             _mm_packus_epi16(block, block));
        };
        for (std::size_t i = 0; i + blockSize < text.size(); i += blockSize) {
            narrow(i);
        }
        narrow(text.size() - blockSize);
        return;
    }
#endif
    std::transform(text.begin(), text.end(), target,
                   [](char16_t c) { return static_cast<char>(c); });
}

} // namespace MoxCommonNS

#include "images/SVGBase64Lines.h"

#include "images/SVGBase64.h"

#include <algorithm>
#include <cstdint>
#include <cstring>

#if defined(__x86_64__) && defined(__GNUC__)
#define DRAWMERE_VECTOR_BASE64
#include <immintrin.h>
#endif

namespace DrawmereNS {
namespace {

constexpr std::size_t tripleBytes = 3;
constexpr std::size_t quadCharacters = 4;

unsigned int toBits(char byte) { return static_cast<unsigned char>(byte); }

void encodePlain(const char* in, std::size_t lines, char* out, std::size_t distance) {
    const char* const alphabet = SVGBase64::BASE64_ALPHABET;
    for (std::size_t line = 0; line < lines; ++line) {
        for (std::size_t i = 0; i < SVGBase64Lines::lineBytes; i += tripleBytes) {
            const unsigned int bits =
                toBits(in[i]) << 16U | toBits(in[i + 1]) << 8U | toBits(in[i + 2]);
            *out++ = alphabet[bits >> 18U];
            *out++ = alphabet[bits >> 12U & 0x3FU];
            *out++ = alphabet[bits >> 6U & 0x3FU];
            *out++ = alphabet[bits & 0x3FU];
        }
        in += SVGBase64Lines::lineBytes;
        out += distance - SVGBase64Lines::lineCharacters;
    }
}

bool isAlwaysSupported() { return true; }

#ifdef DRAWMERE_VECTOR_BASE64

// Both vector encoders work alike. A shuffle puts the three bytes of each group into the four bytes
// that it becomes, two multiplications move the fields of six bits into place, and the distance
// from a field to its character comes from a table of sixteen: fields from 52 on and their excess
// over 51 choose a row, those below 26 the row 13, all others the row 0. A line is no whole number
// of vectors, so the last one overlaps the one before it.

// The first sixteen are for bytes at the start of a vector, the others for bytes from the fourth
// on.
alignas(32) constexpr std::int8_t fieldShuffle[] = {
    1, 0, 2, 1, 4, 3, 5, 4, 7,  6,  8,  7,  10, 9,  11, 10, //
    5, 4, 6, 5, 8, 7, 9, 8, 11, 10, 12, 11, 14, 13, 15, 14,
};

// Twice the same row.
alignas(32) constexpr std::int8_t characterShifts[] = {
    'a' - 26, '0' - 52, '0' - 52, '0' - 52, '0' - 52, '0' - 52, '0' - 52, '0' - 52, //
    '0' - 52, '0' - 52, '0' - 52, '+' - 62, '/' - 63, 'A',      0,        0,        //
    'a' - 26, '0' - 52, '0' - 52, '0' - 52, '0' - 52, '0' - 52, '0' - 52, '0' - 52, //
    '0' - 52, '0' - 52, '0' - 52, '+' - 62, '/' - 63, 'A',      0,        0,
};

constexpr int upperFieldMask = 0x0fc0fc00;
constexpr int upperFieldShift = 0x04000040; // to the right, as the high half of a product
constexpr int lowerFieldMask = 0x003f03f0;
constexpr int lowerFieldShift = 0x01000010;

__attribute__((target("ssse3"))) inline __m128i loadVector(const void* in) {
    return _mm_loadu_si128(static_cast<const __m128i*>(in));
}

__attribute__((target("ssse3"))) inline __m128i encodeShuffled(__m128i bytes) {
    const __m128i upper = _mm_mulhi_epu16(_mm_and_si128(bytes, _mm_set1_epi32(upperFieldMask)),
                                          _mm_set1_epi32(upperFieldShift));
    const __m128i lower = _mm_mullo_epi16(_mm_and_si128(bytes, _mm_set1_epi32(lowerFieldMask)),
                                          _mm_set1_epi32(lowerFieldShift));
    const __m128i fields = _mm_or_si128(upper, lower);
    const __m128i isCapital = _mm_cmpgt_epi8(_mm_set1_epi8(26), fields);
    const __m128i rows = _mm_or_si128(_mm_subs_epu8(fields, _mm_set1_epi8(51)),
                                      _mm_and_si128(isCapital, _mm_set1_epi8(13)));
    const __m128i shifts = _mm_shuffle_epi8(loadVector(characterShifts), rows);
    return _mm_add_epi8(fields, shifts);
}

__attribute__((target("ssse3"))) void encodeSsse3(const char* in, std::size_t lines, char* out,
                                                  std::size_t distance) {
    const __m128i shuffle = loadVector(fieldShuffle);
    const __m128i endShuffle = loadVector(fieldShuffle + 16);
    for (std::size_t line = 0; line < lines; ++line) {
        for (std::size_t i = 0; i < 4; ++i) {
            const __m128i bytes = _mm_shuffle_epi8(loadVector(in + 12 * i), shuffle);
            _mm_storeu_si128(reinterpret_cast<__m128i*>(out + 16 * i), encodeShuffled(bytes));
        }
        // Bytes 45 to 57, read together with the four before them: behind them there may be none.
        const __m128i bytes = _mm_shuffle_epi8(loadVector(in + 41), endShuffle);
        _mm_storeu_si128(reinterpret_cast<__m128i*>(out + 60), encodeShuffled(bytes));
        in += SVGBase64Lines::lineBytes;
        out += distance;
    }
}

bool isSsse3Supported() { return __builtin_cpu_supports("ssse3") != 0; }

__attribute__((target("avx2"))) inline __m256i encodeShuffled(__m256i bytes) {
    const __m256i upper =
        _mm256_mulhi_epu16(_mm256_and_si256(bytes, _mm256_set1_epi32(upperFieldMask)),
                           _mm256_set1_epi32(upperFieldShift));
    const __m256i lower =
        _mm256_mullo_epi16(_mm256_and_si256(bytes, _mm256_set1_epi32(lowerFieldMask)),
                           _mm256_set1_epi32(lowerFieldShift));
    const __m256i fields = _mm256_or_si256(upper, lower);
    const __m256i isCapital = _mm256_cmpgt_epi8(_mm256_set1_epi8(26), fields);
    const __m256i rows = _mm256_or_si256(_mm256_subs_epu8(fields, _mm256_set1_epi8(51)),
                                         _mm256_and_si256(isCapital, _mm256_set1_epi8(13)));
    const __m256i table = _mm256_load_si256(reinterpret_cast<const __m256i*>(characterShifts));
    return _mm256_add_epi8(fields, _mm256_shuffle_epi8(table, rows));
}

/// Encodes 24 bytes; the upper half is read with the four bytes before it, so nothing behind is.
__attribute__((target("avx2"))) inline void encodeVector(const char* in, char* out) {
    const __m256i shuffle = _mm256_load_si256(reinterpret_cast<const __m256i*>(fieldShuffle));
    const __m256i bytes = _mm256_inserti128_si256(
        _mm256_castsi128_si256(_mm_loadu_si128(reinterpret_cast<const __m128i*>(in))),
        _mm_loadu_si128(reinterpret_cast<const __m128i*>(in + 8)), 1);
    _mm256_storeu_si256(reinterpret_cast<__m256i*>(out),
                        encodeShuffled(_mm256_shuffle_epi8(bytes, shuffle)));
}

__attribute__((target("avx2"))) void encodeAvx2(const char* in, std::size_t lines, char* out,
                                                std::size_t distance) {
    for (std::size_t line = 0; line < lines; ++line) {
        encodeVector(in, out);
        encodeVector(in + 24, out + 32);
        encodeVector(in + 33, out + 44);
        in += SVGBase64Lines::lineBytes;
        out += distance;
    }
}

bool isAvx2Supported() { return __builtin_cpu_supports("avx2") != 0; }

#endif

constexpr SVGBase64Lines::Variant variants[] = {
#ifdef DRAWMERE_VECTOR_BASE64
    {"avx2", encodeAvx2, isAvx2Supported},
    {"ssse3", encodeSsse3, isSsse3Supported},
#endif
    {"plain", encodePlain, isAlwaysSupported},
};

/// Writes `lineEnd` behind each line, from the end of the first on.
template <std::size_t size> void writeEnds(std::size_t lines, char* out, const char* lineEnd) {
    for (std::size_t line = 0; line < lines; ++line) {
        std::memcpy(out, lineEnd, size);
        out += SVGBase64Lines::lineCharacters + size;
    }
}

/// The ends that texts have get loops of their own: a copy of known size takes no call.
void endLines(std::size_t lines, char* out, std::string_view lineEnd) {
    constexpr std::size_t character = 1;
    constexpr std::size_t reference = 5;
    if (lineEnd.size() == character) {
        writeEnds<character>(lines, out, lineEnd.data());
    } else if (lineEnd.size() == reference) {
        writeEnds<reference>(lines, out, lineEnd.data());
    } else {
        for (std::size_t line = 0; line < lines; ++line) {
            out = std::copy(lineEnd.begin(), lineEnd.end(), out) + SVGBase64Lines::lineCharacters;
        }
    }
}

SVGBase64Lines::Encoder findFastest() {
    const SVGBase64Lines::Variant* variant = variants;
    while (!variant->isSupported()) {
        ++variant;
    }
    return variant->encode;
}

} // namespace

std::span<const SVGBase64Lines::Variant> SVGBase64Lines::getVariants() { return variants; }

void SVGBase64Lines::encode(const char* in, std::size_t lines, char* out,
                            std::string_view lineEnd) {
    static const Encoder fastest = findFastest();
    fastest(in, lines, out, lineCharacters + lineEnd.size());
    endLines(lines, out + lineCharacters, lineEnd);
}

char* SVGBase64Lines::encodeText(const char* in, std::size_t size, char* out,
                                 std::string_view lineEnd) {
    const std::size_t lines = size / lineBytes;
    encode(in, lines, out, lineEnd);
    const char* const end = in + size;
    in += lines * lineBytes;
    out += lines * (lineCharacters + lineEnd.size());
    while (in != end) {
        const std::size_t count = std::min<std::size_t>(end - in, tripleBytes);
        SVGBase64::EncodeByteTriple(in, count, out);
        in += count;
        out += quadCharacters;
    }
    return out;
}

std::size_t SVGBase64Lines::countText(std::size_t bytes) {
    return (bytes + tripleBytes - 1) / tripleBytes * quadCharacters + bytes / lineBytes;
}

} // namespace DrawmereNS

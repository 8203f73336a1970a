#include "foundation/common/MoxDigitPairs.h"

#include "foundation/common/MoxXmlScan.h"

#include <array>
#include <cstdint>
#include <cstring>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

namespace MoxCommonNS {
namespace {

// Most have the lower half of their ASCII code, which suits vectors. The last one can't follow
// itself: the byte that would say so is the mark of a pair as it is.
constexpr std::string_view alphabet = "0123456789 l,-.c";
constexpr unsigned int bitsOfOne = 4;
constexpr std::uint8_t plainMark = 0xFF;
constexpr std::size_t plainSize = 3; // the mark and its pair
constexpr std::uint16_t stranger = 0x100;

using CodeTable = std::array<std::uint16_t, 256>;

constexpr CodeTable makeCodes(unsigned int shift) {
    CodeTable codes = {};
    codes.fill(stranger);
    for (std::size_t i = 0; i < alphabet.size(); ++i) {
        codes[static_cast<unsigned char>(alphabet[i])] = static_cast<std::uint16_t>(i << shift);
    }
    return codes;
}

constexpr CodeTable firstCodes = makeCodes(bitsOfOne);
constexpr CodeTable secondCodes = makeCodes(0);

struct Pair {
    char characters[2];
};

constexpr std::array<Pair, 256> pairs = [] {
    std::array<Pair, 256> result = {};
    for (std::size_t code = 0; code < result.size(); ++code) {
        result[code] = {{alphabet[code >> bitsOfOne], alphabet[code % alphabet.size()]}};
    }
    return result;
}();

unsigned int findCode(char first, char second) {
    return static_cast<unsigned int>(firstCodes[static_cast<unsigned char>(first)] |
                                     secondCodes[static_cast<unsigned char>(second)]);
}

#if defined(__SSE2__)

constexpr std::size_t charactersAtOnce = 16;

__m128i mark(__m128i bytes, char c) { return _mm_cmpeq_epi8(bytes, _mm_set1_epi8(c)); }

__m128i choose(__m128i marks, int value) {
    return _mm_and_si128(marks, _mm_set1_epi8(static_cast<char>(value)));
}

/// Marks the characters from `first` to `last`, both ASCII.
__m128i markRange(__m128i text, char first, char last) {
    return _mm_and_si128(_mm_cmpgt_epi8(text, _mm_set1_epi8(static_cast<char>(first - 1))),
                         _mm_cmplt_epi8(text, _mm_set1_epi8(static_cast<char>(last + 1))));
}

/// Packs sixteen characters into eight bytes, when all are of the alphabet.
bool packVector(const char* text, char* out) {
    const __m128i in = _mm_loadu_si128(reinterpret_cast<const __m128i*>(text));
    const __m128i blank = mark(in, ' ');
    const __m128i line = mark(in, 'l');
    const __m128i cubic = mark(in, 'c');
    const __m128i numeric = _mm_or_si128(markRange(in, '0', '9'), markRange(in, ',', '.'));
    const __m128i known = _mm_or_si128(_mm_or_si128(numeric, blank), _mm_or_si128(line, cubic));
    // What the lower half of the code lacks.
    const __m128i change = _mm_or_si128(
        _mm_or_si128(choose(blank, 10), choose(line, 'l' % 16 ^ 11)), choose(cubic, 'c' % 16 ^ 15));
    const __m128i codes = _mm_xor_si128(_mm_and_si128(in, _mm_set1_epi8(15)), change);
    const __m128i joined =
        _mm_and_si128(_mm_or_si128(_mm_slli_epi16(codes, bitsOfOne), _mm_srli_epi16(codes, 8)),
                      _mm_set1_epi16(0xFF));
    const __m128i bytes = _mm_packus_epi16(joined, joined);
    const int strangers = _mm_movemask_epi8(known) ^ 0xFFFF;
    const int marks = _mm_movemask_epi8(mark(bytes, static_cast<char>(plainMark)));
    _mm_storel_epi64(reinterpret_cast<__m128i*>(out), bytes);
    return (strangers | marks) == 0;
}

/// Unpacks eight bytes, when none is the mark of a pair as it is.
bool unpackVector(const char* packed, char* out) {
    const __m128i bytes = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(packed));
    const __m128i low = _mm_set1_epi8(15);
    const __m128i codes = _mm_unpacklo_epi8(_mm_and_si128(_mm_srli_epi16(bytes, bitsOfOne), low),
                                            _mm_and_si128(bytes, low));
    const __m128i punctuation = markRange(codes, 12, 14);
    const __m128i change = _mm_or_si128(
        _mm_or_si128(choose(mark(codes, 10), ' ' - 10 - '0'),
                     choose(mark(codes, 11), 'l' - 11 - '0')),
        _mm_or_si128(choose(punctuation, ',' - 12 - '0'), choose(mark(codes, 15), 'c' - 15 - '0')));
    const __m128i text = _mm_add_epi8(_mm_add_epi8(codes, _mm_set1_epi8('0')), change);
    _mm_storeu_si128(reinterpret_cast<__m128i*>(out), text);
    constexpr int eight = 0xFF;
    return (_mm_movemask_epi8(mark(bytes, static_cast<char>(plainMark))) & eight) == 0;
}

#endif

/// Where a text is packed to.
class PairWriter {
public:
    PairWriter(std::string_view text, char* target)
        : place(target), roomLeft(text.size() - text.size() / 4), pairsLeft((text.size() + 1) / 2) {
    }

    char* get() const { return place; }

    void skip(std::size_t bytes) {
        place += bytes;
        roomLeft -= bytes;
        pairsLeft -= bytes;
    }

    /// Returns: whether there is room; every pair that is left takes a byte at least.
    bool write(char first, char second) {
        const unsigned int code = findCode(first, second);
        if (code < plainMark) {
            *place = static_cast<char>(code);
            skip(1);
            return true;
        }
        if (plainSize + pairsLeft - 1 > roomLeft || mayBeXmlMarkup(first) ||
            mayBeXmlMarkup(second)) {
            return false;
        }
        place[0] = static_cast<char>(plainMark);
        place[1] = first;
        place[2] = second;
        place += plainSize;
        roomLeft -= plainSize;
        --pairsLeft;
        return true;
    }

private:
    char* place; // borrowed
    std::size_t roomLeft;
    std::size_t pairsLeft;
};

} // namespace

std::size_t MoxDigitPairs::pack(std::string_view text, char* out) {
    PairWriter writer(text, out);
    std::size_t i = 0;
    while (i < text.size()) {
#if defined(__SSE2__)
        if (i + charactersAtOnce <= text.size() && packVector(text.data() + i, writer.get())) {
            writer.skip(charactersAtOnce / 2);
            i += charactersAtOnce;
            continue;
        }
#endif
        const char second = i + 1 < text.size() ? text[i + 1] : alphabet[0];
        if (!writer.write(text[i], second)) {
            return 0;
        }
        i += 2;
    }
    return static_cast<std::size_t>(writer.get() - out);
}

const char* MoxDigitPairs::unpack(const char* packed, std::size_t length, char* out) {
    const char* const end = out + length;
    while (out < end) {
#if defined(__SSE2__)
        // Sixteen characters that are left are eight bytes at least.
        if (out + charactersAtOnce <= end && unpackVector(packed, out)) {
            out += charactersAtOnce;
            packed += charactersAtOnce / 2;
            continue;
        }
#endif
        const auto code = static_cast<unsigned char>(*packed++);
        if (code != plainMark) {
            std::memcpy(out, pairs[code].characters, sizeof(Pair));
        } else {
            std::memcpy(out, packed, sizeof(Pair));
            packed += sizeof(Pair);
        }
        out += sizeof(Pair);
    }
    return packed;
}

} // namespace MoxCommonNS

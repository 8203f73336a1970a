#include "foundation/graphicservice/GS_Crc32.h"

#include "foundation/graphicservice/GS_Bytes.h"

#include <array>

#if defined(__x86_64__) && defined(__GNUC__)
#define DRAWMERE_VECTOR_CRC32
#include <immintrin.h>
#endif

namespace MoxGraphicService_NS {
namespace {

constexpr std::size_t sliceCount = 8;
constexpr std::size_t byteCount = 256;

using CrcTable = std::array<std::uint32_t, byteCount>;

/// Table k holds what a byte comes to when k null bytes follow it.
constexpr std::array<CrcTable, sliceCount> makeTables() {
    constexpr std::uint32_t polynomial = 0xEDB88320;
    std::array<CrcTable, sliceCount> tables = {};
    for (std::uint32_t byte = 0; byte < byteCount; ++byte) {
        std::uint32_t value = byte;
        for (int bit = 0; bit < 8; ++bit) {
            value = (value >> 1) ^ ((value & 1) != 0 ? polynomial : 0);
        }
        tables[0][byte] = value;
    }
    for (std::size_t k = 1; k < sliceCount; ++k) {
        for (std::size_t byte = 0; byte < byteCount; ++byte) {
            const std::uint32_t before = tables[k - 1][byte];
            tables[k][byte] = (before >> 8) ^ tables[0][before & 0xFF];
        }
    }
    return tables;
}

constexpr std::array<CrcTable, sliceCount> crcTables = makeTables();

std::uint32_t lookUp(std::uint32_t word, std::size_t table) {
    return crcTables[table][word & 0xFF] ^ crcTables[table - 1][word >> 8 & 0xFF] ^
           crcTables[table - 2][word >> 16 & 0xFF] ^ crcTables[table - 3][word >> 24];
}

#ifdef DRAWMERE_VECTOR_CRC32

// A register of sixteen bytes is moved on over what follows by a multiplication without carries:
// each half times the remainder of a power of x. What is left in the end has the checksum of all.

constexpr std::size_t registerSize = 16;
constexpr std::size_t strideSize = 4 * registerSize;

__attribute__((target("pclmul"))) inline __m128i loadRegister(const std::uint8_t* bytes) {
    return _mm_loadu_si128(reinterpret_cast<const __m128i*>(bytes));
}

/// Returns: `value`, moved on as `powers` say, and what is there.
__attribute__((target("pclmul"))) inline __m128i fold(__m128i value, __m128i powers,
                                                      __m128i there) {
    return _mm_xor_si128(there, _mm_xor_si128(_mm_clmulepi64_si128(value, powers, 0x00),
                                              _mm_clmulepi64_si128(value, powers, 0x11)));
}

/// Takes whole strides, at least one, and leaves in `rest` sixteen bytes with the same checksum.
__attribute__((target("pclmul"))) void foldStrides(std::uint32_t state, const std::uint8_t* bytes,
                                                   std::size_t strides, std::uint8_t* rest) {
    const __m128i strideOn = _mm_set_epi64x(0x1C6E41596, 0x154442BD4);
    const __m128i registerOn = _mm_set_epi64x(0x0CCAA009E, 0x1751997D0);
    __m128i values[4];
    for (std::size_t i = 0; i < 4; ++i) {
        values[i] = loadRegister(bytes + i * registerSize);
    }
    values[0] = _mm_xor_si128(values[0], _mm_cvtsi32_si128(static_cast<int>(state)));
    for (std::size_t stride = 1; stride < strides; ++stride) {
        bytes += strideSize;
        for (std::size_t i = 0; i < 4; ++i) {
            values[i] = fold(values[i], strideOn, loadRegister(bytes + i * registerSize));
        }
    }
    __m128i value = values[0];
    for (std::size_t i = 1; i < 4; ++i) {
        value = fold(value, registerOn, values[i]);
    }
    _mm_storeu_si128(reinterpret_cast<__m128i*>(rest), value);
}

bool canFold() {
    static const bool isSupported = __builtin_cpu_supports("pclmul") != 0;
    return isSupported;
}

#endif

} // namespace

void GS_Crc32::add(const std::uint8_t* bytes, std::size_t count) {
#ifdef DRAWMERE_VECTOR_CRC32
    const std::size_t strides = count / strideSize;
    if (strides > 0 && canFold()) {
        std::uint8_t rest[registerSize];
        foldStrides(state, bytes, strides, rest);
        state = 0;
        addPlain(rest, registerSize);
        bytes += strides * strideSize;
        count -= strides * strideSize;
    }
#endif
    addPlain(bytes, count);
}

void GS_Crc32::addPlain(const std::uint8_t* bytes, std::size_t count) {
    std::size_t i = 0;
    for (; i + sliceCount <= count; i += sliceCount) {
        state = lookUp(readLittle32(bytes + i) ^ state, 7) ^ lookUp(readLittle32(bytes + i + 4), 3);
    }
    for (; i < count; ++i) {
        state = (state >> 8) ^ crcTables[0][(state ^ bytes[i]) & 0xFF];
    }
}

std::uint32_t GS_Crc32::getValue() const { return ~state; }

} // namespace MoxGraphicService_NS

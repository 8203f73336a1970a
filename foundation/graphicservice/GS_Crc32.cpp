#include "foundation/graphicservice/GS_Crc32.h"

#include "foundation/graphicservice/GS_Bytes.h"

#include <array>

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

} // namespace

void GS_Crc32::add(const std::uint8_t* bytes, std::size_t count) {
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

/// Numbers of several bytes, as image files hold them.
#pragma once

#include <cstdint>

namespace MoxGraphicService_NS {

/// Returns: two bytes, the low one first.
constexpr std::uint32_t readLittle16(const std::uint8_t* bytes) {
    return bytes[0] | static_cast<std::uint32_t>(bytes[1]) << 8;
}

/// Returns: four bytes, the lowest first.
constexpr std::uint32_t readLittle32(const std::uint8_t* bytes) {
    return readLittle16(bytes) | readLittle16(bytes + 2) << 16;
}

/// Returns: two bytes, the high one first.
constexpr std::uint32_t readBig16(const std::uint8_t* bytes) {
    return static_cast<std::uint32_t>(bytes[0]) << 8 | bytes[1];
}

/// Returns: four bytes, the highest first.
constexpr std::uint32_t readBig32(const std::uint8_t* bytes) {
    return readBig16(bytes) << 16 | readBig16(bytes + 2);
}

} // namespace MoxGraphicService_NS

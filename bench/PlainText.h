/// How the plain writer spells numbers, colours and images.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace DrawmereNS {

constexpr std::size_t maxPlainNumber = 64; // a float has 39 digits before the point

constexpr const char* plainImagePrefix = "data:image/png;base64,";

/// Writes a number with three decimals at most. Shape: `begin[maxPlainNumber]`.
/// Returns: behind its last character.
char* printPlainNumber(char* begin, float value);

/// Returns: "#rrggbb", with a zero behind it.
std::array<char, 8> makePlainColor(std::uint32_t rgb);

/// Writes base64 without line feeds; only the last piece of a text may be no whole triples.
/// Shape: `begin[count / 3 * 4 + 4]`. Returns: behind its last character.
char* printPlainBase64(char* begin, const unsigned char* bytes, std::size_t count);

} // namespace DrawmereNS

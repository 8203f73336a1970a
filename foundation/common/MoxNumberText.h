/// Decimal texts of numbers, made without allocation and without regard to any locale.
#pragma once

#include "DrawmereExport.h"

#include <cstddef>
#include <cstdint>

namespace MoxCommonNS {

/// Room that any text of `writeReal` and `writeRoundedReal` fits into.
constexpr std::size_t maxRealText = 400;

/// Room that any text of `writeInteger` fits into.
constexpr std::size_t maxIntegerText = 20;

/// Writes the shortest decimal that reads back as the same single-precision number, never with an
/// exponent; NaN, the infinities and minus zero give "0".
/// Shape: `out` has room for `maxRealText` characters; no terminator is written.
/// Returns: the number of characters.
DRAWMERE_API std::size_t writeReal(float value, char* out);

/// Writes a double that is exactly a float like that float, any other as the shortest decimal that
/// reads back as the same double. Otherwise like the other form.
DRAWMERE_API std::size_t writeReal(double value, char* out);

/// Writes `value` rounded to at most `decimals` digits behind the point, without trailing zeros. A
/// value that is not zero never becomes "0": where rounding would do that, the first digit that is
/// not zero stays. Negative `decimals` count as none.
/// Shape, Returns: as `writeReal`.
DRAWMERE_API std::size_t writeRoundedReal(float value, int decimals, char* out);

/// Writes a whole number. Returns: the number of characters.
DRAWMERE_API std::size_t writeInteger(std::int64_t value, char* out);

} // namespace MoxCommonNS

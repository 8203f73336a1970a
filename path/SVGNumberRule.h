/// The texts of coordinates in path data and of text positions: at most three decimals, no zero
/// that is not needed, no blank.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxPointT.h"

#include <cstddef>

namespace DrawmereNS {

using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxPointT;

/// Room that the text of any number fits into: 39 digits before the point, the point, three behind
/// it, and a sign.
constexpr std::size_t maxRuleText = 44;

/// Room that the text of any point fits into.
constexpr std::size_t maxRulePoint = 2 * maxRuleText + 1;

/// Writes the digits of `value` alone: rounded to three decimals, halves to the even digit,
/// trailing zeros cut, the zero before the point dropped. What rounds to nothing keeps its sign:
/// "0" or "-0". NaN and the infinities give "0". `Char` is `char` or `char16_t`.
/// Shape: `out` has room for `maxRuleText` characters; no terminator is written.
/// Returns: the end of the text.
template <typename Char> DRAWMERE_API Char* writeRuleDigits(float value, Char* out);

/// Writes a length in points by the whole rule: what is no farther from zero than a thousandth of a
/// millimetre is "0".
/// Shape, Returns: as `writeRuleDigits`.
template <typename Char> DRAWMERE_API Char* writeRuleNumber(MoxLength length, Char* out);

/// Writes x, a comma and y; the comma stands before a negative number too.
/// Shape: `out` has room for `maxRulePoint` characters; no terminator is written.
/// Returns: the end of the text.
template <typename Char>
DRAWMERE_API Char* writeRulePoint(const MoxPointT<MoxLength>& point, Char* out);

/// Returns: whether the number rule takes `length` for zero. A NaN is none.
DRAWMERE_API bool isRuleZero(MoxLength length);

} // namespace DrawmereNS

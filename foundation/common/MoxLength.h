/// A length in points.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxUnitType.h"

namespace MoxCommonNS {

/// One single-precision number of points, passed by value. Reading and writing points, and every
/// number that is no unit of length, takes the number as it is; the other units are converted in
/// double precision and rounded to a float at the end. NaN and infinities pass through.
class DRAWMERE_API MoxLength {
public:
    /// No length: 0 points.
    constexpr MoxLength() = default;

    /// Units: `number` counts `unit`s.
    constexpr MoxLength(float number, MoxUnitType unit) : value(toPoints(number, unit)) {}

    /// The length of `points`.
    static constexpr MoxLength fromRaw(float points) { return {points, MOXUNIT_POINT}; }

    /// Returns: the length in `unit`.
    constexpr float getRealValue(MoxUnitType unit) const {
        const Ratio ratio = pointsPerUnit(unit);
        return isOne(ratio) ? value : scale(value, ratio.below, ratio.above);
    }

    /// Returns: the number that is kept, which is in points.
    constexpr float getRawValue() const { return value; }

    /// Exact: lengths are equal when their numbers are.
    constexpr bool operator==(const MoxLength&) const = default;

    float value = 0.0F; ///< in points, or a keyword of `SVGFont`

private:
    /// A ratio of whole numbers, so that a conversion is one exact product and one quotient.
    struct Ratio {
        double above;
        double below;
    };

    static constexpr Ratio ratios[] = {
        {3600.0, 127.0}, // centimetre
        {360.0, 127.0},  // millimetre
        {72.0, 1.0},     // inch
        {1.0, 1.0},      // point
        {12.0, 1.0},     // pica
    };

    static constexpr Ratio pointsPerUnit(MoxUnitType unit) {
        const bool listed = unit >= MOXUNIT_CM && unit <= MOXUNIT_PICA;
        return ratios[(listed ? unit : MOXUNIT_POINT) - MOXUNIT_CM];
    }

    static constexpr bool isOne(const Ratio& ratio) { return ratio.above == ratio.below; }

    static constexpr float scale(float number, double factor, double divisor) {
        return static_cast<float>(static_cast<double>(number) * factor / divisor);
    }

    static constexpr float toPoints(float number, MoxUnitType unit) {
        const Ratio ratio = pointsPerUnit(unit);
        return isOne(ratio) ? number : scale(number, ratio.above, ratio.below);
    }
};

static_assert(sizeof(MoxLength) == sizeof(float));

} // namespace MoxCommonNS

/// One step of a linear gradient.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxColor.h"
#include "foundation/common/MoxLength.h"
#include "foundation/common/MoxPointT.h"

#include <cstdint>

namespace DrawmereNS {

using MoxCommonNS::MoxColor;
using MoxCommonNS::MoxLength;
using MoxCommonNS::MoxPointT;

/// A step of a linear gradient as a pair of ends, for callers that cut their gradients into steps;
/// nothing in the library makes one. What the flags and the values of the ends mean is up to the
/// caller.
class DRAWMERE_API SVGLinearGradientCell {
public:
    /// Returns: the way from `first` to `second` along the axis on which they are farther apart, x
    /// when they are equally far: 18 to the right, 66 to the left and for equal points, 33
    /// downwards, 36 upwards.
    int getDirection(const MoxPointT<MoxLength>& first, const MoxPointT<MoxLength>& second) const;

    /// Swaps the two ends with all that belongs to them.
    void replaceStartEnd();

    std::uint64_t reserved = 0;      ///< left alone by all operations
    MoxColor startColor;             ///< of the start
    MoxColor endColor;               ///< of the end
    std::uint8_t startFlag = 0;      ///< of the start
    std::uint8_t endFlag = 0;        ///< of the end
    float startValue = 0.0F;         ///< of the start
    float endValue = 0.0F;           ///< of the end
    MoxPointT<MoxLength> startPoint; ///< where the step starts
    MoxPointT<MoxLength> endPoint;   ///< where the step ends
};

} // namespace DrawmereNS

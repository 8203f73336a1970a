/// A rectangle of any coordinate type.
#pragma once

#include "foundation/common/MoxPointT.h"

namespace MoxCommonNS {

/// A rectangle by two opposite corners, which may be any two: nothing sorts them.
template <typename T> class MoxRectT {
public:
    constexpr MoxRectT() = default;

    /// A rectangle from the coordinates of two opposite corners.
    constexpr MoxRectT(const T& firstX, const T& firstY, const T& secondX, const T& secondY)
        : x1(firstX), y1(firstY), x2(secondX), y2(secondY) {}

    /// A rectangle from two opposite corners.
    constexpr MoxRectT(const MoxPointT<T>& first, const MoxPointT<T>& second)
        : MoxRectT(first.x, first.y, second.x, second.y) {}

    /// True when both are the same.
    constexpr bool operator==(const MoxRectT&) const = default;

    T x1 = T(); ///< of the first corner
    T y1 = T(); ///< of the first corner
    T x2 = T(); ///< of the second corner
    T y2 = T(); ///< of the second corner
};

} // namespace MoxCommonNS

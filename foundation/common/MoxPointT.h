/// A point of any coordinate type.
#pragma once

namespace MoxCommonNS {

/// The two coordinates of a point.
template <typename T> class MoxPointT {
public:
    constexpr MoxPointT() = default;

    /// A point from its coordinates.
    constexpr MoxPointT(const T& xValue, const T& yValue) : x(xValue), y(yValue) {}

    /// True when both are the same.
    constexpr bool operator==(const MoxPointT&) const = default;

    T x = T(); ///< to the right
    T y = T(); ///< downwards on pages
};

} // namespace MoxCommonNS

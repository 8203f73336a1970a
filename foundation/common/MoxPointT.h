/// A point of any coordinate type.
#pragma once

namespace MoxCommonNS {

/// The two coordinates of a point.
template <typename T> class MoxPointT {
public:
    constexpr MoxPointT() = default;

    constexpr MoxPointT(const T& xValue, const T& yValue) : x(xValue), y(yValue) {}

    constexpr bool operator==(const MoxPointT&) const = default;

    T x = T();
    T y = T();
};

} // namespace MoxCommonNS
